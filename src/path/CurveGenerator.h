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

// Catmull-Rom in the Barry-Goldman form from p1 to p2 in `steps` samples; p2 itself
// is not produced. Any sample can be had on its own.
class Spline
{
public:
    Spline(const QPointF &p0, const QPointF &p1, const QPointF &p2, const QPointF &p3, int steps);
    int size() const { return m_steps; } // 0 for a leg of no length
    QPointF at(int j) const;

private:
    QPointF m_p0, m_p1, m_p2, m_p3;
    double m_t1 = 0, m_t2 = 0, m_t3 = 0, m_step = 0;
    int m_steps = 0;
};

// One leg of the straight generator, prepared so that a caller may walk its
// samples one by one instead of making them all.
class StraightLeg
{
public:
    StraightLeg(const QPointF &a, const QPointF &b);
    // The whole leg as the straight generator makes it.
    Leg samples() const;
    // True when no step can be wider than one unit, so `sample(j)` for j below
    // `splineSize()` is exactly the j-th of `samples()`.
    bool stepsAreSmall() const { return m_stepsAreSmall; }
    int splineSize() const { return m_spline.size(); }
    QPointF sample(int j) const;

private:
    QPointF m_a, m_b;
    bool m_wrapped;
    bool m_stepsAreSmall;
    Spline m_spline;
};

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
