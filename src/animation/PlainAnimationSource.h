#pragma once

#include "animation/AnimationSource.h"
#include "animation/AnimationTiming.h"
#include "path/PathManager.h"

#include <QHash>

// An AnimationSource that holds every value itself, with the project's defaults:
// for tools and for code that has a path but no project document.
class PlainAnimationSource : public AnimationSource
{
public:
    PlainAnimationSource();

    PathManager paths;
    AnimationTiming animationTiming;
    CameraView camera;
    GeoRect boundaries; // the stored view boundary
    FlyInSwitches flyIn;
    bool linear = true;
    FullFrameTiming fullFrame;
    QHash<QString, QSize> photoPool;
    int32_t eventCount = 0;

    const PathManager &pathManager() const override { return paths; }
    AnimationTiming &timing() override { return animationTiming; }
    const AnimationTiming &timing() const override { return animationTiming; }
    CameraView cameraView() const override { return camera; }
    void setCameraView(const CameraView &view) override { camera = view; }
    GeoRect visibleBoundaries() const override { return boundaries; }
    FlyInSwitches flyInSwitches() const override { return flyIn; }
    bool linearAnimationDurations() const override { return linear; }
    FullFrameTiming fullFrameTiming() const override { return fullFrame; }
    QSize photoPoolSize(const QString &file) const override { return photoPool.value(file); }
    void setAnimationEventCount(int32_t count) override { eventCount = count; }
};
