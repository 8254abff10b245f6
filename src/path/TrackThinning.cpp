#include "path/TrackThinning.h"

#include "path/CurveGenerator.h"
#include "path/GeoDistance.h"
#include "app/Trace.h"

#include <limits>

#include <algorithm>
#include <cmath>

#include <QtMath>

namespace {

// Tells whether points lie at least `threshold` metres from one place. Close
// points are measured by a short series of the haversine term, far ones and
// those near the threshold by the term itself; a decision within rounding of
// the threshold is left to the distance in metres, computed as everywhere else.
class ThresholdTest
{
public:
    explicit ThresholdTest(double threshold)
        : m_threshold(threshold), m_term(GeoDistanceFrom::metresToTerm(threshold)), m_from(0.0, 0.0)
    {
    }

    double thresholdTerm() const { return m_term; }
    void setFrom(const QPointF &from)
    {
        m_from = GeoDistanceFrom(from.y(), from.x());
        m_lat = from.y();
        m_lon = from.x();
        m_cosLat = std::cos(qDegreesToRadians(m_lat));
        m_sinLat = std::sin(qDegreesToRadians(m_lat));
        m_seriesValid = m_from.valid() && std::fabs(m_lat) < 80.0;
    }

    // `term` receives the haversine term, a measure that grows with the distance.
    bool reaches(const QPointF &p, double &term) const
    {
        if (seriesTerm(p, term)) {
            if (term > m_term * (1 + 1e-7))
                return true;
            if (term < m_term * (1 - 1e-7))
                return false;
        }
        term = m_from.term(p.y(), p.x());
        if (term > m_term * (1 + 1e-9))
            return true;
        if (term < m_term * (1 - 1e-9))
            return false;
        return GeoDistanceFrom::termToMetres(term) >= m_threshold;
    }
    bool reaches(const QPointF &p) const
    {
        double term;
        return reaches(p, term);
    }

private:
    // The term by Taylor series for points within about half a degree, where
    // its relative error stays below 1e-8; false elsewhere.
    bool seriesTerm(const QPointF &p, double &term) const
    {
        const double dLat = qDegreesToRadians(p.y() - m_lat);
        const double dLon = qDegreesToRadians(p.x() - m_lon);
        if (!m_seriesValid || std::fabs(dLat) > 1e-2 || std::fabs(dLon) > 1e-2 || std::fabs(p.x()) > 180.0)
            return false;
        const double h = dLat / 2, g = dLon / 2;
        const double sinH = h * (1 - h * h / 6), sinG = g * (1 - g * g / 6);
        const double cosLat2 = m_cosLat * (1 - dLat * dLat / 2) - m_sinLat * dLat * (1 - dLat * dLat / 6);
        term = sinH * sinH + m_cosLat * cosLat2 * sinG * sinG;
        return true;
    }

    double m_threshold;
    double m_term;
    GeoDistanceFrom m_from;
    double m_lat = 0.0, m_lon = 0.0, m_cosLat = 1.0, m_sinLat = 0.0;
    bool m_seriesValid = false;
};

// Walks the samples of the legs and keeps those that lie at least `threshold`
// from the last kept one; the starts of fixed legs are always kept. Legs are
// made one at a time, so the samples of the whole track are never held at once.
template<typename Points>
class TrackThinner
{
public:
    TrackThinner(std::vector<CurvePoint> &curve, const Points &keys, double threshold)
        : m_curve(curve), m_keys(keys), m_test(threshold)
    {
    }

