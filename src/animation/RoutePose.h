#pragma once

#include "path/CurvePoint.h"

#include <cstdint>
#include <vector>

// Where the avatar stands on the route and where it heads.
struct RoutePose
{
    bool valid = false;
    double longitude = 0.0;
    double latitude = 0.0;
    double heading = 0.0; // degrees clockwise from north
};

// The pose at sample `index`. The heading runs from the sample about half `span`
// metres behind to the one about half `span` ahead, so that the jitter of a
// recorded track doesn't shake the avatar; near an end the span shortens.
RoutePose routePoseAt(const std::vector<CurvePoint> &curve, uint32_t index, double span);

// A span that suits the route: a small share of its length, within sane bounds.
double headingSpanFor(const std::vector<CurvePoint> &curve);
