#pragma once

#include "path/GeoPoint.h"
#include "path/KeyPointProperties.h"

// A waypoint. Besides x, y, z it keeps a geographic position of its own: the
// two sets are equal after an ordinary edit, but scaling of the path moves
// x and y only.
class KeyPoint : public GeoPoint
{
public:
    KeyPoint() = default;
    // Both positions start at (x, y, z).
    KeyPoint(double x, double y, double z);
    KeyPoint(double x, double y, double z, const QString &name);
    KeyPoint(const KeyPoint &other) = default;
    KeyPoint(KeyPoint &&other) noexcept;
    KeyPoint &operator=(const KeyPoint &other) = default;
    KeyPoint &operator=(KeyPoint &&other) noexcept;
    ~KeyPoint() override;

    bool Save(ProjectController &store, QString section) const override;
    bool Load(ProjectController &store, QString section) override;

    QString title() const { return properties.title; }

    KeyPointProperties properties;
    // Id of the path segment that starts here; an index while in the file.
    uint32_t correspondingPathSegmentId = 0;

private:
    void makeEmptyKeyPoint();
};
