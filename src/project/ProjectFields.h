#pragma once

#include "path/KeyPoint.h"
#include "path/PathSettings.h"

#include <QString>

#include <cstdint>

// The persistent scalar state of a project, with the defaults of a new project.
// The timing values (fly-in angles and duration, route factor, key point pad) live
// in the document's AnimationTiming, the full-frame picture options in its photo pool.
struct ProjectFields
{
    ProjectFields();

    QString hostName; // the host program, empty when standalone
    QString versionText = QStringLiteral("0.0.0.5");

    int32_t sceneMode = 0;
    QString projectTitle;
    int32_t projectWidth = 1920;
    int32_t projectHeight = 1080;
    int32_t hostWidth = 0;
    int32_t hostHeight = 0;
    int32_t sceneWidth = 0;
    int32_t sceneHeight = 0;
    int32_t pathMode = 0;
    int32_t animationMode = 0;
    int32_t animationFrame = 0;
    QString animationFrameSource;
    QString backgroundMap;
    QString backgroundMapColor = QStringLiteral("#70B5D5");
    bool ignorePauseOnKeyPoint = false;
    bool showKeyPointsOnAnimationPosition = true;
    bool animateKeyPoints = true;
    bool keyPointsLocked = false;
    double currentZoomLevel = 10.0;
    double currentBearing = 0.0;
    double currentTilt = 0.0;

    KeyPoint centerPosition;
    KeyPoint visibleBoundariesTL;
    KeyPoint visibleBoundariesBR;
    KeyPoint pseudoBoundariesTL;
    KeyPoint pseudoBoundariesBR;

    bool showCompass = false;
    bool sendExportToHost = true;

    bool flyInEnabled = false;
    bool flyInRotation = true;
    bool flyInTilt = true;

    bool linearAnimationDurations = true;
    PathSettings pathSettings;
    int32_t pad = 20;

    int32_t fullFrameDuration = 5000;     // ms
    int32_t fullFrameFadeDuration = 500;  // ms
    bool fullFrameFullscreen = true;
    int32_t fullFrameTransitionMode = 0;  // 0 cut, 1 fade, 2 zoom, 3 rotation

    int32_t altitudePresetIndex = 0;
    int32_t altitudeBoardX = -1;
    int32_t altitudeBoardY = -1;
    int32_t altitudeBoardWidth = -1;
    int32_t altitudeBoardHeight = -1;
    int32_t fullFrameX = -1;
    int32_t fullFrameY = -1;
    int32_t fullFrameWidth = -1;
    int32_t fullFrameHeight = -1;

    bool pseudoMapCropMode = false;
    double pseudoMapInitialZoom = 10.0;
    KeyPoint pseudoMapCenter;

    bool fileNameChangedByUser = false;
};

// The map position of a new project.
KeyPoint defaultCenterPosition();
