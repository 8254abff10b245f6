#pragma once

#include "path/KeyPoint.h"

#include <QSize>
#include <QString>

#include <cmath>
#include <cstdint>

class AnimationTiming;
class PathManager;

// The camera the user prepared on the map.
struct CameraView
{
    double zoom = 10.0;
    KeyPoint centre; // only longitude and latitude count
    double bearing = 0.0;
    double tilt = 0.0;
};

// A map rectangle in degrees, from its top-left and bottom-right corners.
struct GeoRect
{
    double left = 0.0;   // longitude
    double top = 0.0;    // latitude
    double right = 0.0;  // longitude
    double bottom = 0.0; // latitude

    double width() const { return std::abs(right - left); }
    double height() const { return std::abs(top - bottom); }
};

// What the fly-in may do besides zooming.
struct FlyInSwitches
{
    bool enabled = false; // the document's `flyInAnimation`
    bool enableRotation = true;
    bool enableTilt = true;
};

// How long a photograph stands on the full frame, and its fades, in milliseconds.
struct FullFrameTiming
{
    int32_t duration = 5000;
    int32_t fadeDuration = 500;
};

// The part of the project document that the animation engine reads and, for the
// camera, writes back. The document implements it; tools and tests can use
// PlainAnimationSource.
class AnimationSource
{
public:
    virtual ~AnimationSource() = default;

    virtual const PathManager &pathManager() const = 0;
    virtual AnimationTiming &timing() = 0;
    virtual const AnimationTiming &timing() const = 0;

    virtual CameraView cameraView() const = 0;
    virtual void setCameraView(const CameraView &view) = 0;
    // The view rectangle stored with the project ("visibleBoundariesTL"/"BR"): it
    // stands in for the map's own while no map can tell.
    virtual GeoRect visibleBoundaries() const = 0;

    virtual FlyInSwitches flyInSwitches() const = 0;
    virtual bool linearAnimationDurations() const = 0;
    virtual FullFrameTiming fullFrameTiming() const = 0;
    // Picture size that the photo pool holds for this file; an invalid size when
    // the pool doesn't have it.
    virtual QSize photoPoolSize(const QString &file) const = 0;

    // Told after every complete build, for the timeline.
    virtual void setAnimationEventCount(int32_t count) = 0;

    // Frames of all legs at their own durations, without pauses.
    int32_t naturalFrames() const;
};
