#pragma once

#include <cmath>
#include <cstdint>

namespace FrameRate {

constexpr double framesPerSecond = 30.0;
constexpr double frameDuration = 1000.0 / framesPerSecond; // milliseconds

// Frames of a duration in milliseconds, times `factor`. Multiplying by the rate
// instead of dividing by the frame duration keeps whole multiples exact:
// 500 ms is 15 frames, not 14.999...
inline int32_t framesFromMs(double ms, double factor = 1.0)
{
    return static_cast<int32_t>(std::trunc(ms * framesPerSecond / 1000.0 * factor));
}

}
