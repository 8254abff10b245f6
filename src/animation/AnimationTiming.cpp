#include "animation/AnimationTiming.h"

#include "animation/FrameRate.h"

#include <algorithm>
#include <cmath>

AnimationTiming::AnimationTiming()
    : totalFrames(int32_t(FrameRate::framesPerSecond * 30))
    , frameDuration(FrameRate::frameDuration)
    , keyPointAnimationFrames(int32_t(std::trunc(keyPointAnimationDuration * 0.5 * FrameRate::framesPerSecond)))
{
}

int32_t AnimationTiming::limitSeconds(uint32_t index)
{
    static const int32_t seconds[] = {60, 300, 600, 1800, 3600};
    return index < 5 ? seconds[index] : 300;
}

QString AnimationTiming::formatDuration(int32_t frames)
{
    if (frames == 0)
        return QStringLiteral("00m01s");
    const double rate = FrameRate::framesPerSecond;
    const int64_t minutes = int64_t(std::trunc(frames / (rate * 60)));
    int64_t seconds = int64_t(std::trunc(std::trunc(frames - rate * 60 * double(minutes)) / rate));
    if (minutes == 0 && seconds < 1)
        seconds = 1;
    return QStringLiteral("%1m%2s").arg(minutes, 2, 10, QLatin1Char('0')).arg(seconds, 2, 10, QLatin1Char('0'));
}

int32_t AnimationTiming::limitFrames(int32_t frames)
{
    const double rate = FrameRate::framesPerSecond;
    const double longest = limitSeconds(maxDurationIndex) * rate;
    const double wanted = std::max(frames * stretchLimit, std::trunc(rate * 120.0));
    totalFrames = int32_t(std::trunc(std::min(longest, wanted)));
    return totalFrames;
}

void AnimationTiming::updateStretch(int32_t frames)
{
    durationText = formatDuration(int32_t(std::trunc(totalFrames * durationFactor)));
    const double r = totalFrames == 0 ? 0.0 : double(frames) / totalFrames;
    stretch = (totalFrames == 0 || r == 0.0) ? 0.0 : durationFactor / r;
}

void AnimationTiming::setFrames(int32_t frames)
{
    limitFrames(frames);
    if (durationFactor < 0)
        durationFactor = 1.0 / stretchLimit;
    updateStretch(frames);
}

void AnimationTiming::setFramesFixed(int32_t frames, int32_t seconds)
{
    const int32_t t = limitFrames(frames);
    // Capped by the frame count rather than by 1, as the timeline has always done.
    durationFactor = t == 0 ? 0.0 : std::min(seconds * FrameRate::framesPerSecond / t, double(t));
    updateStretch(frames);
}

void AnimationTiming::setDurationFactor(double value)
{
    durationFactor = value;
    durationText = formatDuration(int32_t(std::trunc(totalFrames * value)));
}

void AnimationTiming::setFromOldPercent(double percent, int32_t frames)
{
    limitFrames(frames);
    const double base = 1.0 / stretchLimit;
    if (percent > 0)
        durationFactor = (percent / 100 * 9 + 1) * base;
    else if (percent < 0)
        durationFactor = base * (-1 / percent);
    else
        durationFactor = base;
}

int32_t AnimationTiming::pauseFrames(double ms) const
{
    return FrameRate::framesFromMs(ms);
}

int32_t AnimationTiming::legFrames(double ms) const
{
    return FrameRate::framesFromMs(ms, stretch);
}

int32_t AnimationTiming::scaledFrames(int32_t frames) const
{
    return int32_t(std::trunc(frames * stretch));
}

bool AnimationTiming::setKeyPointAnimationDuration(int32_t value)
{
    if (value == keyPointAnimationDuration)
        return false;
    keyPointAnimationDuration = value;
    keyPointAnimationFrames = int32_t(std::trunc(value * 0.5 * FrameRate::framesPerSecond));
    return true;
}