    // `fixedAtStart`: the first sample of this leg must be kept.
    template<typename OnTake>
    void walkLeg(size_t l, bool fixedAtStart, OnTake &&onTake)
    {
        const QPointF a(trackpoint::x(m_keys[l]), trackpoint::y(m_keys[l]));
        const QPointF b(trackpoint::x(m_keys[l + 1]), trackpoint::y(m_keys[l + 1]));
        const CurveGenerator::StraightLeg leg(a, b);
        const bool lastLeg = l + 2 == size_t(m_keys.size());
        if (lastLeg || !leg.stepsAreSmall() || leg.splineSize() == 0) {
            CurveGenerator::Leg samples = leg.samples();
            if (lastLeg)
                samples.back() = b;
            for (size_t j = 0; j < samples.size(); ++j) {
                const bool take = m_curve.empty() || m_test.reaches(samples[j]) || (j == 0 && fixedAtStart)
                               || (lastLeg && j + 1 == samples.size() && m_fixedAtEnd);
                if (take)
                    append(samples[j], l, j == 0, onTake);
            }
            return;
        }
        // Short legs are straight runs: the distance from the last kept sample
        // first falls, then rises along them, so the next sample to keep is
        // searched between one inside and one outside the threshold.
        const int n = leg.splineSize();
        int j = 0;
        bool fromOnLeg = false; // the last kept sample is sample(j - 1) of this leg
        if (m_curve.empty() || fixedAtStart) {
            append(leg.sample(0), l, true, onTake);
            j = 1;
            fromOnLeg = true;
        }
        while (j < n) {
            int near = j - 1;
            double nearTerm = 0.0, farTerm;
            if (!fromOnLeg) {
                if (m_test.reaches(leg.sample(j), nearTerm)) {
                    append(leg.sample(j), l, j == 0, onTake);
                    ++j;
                    fromOnLeg = true;
                    continue;
                }
                near = j;
            }
            // From a kept sample of this leg the distance only grows along it.
            if (!m_test.reaches(leg.sample(n - 1), farTerm))
                break;
            const int crossing = searchCrossing(leg, near, nearTerm, n - 1, farTerm);
            append(leg.sample(crossing), l, false, onTake);
            j = crossing + 1;
            fromOnLeg = true;
        }
    }

    void setFixedAtEnd(bool fixed) { m_fixedAtEnd = fixed; }

private:
    // The first sample in (near, far] that reaches the threshold. Near the
    // crossing the distance grows about linearly with the index, so the guess
    // interpolates the square root of the term; a guess that doesn't halve the
    // bracket is followed by a plain halving.
    int searchCrossing(const CurveGenerator::StraightLeg &leg, int near, double nearTerm, int far, double farTerm) const
    {
        bool interpolate = true;
        while (far - near > 1) {
            int mid = near + (far - near) / 2;
            if (interpolate) {
                const double lo = std::sqrt(nearTerm), hi = std::sqrt(farTerm);
                const double guess = near + (std::sqrt(m_test.thresholdTerm()) - lo) / (hi - lo) * (far - near);
                if (std::isfinite(guess))
                    mid = std::clamp(int(std::ceil(std::clamp(guess, double(near), double(far)))), near + 1, far - 1);
            }
            const int before = far - near;
            double term;
            if (m_test.reaches(leg.sample(mid), term)) {
                far = mid;
                farTerm = term;
            } else {
                near = mid;
                nearTerm = term;
            }
            interpolate = 2 * (far - near) <= before;
        }
        return far;
    }

    template<typename OnTake>
    void append(const QPointF &p, size_t l, bool first, OnTake &onTake)
    {
        onTake(l, first);
        const double z = trackpoint::z(l < size_t(m_keys.size()) ? m_keys[l] : m_keys.front());
        m_curve.emplace_back(p.x(), p.y(), z);
        m_test.setFrom(p);
    }

    std::vector<CurvePoint> &m_curve;
    const Points &m_keys;
    ThresholdTest m_test;
    bool m_fixedAtEnd = false;
};

} // namespace

