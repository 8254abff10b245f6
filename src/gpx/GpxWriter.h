#pragma once

#include "path/CurvePoint.h"

#include <QString>

#include <vector>

class Path;

// Writes a route as one GPX "rte" that the track reader takes back as a file of
// our own: creator "Tourlet", private bounds, titled samples as named points.
class GpxWriter
{
public:
    // `samples` are the route's samples in order; `path` gives the bounds and the
    // key points' titles. The file is replaced only by a complete new one: false,
    // with the reason in `error`, when it could not be written whole.
    static bool write(const QString &fileName, const std::vector<CurvePoint> &samples, const Path &path,
                      QString *error = nullptr);
};
