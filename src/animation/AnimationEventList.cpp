#include "animation/AnimationEventList.h"

#include "animation/AnimationSource.h"
#include "animation/AnimationTiming.h"
#include "animation/EventListBuilder.h"
#include "animation/FrameRate.h"
#include "app/Trace.h"

#include <cmath>

AnimationEventList::AnimationEventList(AnimationSource &source) : m_source(source) {}

bool AnimationEventList::build(bool linear, bool flyIn, double startZoom)
{
    if (m_totalFrames < 0)
        updateDuration();
    BuiltEvents built;
    built.events.swap(m_events); // reused: a rebuild before each playback needs no fresh pages
    const bool ok = EventListBuilder(m_source).build(linear, flyIn, startZoom, m_totalFrames, built);
    m_events = std::move(built.events);
    m_photos = std::move(built.photos);
    m_pilotSteps = built.pilotSteps;
    m_durationPercents = std::move(built.durationPercents);
    if (built.ended)
        m_source.setAnimationEventCount(count());
    return ok;
}

const PhotoFrame &AnimationEventList::photo(const AnimationEvent &event) const
{
    static const PhotoFrame none;
    return event.type == AnimationEvent::Type::MediaPoint && event.photo < m_photos.size() ? m_photos[event.photo] : none;
}

QVariantMap AnimationEventList::toVariantMap(const AnimationEvent &event) const
{
    return event.toVariantMap(photo(event));
}

bool AnimationEventList::event(uint32_t index, QVariantMap &out) const
{
    if (index >= m_events.size())
        return false;
    out = toVariantMap(m_events[index]);
    return true;
}

bool AnimationEventList::eventInRange(uint32_t from, uint32_t to, QVariantMap &out) const
{
    if (to >= m_events.size())
        return false;
    for (uint32_t i = from; i < to; ++i) {
        const AnimationEvent::Type type = m_events[i].type;
        if (type == AnimationEvent::Type::MediaPoint || type == AnimationEvent::Type::Start) {
            out = toVariantMap(m_events[i]);
            return true;
        }
    }
    out = toVariantMap(m_events[to]);
    return true;
}

int32_t AnimationEventList::updateDuration()
{
    AnimationTiming &timing = m_source.timing();
    const int32_t natural = m_source.naturalFrames();
    timing.setFrames(natural);
    m_totalFrames = timing.scaledFrames(natural);
    return m_totalFrames;
}

int32_t AnimationEventList::updateDurationFixed()
{
    AnimationTiming &timing = m_source.timing();
    const int32_t natural = m_source.naturalFrames();
    timing.setFramesFixed(natural, fixedSeconds);
    m_totalFrames = timing.scaledFrames(natural);
    return m_totalFrames;
}

QString AnimationEventList::durationAt(double position)
{
    if (m_totalFrames < 0)
        updateDuration();
    if (position == 0.0)
        return QStringLiteral("00m00s");
    const double rate = FrameRate::framesPerSecond;
    const double frames = m_totalFrames * position;
    const double minutes = std::trunc(frames / (rate * 60));
    const double seconds = std::trunc((frames - rate * 60 * minutes) / rate);
    return QStringLiteral("%1m%2s")
        .arg(qint64(minutes), 2, 10, QLatin1Char('0'))
        .arg(qint64(seconds), 2, 10, QLatin1Char('0'));
}

const QMap<QString, int> &AnimationEventList::transitionKinds()
{
    static const QMap<QString, int> kinds{{QStringLiteral("cut"), 0},
                                          {QStringLiteral("fade"), 1},
                                          {QStringLiteral("zoom"), 2},
                                          {QStringLiteral("rotate"), 3}};
    return kinds;
}

bool AnimationEventList::setTransitionKind(uint32_t kind)
{
    const bool taken = kind < 4;
    if (taken)
        m_transitionKind = kind;
    const QString name = taken ? transitionKinds().key(int(kind)) : QStringLiteral("unkown");
    logTrace(0, QStringLiteral("AnimationEventList::setTransitionKind %s"), name);
    if (m_transitionReporter)
        m_transitionReporter(name);
    return taken;
}

void AnimationEventList::setTransitionKindReporter(std::function<void(const QString &)> reporter)
{
    m_transitionReporter = std::move(reporter);
}
