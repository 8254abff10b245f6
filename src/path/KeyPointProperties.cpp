#include "path/KeyPointProperties.h"

#include "path/DefaultTitle.h"
#include "path/PointRecord.h"

void KeyPointFont::reset()
{
    family = QStringLiteral("Arial");
    color = QStringLiteral("#000000");
    pointSize = 18.0;
    hasShadow = false;
    hasFrame = true;
    style = 0;
}

void KeyPointFont::save(const PointRecordWriter &out) const
{
    out.write(QStringLiteral("family"), family);
    out.write(QStringLiteral("color"), color);
    out.write(QStringLiteral("pointSize"), pointSize);
    out.write(QStringLiteral("hasShadow"), hasShadow);
    out.write(QStringLiteral("hasFrame"), hasFrame);
    out.write(QStringLiteral("style"), style);
}

void KeyPointFont::load(const PointRecordReader &in)
{
    in.read(QStringLiteral("family"), family);
    in.read(QStringLiteral("color"), color);
    in.read(QStringLiteral("pointSize"), pointSize);
    in.read(QStringLiteral("hasShadow"), hasShadow);
    in.read(QStringLiteral("hasFrame"), hasFrame);
    in.read(QStringLiteral("style"), style);
}

void KeyPointProperties::reset()
{
    title = defaultPointTitle();
    enabled = true;
    isMediaTemplate = false;
    mediaCenterOffsetX = 0.0;
    mediaCenterOffsetY = 0.0;
    mediaSizeW = 0.0;
    mediaSizeH = 0.0;
    durationToNextKP = 3000;
    size = 1.0;
    durationPause = 500;
    indexPosition = 0;
    imageSource.clear();
    mediaSource.clear();
    mediaRotation = 0;
    font.reset();
}
