#pragma once

#include <QPointF>

#include <vector>

// Generators of the drawn route between key points (x = longitude, y = latitude).
// Each returns one list of samples per leg; fewer than two key points give no legs.
namespace CurveGenerator {

using Leg = std::vector<QPointF>;

std::vector<Leg> straight(const std::vector<QPointF> &keys);
std::vector<Leg> smooth(const std::vector<QPointF> &keys);
// One parabolic leg between exactly two key points; any other count gives nothing.
std::vector<Leg> arc(const std::vector<QPointF> &keys);

// Building blocks, public for their tests.
struct WrappedLon
{
    double lon;
    bool wrapped;
};
// Moves `lon` across the antimeridian when that is the shorter way from `reference`.
WrappedLon wrapAgainst(double reference, double lon);
double roundHalfAway(double v);
// Fills steps wider than one unit in x, then in y, as maps with large numbers need.
Leg fillGaps(const Leg &samples, const QPointF &a, const QPointF &b);
// Catmull-Rom in the Barry-Goldman form from p1 to p2 (p2 itself not produced).
void appendSpline(Leg &out, const QPointF &p0, const QPointF &p1, const QPointF &p2, const QPointF &p3, int steps);

} // namespace CurveGenerator
