#pragma once

#include <QString>
#include <QStringList>

// Reading and changing content ini files. Each call opens its file anew; with
// useContentIni the file is read through the tolerant ContentIni format, else
// through QSettings::IniFormat. Writes always use QSettings::IniFormat.

QString readIniValue(const QString &file, const QString &section, const QString &key, bool useContentIni,
                     const QString &defaultValue = QString());

// The value split at delimiter, each part trimmed, empty parts dropped.
QStringList readIniList(const QString &file, const QString &section, const QString &key, const QString &delimiter,
                        bool useContentIni);

// Reads the list under section/key and gives, for each entry, the value of the key
// of that name in valueSection (the same section when empty); a missing key
// gives an empty text, so the result lines up with the list.
QStringList readIniListValues(const QString &file, const QString &section, const QString &key,
                              const QString &valueSection = QString(), bool useContentIni = true);

// Puts value in front of the list under section/key and syncs. Duplicates stay.
bool prependIniListValue(const QString &file, const QString &value, const QString &section, const QString &key);

// Rewrites the list under section/key without every entry whose base name is stem.
bool removeIniListValue(const QString &file, const QString &stem, const QString &section, const QString &key);

bool fileExists(const QString &path);
// Full paths of the sub-folders, in directory-iterator order.
QStringList listSubfolders(const QString &path, bool recursive);
// Stems of the files in folder that match pattern, sorted by name ignoring case;
// empty if the folder doesn't exist.
QStringList listFileStems(const QString &folder, const QString &pattern);
// The names of the files folder + "/informations/*.ini", the suffix in any case,
// sorted by stem ignoring case.
QStringList listInformationFiles(const QString &folder);
bool samePath(const QString &a, const QString &b);

// While one of these lives, reads on this thread are answered from the files
// parsed earlier in its lifetime; the two writers above drop the file they
// change. Meant for one scan, during which nothing else writes content files:
// the answers are the same as with a fresh parse per read.
class IniReadCache
{
public:
    IniReadCache();
    ~IniReadCache();
    IniReadCache(const IniReadCache &) = delete;
    IniReadCache &operator=(const IniReadCache &) = delete;
};
