#pragma once

#include <cstdint>

// The export state the document carries for the window and the interface; the
// exporter keeps it up to date while it produces frames.
struct ExportProperties
{
    bool exportActive = false;       // frames are being produced
    int32_t requiredFrameNumber = 0; // frame the timeline stands on
    int32_t totalFrames = 0;         // frames of the film being exported

    // Share of the film done, 0..1; 0 while the total is unknown.
    double position() const
    {
        if (totalFrames <= 0)
            return 0.0;
        const double share = static_cast<double>(requiredFrameNumber) / totalFrames;
        return share < 0.0 ? 0.0 : share > 1.0 ? 1.0 : share;
    }
};
