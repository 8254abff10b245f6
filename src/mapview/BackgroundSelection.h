#pragma once

#include <QColor>
#include <QString>

#include <vector>

class FileDialogs;
class QMainController;
struct MapItem;

// What a background identifier stands for, and the choice of one: a live map layer
// ("osm:..." or "esri:..."), a catalogue map ("pseudeo:map:" + its id, spelt so), a
// picture of the user's own ("file:///..."), or "?browse" for the dialog that finds one.
class BackgroundSelection
{
public:
    static const QString defaultMap; // "osm:layer:0"

    enum class Kind { Invalid, LiveOsm, LiveEsri, CatalogueMap, Browse, OwnPicture };
    static Kind kindOf(const QString &identifier);
    // The word usage tracking reports for a background.
    static QString trackingWord(const QString &identifier);

    // Resolves `identifier` into the background to store: false when nothing is to
    // change (an unknown catalogue map, a cancelled dialog, an invalid identifier).
    // A catalogue map also gives its colour; the dialog asks through `controller`.
    bool resolve(const QString &identifier, const std::vector<MapItem> &maps, QMainController &controller);

    const QString &background() const { return m_background; }
    // The local picture a background stands for; empty for live layers.
    const QString &picture() const { return m_picture; }
    const QColor &colour() const { return m_colour; }

private:
    QString m_background;
    QString m_picture;
    QColor m_colour;
};
