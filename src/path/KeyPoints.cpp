#include "path/KeyPoints.h"

#include "app/Trace.h"
#include "path/DefaultTitle.h"
#include "path/PointRecord.h"

namespace {
const QString listSection = QStringLiteral("keypoints");
}

QString keyPointSection(int index)
{
    return QStringLiteral("keypoint%1").arg(index);
}

bool loadKeyPoints(ProjectController &store, uint32_t projectVersion, QVector<KeyPoint> &out)
{
    const PointRecordReader list(store, listSection);
    int32_t count = 0;
    if (!list.read(QStringLiteral("elements"), count))
        return false;
    if (count < 0)
        count = 0;

    uint32_t titleCounter = static_cast<uint32_t>(count) + 1;
    list.read(QStringLiteral("defaultKeyPointTitleCounter"), titleCounter);
    setDefaultKeyPointTitleCounter(titleCounter);

    const bool sharedLook = projectVersion < 2;
    KeyPointFont sharedFont;
    double sharedSize = 1.0;
    if (sharedLook) {
        sharedFont.load(PointRecordReader(store, QStringLiteral("kp_font")));
        list.read(QStringLiteral("size"), sharedSize);
    }

    for (int32_t i = 0; i < count; ++i) {
        const QString section = keyPointSection(i);
        // Every saved key point has "x"; a count beyond the stored sections is damage.
        if (!PointRecordReader(store, section).has(QStringLiteral("x"))) {
            logTrace(3, QStringLiteral("loadKeyPoints -> section %s missing, %d of %d key points read"), section, i, count);
            break;
        }
        KeyPoint point;
        if (sharedLook) {
            point.properties.font = sharedFont;
            point.properties.size = sharedSize;
        }
        point.Load(store, section);
        out.append(std::move(point));
    }
    return true;
}

bool saveKeyPoints(ProjectController &store, const QVector<KeyPoint> &keyPoints, const SegmentIndexOf &segmentIndexOf)
{
    const PointRecordWriter list(store, listSection);
    list.write(QStringLiteral("elements"), static_cast<int32_t>(keyPoints.size()));
    list.write(QStringLiteral("defaultKeyPointTitleCounter"), defaultKeyPointTitleCounter());
    for (int i = 0; i < keyPoints.size(); ++i) {
        KeyPoint stored = keyPoints.at(i);
        stored.correspondingPathSegmentId = segmentIndexOf(stored.correspondingPathSegmentId);
        stored.Save(store, keyPointSection(i));
    }
    return true;
}
