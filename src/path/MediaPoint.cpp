#include "path/MediaPoint.h"

#include "app/Trace.h"
#include "path/ContentPath.h"
#include "path/DefaultTitle.h"
#include "path/PointRecord.h"
#include "platform/PictureMetadata.h"

namespace {
QString imageSourceKey(int index)
{
    return QStringLiteral("mppImageSource%1").arg(index);
}

int32_t orientationOfPicture(const QString &path)
{
    if (const auto orientation = readPictureOrientation(localFilePath(path))) {
        if (const auto rotation = rotationForOrientation(*orientation))
            return *rotation;
    }
    return 0;
}
}

void MediaPointProperties::reset()
{
    title = defaultPointTitle();
    enabled = true;
    durationToNextKP = 3000;
    durationPause = 500;
    indexPosition = 0;
    imageSources.clear();
    spare = 0;
}

MediaPoint::MediaPoint(double x_, double y_, double z_) : BasePoint(x_, y_, z_), longitude(x_), latitude(y_), altitude(z_) {}

MediaPoint::MediaPoint(MediaPoint &&other) noexcept : MediaPoint(static_cast<const MediaPoint &>(other))
{
    other.makeEmptyMediaPoint();
}

MediaPoint &MediaPoint::operator=(MediaPoint &&other) noexcept
{
    if (this != &other) {
        *this = static_cast<const MediaPoint &>(other);
        other.makeEmptyMediaPoint();
    }
    return *this;
}

MediaPoint::~MediaPoint() = default;

void MediaPoint::makeEmptyMediaPoint()
{
    makeEmpty();
    longitude = latitude = altitude = 0.0;
    name.clear();
    type = 1;
    properties.reset();
}

void MediaPoint::setLongitude(double value, bool alsoBase)
{
    longitude = value;
    if (alsoBase)
        x = value;
}

void MediaPoint::setLatitude(double value, bool alsoBase)
{
    latitude = value;
    if (alsoBase)
        y = value;
}

void MediaPoint::setAltitude(double value, bool alsoBase)
{
    altitude = value;
    if (alsoBase)
        z = value;
}

bool MediaPoint::Save(ProjectController &store, QString section) const
{
    BasePoint::Save(store, section);
    const PointRecordWriter out(store, section);
    out.writeCoordinate(QStringLiteral("longitude"), longitude);
    out.writeCoordinate(QStringLiteral("latitude"), latitude);
    out.writeCoordinate(QStringLiteral("altitude"), altitude);
    out.write(QStringLiteral("name"), name);
    out.write(QStringLiteral("type"), type);

    const MediaPointProperties &p = properties;
    out.write(QStringLiteral("mppTitle"), p.title);
    out.write(QStringLiteral("mppEnabled"), p.enabled);
    out.write(QStringLiteral("mppDurationToNextKP"), p.durationToNextKP);
    out.write(QStringLiteral("mppDurationPause"), p.durationPause);
    out.write(QStringLiteral("mppIndexPosition"), p.indexPosition);
    out.write(QStringLiteral("mppFileListCount"), static_cast<int32_t>(p.imageSources.size()));
    for (int i = 0; i < p.imageSources.size(); ++i)
        out.write(imageSourceKey(i), p.imageSources.at(i).path);
    return true;
}

bool MediaPoint::Load(ProjectController &store, QString section)
{
    BasePoint::Load(store, section);
    const PointRecordReader in(store, section);
    in.read(QStringLiteral("longitude"), longitude);
    in.read(QStringLiteral("latitude"), latitude);
    in.read(QStringLiteral("altitude"), altitude);
    in.read(QStringLiteral("name"), name);
    in.read(QStringLiteral("type"), type);

    MediaPointProperties &p = properties;
    in.read(QStringLiteral("mppTitle"), p.title);
    in.read(QStringLiteral("mppEnabled"), p.enabled);
    in.read(QStringLiteral("mppDurationToNextKP"), p.durationToNextKP);
    in.read(QStringLiteral("mppDurationPause"), p.durationPause);
    in.read(QStringLiteral("mppIndexPosition"), p.indexPosition);

    int32_t count = 0;
    if (!in.read(QStringLiteral("mppFileListCount"), count))
        return true;
    p.imageSources.clear();
    for (int32_t i = 0; i < count; ++i) {
        const QString path = in.text(imageSourceKey(i));
        // A damaged count must not run on for billions of absent entries.
        if (path.isEmpty()) {
            logTrace(3, QStringLiteral("MediaPoint::Load -> %s: %s missing, %d of %d files read"), section,
                     imageSourceKey(i), i, count);
            break;
        }
        p.imageSources.append(MediaFile{path, orientationOfPicture(path)});
    }
    return true;
}
