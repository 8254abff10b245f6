#include "path/NearestSample.h"

#include "path/GeoDistance.h"

#include <QtMath>

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>

namespace {

constexpr size_t fanOut = 32;

double halfAngleTerm(double degrees)
{
    const double s = std::sin(qDegreesToRadians(degrees) / 2.0);
    return s * s;
}

} // namespace

struct NearestSample::Search
{
    const GeoDistanceFrom &from;
    double lat, lon, cosLat;
    double best;
    int bestIndex = -1;
};

NearestSample::NearestSample(const std::vector<CurvePoint> &samples) : m_samples(samples)
{
    const double inf = std::numeric_limits<double>::infinity();
    const Box empty{inf, -inf, inf, -inf, 1.0, false};
    std::vector<Box> level((samples.size() + fanOut - 1) / fanOut, empty);
    for (size_t i = 0; i < samples.size(); ++i) {
        Box &box = level[i / fanOut];
        const double lat = samples[i].y, lon = samples[i].x;
        if (!isValidCoordinate(lat, lon)) {
            box.hasInvalid = true;
            continue;
        }
        box.south = std::min(box.south, lat);
        box.north = std::max(box.north, lat);
        box.west = std::min(box.west, lon);
        box.east = std::max(box.east, lon);
    }
    for (Box &box : level) {
        if (box.south <= box.north)
            box.minCos = std::min(std::cos(qDegreesToRadians(box.south)), std::cos(qDegreesToRadians(box.north)));
    }
    m_levels.push_back(std::move(level));
    while (m_levels.back().size() > 1) {
        const std::vector<Box> &below = m_levels.back();
        std::vector<Box> above((below.size() + fanOut - 1) / fanOut, empty);
        for (size_t i = 0; i < below.size(); ++i) {
            Box &box = above[i / fanOut];
            const Box &child = below[i];
            box.south = std::min(box.south, child.south);
            box.north = std::max(box.north, child.north);
            box.west = std::min(box.west, child.west);
            box.east = std::max(box.east, child.east);
            box.minCos = std::min(box.minCos, child.minCos);
            box.hasInvalid = box.hasInvalid || child.hasInvalid;
        }
        m_levels.push_back(std::move(above));
    }
}

// No sample in the box has a smaller term than this. The term of a sample is
// sin²(Δlat/2) + cos(lat₀)·cos(lat)·sin²(Δlon/2), and each part is at least its
// value at the nearest edge of the box; a little is taken off for rounding.
double NearestSample::lowerBound(const Box &box, double lat, double lon, double cosLat) const
{
    if (box.hasInvalid)
        return 0.0;
    if (box.south > box.north)
        return std::numeric_limits<double>::infinity(); // no sample at all
    const double dLat = lat < box.south ? box.south - lat : lat > box.north ? lat - box.north : 0.0;
    double dLon = 0.0;
    if (lon < box.west || lon > box.east) {
        // The way round the other side of the globe may be the shorter one.
        const auto around = [](double a, double b) {
            const double d = std::fabs(a - b);
            return std::min(d, 360.0 - d);
        };
        dLon = std::min(around(lon, box.west), around(lon, box.east));
    }
    const double bound = halfAngleTerm(dLat) + cosLat * box.minCos * halfAngleTerm(dLon);
    return bound * (1.0 - 1e-9);
}

void NearestSample::visit(Search &search, size_t level, size_t index) const
{
    if (level == 0) {
        const size_t end = std::min(m_samples.size(), (index + 1) * fanOut);
        for (size_t i = index * fanOut; i < end; ++i) {
            const double d = search.from.term(m_samples[i].y, m_samples[i].x);
            // The first of equal terms wins, as in a scan from the start.
            if (d < search.best || (d == search.best && search.bestIndex >= 0 && int(i) < search.bestIndex)) {
                search.best = d;
                search.bestIndex = int(i);
            }
        }
        return;
    }
    // The nearest boxes first, so that a close sample soon rules out the others.
    const std::vector<Box> &children = m_levels[level - 1];
    std::array<std::pair<double, size_t>, fanOut> order;
    size_t count = 0;
    for (size_t child = index * fanOut; child < std::min(children.size(), (index + 1) * fanOut); ++child)
        order[count++] = {lowerBound(children[child], search.lat, search.lon, search.cosLat), child};
    std::sort(order.begin(), order.begin() + long(count));
    for (size_t i = 0; i < count && order[i].first <= search.best; ++i)
        visit(search, level - 1, order[i].second);
}

int NearestSample::find(double lat, double lon, double limitTerm) const
{
    if (m_samples.empty())
        return -1;
    const GeoDistanceFrom from(lat, lon);
    if (!from.valid())
        return 0.0 < limitTerm ? 0 : -1; // every term is 0
    Search search{from, lat, lon, std::cos(qDegreesToRadians(lat)), limitTerm};
    if (lowerBound(m_levels.back().front(), lat, lon, search.cosLat) <= limitTerm)
        visit(search, m_levels.size() - 1, 0);
    return search.bestIndex;
}
