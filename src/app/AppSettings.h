#pragma once

#include <QLatin1String>
#include <QString>

class QSettings;

// Keys of the per-user store. All of them live at its top level.
namespace SettingsKey {
inline const QLatin1String Language{"language"};
inline const QLatin1String Folder{"folder"};
inline const QLatin1String ProjectPath{"projectPath"};
inline const QLatin1String ExportPath{"exportPath"};
inline const QLatin1String PresetPath{"presetPath"};
inline const QLatin1String PhotoPath{"photoPath"};
inline const QLatin1String BrowseContentPath{"browseContentPath"};
inline const QLatin1String DynamicContentPath{"DynamicContentPath"};
inline const QLatin1String UserAvatars{"userAvatars"};
inline const QLatin1String Tracking{"tracking"};
inline const QLatin1String EnableBetaPatches{"enableBetaPatches"};
inline const QLatin1String GpxAliasing{"GpxAliasing"};
inline const QLatin1String MaxAnimationDuration{"MaxAnimationDuration"};
inline const QLatin1String LastStartedVersion{"LastStartedVersion"};
inline const QLatin1String Host{"host"};
inline const QLatin1String RenderLoop{"QSGRenderLoop"};
} // namespace SettingsKey

// Scope names of the per-user store.
inline const QLatin1String SettingsOrganisation{"Zenko\\Common\\Services"};
inline const QLatin1String SettingsApplication{"Tourlet"};

// The process-wide per-user store in the native format, made on first use and kept
// until the process ends.
QSettings &defaultSettingsStore();

// A thin front for a settings store: typed access to the keys with their defaults.
// Copies share the store; the store must outlive every front that uses it.
class AppSettings
{
public:
    AppSettings();                          // the process-wide store
    explicit AppSettings(QSettings &store); // any other store, e.g. an ini file in tests

    QSettings &store() const { return *m_store; }

    // Language state of this front; the index of the language table.
    int currentLanguage() const { return m_language; }
    void setCurrentLanguage(int index) { m_language = index; }
    int defaultLanguage() const { return m_defaultLanguage; }
    void setDefaultLanguage(int index) { m_defaultLanguage = index; }
    QString languageName() const { return m_languageName; }
    void setLanguageName(const QString &name) { m_languageName = name; }

    // A folder key: backslashes become slashes, and anything but an existing writable
    // directory gives the first standard location of the key's kind (Movies for
    // "exportPath", Pictures for "photoPath", Documents otherwise). "DynamicContentPath"
    // has no fallback and comes back empty instead.
    QString pathSetting(const QString &key) const;
    void setPathSetting(const QString &key, const QString &value);

    bool enableBetaPatches() const;
    // False, and nothing written, when the value is already stored.
    bool setEnableBetaPatches(bool value);

    // Combo-box indices, stored as decimal text; unreadable text gives 1.
    int gpxAliasing() const;
    void setGpxAliasing(int index);
    int maxAnimationDuration() const;
    void setMaxAnimationDuration(int index);

    QString lastStartedVersion() const;
    void setLastStartedVersion(const QString &version);

    // Program title of the chosen host program.
    QString host() const;
    void setHost(const QString &programTitle);

    // Read only: nothing in the program writes it.
    QString renderLoop() const;

    bool trackingEnabled() const;
    void setTrackingEnabled(bool enabled);

    QString userAvatars() const;
    void setUserAvatars(const QString &value);

private:
    int indexSetting(const QString &key) const;

    QSettings *m_store;
    int m_language = 1;
    int m_defaultLanguage = 1;
    QString m_languageName;
};
