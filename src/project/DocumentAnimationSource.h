#pragma once

#include "animation/AnimationSource.h"

class PainterPathRenderer_Controller;

// The project document as the animation engine sees it: its path, timing, camera,
// stored view boundary, fly-in switches, full-frame timing and photo pool.
class DocumentAnimationSource : public AnimationSource
{
public:
    explicit DocumentAnimationSource(PainterPathRenderer_Controller &document);

    const PathManager &pathManager() const override;
    AnimationTiming &timing() override;
    const AnimationTiming &timing() const override;
    CameraView cameraView() const override;
    void setCameraView(const CameraView &view) override;
    GeoRect visibleBoundaries() const override;
    FlyInSwitches flyInSwitches() const override;
    bool linearAnimationDurations() const override;
    FullFrameTiming fullFrameTiming() const override;
    QSize photoPoolSize(const QString &file) const override;
    void setAnimationEventCount(int32_t count) override { m_eventCount = count; }

    // The count of the last complete build; 0 before one.
    int32_t animationEventCount() const { return m_eventCount; }

private:
    PainterPathRenderer_Controller &m_document;
    int32_t m_eventCount = 0;
};
