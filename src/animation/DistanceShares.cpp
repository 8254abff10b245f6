#include "animation/DistanceShares.h"

#include "app/Trace.h"
#include "path/GeoDistance.h"

#include <algorithm>
#include <limits>

namespace {

struct Leg
{
    double distance = 0.0;
    double min = std::numeric_limits<double>::max();
    double max = 0.0;
};

}

std::vector<double> distanceShares(const std::vector<CurvePoint> &curve)
{
    double min = std::numeric_limits<double>::max();
    double max = 0.0;
    double complete = 0.0;
    std::vector<Leg> legs;
    for (size_t i = 0; i < curve.size(); ++i) {
        if (curve[i].correspondingKeyPoint != 0) {
            // The step into a key point's sample is left out on purpose.
            legs.emplace_back();
            continue;
        }
        // Samples before the first key point belong to no leg.
        if (legs.empty())
            continue;
        const CurvePoint &a = curve[i - 1];
        const CurvePoint &b = curve[i];
        const double d = geoDistance(a.y, a.x, b.y, b.x);
        min = std::min(min, d);
        max = std::max(max, d);
        Leg &leg = legs.back();
        leg.min = std::min(leg.min, d);
        leg.max = std::max(leg.max, d);
        leg.distance += d;
        complete += d;
    }

    std::vector<double> shares;
    if (legs.size() > 1)
        shares.reserve(legs.size() - 1);
    for (size_t i = 0; i + 1 < legs.size(); ++i) {
        // A route whose samples all lie on one spot has nothing to share out.
        const double share = complete > 0.0 ? legs[i].distance / complete : 0.0;
        shares.push_back(share);
        logTrace(0, QStringLiteral("   seg %d: min = %f, max = %f, distance = %f, durationPercent = %f"), int(i), legs[i].min,
                 legs[i].max, legs[i].distance, share);
    }
    logTrace(0, QStringLiteral("linearAnimation: min = %f, max = %f, complete = %f, segments = %d"), min, max, complete,
             int(legs.size()));
    return shares;
}
