#pragma once

#include "path/CurvePoint.h"
#include "path/KeyPoint.h"
#include "path/TrackPoint.h"

#include <vector>

// A key point that stays when a track is converted: the first, the last and the
// titled ones, with its place in the curve.
struct FixedKeyPoint
{
    KeyPoint point;
    size_t index;
    bool placed = false;
};

// Where a point that stays lies: `source` among the track's points; `index` is its
// place in the curve once `placed`, until then the same as `source`.
struct FixedPlace
{
    size_t source;
    size_t index;
    bool placed = false;
};

// The same walk serves the key points of a path and the lighter points of a file.
namespace trackpoint {
inline double x(const KeyPoint &k) { return k.x; }
inline double y(const KeyPoint &k) { return k.y; }
inline double z(const KeyPoint &k) { return k.z; }
inline bool titled(const KeyPoint &k) { return !k.title().isEmpty(); }
inline double x(const TrackPoint &p) { return p.longitude; }
inline double y(const TrackPoint &p) { return p.latitude; }
inline double z(const TrackPoint &p) { return p.hasAltitude ? p.altitude : 0.0; }
inline bool titled(const TrackPoint &p) { return !p.name.isEmpty(); }
}

// Drops repeated positions (a titled repeat replaces the point before it) and
// returns the spacing to thin at for the "GpxAliasing" setting: 0 off (the largest
// double), 1 auto, 2 default, 3 max. Instantiated for std::vector<KeyPoint> and TrackPoints.
template<typename Points>
double gpxThresholdOf(Points &points, uint32_t aliasing, int32_t fixedDuration);

// Makes `curve` from the straight legs between the track's points, keeping a
// sample only when it lies at least `threshold` metres from the last one kept;
// the first sample of a fixed point's leg and the very last sample are always
// kept. Returns the fixed points with their places in the curve.
template<typename Points>
std::vector<FixedPlace> thinTrack(const Points &points, double threshold, std::vector<CurvePoint> &curve);
