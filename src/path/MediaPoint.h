#pragma once

#include "path/GeoPoint.h"

#include <QVector>

// One photograph of a media point.
struct MediaFile
{
    QString path;
    int32_t orientation = 0; // degrees to turn the picture
};

struct MediaPointProperties
{
    MediaPointProperties() { reset(); }
    // Defaults; the title is the shared default title at the time of the call.
    void reset();

    QString title;
    bool enabled = true;
    int32_t durationToNextKP = 3000; // ms
    int32_t durationPause = 500;     // ms for which the photos stand
    int32_t indexPosition = 0;
    QVector<MediaFile> imageSources;
    int32_t spare = 0;
};

// A place on the route where photographs are shown.
class MediaPoint : public GeoPoint
{
public:
    MediaPoint() = default;
    // Both positions start at (x, y, z).
    MediaPoint(double x, double y, double z);
    MediaPoint(const MediaPoint &other) = default;
    MediaPoint(MediaPoint &&other) noexcept;
    MediaPoint &operator=(const MediaPoint &other) = default;
    MediaPoint &operator=(MediaPoint &&other) noexcept;
    ~MediaPoint() override;

    // The photographs' orientation is not stored; Load takes it from the files.
    bool Save(ProjectController &store, QString section) const override;
    bool Load(ProjectController &store, QString section) override;

    QString title() const { return properties.title; }

    MediaPointProperties properties;

private:
    void makeEmptyMediaPoint();
};
