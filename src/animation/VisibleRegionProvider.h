#pragma once

#include "animation/AnimationSource.h"

// The map's view as it is now. The map controller implements it; without one the
// project's stored view boundary is used.
class VisibleRegionProvider
{
public:
    virtual ~VisibleRegionProvider() = default;
    // False when the map can't tell yet.
    virtual bool visibleRegion(GeoRect &region) const = 0;
};
