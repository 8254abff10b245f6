#pragma once

#include "animation/AnimationEvent.h"
#include "animation/AnimationSource.h"
#include "animation/AvatarStepping.h"

#include <QHash>

#include <vector>

class MediaPoint;

// What one build produced.
struct BuiltEvents
{
    std::vector<AnimationEvent> events;
    std::vector<PhotoFrame> photos;
    std::vector<double> durationPercents;
    int32_t pilotSteps = 0;
    bool ended = false; // an "end" event closes the list
};

// Makes the per-frame events of one film from the document's path, timing and
// camera. Used once per build.
class EventListBuilder
{
public:
    // No film of sane durations comes near this; damaged durations stop here
    // instead of exhausting memory. Four hours at 30 frames per second.
    static constexpr size_t maxEvents = 4 * 3600 * 30;

    explicit EventListBuilder(const AnimationSource &source);

    // `timelineFrames` is the event list's length of the timeline, which the
    // linear mode shares out. False when the list had to be given up; it is then empty.
    bool build(bool linear, bool flyIn, double startZoom, int32_t timelineFrames, BuiltEvents &out);

private:
    bool appendFlyIn(double startZoom);
    bool walkKeyPoints(bool linear, int32_t timelineFrames);
    // Room for the events of the key point walk, so that the list grows once.
    size_t estimatedEvents(const std::vector<KeyPoint> &keys, const std::vector<double> *shares, int32_t timelineFrames) const;
    // False when the media point doesn't exist, or the list is full.
    bool buildMedia(uint32_t mediaPointId, uint32_t position, int32_t stepping);
    bool appendFade(AnimationEvent::Transition transition, int32_t fade, uint32_t photo, uint32_t position);
    bool appendRun(AnimationEvent::Type type, int64_t count, uint32_t cKpId, uint32_t position, int32_t stepping);
    AnimationEvent &append(AnimationEvent::Type type);
    bool room(int64_t count);
    uint32_t addPhoto(const QString &file, int32_t orientation);
    const PilotProperties *avatarOf(uint32_t keyPointId) const;
    const MediaPoint *mediaPointById(uint32_t id) const;

    const AnimationSource &m_source;
    BuiltEvents *m_out = nullptr;
    const std::vector<CurvePoint> *m_curve = nullptr;
    std::vector<CurvePoint> m_scaledCurve;
    AvatarStepping m_stepping;
    QHash<uint32_t, size_t> m_mediaIndex;
    bool m_overflow = false;
};
