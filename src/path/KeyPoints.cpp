#include "path/KeyPoints.h"

#include "app/Trace.h"
#include "path/DefaultTitle.h"
#include "path/PointRecord.h"
#include "project/ProjectController.h"

namespace {
const QString listSection = QStringLiteral("keypoints");
}

QString keyPointSection(int index)
{
    return QStringLiteral("keypoint%1").arg(index);
}

bool loadKeyPoints(ProjectController &store, uint32_t projectVersion, QVector<KeyPoint> &out,
                   std::vector<int32_t> *numbers)
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

    const std::vector<int32_t> present = store.numberedSections(QStringLiteral("keypoint"), count);
    if (present.size() != size_t(count))
        logTrace(3, QStringLiteral("loadKeyPoints -> %d of %d key point sections present"), int(present.size()), count);
    out.reserve(out.size() + int(present.size()));
    for (const int32_t i : present) {
        KeyPoint point;
        if (sharedLook) {
            point.properties.font = sharedFont;
            point.properties.size = sharedSize;
        }
        point.Load(store, keyPointSection(i));
        out.append(std::move(point));
    }
    if (numbers)
        *numbers = present;
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
