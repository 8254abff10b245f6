#pragma once

#include "path/KeyPoint.h"

#include <QVector>

#include <cstdint>
#include <functional>
#include <vector>

class ProjectController;

// The key point list of a project: section "keypoints" with "elements" and
// "defaultKeyPointTitleCounter", one section "keypoint%d" per point from 0.

// Appends the stored key points to out and sets the process-wide title counter
// (count + 1 when the file has none). Files before version 2 had one font and
// size for all key points, in "kp_font" and "keypoints/size"; they preset every
// point. A missing section is skipped and the points after it are loaded; the
// section numbers of the loaded points go to `numbers` when given. Returns false
// when the count is missing. The points' segment references are still indices
// afterwards.
bool loadKeyPoints(ProjectController &store, uint32_t projectVersion, QVector<KeyPoint> &out,
                   std::vector<int32_t> *numbers = nullptr);

// Maps a segment id to its position in the path's segment list.
using SegmentIndexOf = std::function<uint32_t(uint32_t segmentId)>;

// Writes the list; each point is saved from a copy whose segment reference is
// the index that segmentIndexOf gives, so the live points keep their ids.
bool saveKeyPoints(ProjectController &store, const QVector<KeyPoint> &keyPoints, const SegmentIndexOf &segmentIndexOf);

QString keyPointSection(int index);
