#include "animation/EventListBuilder.h"

#include "animation/AnimationTiming.h"
#include "animation/DistanceShares.h"
#include "animation/FrameRate.h"
#include "app/Trace.h"
#include "path/PathManager.h"

#include <QUrl>

#include <algorithm>
#include <cmath>

namespace {

const QString imageProviderPrefix = QStringLiteral("image://fullFrameImageProvider/");

QString localPathOf(const QString &file)
{
    const QUrl url = file.startsWith(QLatin1String("file:"), Qt::CaseInsensitive) ? QUrl(file) : QUrl::fromLocalFile(file);
    return url.toLocalFile();
}

}

EventListBuilder::EventListBuilder(const AnimationSource &source) : m_source(source) {}

bool EventListBuilder::build(bool linear, bool flyIn, double startZoom, int32_t timelineFrames, BuiltEvents &out)
{
    // The caller may hand in the last list's storage: clearing keeps its capacity.
    out.events.clear();
    out.photos.clear();
    out.durationPercents.clear();
    out.pilotSteps = 0;
    out.ended = false;
    m_out = &out;
    m_mediaIndex.clear();
    m_overflow = false;

    append(AnimationEvent::Type::Start);
    logTrace(0, QStringLiteral("currentZoomLevel = %f"), m_source.cameraView().zoom);

    bool ok = !flyIn || appendFlyIn(startZoom);
    if (ok)
        ok = walkKeyPoints(linear, timelineFrames);
    if (!ok) {
        out.events.clear();
        out.photos.clear();
        out.pilotSteps = 0;
        out.ended = false;
    }
    m_out = nullptr;
    m_curve = nullptr;
    m_scaledCurve.clear();
    return ok;
}

bool EventListBuilder::appendFlyIn(double startZoom)
{
    const AnimationTiming &timing = m_source.timing();
    const CameraView view = m_source.cameraView();
    const FlyInSwitches switches = m_source.flyInSwitches();
    const int64_t n = int64_t(std::trunc(timing.flyInDuration * FrameRate::framesPerSecond));
    if (!room(std::max<int64_t>(n, 0) + 30))
        return false;

    double zoom = view.zoom;
    const double zoomStep = n > 0 ? (zoom - startZoom) / double(n) : 0.0;
    double bearing = view.bearing;
    double bearingStep = 0.0;
    if (switches.enableRotation) {
        const double rotation = std::trunc(timing.flyInRotation);
        bearing += rotation;
        bearingStep = n > 0 ? rotation / double(n) : 0.0;
    }
    const double targetTilt = (view.tilt != 0.0 || !switches.enableTilt) ? view.tilt : std::trunc(timing.flyInTilt);
    double tilt = targetTilt;
    double tiltStep = 0.0;
    if (switches.enableTilt) {
        tilt = 0.0;
        tiltStep = n > 0 ? targetTilt / double(n) : 0.0;
    }

    for (int64_t k = 1; k <= n; ++k) {
        AnimationEvent &e = append(AnimationEvent::Type::FlyIn);
        e.zoom = k == n ? startZoom : zoom;
        e.bearing = bearing;
        e.tilt = tilt;
        zoom -= zoomStep;
        bearing -= bearingStep;
        tilt += tiltStep;
    }
    // One second of standing still, whatever the fly-in's length.
    for (int k = 0; k < 30; ++k)
        append(AnimationEvent::Type::Pause);
    return true;
}

