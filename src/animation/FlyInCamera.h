#pragma once

#include "animation/AnimationSource.h"

class VisibleRegionProvider;

// The user's camera around playback: saved at the start, brought back after it,
// and the zoom from which a fly-in starts.
class FlyInCamera
{
public:
    // `map` may be null: the project's stored view boundary then stands in.
    explicit FlyInCamera(AnimationSource &source, const VisibleRegionProvider *map = nullptr);

    // The view saved by the last saveView, one for the whole process.
    static const CameraView &savedView();

    void saveView();
    // Zoom, centre (its longitude and latitude only), bearing and tilt go back.
    void restoreView();
    // Saves the view; with a fly-in, zooms the document's camera out to the
    // route's extent. Returns the zoom the fly-in ends at, the user's own.
    double prepareFlyIn();
    // Sets the document's zoom so that a route of this extent in degrees fits
    // the map's visible rectangle.
    void setZoomForExtent(double width, double height);

    GeoRect visibleRegion() const;

private:
    AnimationSource &m_source;
    const VisibleRegionProvider *m_map;
};
