#include "path/TrackThinning.h"

#include "path/CurveGenerator.h"
#include "path/GeoDistance.h"

#include <functional>

namespace {

double distanceBetween(const QPointF &a, const QPointF &b)
{
    return geoDistance(a.y(), a.x(), b.y(), b.x());
}

// Walks the samples of the legs and keeps those that lie at least `threshold`
// from the last kept one; the starts of fixed legs are always kept. Legs are
// made one at a time, so the samples of the whole track are never held at once.
class TrackThinner
{
public:
    TrackThinner(std::vector<CurvePoint> &curve, const std::vector<KeyPoint> &keys, double threshold)
        : m_curve(curve), m_keys(keys), m_threshold(threshold)
    {
    }

    // `fixedAtStart`: the first sample of this leg must be kept.
    void walkLeg(size_t l, bool fixedAtStart, const std::function<void(size_t l, bool first)> &onTake)
    {
        const QPointF a(m_keys[l].x, m_keys[l].y), b(m_keys[l + 1].x, m_keys[l + 1].y);
        const CurveGenerator::StraightLeg leg(a, b);
        const bool lastLeg = l + 2 == m_keys.size();
        if (lastLeg || !leg.stepsAreSmall() || leg.splineSize() == 0) {
            CurveGenerator::Leg samples = leg.samples();
            if (lastLeg)
                samples.back() = b;
            for (size_t j = 0; j < samples.size(); ++j) {
                const bool take = m_curve.empty() || distanceBetween(last(), samples[j]) >= m_threshold
                               || (j == 0 && fixedAtStart) || (lastLeg && j + 1 == samples.size() && m_fixedAtEnd);
                if (take)
                    append(samples[j], l, j == 0, onTake);
            }
            return;
        }
        // Short legs are straight runs: the distance from the last kept sample
        // first falls, then rises along them, so the next sample to keep is
        // found by bisection instead of by measuring all of them.
        const int n = leg.splineSize();
        int j = 0;
        if (m_curve.empty() || fixedAtStart || distanceBetween(last(), leg.sample(0)) >= m_threshold) {
            append(leg.sample(0), l, true, onTake);
            j = 1;
        }
        while (j < n) {
            const QPointF from = last();
            if (distanceBetween(from, leg.sample(j)) >= m_threshold) {
                append(leg.sample(j), l, false, onTake);
                ++j;
                continue;
            }
            if (distanceBetween(from, leg.sample(n - 1)) < m_threshold)
                break;
            int near = j, far = n - 1; // near is inside the threshold, far outside
            while (far - near > 1) {
                const int mid = near + (far - near) / 2;
                (distanceBetween(from, leg.sample(mid)) >= m_threshold ? far : near) = mid;
            }
            append(leg.sample(far), l, false, onTake);
            j = far + 1;
        }
    }

    void setFixedAtEnd(bool fixed) { m_fixedAtEnd = fixed; }

private:
    QPointF last() const { return QPointF(m_curve.back().x, m_curve.back().y); }

    void append(const QPointF &p, size_t l, bool first, const std::function<void(size_t, bool)> &onTake)
    {
        onTake(l, first);
        const double z = l < m_keys.size() ? m_keys[l].z : m_keys.front().z;
        m_curve.emplace_back(p.x(), p.y(), z);
    }

    std::vector<CurvePoint> &m_curve;
    const std::vector<KeyPoint> &m_keys;
    const double m_threshold;
    bool m_fixedAtEnd = false;
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

