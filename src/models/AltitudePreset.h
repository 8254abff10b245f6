#pragma once

#include <QString>
#include <QVariantMap>

#include <cstdint>

class ProjectController;
class QProjectController;

// The look of the altitude profile board. Stored as a ".tmprs" file of its own
// (empty prefix) or inside a project under sections that start with "altprs.".
struct AltitudePreset
{
    QString version; // the writing program's version text; empty means no preset stored
    uint32_t presetVersion = 0xFFFFFFFFu;

    QString background;
    int32_t borderWidth = 0;
    QString borderColor;
    QString boardColor;
    double opacity = 0.0;
    int32_t boardMargin = 0;
    int32_t radius = 0;

    bool heightScale = false;
    bool distanceScale = false;
    int32_t distanceScaleSize = 0;
    int32_t heightScaleSize = 0;

    QString increaseColor;
    QString decreaseColor;
    double lineOpacity = 0.0;
    int32_t lineWidth = 0;
    QString scaleColor;
    QString scaleFontColor;
    double scaleOpacity = 0.0;

    QString peakColor;
    QString peakBackgroundColor;
    int32_t peakSize = 0;
    double peakTransparency = 0.0;

    QString graphGradientStartColor;
    QString graphGradientMiddleColor;
    QString graphGradientEndColor;
    bool graphUseGradient = false;
    QString graphLineGradientStartColor;
    QString graphLineGradientMiddleColor;
    QString graphLineGradientEndColor;
    bool graphUseLineGradient = false;
    QString graphLineColor;

    bool zeroBasedAltitude = false;

    // The record the active theme starts from: a dark opaque board.
    static AltitudePreset activeThemeDefaults();

    // The theme as the interface sees it: one entry per stored key, header excluded.
    QVariantMap toMap() const;
    // Takes the keys that are present; others keep their value.
    void fromMap(const QVariantMap &map);

    bool operator==(const AltitudePreset &other) const;
    bool operator!=(const AltitudePreset &other) const { return !(*this == other); }
};

// The section prefix of a preset inside a project file.
QString altitudePresetPrefix();

// Reads the preset under `prefix` from the file. False when the file doesn't open
// as a project/preset file (the container then stays open, as it always has for
// presets), when no preset is stored under the prefix, or when a number in it is
// damaged; `preset` changes only on success.
bool loadAltitudePreset(ProjectController &store, const QString &fileName, const QString &prefix, AltitudePreset &preset);

// Writes the preset under `prefix`. A project file (".zkgeo" in the name) is
// opened for adding, so that it keeps its content; any other file is created anew.
// False when the file could not be written whole; it then stays as it was.
bool saveAltitudePreset(QProjectController &store, const QString &fileName, const QString &prefix, const AltitudePreset &preset);

// The keys of the preset under `prefix`, into a container already open for writing.
bool writeAltitudePreset(ProjectController &store, const QString &prefix, const AltitudePreset &preset);
