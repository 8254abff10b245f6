#pragma once

#include "path/CurvePoint.h"
#include "path/KeyPoint.h"

#include <vector>

// A key point that stays when a track is thinned: the first, the last and the
// titled ones. `index` is its place among the key points, and its place in the
// curve once `placed`.
struct FixedKeyPoint
{
    KeyPoint point;
    size_t index;
    bool placed = false;
};

// Makes `curve` from the straight legs between the track's points, keeping a
// sample only when it lies at least `threshold` metres from the last one kept;
// the first sample of a fixed point's leg and the very last sample are always
// kept. Returns the fixed points with their places in the curve.
std::vector<FixedKeyPoint> thinTrack(const std::vector<KeyPoint> &keyPoints, double threshold,
                                     std::vector<CurvePoint> &curve);
