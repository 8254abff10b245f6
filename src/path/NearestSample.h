#pragma once

#include "path/CurvePoint.h"

#include <vector>

// Finds the sample of a curve nearest to a place with the result of a scan over
// all samples: the first of the smallest haversine terms, and only one below a
// limit. Consecutive samples of a route lie close together, so boxes around runs
// of them, and boxes around runs of boxes, let a search skip most of the curve.
// The samples must not move or change in number while this is used.
class NearestSample
{
public:
    explicit NearestSample(const std::vector<CurvePoint> &samples);

    // The index of the nearest sample to (lat, lon) whose term lies below
    // `limitTerm`, or -1.
    int find(double lat, double lon, double limitTerm) const;

private:
    struct Box
    {
        double south, north, west, east;
        double minCos;   // of the latitudes inside
        bool hasInvalid; // a sample outside the valid range, whose term is 0
    };
    struct Search;

    double lowerBound(const Box &box, double lat, double lon, double cosLat) const;
    void visit(Search &search, size_t level, size_t index) const;

    const std::vector<CurvePoint> &m_samples;
    std::vector<std::vector<Box>> m_levels; // m_levels[0] over samples, the last one a single box
};
