#include "app/Language.h"

#include "app/AppSettings.h"
#include "app/Trace.h"

#include <QDir>
#include <QFileInfo>
#include <QSettings>

namespace {

struct LanguageRow
{
    const char *fileName;
    const char *longName;
    const char *shortSuffix;
    const char *hostNames[3];
};

// "ja_JA" on the Qt side against "ja_JP" from hosts is how the names are shipped.
const LanguageRow Rows[LanguageTable::Count] = {
    {"Tourlet_de.qm", "de_DE", "_DE", {"de_DE", nullptr, nullptr}},
    {"Tourlet_en.qm", "en_EN", "_EN", {"en_UK", "en_US", "en_II"}},
    {"Tourlet_fr.qm", "fr_FR", "_FR", {"fr_FR", nullptr, nullptr}},
    {"Tourlet_it.qm", "it_IT", "_IT", {"it_IT", nullptr, nullptr}},
    {"Tourlet_nl.qm", "nl_NL", "_NL", {"nl_NL", nullptr, nullptr}},
    {"Tourlet_es.qm", "es_ES", "_ES", {"es_ES", nullptr, nullptr}},
    {"Tourlet_ja.qm", "ja_JA", "_JA", {"ja_JP", nullptr, nullptr}},
};

const LanguageRow &row(int index)
{
    return Rows[LanguageTable::normalized(index)];
}

QString inLanguageFolder(const QString &fileName, const QString &programDir)
{
    const QString relative = QStringLiteral("language/") + fileName;
    return programDir.isEmpty() ? relative : QDir(programDir).filePath(relative);
}

} // namespace

int LanguageTable::normalized(qint64 index)
{
    return index >= 0 && index < Count ? static_cast<int>(index) : English;
}

QString LanguageTable::fileName(int index)
{
    return QLatin1String(row(index).fileName);
}

QString LanguageTable::longName(int index)
{
    return QLatin1String(row(index).longName);
}

QString LanguageTable::shortSuffix(int index)
{
    return QLatin1String(row(index).shortSuffix);
}

QStringList LanguageTable::hostNames(int index)
{
    QStringList names;
    for (const char *name : row(index).hostNames) {
        if (name)
            names.append(QLatin1String(name));
    }
    return names;
}

QString LanguageTable::filePath(int index, const QString &programDir)
{
    return inLanguageFolder(fileName(index), programDir);
}

QString LanguageTable::referenceFilePath(const QString &programDir)
{
    return inLanguageFolder(QStringLiteral("Tourlet.qm"), programDir);
}

QString LanguageTable::helpFilePath(int index, const QString &programDir)
{
    return QStringLiteral("%1/Help/Tourlet%2.pdf").arg(programDir, shortSuffix(index));
}

int LanguageTable::indexForHostName(const QString &name)
{
    for (int i = 0; i < Count; ++i) {
        for (const char *accepted : Rows[i].hostNames) {
            if (accepted && name == QLatin1String(accepted))
                return i;
        }
    }
    return -1;
}

int LanguageTable::indexByReferenceSize(const QString &programDir)
{
    const QFileInfo reference(referenceFilePath(programDir));
    if (!reference.isFile()) {
        logTrace(1, QStringLiteral("LanguageTable::indexByReferenceSize: no %s, using English"),
                 reference.filePath());
        return English;
    }
    for (int i = 0; i < Count; ++i) {
        const QFileInfo candidate(filePath(i, programDir));
        if (candidate.isFile() && candidate.size() == reference.size())
            return i;
    }
    return English;
}

uint32_t LanguageTable::resolveRequest(uint32_t requested, const QString &programDir)
{
    if (requested == FromFileSize)
        return static_cast<uint32_t>(indexByReferenceSize(programDir));
    return requested;
}

int language(const AppSettings &settings, const QString &hostLanguage)
{
    const QString stored = settings.store().value(SettingsKey::Language, QString()).toString().trimmed();
    if (!stored.isEmpty()) {
        bool ok = false;
        const qlonglong index = stored.toLongLong(&ok);
        if (!ok) {
            logTrace(1, QStringLiteral("language: stored value '%s' is no number, using English"), stored);
            return LanguageTable::English;
        }
        return LanguageTable::normalized(index);
    }

    int index = settings.currentLanguage();
    const int fromHost = LanguageTable::indexForHostName(hostLanguage);
    if (fromHost >= 0)
        index = fromHost;
    return LanguageTable::normalized(index);
}

void storeLanguage(AppSettings &settings, int index)
{
    settings.store().setValue(SettingsKey::Language, index);
}
