#pragma once

#include <QObject>
#include <QVariantMap>

#include <cstdint>
#include <functional>

class AnimationEventList;
class AnimationSource;

// Plays the event list against the wall clock with a chain of single-shot timers,
// one tick pending at a time. The position follows the elapsed time, so a slow
// frame drops events; photographs and the start are never dropped. At the end of
// the list the last event stays a second and the list plays again, until stopped.
class PlaybackLoop : public QObject
{
    Q_OBJECT

public:
    static constexpr int startDelay = 1;
    static constexpr int stepDelay = 3;
    static constexpr int mediaStepDelay = 25;
    static constexpr int loopDelay = 1000;
    // Milliseconds of preview per event: the frame rate taken as milliseconds, which
    // makes the preview a tenth shorter than the film on purpose.
    static constexpr double millisecondsPerEvent = 30.0;

    PlaybackLoop(AnimationEventList &events, AnimationSource &source, QObject *parent = nullptr);

    // Milliseconds from any fixed origin; a steady clock unless a test hands in its own.
    void setClock(std::function<qint64()> clock) { m_clock = std::move(clock); }

    // Arms the chain: the first event plays after startDelay.
    void start();
    // The chain shows the last event at its next tick and ends.
    void stop() { m_manualAnimationActive = false; }
    bool manualAnimationActive() const { return m_manualAnimationActive; }

    uint32_t position() const { return m_animationEventPostion; }
    const QVariantMap &animationEvent() const { return m_animationEvent; }
    // The share 0..1 of the list played.
    double share() const;
    // Jumps to a share of the list; a running chain goes on from there.
    void seek(double share);

    // The frame-accurate step of the export: the event at the position, then one on.
    void stepAnimation();
    void seekToEnd();

signals:
    void animationEventChanged();
    // The event belongs to another key point than the one before.
    void activeKeyPointReached(int kpId);
    // seekToEnd has shown the last event.
    void endShown();

private:
    void startAnimationManually();
    void stepAnimationManually();
    void schedule(int delay, void (PlaybackLoop::*tick)());
    void apply(const QVariantMap &next, const QVariantMap &previous);
    qint64 elapsed() const { return m_clock() - m_origin; }
    qint64 total() const;

    AnimationEventList &m_events;
    AnimationSource &m_source;
    std::function<qint64()> m_clock;
    qint64 m_origin = 0;
    QVariantMap m_animationEvent;
    uint32_t m_animationEventPostion = 0;
    // Ticks of an older chain find another generation and end quietly.
    uint32_t m_generation = 0;
    bool m_manualAnimationActive = false;
    bool m_lastEventWasMedia = false;
};
