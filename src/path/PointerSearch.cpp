#include "path/PointerSearch.h"

#include "path/GeoDistance.h"

#include <cmath>

namespace PointerSearch {
namespace {

// The scan shared by both point kinds: `take(index, metres)` is told of each new best.
template <typename Points, typename Take>
void scan(const Points &points, double scale, double lat, double lon, double radius, double &farthest, Take take)
{
    const GeoDistanceFrom from(lat, lon);
    double best = radius;
    // A little above the term of `best`, so that rounding never passes over an equally
    // near point; the comparison in metres decides.
    const auto termAbove = [](double metres) { return GeoDistanceFrom::metresToTerm(metres) * (1 + 1e-9) + 1e-300; };
    double bestTerm = termAbove(radius);
    for (size_t i = 0; i < points.size(); ++i) {
        const double pLat = points[i].y * scale;
        const double pLon = points[i].x * scale;
        if (from.termAtLeast(pLat, pLon) > bestTerm)
            continue;
        const double metres = GeoDistanceFrom::termToMetres(from.term(pLat, pLon));
        farthest = std::max(farthest, metres);
        if (best > metres) {
            best = metres;
            bestTerm = termAbove(best);
            take(i, metres);
        }
    }
}

} // namespace

uint32_t keyPointAt(const std::vector<KeyPoint> &keyPoints, double scale, double lat, double lon, double radius)
{
    uint32_t hit = 0;
    double farthest = 0.0;
    scan(keyPoints, scale, lat, lon, radius, farthest, [&](size_t i, double) { hit = keyPoints[i].id; });
    return hit;
}

SampleHit sampleAt(const std::vector<CurvePoint> &samples, double scale, double lat, double lon, double radius)
{
    SampleHit hit;
    scan(samples, scale, lat, lon, radius, hit.farthest, [&](size_t i, double metres) {
        hit.index = int(i);
        hit.distance = metres;
    });
    return hit;
}

} // namespace PointerSearch
