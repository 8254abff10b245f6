#pragma once

#include "path/CurvePoint.h"
#include "path/KeyPoint.h"

#include <cstdint>
#include <vector>

// What lies under the mouse pointer on the map: the key point or the route sample
// nearest to it and nearer than a hit radius in metres. The radius is compared
// strictly, the first of equally near points wins, and positions are those of the
// path times its scale. Results equal those of measuring every point; points that
// can't be nearer than the best so far are passed over without trigonometry, since
// this runs on every mouse move over tracks of 100,000 samples.
namespace PointerSearch {

// Id of the key point hit; 0 for none.
uint32_t keyPointAt(const std::vector<KeyPoint> &keyPoints, double scale, double lat, double lon, double radius);

struct SampleHit
{
    int index = -1;        // -1 for none
    double distance = 0.0; // metres
    double farthest = 0.0; // largest distance measured on the way, for the log
};

SampleHit sampleAt(const std::vector<CurvePoint> &samples, double scale, double lat, double lon, double radius);

} // namespace PointerSearch