bool EventListBuilder::walkKeyPoints(bool linear, int32_t timelineFrames)
{
    const PathManager &paths = m_source.pathManager();
    const AnimationTiming &timing = m_source.timing();
    const Path *path = paths.active();
    // The scaled copy equals the path's own samples at scale 1; copying tens of
    // thousands of them is most of a build's time, so that case reads them in place.
    if (path && paths.scale() == 1.0) {
        m_curve = &path->curvePoints;
    } else {
        m_scaledCurve = paths.curvePoints();
        m_curve = &m_scaledCurve;
    }
    const std::vector<KeyPoint> keys = paths.keyPoints();
    if (keys.empty())
        return true;
    const std::vector<CurvePoint> &curve = *m_curve;

    for (size_t i = 0; i < path->mediaPoints.size(); ++i)
        m_mediaIndex.insert(path->mediaPoints[i].id, i);
    std::vector<double> &shares = m_out->durationPercents;
    if (linear && curve.size() >= 2)
        shares = distanceShares(curve);
    m_out->events.reserve(m_out->events.size() + estimatedEvents(keys, linear ? &shares : nullptr, timelineFrames));

    uint32_t p = 0;
    std::vector<size_t> mediaSamples;
    for (size_t i = 0; i < keys.size(); ++i) {
        const KeyPoint &key = keys[i];
        const bool last = i + 1 == keys.size();
        const uint32_t cKpId = last ? 0 : key.id;

        PilotProperties fallback; // width 120.0, flags 2
        const PilotProperties *avatar = avatarOf(key.id);
        const int32_t s = m_stepping.interval(avatar ? *avatar : fallback);

        int64_t pause = key.properties.enabled ? timing.pauseFrames(key.properties.durationPause) : 0;
        int64_t leg = timing.legFrames(key.properties.durationToNextKP);
        if (last)
            pause = std::max<int64_t>(pause, timing.keyPointAnimationFrames);
        else if (linear && i < shares.size())
            leg = int64_t(std::trunc(timelineFrames * shares[i]));

        if (!appendRun(AnimationEvent::Type::Pause, pause, cKpId, p, s))
            return false;

        if (last) {
            if (!curve.empty())
                buildMedia(curve.back().correspondingMediaPoint, p, s);
            if (m_overflow)
                return false;
            break;
        }

        const uint32_t nextId = keys[i + 1].id;
        mediaSamples.clear();
        uint32_t q = p;
        for (size_t j = p; j < curve.size(); ++j) {
            if (curve[j].correspondingMediaPoint != 0)
                mediaSamples.push_back(j);
            if (curve[j].correspondingKeyPoint == nextId) {
                q = uint32_t(j);
                break;
            }
        }
        if (q == p) {
            logTrace(3, QStringLiteral("can't find next keypoint"));
            return false;
        }

        // A leg of no frames makes an endless step: one "step", then the one at q.
        leg = std::max<int64_t>(leg, 0);
        if (!room(leg + 1))
            return false;
        const double c = double(q - p) / double(leg);
        double t = p;
        size_t nextMedia = 0;
        while (double(q) > t) {
            AnimationEvent &e = append(AnimationEvent::Type::Step);
            e.cKpId = cKpId;
            e.pathPosition = p;
            e.stepAnimatedPilot = AvatarStepping::steps(m_out->events.size() - 1, s);
            m_out->pilotSteps += e.stepAnimatedPilot ? 1 : 0;
            t += c;
            while (nextMedia < mediaSamples.size() && t > double(mediaSamples[nextMedia]) && double(q) >= t) {
                buildMedia(curve[mediaSamples[nextMedia]].correspondingMediaPoint, p, s);
                if (m_overflow)
                    return false;
                ++nextMedia;
            }
            p = t < double(q) ? uint32_t(t) : q;
        }
        if (!appendRun(AnimationEvent::Type::Step, 1, cKpId, q, s))
            return false;
        p = q;
    }

    if (!room(1))
        return false;
    AnimationEvent &end = append(AnimationEvent::Type::End);
    end.pathPosition = p;
    m_out->ended = true;
    return true;
}

size_t EventListBuilder::estimatedEvents(const std::vector<KeyPoint> &keys, const std::vector<double> *shares,
                                         int32_t timelineFrames) const
{
    const AnimationTiming &timing = m_source.timing();
    int64_t count = 1;
    for (size_t i = 0; i < keys.size(); ++i) {
        const KeyPointProperties &p = keys[i].properties;
        // The closing step of a leg, and one more that rounding of the step size can add.
        count += std::max(0, timing.pauseFrames(p.durationPause)) + 2;
        if (shares && i < shares->size())
            count += std::max<int64_t>(0, int64_t(timelineFrames * (*shares)[i]));
        else if (i + 1 < keys.size())
            count += std::max(0, timing.legFrames(p.durationToNextKP));
    }
    count += timing.keyPointAnimationFrames;
    const FullFrameTiming fullFrame = m_source.fullFrameTiming();
    const int64_t fade = std::max(0, timing.pauseFrames(fullFrame.fadeDuration));
    const int64_t perPhoto = std::max<int64_t>(fade, timing.pauseFrames(fullFrame.duration) - fade);
    for (const MediaPoint &media : m_source.pathManager().active()->mediaPoints)
        count += media.properties.imageSources.size() * perPhoto + fade;
    return size_t(std::min<int64_t>(count, int64_t(maxEvents)));
}

