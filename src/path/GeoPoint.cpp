#include "path/GeoPoint.h"

#include "path/ContentPath.h"
#include "path/PointRecord.h"
#include "platform/PictureMetadata.h"

GeoPoint::GeoPoint(double x_, double y_, double z_) : BasePoint(x_, y_, z_), longitude(x_), latitude(y_), altitude(z_) {}

void GeoPoint::setLongitude(double value, bool alsoBase)
{
    longitude = value;
    if (alsoBase)
        x = value;
}

void GeoPoint::setLatitude(double value, bool alsoBase)
{
    latitude = value;
    if (alsoBase)
        y = value;
}

void GeoPoint::setAltitude(double value, bool alsoBase)
{
    altitude = value;
    if (alsoBase)
        z = value;
}

void GeoPoint::saveGeo(const PointRecordWriter &out) const
{
    out.writeCoordinate(QStringLiteral("longitude"), longitude);
    out.writeCoordinate(QStringLiteral("latitude"), latitude);
    out.writeCoordinate(QStringLiteral("altitude"), altitude);
    out.write(QStringLiteral("name"), name);
    out.write(QStringLiteral("type"), type);
}

void GeoPoint::loadGeo(const PointRecordReader &in)
{
    in.readCoordinate(QStringLiteral("longitude"), longitude);
    in.readCoordinate(QStringLiteral("latitude"), latitude);
    in.readCoordinate(QStringLiteral("altitude"), altitude);
    in.read(QStringLiteral("name"), name);
    in.read(QStringLiteral("type"), type);
}

void GeoPoint::makeEmptyGeo()
{
    makeEmpty();
    longitude = latitude = altitude = 0.0;
    name.clear();
    type = 1;
}

std::optional<int32_t> pictureRotation(const QString &path)
{
    if (const auto orientation = readPictureOrientation(localFilePath(path)))
        return rotationForOrientation(*orientation);
    return std::nullopt;
}