template<typename Points>
std::vector<FixedPlace> thinTrack(const Points &keyPoints, double threshold, std::vector<CurvePoint> &curvePoints)
{
    const size_t count = size_t(keyPoints.size());
    std::vector<FixedPlace> fixed;
    for (size_t i = 0; i < count; ++i) {
        if (i == 0 || i + 1 == count || trackpoint::titled(keyPoints[i]))
            fixed.push_back({i, i});
    }
    curvePoints.clear();
    if (count < 2)
        return fixed;
    // A track is seldom thinned to more samples than it has points.
    curvePoints.reserve(count + 1);
    const size_t legs = count - 1;
    // Fixed entries are in the order of the key points, so one cursor finds them.
    size_t cursor = 0;
    auto fixedAtLegStart = [&](size_t l) {
        while (cursor < fixed.size() && (fixed[cursor].placed || fixed[cursor].index < l))
            ++cursor;
        return cursor < fixed.size() && fixed[cursor].index == l && !fixed[cursor].placed;
    };
    auto onTake = [&](size_t l, bool first) {
        if (first && fixedAtLegStart(l)) {
            fixed[cursor].index = curvePoints.size();
            fixed[cursor].placed = true;
        }
    };

    TrackThinner<Points> thinner(curvePoints, keyPoints, threshold);
    for (size_t l = 0; l < legs; ++l) {
        if (l + 1 == legs) {
            thinner.setFixedAtEnd(true);
            // The end of the last leg is where the last key point goes.
            FixedPlace &end = fixed.back();
            thinner.walkLeg(l, fixedAtLegStart(l) && cursor > 0, onTake);
            if (!end.placed && end.index == legs) {
                end.index = curvePoints.size() - 1;
                end.placed = true;
            }
            break;
        }
        thinner.walkLeg(l, fixedAtLegStart(l) && cursor > 0, onTake);
    }
    return fixed;
}


template<typename Points>
double gpxThresholdOf(Points &points, uint32_t aliasing, int32_t fixedDuration)
{
    if (aliasing == 0)
        return std::numeric_limits<double>::max();
    const bool big = aliasing == 1 && points.size() > 10000;
    logTrace(0, QStringLiteral("m_GPXFixedDuration %d"), fixedDuration);

    // Repeated positions go; a titled repeat replaces the point before it.
    double complete = 0.0;
    double minDistance = std::numeric_limits<double>::max();
    int count = 0;
    // Read through a const view: shared point lists are copied only when a repeat
    // has to go.
    const Points &view = points;
    size_t kept = view.empty() ? 0 : 1;
    for (size_t i = 1; i < size_t(view.size()); ++i) {
        const auto &previous = view[kept - 1];
        const auto &point = view[i];
        const double px = trackpoint::x(point), py = trackpoint::y(point);
        if (px == trackpoint::x(previous) && py == trackpoint::y(previous)) {
            if (trackpoint::titled(point))
                points[kept - 1] = std::move(points[i]);
            continue;
        }
        const double d = geoDistance(py, px, trackpoint::y(previous), trackpoint::x(previous));
        complete += d;
        ++count;
        minDistance = std::min(minDistance, d);
        if (kept != i)
            points[kept] = std::move(points[i]);
        ++kept;
    }
    if (kept != size_t(view.size()))
        points.resize(decltype(points.size())(kept));

    const double byCount = complete / count;
    const double byTarget = complete / fixedDuration;
    logTrace(0, QStringLiteral("fMinDistance: %f"), minDistance);
    logTrace(0, QStringLiteral("fDistanceComplete: %f"), complete);
    logTrace(0, QStringLiteral("fDistanceAverage: %f"), byCount);
    if (aliasing == 2 || big)
        return std::min(byTarget, byCount);
    return std::min(byTarget, minDistance);
}

template double gpxThresholdOf(std::vector<KeyPoint> &, uint32_t, int32_t);
template double gpxThresholdOf(TrackPoints &, uint32_t, int32_t);
template std::vector<FixedPlace> thinTrack(const std::vector<KeyPoint> &, double, std::vector<CurvePoint> &);
template std::vector<FixedPlace> thinTrack(const TrackPoints &, double, std::vector<CurvePoint> &);
