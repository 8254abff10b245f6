#pragma once

#include "animation/AnimationEvent.h"

#include <QMap>
#include <QString>
#include <QVariantMap>

#include <functional>
#include <vector>

class AnimationSource;

// The film as a list of events, one per output frame, built at each start of
// playback and before export. Also the timeline's length and its texts.
class AnimationEventList
{
public:
    explicit AnimationEventList(AnimationSource &source);

    // Builds the list anew. On "can't find next keypoint" the list stays empty and
    // the result is false.
    bool build(bool linear, bool flyIn, double startZoom);

    int32_t count() const { return int32_t(m_events.size()); }
    const std::vector<AnimationEvent> &events() const { return m_events; }
    const PhotoFrame &photo(const AnimationEvent &event) const;
    QVariantMap toVariantMap(const AnimationEvent &event) const;
    // False when index is past the end; `out` is then untouched.
    bool event(uint32_t index, QVariantMap &out) const;
    // The first "mediaPoint" or "start" event in [from, to), else the one at `to`,
    // so that a late tick never skips a photograph's opening or the start.
    bool eventInRange(uint32_t from, uint32_t to, QVariantMap &out) const;

    int32_t pilotSteps() const { return m_pilotSteps; }
    const std::vector<double> &durationPercents() const { return m_durationPercents; }

    // Length of the timeline in frames; -1 until first computed.
    int32_t totalFrames() const { return m_totalFrames; }
    int32_t updateDuration();
    int32_t updateDurationFixed();
    int32_t fixedSeconds = 30;
    // "%1m%2s" at a position 0..1 of the timeline.
    QString durationAt(double position);

    static const QMap<QString, int> &transitionKinds();
    uint32_t transitionKind() const { return m_transitionKind; }
    // Kinds below 4 are taken. Each call is reported by the kind's name.
    bool setTransitionKind(uint32_t kind);
    void setTransitionKindReporter(std::function<void(const QString &name)> reporter);

private:
    AnimationSource &m_source;
    std::vector<AnimationEvent> m_events;
    std::vector<PhotoFrame> m_photos;
    int32_t m_pilotSteps = 0;
    uint32_t m_transitionKind = 1; // "fade"
    int32_t m_totalFrames = -1;
    std::vector<double> m_durationPercents;
    std::function<void(const QString &)> m_transitionReporter;
};
