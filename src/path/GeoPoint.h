#pragma once

#include "path/BasePoint.h"

#include <QString>

#include <cstdint>
#include <optional>

class PointRecordReader;
class PointRecordWriter;

// What key points and media points share: a geographic position beside the
// base x, y, z, a name and a type, stored under the same keys by both.
class GeoPoint : public BasePoint
{
public:
    GeoPoint() = default;
    // Both positions start at (x, y, z).
    GeoPoint(double x, double y, double z);

    // alsoBase: move x, y or z along; false for points that only carry a
    // geographic value.
    void setLongitude(double value, bool alsoBase);
    void setLatitude(double value, bool alsoBase);
    void setAltitude(double value, bool alsoBase);

    double longitude = 0.0;
    double latitude = 0.0;
    double altitude = 0.0;
    QString name;
    int32_t type = 1;

protected:
    // Keys "longitude", "latitude", "altitude", "name", "type".
    void saveGeo(const PointRecordWriter &out) const;
    void loadGeo(const PointRecordReader &in);
    // Back to the values of a new point, with id 0.
    void makeEmptyGeo();
};

// Degrees to turn the picture of a content or local path by its orientation tag;
// nothing when the picture or the tag can't be read or the value is unknown.
std::optional<int32_t> pictureRotation(const QString &path);
