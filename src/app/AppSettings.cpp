#include "app/AppSettings.h"

#include "app/Trace.h"

#include <QFileInfo>
#include <QSettings>
#include <QStandardPaths>
#include <QVariant>

namespace {

// Bool keys come back as text from a file store: "1", "0", "true", "false".
// Anything that reads as neither a number nor "true" counts as false.
bool variantToBool(const QVariant &value)
{
    if (value.type() == QVariant::Bool)
        return value.toBool();
    const QString text = value.toString().trimmed();
    bool ok = false;
    const qlonglong number = text.toLongLong(&ok);
    if (ok)
        return number != 0;
    return text.compare(QLatin1String("true"), Qt::CaseInsensitive) == 0;
}

bool isWritableDirectory(const QString &path)
{
    if (path.isEmpty())
        return false;
    const QFileInfo info(path);
    return info.isDir() && info.isWritable();
}

QStandardPaths::StandardLocation fallbackLocation(const QString &key)
{
    if (key == SettingsKey::ExportPath)
        return QStandardPaths::MoviesLocation;
    if (key == SettingsKey::PhotoPath)
        return QStandardPaths::PicturesLocation;
    return QStandardPaths::DocumentsLocation;
}

} // namespace

QSettings &defaultSettingsStore()
{
    static QSettings store(QSettings::NativeFormat, QSettings::UserScope, SettingsOrganisation,
                           SettingsApplication);
    return store;
}

AppSettings::AppSettings() : m_store(&defaultSettingsStore()) {}

AppSettings::AppSettings(QSettings &store) : m_store(&store) {}

QString AppSettings::pathSetting(const QString &key) const
{
    QString path = m_store->value(key, QString()).toString();
    path.replace(QLatin1Char('\\'), QLatin1Char('/'));
    if (!isWritableDirectory(path))
        path.clear();
    if (path.isEmpty() && key != SettingsKey::DynamicContentPath) {
        const QStringList locations = QStandardPaths::standardLocations(fallbackLocation(key));
        if (!locations.isEmpty())
            path = locations.first();
    }
    return path;
}

void AppSettings::setPathSetting(const QString &key, const QString &value)
{
    m_store->setValue(key, value);
}

bool AppSettings::enableBetaPatches() const
{
    return variantToBool(m_store->value(SettingsKey::EnableBetaPatches, false));
}

bool AppSettings::setEnableBetaPatches(bool value)
{
    if (enableBetaPatches() == value)
        return false;
    m_store->setValue(SettingsKey::EnableBetaPatches, QString::number(value ? 1 : 0));
    return true;
}

int AppSettings::indexSetting(const QString &key) const
{
    const QString text = m_store->value(key, QStringLiteral("1")).toString().trimmed();
    bool ok = false;
    const int index = text.toInt(&ok);
    if (!ok) {
        logTrace(1, QStringLiteral("AppSettings::indexSetting: %s holds '%s', using 1"), key, text);
        return 1;
    }
    return index;
}

int AppSettings::gpxAliasing() const
{
    return indexSetting(SettingsKey::GpxAliasing);
}

void AppSettings::setGpxAliasing(int index)
{
    m_store->setValue(SettingsKey::GpxAliasing, QString::number(index));
}

int AppSettings::maxAnimationDuration() const
{
    return indexSetting(SettingsKey::MaxAnimationDuration);
}

void AppSettings::setMaxAnimationDuration(int index)
{
    m_store->setValue(SettingsKey::MaxAnimationDuration, QString::number(index));
}

QString AppSettings::lastStartedVersion() const
{
    return m_store->value(SettingsKey::LastStartedVersion, QString()).toString();
}

void AppSettings::setLastStartedVersion(const QString &version)
{
    m_store->setValue(SettingsKey::LastStartedVersion, version);
}

QString AppSettings::host() const
{
    return m_store->value(SettingsKey::Host, QString()).toString();
}

void AppSettings::setHost(const QString &programTitle)
{
    m_store->setValue(SettingsKey::Host, programTitle);
}

QString AppSettings::renderLoop() const
{
    return m_store->value(SettingsKey::RenderLoop, QStringLiteral("basic")).toString();
}

bool AppSettings::trackingEnabled() const
{
    return variantToBool(m_store->value(SettingsKey::Tracking, false));
}

void AppSettings::setTrackingEnabled(bool enabled)
{
    m_store->setValue(SettingsKey::Tracking, enabled ? QStringLiteral("true") : QStringLiteral("false"));
}

QString AppSettings::userAvatars() const
{
    return m_store->value(SettingsKey::UserAvatars, QString()).toString();
}

void AppSettings::setUserAvatars(const QString &value)
{
    m_store->setValue(SettingsKey::UserAvatars, value);
}
