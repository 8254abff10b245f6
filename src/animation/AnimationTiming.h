#pragma once

#include <QString>

#include <cstdint>

// Turns milliseconds and the user's duration choice into frames, and holds the
// length of the timeline. Part of the project document.
class AnimationTiming
{
public:
    uint32_t maxDurationIndex = 1;
    int32_t reserved[2] = {20, 0};
    int32_t totalFrames;
    int32_t keyPointAnimationDuration = 2;
    double frameDuration;
    double durationFactor = -1.0; // share of the timeline; below 0 when not chosen yet
    QString durationText;
    double stretch = 1.0;
    int32_t keyPointAnimationFrames;
    double flyInRotation = 60.0;
    double flyInTilt = 54.0;
    int32_t flyInDuration = 5; // seconds
    double stretchLimit = 15.0;

    AnimationTiming();

    // Longest film for each "MaxAnimationDuration" index; any other index gives 300 s.
    static int32_t limitSeconds(uint32_t maxDurationIndex);
    static QString formatDuration(int32_t frames);

    int32_t limitFrames(int32_t frames);
    void setFrames(int32_t frames);
    void setFramesFixed(int32_t frames, int32_t seconds);
    void setDurationFactor(double value);
    void setFromOldPercent(double percent, int32_t frames);
    int32_t pauseFrames(double ms) const;
    int32_t legFrames(double ms) const;
    int32_t scaledFrames(int32_t frames) const;
    bool setKeyPointAnimationDuration(int32_t value);

private:
    void updateStretch(int32_t frames);
};
