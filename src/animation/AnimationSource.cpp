#include "animation/AnimationSource.h"

#include "animation/FrameRate.h"
#include "path/PathManager.h"

#include <algorithm>
#include <climits>

int32_t AnimationSource::naturalFrames() const
{
    const Path *path = pathManager().active();
    if (!path || path->keyPoints.empty())
        return 0;
    int64_t frames = 0;
    for (size_t i = 0; i + 1 < path->keyPoints.size(); ++i)
        frames += FrameRate::framesFromMs(path->keyPoints[i].properties.durationToNextKP);
    return int32_t(std::max<int64_t>(INT32_MIN, std::min<int64_t>(INT32_MAX, frames)));
}
