#include "path/CurveGenerator.h"

#include <algorithm>
#include <cmath>

namespace CurveGenerator {

namespace {

constexpr double outerShare = 0.1;        // distance of a stand-in control point, as a share of the leg
constexpr double knotExponent = 0.5 / 100; // nearly uniform knots
constexpr int baseSamples = 200;

float f(double v) { return static_cast<float>(v); }

// The control point that continues the leg a->b beyond `from`, away from `to`.
QPointF outerPoint(const QPointF &from, const QPointF &to)
{
    const float dx = f(from.x() - to.x());
    const float dy = f(from.y() - to.y());
    const float d = std::sqrt(dx * dx + dy * dy);
    const float share = f(d * outerShare);
    return QPointF(f(from.x() + f(dx / d) * share), f(from.y() + f(dy / d) * share));
}

int sampleCount(const QPointF &a, const QPointF &b)
{
    const double dLon = std::trunc(std::fabs(a.x() - b.x()));
    const double dLat = std::trunc(std::fabs(a.y() - b.y()));
    return static_cast<int>(std::max(dLon, dLat)) + baseSamples;
}

void finishLeg(Leg &leg, const QPointF &a, const QPointF &b, bool wrapped)
{
    leg = fillGaps(leg, a, b);
    if (wrapped) {
        for (QPointF &p : leg) {
            if (p.x() > 180.0)
                p.setX(p.x() - 180.0 - 180.0);
            else if (p.x() < -180.0)
                p.setX(p.x() + 360.0);
        }
    }
    if (leg.empty())
        leg.push_back(a);
}

// One leg of the straight or smooth generator; prev/next are the neighbouring
// key points, or null where an outer point stands in.
Leg makeLeg(const QPointF &a, const QPointF &bRaw, const QPointF *prev, const QPointF *next)
{
    const WrappedLon wb = wrapAgainst(a.x(), bRaw.x());
    const QPointF b(wb.lon, bRaw.y());
    bool wrapped = wb.wrapped;

    QPointF p0 = outerPoint(a, b);
    QPointF p3 = outerPoint(b, a);
    if (prev) {
        p0 = QPointF(wrapAgainst(a.x(), prev->x()).lon, prev->y());
    }
    if (next) {
        const WrappedLon wn = wrapAgainst(b.x(), next->x());
        p3 = QPointF(wn.lon, next->y());
        if (!wn.wrapped)
            wrapped = false;
    }
    Leg leg;
    const int steps = sampleCount(a, b);
    leg.reserve(steps + 2);
    appendSpline(leg, p0, a, b, p3, steps);
    finishLeg(leg, a, b, wrapped);
    return leg;
}

std::vector<Leg> generate(const std::vector<QPointF> &keys, bool useNeighbours)
{
    std::vector<Leg> legs;
    if (keys.size() < 2)
        return legs;
    legs.reserve(keys.size() - 1);
    for (size_t i = 0; i + 1 < keys.size(); ++i) {
        const QPointF *prev = useNeighbours && i > 0 ? &keys[i - 1] : nullptr;
        const QPointF *next = useNeighbours && i + 2 < keys.size() ? &keys[i + 2] : nullptr;
        legs.push_back(makeLeg(keys[i], keys[i + 1], prev, next));
    }
    return legs;
}

} // namespace

WrappedLon wrapAgainst(double reference, double lon)
{
    double wrapped = lon;
    if (reference > 0 && lon < 0)
        wrapped = 180.0 - std::fabs(lon) + 180.0;
    else if (reference < 0 && lon > 0)
        wrapped = -180.0 - (180.0 - std::fabs(lon));
    if (std::fabs(reference - wrapped) > std::fabs(reference - lon))
        return {lon, false};
    return {wrapped, true};
}

double roundHalfAway(double v)
{
    if (v >= 0)
        return std::trunc(v + 0.5);
    const double t = std::trunc(v - 1);
    return t + std::trunc(v - t + 0.5);
}

void appendSpline(Leg &out, const QPointF &p0, const QPointF &p1, const QPointF &p2, const QPointF &p3, int steps)
{
    auto knot = [](const QPointF &u, const QPointF &v) {
        const double dx = u.x() - v.x(), dy = u.y() - v.y();
        return std::pow(std::sqrt(dx * dx + dy * dy), knotExponent);
    };
    const double t1 = knot(p0, p1);
    const double t2 = t1 + knot(p1, p2);
    const double t3 = t2 + knot(p2, p3);
    if (!(t1 < t2) || steps <= 0)
        return;
    // Counting the steps instead of adding them up keeps the sample count at
    // exactly `steps`, whatever the rounding of the sum.
    const double step = (t2 - t1) / steps;
    for (int j = 0; j < steps; ++j) {
        const double t = t1 + j * step;
        const QPointF a1 = ((t1 - t) / t1) * p0 + (t / t1) * p1;
        const QPointF a2 = ((t2 - t) / (t2 - t1)) * p1 + ((t - t1) / (t2 - t1)) * p2;
        const QPointF a3 = ((t3 - t) / (t3 - t2)) * p2 + ((t - t2) / (t3 - t2)) * p3;
        const QPointF b1 = ((t2 - t) / t2) * a1 + (t / t2) * a2;
        const QPointF b2 = ((t3 - t) / (t3 - t1)) * a2 + ((t - t1) / (t3 - t1)) * a3;
        out.push_back(((t2 - t) / (t2 - t1)) * b1 + ((t - t1) / (t2 - t1)) * b2);
    }
}

Leg fillGaps(const Leg &samples, const QPointF &a, const QPointF &b)
{
    if (samples.empty())
        return {};
    // Degrees rarely step by more than one unit: leave the common case untouched.
    bool needsFill = false;
    for (size_t i = 1; i < samples.size() && !needsFill; ++i)
        needsFill = f(std::fabs(samples[i].x() - samples[i - 1].x())) > 1.0f
                 || std::fabs(samples[i].y() - samples[i - 1].y()) > 1.0;
    if (!needsFill)
        return samples;

    Leg byX;
    byX.reserve(samples.size());
    byX.push_back(samples.front());
    const double dirX = a.x() > b.x() ? -1.0 : 1.0;
    for (size_t i = 1; i < samples.size(); ++i) {
        const QPointF s = samples[i];
        const float dx = f(std::fabs(s.x() - byX.back().x()));
        if (dx > 1.0f) {
            for (int k = 1; dx > k; ++k) {
                const QPointF prev = byX.back();
                const double slope = (s.y() - prev.y()) / (s.x() - prev.x());
                const double nx = prev.x() + dirX;
                byX.emplace_back(nx, roundHalfAway((nx - prev.x()) * slope + prev.y()));
            }
        }
        byX.push_back(s);
    }

    Leg byY;
    byY.reserve(byX.size());
    byY.push_back(byX.front());
    const double dirY = a.y() > b.y() ? -1.0 : 1.0;
    for (size_t i = 1; i < byX.size(); ++i) {
        const QPointF s = byX[i];
        const double dy = std::fabs(s.y() - byY.back().y());
        if (dy > 1.0) {
            for (int k = 1; dy > k; ++k)
                byY.emplace_back(std::trunc(s.x()), std::trunc(s.y() - k * dirY));
        }
        byY.push_back(s);
    }
    return byY;
}

std::vector<Leg> straight(const std::vector<QPointF> &keys)
{
    return generate(keys, false);
}

std::vector<Leg> smooth(const std::vector<QPointF> &keys)
{
    return generate(keys, true);
}

std::vector<Leg> arc(const std::vector<QPointF> &keys)
{
    if (keys.size() != 2)
        return {};
    const QPointF a = keys[0], b = keys[1];
    const float e2 = f(2 * (a.y() - b.y()));
    const float h = f(std::fabs(a.x() - b.x()) * 0.5 + a.x());
    const float k = f(std::fabs(a.y() - b.y()) + a.y() - e2);
    const float c = f((a.y() - k) / ((a.x() - h) * (a.x() - h)));
    const float last = f(std::max(a.x(), b.x()));
    constexpr double longestSpan = 1e7; // one sample per unit: refuse absurd spans instead of hanging
    if (!(last - std::min(a.x(), b.x()) < longestSpan))
        return {};
    Leg leg;
    for (double i = std::trunc(f(std::min(a.x(), b.x()))); last >= i; i += 1.0) {
        const double y = f(c * (i - h) * (i - h) + k);
        if (std::isfinite(y)) // a vertical leg has no parabola
            leg.emplace_back(i, y);
    }
    if (leg.empty())
        return {};
    return {leg};
}

} // namespace CurveGenerator
