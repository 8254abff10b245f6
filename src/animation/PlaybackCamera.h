#pragma once

#include "animation/AnimationSource.h"
#include "animation/RoutePose.h"

#include <QVariantMap>

#include <cstdint>

class AnimationEventList;

// How the camera follows the film.
enum class CameraMode : int32_t { Static = 0, KeepCentered = 1, CropByCircle = 2, CropByRectangle = 3 };

// The map's view for each event of a playback: the fly-in's own zoom, bearing and
// tilt, gliding from the middle of the route to where the film begins; then the
// user's zoom with the fly-in's last bearing and tilt, over the user's centre or
// over the avatar.
class PlaybackCamera
{
public:
    // `userView` is the view saved before the fly-in zoomed out; `routeCentre` the
    // middle of the route's extent.
    void prepare(const CameraView &userView, const AnimationEventList &events, double routeCentreLongitude,
                 double routeCentreLatitude);

    // The keys of the map view's location settings: "centerLongitude",
    // "centerLatitude", "zoomLevel", "bearing", "tilt".
    QVariantMap viewFor(const QVariantMap &event, const RoutePose &pose, CameraMode mode) const;

    static bool follows(CameraMode mode) { return mode != CameraMode::Static; }

private:
    CameraView m_user;
    double m_bearingAfterFlyIn = 0.0;
    double m_tiltAfterFlyIn = 0.0;
    uint32_t m_firstFlyIn = 0;
    uint32_t m_flyInCount = 0;
    double m_routeLongitude = 0.0;
    double m_routeLatitude = 0.0;
};
