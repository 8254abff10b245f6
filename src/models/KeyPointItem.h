#pragma once

#include <QColor>
#include <QFont>
#include <QPointF>
#include <QSizeF>
#include <QString>
#include <QVariantMap>

#include <cstdint>

class KeyPoint;
struct KeyPointFont;

// One row of the waypoint list: what the interface shows and edits of a key point.
// Durations are milliseconds, as the key point keeps them; the interface shows seconds.
struct KeyPointItem
{
    uint32_t elementId = 0;
    bool enabled = true;
    double pauseDuration = 0.0;
    double animationDuration = 0.0;
    double size = 1.0;
    bool keyPointFontShadow = false;
    bool keyPointFontFrame = true;
    bool isMediaTemplate = false;
    QString title;
    QFont keyPointFont;
    int32_t mediaFileOrientation = 0;
    QString keyPointImageSource;
    QString mediaFileName;
    QPointF mediaCenterPositionOffset;
    QSizeF mediaSourceSize;
    QColor keyPointFontColor;
    // Whether the marker shows during playback; lives only here.
    bool enabledForAnimation = true;
    // Index of the curve sample that names the key point: its place along the route.
    int32_t orderIndex = 0;

    // Everything but the two fields that the key point doesn't hold.
    void assignFrom(const KeyPoint &point);
    // The marker's map, also the settings page's `activeItem`.
    QVariantMap toMap() const;
};

// The font as the interface takes it, and back. Style bits: 1 bold, 2 italic,
// 4 underline, 8 overline, 16 strike-out.
QFont keyPointQFont(const KeyPointFont &font);
void setKeyPointFont(KeyPointFont &font, const QFont &from);

// A local path as "file:///" URL for the interface; a URL or empty text stays.
QString interfaceFileUrl(const QString &stored);
