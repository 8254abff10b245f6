#include "models/AltitudePreset.h"

#include "app/Trace.h"
#include "project/QProjectController.h"
#include "project/ValueParsers.h"

#include <variant>

namespace {

using Member = std::variant<QString AltitudePreset::*, int32_t AltitudePreset::*, uint32_t AltitudePreset::*,
                            double AltitudePreset::*, bool AltitudePreset::*>;

struct PresetKey
{
    const char *section;
    const char *key;
    Member member;
};

// The stored keys in the order of writing and reading.
const PresetKey presetKeys[] = {
    {"Header", "version", &AltitudePreset::version},
    {"Header", "preset_version", &AltitudePreset::presetVersion},
    {"base", "background", &AltitudePreset::background},
    {"base", "borderWidth", &AltitudePreset::borderWidth},
    {"base", "borderColor", &AltitudePreset::borderColor},
    {"base", "boardColor", &AltitudePreset::boardColor},
    {"base", "opacity", &AltitudePreset::opacity},
    {"base", "boardMargin", &AltitudePreset::boardMargin},
    {"base", "radius", &AltitudePreset::radius},
    {"scale", "heightScale", &AltitudePreset::heightScale},
    {"scale", "distanceScale", &AltitudePreset::distanceScale},
    {"scale", "distanceScaleSize", &AltitudePreset::distanceScaleSize},
    {"scale", "heightScaleSize", &AltitudePreset::heightScaleSize},
    {"graph", "increaseColor", &AltitudePreset::increaseColor},
    {"graph", "decreaseColor", &AltitudePreset::decreaseColor},
    {"graph", "lineOpacity", &AltitudePreset::lineOpacity},
    {"graph", "lineWidth", &AltitudePreset::lineWidth},
    {"graph", "scaleColor", &AltitudePreset::scaleColor},
    {"graph", "scaleFontColor", &AltitudePreset::scaleFontColor},
    {"graph", "scaleOpacity", &AltitudePreset::scaleOpacity},
    {"peak", "peakColor", &AltitudePreset::peakColor},
    {"peak", "peakBackgroundColor", &AltitudePreset::peakBackgroundColor},
    {"peak", "peakSize", &AltitudePreset::peakSize},
    {"peak", "peakTransparency", &AltitudePreset::peakTransparency},
    {"graph", "graphGradientStartColor", &AltitudePreset::graphGradientStartColor},
    {"graph", "graphGradientMiddleColor", &AltitudePreset::graphGradientMiddleColor},
    {"graph", "graphGradientEndColor", &AltitudePreset::graphGradientEndColor},
    {"graph", "graphUseGradient", &AltitudePreset::graphUseGradient},
    {"graph", "graphLineGradientStartColor", &AltitudePreset::graphLineGradientStartColor},
    {"graph", "graphLineGradientMiddleColor", &AltitudePreset::graphLineGradientMiddleColor},
    {"graph", "graphLineGradientEndColor", &AltitudePreset::graphLineGradientEndColor},
    {"graph", "graphUseLineGradient", &AltitudePreset::graphUseLineGradient},
    {"graph", "graphLineColor", &AltitudePreset::graphLineColor},
    {"base", "zeroBasedAltitude", &AltitudePreset::zeroBasedAltitude},
};

bool isHeader(const PresetKey &k)
{
    return qstrcmp(k.section, "Header") == 0;
}

struct Formatter
{
    const AltitudePreset &preset;
    QString operator()(QString AltitudePreset::*m) const { return preset.*m; }
    QString operator()(int32_t AltitudePreset::*m) const { return formatInt(preset.*m); }
    QString operator()(uint32_t AltitudePreset::*m) const { return formatUInt(preset.*m); }
    QString operator()(double AltitudePreset::*m) const { return formatDouble(preset.*m); }
    QString operator()(bool AltitudePreset::*m) const { return formatBool(preset.*m); }
};

struct Parser
{
    AltitudePreset &preset;
    const QString &text;
    void operator()(QString AltitudePreset::*m) const { initString(text, preset.*m); }
    void operator()(int32_t AltitudePreset::*m) const { initInt(text, preset.*m); }
    void operator()(uint32_t AltitudePreset::*m) const { initUInt(text, preset.*m); }
    void operator()(double AltitudePreset::*m) const { initDouble(text, preset.*m); }
    void operator()(bool AltitudePreset::*m) const { initBool(text, preset.*m); }
};

struct ToVariant
{
    const AltitudePreset &preset;
    template <typename T>
    QVariant operator()(T AltitudePreset::*m) const
    {
        return QVariant::fromValue(preset.*m);
    }
};

struct FromVariant
{
    AltitudePreset &preset;
    const QVariant &value;
    void operator()(QString AltitudePreset::*m) const { preset.*m = value.toString(); }
    void operator()(int32_t AltitudePreset::*m) const { preset.*m = value.toInt(); }
    void operator()(uint32_t AltitudePreset::*m) const { preset.*m = value.toUInt(); }
    void operator()(double AltitudePreset::*m) const { preset.*m = value.toDouble(); }
    void operator()(bool AltitudePreset::*m) const { preset.*m = value.toBool(); }
};

struct Equal
{
    const AltitudePreset &a;
    const AltitudePreset &b;
    template <typename T>
    bool operator()(T AltitudePreset::*m) const
    {
        return a.*m == b.*m;
    }
};

QString sectionName(const QString &prefix, const char *section)
{
    return prefix + QLatin1String(section);
}

} // namespace

