#pragma once

#include "path/CurvePoint.h"

#include <vector>

// For linear timing: each leg's share of the route's length. A leg runs from a
// curve point that names a key point to the next such point; the result has one
// share per leg, the part behind the last key point not counted.
std::vector<double> distanceShares(const std::vector<CurvePoint> &curve);
