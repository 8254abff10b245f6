#include "path/MediaPoint.h"

#include "app/Trace.h"
#include "path/DefaultTitle.h"
#include "path/PointRecord.h"

namespace {
QString imageSourceKey(int index)
{
    return QStringLiteral("mppImageSource%1").arg(index);
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

MediaPoint::MediaPoint(double x_, double y_, double z_) : GeoPoint(x_, y_, z_) {}

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
    makeEmptyGeo();
    properties.reset();
}

bool MediaPoint::Save(ProjectController &store, QString section) const
{
    BasePoint::Save(store, section);
    const PointRecordWriter out(store, section);
    saveGeo(out);

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
    loadGeo(in);

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
        p.imageSources.append(MediaFile{path, pictureRotation(path).value_or(0)});
    }
    return true;
}
