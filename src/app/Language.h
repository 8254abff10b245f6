#pragma once

#include <QString>
#include <QStringList>

#include <cstdint>

class AppSettings;

// The seven user-interface languages. Settings and lists hold the index; every index
// other than 0 and 2..6 means English (1).
class LanguageTable
{
public:
    static constexpr int Count = 7;
    static constexpr int English = 1;
    // An install request with this value picks the language whose file has the size
    // of "language/Tourlet.qm".
    static constexpr uint32_t FromFileSize = 0xFFFFFFFFu;

    static int normalized(qint64 index);

    // Each of these maps the index through normalized() first.
    static QString fileName(int index);    // "Tourlet_de.qm"
    static QString longName(int index);    // "de_DE", the name of Qt's own translations
    static QString shortSuffix(int index); // "_DE", for help and splash files
    static QStringList hostNames(int index);

    // "language/Tourlet_de.qm", relative to programDir, or to the working directory
    // when programDir is empty.
    static QString filePath(int index, const QString &programDir = QString());
    // "language/Tourlet.qm", the copy of the installer's language.
    static QString referenceFilePath(const QString &programDir = QString());
    // "<programDir>/Help/Tourlet_DE.pdf", the user guide that openHelp shows.
    static QString helpFilePath(int index, const QString &programDir);

    // Index whose accepted host names include name (exact match), or -1.
    static int indexForHostName(const QString &name);

    // The first index, in table order, whose file has the size of the reference file;
    // English when the reference file is missing or no size matches.
    static int indexByReferenceSize(const QString &programDir = QString());

    // What an install request means: FromFileSize becomes indexByReferenceSize(),
    // anything else is passed on unchanged (an install ignores indices from 7 on).
    static uint32_t resolveRequest(uint32_t requested, const QString &programDir = QString());
};

// The language at start: the stored "language" if it holds anything, otherwise the
// host program's "Language" value matched against the accepted names, otherwise the
// front's current language. The result is always a valid index.
int language(const AppSettings &settings, const QString &hostLanguage = QString());

// Remembers the index for the next start.
void storeLanguage(AppSettings &settings, int index);
