#include "animation/PlaybackLoop.h"

#include "animation/AnimationEventList.h"
#include "animation/AnimationSource.h"
#include "app/Trace.h"
#include "path/PathManager.h"

#include <QElapsedTimer>
#include <QTimer>

#include <algorithm>
#include <cmath>

namespace {

qint64 steadyMilliseconds()
{
    static QElapsedTimer clock;
    if (!clock.isValid())
        clock.start();
    return clock.elapsed();
}

const QString mediaPointType = QStringLiteral("mediaPoint");

}

PlaybackLoop::PlaybackLoop(AnimationEventList &events, AnimationSource &source, QObject *parent)
    : QObject(parent), m_events(events), m_source(source), m_clock(steadyMilliseconds)
{
}

qint64 PlaybackLoop::total() const
{
    return qint64(std::trunc(m_events.count() * millisecondsPerEvent));
}

double PlaybackLoop::share() const
{
    const int32_t count = m_events.count();
    return count > 1 ? std::min(1.0, double(m_animationEventPostion) / double(count - 1)) : 0.0;
}

void PlaybackLoop::schedule(int delay, void (PlaybackLoop::*tick)())
{
    const uint32_t generation = m_generation;
    QTimer::singleShot(delay, this, [this, generation, tick] {
        if (generation == m_generation)
            (this->*tick)();
    });
}

void PlaybackLoop::start()
{
    ++m_generation;
    m_manualAnimationActive = true;
    schedule(startDelay, &PlaybackLoop::startAnimationManually);
}

void PlaybackLoop::startAnimationManually()
{
    const std::vector<KeyPoint> keys = m_source.pathManager().keyPoints();
    if (keys.empty())
        return;
    emit activeKeyPointReached(int(keys.front().id));
    m_animationEventPostion = 0;
    m_origin = m_clock();
    schedule(startDelay, &PlaybackLoop::stepAnimationManually);
}

void PlaybackLoop::stepAnimationManually()
{
    if (!m_manualAnimationActive) {
        seekToEnd();
        return;
    }
    const qint64 passed = elapsed();
    const qint64 length = total();
    if (passed >= length) {
        seekToEnd();
        schedule(loopDelay, &PlaybackLoop::startAnimationManually);
        return;
    }
    const uint32_t old = m_animationEventPostion;
    const uint32_t next = m_lastEventWasMedia ? old + 1
                                              : uint32_t(std::trunc(m_events.count() * (double(passed) / double(length))));
    m_animationEventPostion = next;
    if (next != old || next == 0) {
        logTrace(0, QStringLiteral("stepAnimationManually: %d of %d is over - m_animationEventPostion = %d"), int(passed),
                 int(length), int(next));
        const QVariantMap previous = m_animationEvent;
        QVariantMap current;
        if (m_events.eventInRange(old, next, current)) {
            m_animationEvent = current;
            apply(current, previous);
        } else {
            m_animationEvent = previous;
        }
        m_lastEventWasMedia = m_animationEvent.value(QStringLiteral("type")).toString() == mediaPointType;
        emit animationEventChanged();
    }
    schedule(m_lastEventWasMedia ? mediaStepDelay : stepDelay, &PlaybackLoop::stepAnimationManually);
}

void PlaybackLoop::apply(const QVariantMap &next, const QVariantMap &previous)
{
    const uint32_t kpId = next.value(QStringLiteral("cKpId")).toUInt();
    if (kpId != 0 && kpId != previous.value(QStringLiteral("cKpId")).toUInt())
        emit activeKeyPointReached(int(kpId));
}

void PlaybackLoop::stepAnimation()
{
    const QVariantMap previous = m_animationEvent;
    QVariantMap current;
    if (m_events.event(m_animationEventPostion, current)) {
        m_animationEvent = current;
        apply(current, previous);
    }
    ++m_animationEventPostion;
    emit animationEventChanged();
    if (m_animationEventPostion >= uint32_t(std::max(0, m_events.count())))
        m_animationEventPostion = 0;
}

void PlaybackLoop::seekToEnd()
{
    const QVariantMap previous = m_animationEvent;
    const int32_t count = m_events.count();
    QVariantMap last;
    if (count > 0 && m_events.event(uint32_t(count - 1), last)) {
        m_animationEvent = last;
        apply(last, previous);
    }
    m_animationEventPostion = uint32_t(std::max(0, count - 1));
    emit animationEventChanged();
    emit endShown();
}

void PlaybackLoop::seek(double to)
{
    const int32_t count = m_events.count();
    if (count <= 0)
        return;
    to = std::clamp(to, 0.0, 1.0);
    m_animationEventPostion = uint32_t(std::trunc(to * (count - 1)));
    m_origin = m_clock() - qint64(std::trunc(total() * to));
    m_lastEventWasMedia = false;
}
