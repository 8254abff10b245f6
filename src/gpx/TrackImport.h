#pragma once

#include <QString>

#include <cstdint>

class Path;
class TrackFile;

// Opens a track file the way the program does: reads it, chooses the item that
// becomes the route, turns it into `outPath` (a thinned fixed track, or an ordinary
// path of few points) and gives the path the item's extent.
class TrackImport
{
public:
    // Target number of samples of a converted track: two minutes of frames.
    static constexpr int32_t fixedDuration = 3600;

    // `aliasing` is the "GpxAliasing" setting: 0 off, 1 auto, 2 default, 3 max.
    static bool read(const QString &fileName, Path &outPath, uint32_t aliasing,
                     int32_t fixedDurationSamples = fixedDuration, TrackFile *file = nullptr);
};
