#include "animation/RoutePose.h"

#include "path/GeoDistance.h"

#include <QGeoCoordinate>

#include <algorithm>

namespace {

double distanceBetween(const CurvePoint &a, const CurvePoint &b)
{
    return geoDistance(a.y, a.x, b.y, b.x);
}

// The sample about `reach` metres along the route from `from` in direction `step`,
// at least one sample away unless `from` is the end.
size_t walk(const std::vector<CurvePoint> &curve, size_t from, int step, double reach)
{
    size_t at = from;
    double covered = 0.0;
    do {
        const long next = long(at) + step;
        if (next < 0 || next >= long(curve.size()))
            break;
        covered += distanceBetween(curve[at], curve[size_t(next)]);
        at = size_t(next);
    } while (covered < reach);
    return at;
}

}

RoutePose routePoseAt(const std::vector<CurvePoint> &curve, uint32_t index, double span)
{
    RoutePose pose;
    if (curve.empty())
        return pose;
    const size_t at = std::min<size_t>(index, curve.size() - 1);
    pose.valid = true;
    pose.longitude = curve[at].x;
    pose.latitude = curve[at].y;

    const size_t back = walk(curve, at, -1, span / 2);
    const size_t ahead = walk(curve, at, +1, span / 2);
    const CurvePoint &from = curve[back];
    const CurvePoint &to = curve[ahead];
    if (back != ahead && distanceBetween(from, to) > 0.0) {
        const double azimuth = QGeoCoordinate(from.y, from.x).azimuthTo(QGeoCoordinate(to.y, to.x));
        pose.heading = azimuth < 0.0 ? azimuth + 360.0 : azimuth;
    }
    return pose;
}

double headingSpanFor(const std::vector<CurvePoint> &curve)
{
    double length = 0.0;
    for (size_t i = 1; i < curve.size(); ++i)
        length += distanceBetween(curve[i - 1], curve[i]);
    return std::clamp(length / 300.0, 5.0, 20000.0);
}
