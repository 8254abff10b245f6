#include "path/TrackThinning.h"

#include "path/CurveGenerator.h"
#include "path/GeoDistance.h"

#include <algorithm>
#include <cmath>

namespace {

// Tells whether points lie at least `threshold` metres from one place. The
// haversine term decides alone unless it is within rounding of the threshold's
// term; there the distance in metres is computed as everywhere else.
class ThresholdTest
{
public:
    explicit ThresholdTest(double threshold)
        : m_threshold(threshold), m_term(GeoDistanceFrom::metresToTerm(threshold)), m_from(0.0, 0.0)
    {
    }

    double thresholdTerm() const { return m_term; }
    void setFrom(const QPointF &from) { m_from = GeoDistanceFrom(from.y(), from.x()); }

    // `term` receives the haversine term, a measure that grows with the distance.
    bool reaches(const QPointF &p, double &term) const
    {
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
    double m_threshold;
    double m_term;
    GeoDistanceFrom m_from;
};

// Walks the samples of the legs and keeps those that lie at least `threshold`
// from the last kept one; the starts of fixed legs are always kept. Legs are
// made one at a time, so the samples of the whole track are never held at once.
class TrackThinner
{
public:
    TrackThinner(std::vector<CurvePoint> &curve, const std::vector<KeyPoint> &keys, double threshold)
        : m_curve(curve), m_keys(keys), m_test(threshold)
    {
    }

    // `fixedAtStart`: the first sample of this leg must be kept.
    template<typename OnTake>
    void walkLeg(size_t l, bool fixedAtStart, OnTake &&onTake)
    {
        const QPointF a(m_keys[l].x, m_keys[l].y), b(m_keys[l + 1].x, m_keys[l + 1].y);
        const CurveGenerator::StraightLeg leg(a, b);
        const bool lastLeg = l + 2 == m_keys.size();
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
        if (m_curve.empty() || fixedAtStart || m_test.reaches(leg.sample(0))) {
            append(leg.sample(0), l, true, onTake);
            j = 1;
        }
        while (j < n) {
            double nearTerm, farTerm;
            if (m_test.reaches(leg.sample(j), nearTerm)) {
                append(leg.sample(j), l, false, onTake);
                ++j;
                continue;
            }
            if (!m_test.reaches(leg.sample(n - 1), farTerm))
                break;
            append(leg.sample(searchCrossing(leg, j, nearTerm, n - 1, farTerm)), l, false, onTake);
            j = m_lastIndex + 1;
        }
    }

    void setFixedAtEnd(bool fixed) { m_fixedAtEnd = fixed; }

private:
    // The first sample in (near, far] that reaches the threshold. Near the
    // crossing the distance grows about linearly with the index, so the guess
    // interpolates the square root of the term; a guess that doesn't halve the
    // bracket is followed by a plain halving.
    int searchCrossing(const CurveGenerator::StraightLeg &leg, int near, double nearTerm, int far, double farTerm)
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
        m_lastIndex = far;
        return far;
    }

    template<typename OnTake>
    void append(const QPointF &p, size_t l, bool first, OnTake &onTake)
    {
        onTake(l, first);
        const double z = l < m_keys.size() ? m_keys[l].z : m_keys.front().z;
        m_curve.emplace_back(p.x(), p.y(), z);
        m_test.setFrom(p);
    }

    std::vector<CurvePoint> &m_curve;
    const std::vector<KeyPoint> &m_keys;
    ThresholdTest m_test;
    bool m_fixedAtEnd = false;
    int m_lastIndex = 0;
};

} // namespace

std::vector<FixedKeyPoint> thinTrack(const std::vector<KeyPoint> &keyPoints, double threshold, std::vector<CurvePoint> &curvePoints)
{
    std::vector<FixedKeyPoint> fixed;
    for (size_t i = 0; i < keyPoints.size(); ++i) {
        if (i == 0 || i + 1 == keyPoints.size() || !keyPoints[i].title().isEmpty())
            fixed.push_back({keyPoints[i], i});
    }
    curvePoints.clear();
    // A track is seldom thinned to more samples than it has points.
    curvePoints.reserve(keyPoints.size() + 1);
    const size_t legs = keyPoints.size() - 1;
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

    TrackThinner thinner(curvePoints, keyPoints, threshold);
    for (size_t l = 0; l < legs; ++l) {
        if (l + 1 == legs) {
            thinner.setFixedAtEnd(true);
            // The end of the last leg is where the last key point goes.
            FixedKeyPoint &end = fixed.back();
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

