#include "animation/PlaybackCamera.h"

#include "animation/AnimationEventList.h"

#include <algorithm>

namespace {

QVariantMap view(double longitude, double latitude, double zoom, double bearing, double tilt)
{
    return {{QStringLiteral("centerLongitude"), longitude},
            {QStringLiteral("centerLatitude"), latitude},
            {QStringLiteral("zoomLevel"), zoom},
            {QStringLiteral("bearing"), bearing},
            {QStringLiteral("tilt"), tilt}};
}

}

void PlaybackCamera::prepare(const CameraView &userView, const AnimationEventList &events,
                             double routeCentreLongitude, double routeCentreLatitude)
{
    m_user = userView;
    m_bearingAfterFlyIn = userView.bearing;
    m_tiltAfterFlyIn = userView.tilt;
    m_flyInCount = 0;
    m_routeLongitude = routeCentreLongitude;
    m_routeLatitude = routeCentreLatitude;
    const std::vector<AnimationEvent> &list = events.events();
    for (const AnimationEvent &event : list) {
        if (event.type != AnimationEvent::Type::FlyIn)
            continue;
        if (m_flyInCount++ == 0)
            m_firstFlyIn = event.index;
        m_bearingAfterFlyIn = event.bearing;
        m_tiltAfterFlyIn = event.tilt;
    }
}

QVariantMap PlaybackCamera::viewFor(const QVariantMap &event, const RoutePose &pose, CameraMode mode) const
{
    const bool onAvatar = follows(mode) && pose.valid;
    const double endLongitude = onAvatar ? pose.longitude : m_user.centre.longitude;
    const double endLatitude = onAvatar ? pose.latitude : m_user.centre.latitude;
    if (event.value(QStringLiteral("type")).toString() != QLatin1String("flyin"))
        return view(endLongitude, endLatitude, m_user.zoom, m_bearingAfterFlyIn, m_tiltAfterFlyIn);

    const uint32_t index = event.value(QStringLiteral("index")).toUInt();
    const double progress =
        m_flyInCount > 0 ? std::clamp(double(index - m_firstFlyIn + 1) / double(m_flyInCount), 0.0, 1.0) : 1.0;
    return view(m_routeLongitude + (endLongitude - m_routeLongitude) * progress,
                m_routeLatitude + (endLatitude - m_routeLatitude) * progress,
                event.value(QStringLiteral("zoom")).toDouble(), event.value(QStringLiteral("bearing")).toDouble(),
                event.value(QStringLiteral("tilt")).toDouble());
}