QString altitudePresetPrefix()
{
    return QStringLiteral("altprs.");
}

AltitudePreset AltitudePreset::activeThemeDefaults()
{
    AltitudePreset preset;
    preset.boardColor = QStringLiteral("#0D0D0D");
    preset.opacity = 1.0;
    preset.boardMargin = 5;
    preset.distanceScaleSize = 30;
    preset.heightScaleSize = 60;
    return preset;
}

QVariantMap AltitudePreset::toMap() const
{
    QVariantMap map;
    for (const PresetKey &k : presetKeys) {
        if (!isHeader(k))
            map.insert(QLatin1String(k.key), std::visit(ToVariant{*this}, k.member));
    }
    return map;
}

void AltitudePreset::fromMap(const QVariantMap &map)
{
    for (const PresetKey &k : presetKeys) {
        const auto found = map.constFind(QLatin1String(k.key));
        if (!isHeader(k) && found != map.constEnd())
            std::visit(FromVariant{*this, found.value()}, k.member);
    }
}

bool AltitudePreset::operator==(const AltitudePreset &other) const
{
    for (const PresetKey &k : presetKeys) {
        if (!std::visit(Equal{*this, other}, k.member))
            return false;
    }
    return true;
}

bool loadAltitudePreset(ProjectController &store, const QString &fileName, const QString &prefix, AltitudePreset &preset)
{
    // No close after a failed open: the container keeps the reader, as it always has here.
    if (!store.openProjectFile(fileName, true))
        return false;
    const QString header = sectionName(prefix, "Header");
    if (store.readProperty(header, QStringLiteral("version"), QString()).isEmpty()) {
        store.closeProjectFile();
        return false;
    }
    AltitudePreset read = preset;
    try {
        for (const PresetKey &k : presetKeys) {
            const QString text = store.readProperty(sectionName(prefix, k.section), QLatin1String(k.key), QString());
            std::visit(Parser{read, text}, k.member);
        }
    } catch (const DamagedNumberError &error) {
        logTrace(3, QStringLiteral("loadAltitudePreset[%s] - damaged number: %s"), fileName, error.what());
        store.closeProjectFile();
        return false;
    }
    store.closeProjectFile();
    preset = read;
    return true;
}

bool saveAltitudePreset(QProjectController &store, const QString &fileName, const QString &prefix, const AltitudePreset &preset)
{
    const bool opened = fileName.contains(QLatin1String(".zkgeo")) ? store.openProjectFile(fileName, false)
                                                                    : store.createProjectFile(fileName);
    if (!opened)
        return false;
    const bool written = writeAltitudePreset(store, prefix, preset);
    store.closeProjectFile();
    return written && !store.lastWriteFailed();
}

bool writeAltitudePreset(ProjectController &store, const QString &prefix, const AltitudePreset &preset)
{
    bool written = true;
    for (const PresetKey &k : presetKeys) {
        written = store.writeProperty(sectionName(prefix, k.section), QLatin1String(k.key),
                                      std::visit(Formatter{preset}, k.member)) && written;
    }
    return written;
}
