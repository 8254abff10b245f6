#include "path/KeyPoint.h"

#include "path/ContentPath.h"
#include "path/PointRecord.h"

KeyPoint::KeyPoint(double x_, double y_, double z_) : GeoPoint(x_, y_, z_) {}

KeyPoint::KeyPoint(double x_, double y_, double z_, const QString &name_) : KeyPoint(x_, y_, z_)
{
    name = name_;
}

KeyPoint::KeyPoint(KeyPoint &&other) noexcept : KeyPoint(static_cast<const KeyPoint &>(other))
{
    other.makeEmptyKeyPoint();
}

KeyPoint &KeyPoint::operator=(KeyPoint &&other) noexcept
{
    if (this != &other) {
        *this = static_cast<const KeyPoint &>(other);
        other.makeEmptyKeyPoint();
    }
    return *this;
}

KeyPoint::~KeyPoint() = default;

void KeyPoint::makeEmptyKeyPoint()
{
    makeEmptyGeo();
    properties.reset();
    correspondingPathSegmentId = 0;
}

bool KeyPoint::Save(ProjectController &store, QString section) const
{
    BasePoint::Save(store, section);
    const PointRecordWriter out(store, section);
    saveGeo(out);

    const KeyPointProperties &p = properties;
    out.write(QStringLiteral("kppTitle"), p.title);
    out.write(QStringLiteral("kppEnabled"), p.enabled);
    out.write(QStringLiteral("kppIsMediaTemplate"), p.isMediaTemplate);
    if (p.isMediaTemplate) {
        out.write(QStringLiteral("kppMediaSizeW"), p.mediaSizeW);
        out.write(QStringLiteral("kppMediaSizeH"), p.mediaSizeH);
        out.write(QStringLiteral("kppMediaCenterOffsetX"), p.mediaCenterOffsetX);
        out.write(QStringLiteral("kppMediaCenterOffsetY"), p.mediaCenterOffsetY);
    }
    out.write(QStringLiteral("kppDurationToNextKP"), p.durationToNextKP);
    out.write(QStringLiteral("kppSize"), p.size);
    out.write(QStringLiteral("kppDurationPause"), p.durationPause);
    out.write(QStringLiteral("kppIndexPosition"), p.indexPosition);
    out.write(QStringLiteral("kppImageSource"), p.imageSource);
    out.write(QStringLiteral("kppMediaSource"), p.mediaSource);
    p.font.save(out);
    out.write(QStringLiteral("correspondingPathSegmentId"), correspondingPathSegmentId);
    return true;
}

bool KeyPoint::Load(ProjectController &store, QString section)
{
    BasePoint::Load(store, section);
    const PointRecordReader in(store, section);
    loadGeo(in);

    KeyPointProperties &p = properties;
    in.read(QStringLiteral("kppTitle"), p.title);
    in.read(QStringLiteral("kppEnabled"), p.enabled);
    in.read(QStringLiteral("kppIsMediaTemplate"), p.isMediaTemplate);
    if (p.isMediaTemplate) {
        in.read(QStringLiteral("kppMediaSizeW"), p.mediaSizeW);
        in.read(QStringLiteral("kppMediaSizeH"), p.mediaSizeH);
        in.read(QStringLiteral("kppMediaCenterOffsetX"), p.mediaCenterOffsetX);
        in.read(QStringLiteral("kppMediaCenterOffsetY"), p.mediaCenterOffsetY);
    }
    in.read(QStringLiteral("kppDurationToNextKP"), p.durationToNextKP);
    in.read(QStringLiteral("kppSize"), p.size);
    in.read(QStringLiteral("kppDurationPause"), p.durationPause);
    in.read(QStringLiteral("kppIndexPosition"), p.indexPosition);
    if (in.read(QStringLiteral("kppImageSource"), p.imageSource))
        p.imageSource = rebaseContentPath(p.imageSource);
    if (in.read(QStringLiteral("kppMediaSource"), p.mediaSource))
        p.mediaSource = rebaseContentPath(p.mediaSource);

    if (!p.mediaSource.isEmpty()) {
        if (const auto rotation = pictureRotation(p.mediaSource))
            p.mediaRotation = *rotation;
    }

    p.font.load(in);
    in.read(QStringLiteral("correspondingPathSegmentId"), correspondingPathSegmentId);
    return true;
}