bool EventListBuilder::buildMedia(uint32_t mediaPointId, uint32_t position, int32_t stepping)
{
    const MediaPoint *media = mediaPointId != 0 ? mediaPointById(mediaPointId) : nullptr;
    if (!media)
        return false;
    const AnimationTiming &timing = m_source.timing();
    const FullFrameTiming fullFrame = m_source.fullFrameTiming();
    const int32_t fade = timing.pauseFrames(fullFrame.fadeDuration);
    const int64_t hold = int64_t(timing.pauseFrames(fullFrame.duration)) - 2 * int64_t(fade);
    const auto &files = media->properties.imageSources;
    if (files.isEmpty())
        return true;

    const size_t first = m_out->events.size();
    uint32_t photo = 0;
    for (int j = 0; j < files.size(); ++j) {
        photo = addPhoto(files[j].path, files[j].orientation);
        const auto transition = j == 0 ? AnimationEvent::Transition::FadeIn : AnimationEvent::Transition::CrossFade;
        if (!appendFade(transition, fade, photo, position) || !appendRun(AnimationEvent::Type::Pause, hold, 0, position, stepping))
            return false;
    }
    if (!appendFade(AnimationEvent::Transition::FadeOut, fade, photo, position))
        return false;

    std::vector<AnimationEvent> &events = m_out->events;
    if (events.size() > first) {
        events[first].mpePosition = AnimationEvent::MpePosition::FirstEvent;
        events.back().mpePosition = AnimationEvent::MpePosition::LastEvent;
    }
    return true;
}

bool EventListBuilder::appendFade(AnimationEvent::Transition transition, int32_t fade, uint32_t photo, uint32_t position)
{
    if (fade <= 0)
        return true;
    if (!room(fade))
        return false;
    const double step = 1.0 / fade;
    const bool fadingOut = transition == AnimationEvent::Transition::FadeOut;
    for (int32_t k = 1; k <= fade; ++k) {
        AnimationEvent &e = append(AnimationEvent::Type::MediaPoint);
        e.transition = transition;
        e.photo = photo;
        e.pathPosition = position;
        e.opacity = (fadingOut ? fade - k : k) * step;
        ++m_out->pilotSteps;
    }
    return true;
}

bool EventListBuilder::appendRun(AnimationEvent::Type type, int64_t count, uint32_t cKpId, uint32_t position,
                                 int32_t stepping)
{
    if (count <= 0)
        return true;
    if (!room(count))
        return false;
    for (int64_t k = 0; k < count; ++k) {
        const bool steps = AvatarStepping::steps(m_out->events.size(), stepping);
        AnimationEvent &e = append(type);
        e.cKpId = cKpId;
        e.pathPosition = position;
        e.stepAnimatedPilot = steps;
        m_out->pilotSteps += steps ? 1 : 0;
    }
    return true;
}

AnimationEvent &EventListBuilder::append(AnimationEvent::Type type)
{
    std::vector<AnimationEvent> &events = m_out->events;
    events.emplace_back();
    AnimationEvent &e = events.back();
    e.index = uint32_t(events.size() - 1);
    e.type = type;
    return e;
}

bool EventListBuilder::room(int64_t count)
{
    if (int64_t(m_out->events.size()) + count <= int64_t(maxEvents))
        return true;
    m_overflow = true;
    logTrace(3, QStringLiteral("AnimationEventList::build: the film would exceed %d frames; durations are damaged"),
             int(maxEvents));
    return false;
}

uint32_t EventListBuilder::addPhoto(const QString &file, int32_t orientation)
{
    PhotoFrame photo;
    photo.file = file;
    photo.fileUrl = imageProviderPrefix + localPathOf(file);
    photo.orientation = orientation;
    const QSize size = m_source.photoPoolSize(file);
    if (size.isValid()) {
        photo.width = size.width();
        photo.height = size.height();
    }
    if (orientation == 90 || orientation == 270)
        std::swap(photo.width, photo.height);
    m_out->photos.push_back(photo);
    return uint32_t(m_out->photos.size() - 1);
}

const PilotProperties *EventListBuilder::avatarOf(uint32_t keyPointId) const
{
    const Path *path = m_source.pathManager().active();
    if (!path)
        return nullptr;
    for (const PathSegment &segment : path->pathSegments) {
        if (segment.keyPointId == keyPointId)
            return &segment.pilot;
    }
    return nullptr;
}

const MediaPoint *EventListBuilder::mediaPointById(uint32_t id) const
{
    const Path *path = m_source.pathManager().active();
    const auto found = m_mediaIndex.constFind(id);
    if (!path || found == m_mediaIndex.constEnd() || found.value() >= path->mediaPoints.size())
        return nullptr;
    return &path->mediaPoints[found.value()];
}
