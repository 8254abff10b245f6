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

// No leg between valid coordinates spans more units than this; a damaged file's
// point far beyond them must not make millions of samples.
constexpr double widestLeg = 720.0;

int sampleCount(const QPointF &a, const QPointF &b)
{
    const double dLon = std::trunc(std::fabs(a.x() - b.x()));
    const double dLat = std::trunc(std::fabs(a.y() - b.y()));
    const double span = std::max(dLon, dLat);
    return static_cast<int>(span < widestLeg ? span : widestLeg) + baseSamples;
}

QPointF unwrapLon(QPointF p);

void finishLeg(Leg &leg, const QPointF &a, const QPointF &b, bool wrapped)
{
    leg = fillGaps(leg, a, b);
    if (wrapped) {
        for (QPointF &p : leg)
            p = unwrapLon(p);
    }
    if (leg.empty())
        leg.push_back(a);
}

QPointF unwrapLon(QPointF p)
{
    if (p.x() > 180.0)
        p.setX(p.x() - 180.0 - 180.0);
    else if (p.x() < -180.0)
        p.setX(p.x() + 360.0);
    return p;
}

// One leg of the straight or smooth generator; prev/next are the neighbouring
// key points, or null where an outer point stands in.
Leg makeLeg(const QPointF &a, const QPointF &bRaw, const QPointF *prev, const QPointF *next)
{
    if (!prev && !next)
        return StraightLeg(a, bRaw).samples();
    const WrappedLon wb = wrapAgainst(a.x(), bRaw.x());
    const QPointF b(wb.lon, bRaw.y());
    bool wrapped = wb.wrapped;

    QPointF p0 = prev ? QPointF(wrapAgainst(a.x(), prev->x()).lon, prev->y()) : outerPoint(a, b);
    QPointF p3 = outerPoint(b, a);
    if (next) {
        const WrappedLon wn = wrapAgainst(b.x(), next->x());
        p3 = QPointF(wn.lon, next->y());
        if (!wn.wrapped)
            wrapped = false;
    }
    Leg leg;
    const int steps = sampleCount(a, b);
    leg.reserve(size_t(steps) + 2);
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

Spline::Spline(const QPointF &p0, const QPointF &p1, const QPointF &p2, const QPointF &p3, int steps)
    : m_p0(p0), m_p1(p1), m_p2(p2), m_p3(p3)
{
    auto knot = [](const QPointF &u, const QPointF &v) {
        const double dx = u.x() - v.x(), dy = u.y() - v.y();
        return std::pow(std::sqrt(dx * dx + dy * dy), knotExponent);
    };
    m_t1 = knot(p0, p1);
    m_t2 = m_t1 + knot(p1, p2);
    m_t3 = m_t2 + knot(p2, p3);
    if (!(m_t1 < m_t2) || steps <= 0)
        return;
    m_steps = steps;
    m_step = (m_t2 - m_t1) / steps;
}

QPointF Spline::at(int j) const
{
    // Counting the steps instead of adding them up keeps the sample count at
    // exactly `steps`, whatever the rounding of the sum.
    const double t = m_t1 + j * m_step;
    const double t1 = m_t1, t2 = m_t2, t3 = m_t3;
    // A neighbouring key point on the same spot as an end of the leg gives a knot
    // interval of 0; the blend of two equal points is that point, not 0 / 0.
    const QPointF a1 = t1 > 0 ? ((t1 - t) / t1) * m_p0 + (t / t1) * m_p1 : m_p1;
    const QPointF a2 = ((t2 - t) / (t2 - t1)) * m_p1 + ((t - t1) / (t2 - t1)) * m_p2;
    const QPointF a3 = t3 > t2 ? ((t3 - t) / (t3 - t2)) * m_p2 + ((t - t2) / (t3 - t2)) * m_p3 : m_p2;
    const QPointF b1 = ((t2 - t) / t2) * a1 + (t / t2) * a2;
    const QPointF b2 = ((t3 - t) / (t3 - t1)) * a2 + ((t - t1) / (t3 - t1)) * a3;
    return ((t2 - t) / (t2 - t1)) * b1 + ((t - t1) / (t2 - t1)) * b2;
}

void appendSpline(Leg &out, const QPointF &p0, const QPointF &p1, const QPointF &p2, const QPointF &p3, int steps)
{
    const Spline spline(p0, p1, p2, p3, steps);
    for (int j = 0; j < spline.size(); ++j)
        out.push_back(spline.at(j));
}

StraightLeg::StraightLeg(const QPointF &a, const QPointF &bRaw)
    : m_a(a)
    , m_b(wrapAgainst(a.x(), bRaw.x()).lon, bRaw.y())
    , m_wrapped(wrapAgainst(a.x(), bRaw.x()).wrapped)
    , m_stepsAreSmall(std::fabs(a.x() - m_b.x()) < 1.0 && std::fabs(a.y() - m_b.y()) < 1.0)
    , m_spline(outerPoint(m_a, m_b), m_a, m_b, outerPoint(m_b, m_a), sampleCount(m_a, m_b))
{
}

Leg StraightLeg::samples() const
{
    Leg leg;
    leg.reserve(size_t(m_spline.size()) + 2);
    for (int j = 0; j < m_spline.size(); ++j)
        leg.push_back(m_spline.at(j));
    finishLeg(leg, m_a, m_b, m_wrapped);
    return leg;
}

QPointF StraightLeg::sample(int j) const
{
    const QPointF p = m_spline.at(j);
    return m_wrapped ? unwrapLon(p) : p;
}

Leg fillGaps(const Leg &samples, const QPointF &a, const QPointF &b)
{
    if (samples.empty())
        return {};
    // Far off the globe the steps are rounding noise of huge numbers: nothing to fill.
    for (const double v : {a.x(), a.y(), b.x(), b.y()}) {
        if (!(std::fabs(v) <= widestLeg))
            return samples;
    }
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
