#include "content/IniAccess.h"

#include "app/Trace.h"
#include "content/ContentIni.h"
#include "platform/TextDecoding.h"

#include <QDir>
#include <QDirIterator>
#include <QFile>
#include <QFileInfo>
#include <QHash>
#include <QSettings>

#include <algorithm>
#include <memory>

namespace {

struct ReadCache
{
    // A null entry records a file that could not be read.
    QHash<QString, std::shared_ptr<const QSettings::SettingsMap>> contentIni;
    QHash<QString, std::shared_ptr<QSettings>> platformIni;
    int users = 0;
};

thread_local ReadCache *activeCache = nullptr;

// Content ini files are small; anything else under such a name (a folder, a pipe,
// a huge file) is taken as unreadable rather than read.
constexpr qint64 maxIniFileSize = 16 * 1024 * 1024;

bool isReadableIni(const QString &file)
{
    const QFileInfo info(file);
    if (!info.isFile())
        return false;
    if (info.size() > maxIniFileSize) {
        logTrace(3, QStringLiteral("readIniValue: %s is too large for an ini file"), file);
        return false;
    }
    return true;
}

// The platform format reads one encoding, which it has to be told: that of the file's
// bytes, by the rules the content format applies itself.
const char *platformCodecOf(const QString &file)
{
    QFile f(file);
    if (!f.open(QIODevice::ReadOnly))
        return "UTF-8";
    const QByteArray bytes = f.read(maxIniFileSize);
    if (textdecoding::codecByMark(bytes) || textdecoding::isUtf8(bytes.constData(), bytes.size()))
        return "UTF-8";
    return "windows-1252";
}

std::shared_ptr<const QSettings::SettingsMap> readContentIniFile(const QString &file)
{
    if (activeCache) {
        const auto hit = activeCache->contentIni.constFind(file);
        if (hit != activeCache->contentIni.constEnd())
            return hit.value();
    }
    std::shared_ptr<QSettings::SettingsMap> map;
    QFile f(file);
    if (isReadableIni(file) && f.open(QIODevice::ReadOnly)) {
        map = std::make_shared<QSettings::SettingsMap>();
        ContentIni::parse(f.readAll(), *map);
    }
    if (activeCache)
        activeCache->contentIni.insert(file, map);
    return map;
}

QVariant readPlatformIni(const QString &file, const QString &address)
{
    if (activeCache) {
        auto hit = activeCache->platformIni.find(file);
        if (hit == activeCache->platformIni.end()) {
            std::shared_ptr<QSettings> settings;
            if (isReadableIni(file)) {
                settings = std::make_shared<QSettings>(file, QSettings::IniFormat);
                settings->setIniCodec(platformCodecOf(file));
            }
            hit = activeCache->platformIni.insert(file, settings);
        }
        return hit.value() ? hit.value()->value(address) : QVariant();
    }
    if (!isReadableIni(file))
        return QVariant();
    QSettings settings(file, QSettings::IniFormat);
    settings.setIniCodec(platformCodecOf(file));
    return settings.value(address);
}

QString address(const QString &section, const QString &key)
{
    return section.isEmpty() ? key : section + QLatin1Char('/') + key;
}

QStringList splitTrimmed(const QString &text, const QString &delimiter)
{
    QStringList out;
    const QStringList parts = text.split(delimiter);
    for (const QString &part : parts) {
        const QString trimmed = part.trimmed();
        if (!trimmed.isEmpty())
            out << trimmed;
    }
    return out;
}

QStringList readWritableList(QSettings &settings, const QString &address)
{
    QStringList list;
    for (const QString &entry : settings.value(address).toStringList())
        if (!entry.trimmed().isEmpty())
            list << entry.trimmed();
    return list;
}

void writeList(QSettings &settings, const QString &address, const QStringList &list)
{
    // An empty list goes as no key at all, which every reader takes as empty.
    if (list.isEmpty())
        settings.remove(address);
    else
        settings.setValue(address, list);
}

void forgetCached(const QString &file)
{
    if (activeCache) {
        activeCache->contentIni.remove(file);
        activeCache->platformIni.remove(file);
    }
}

QString withoutTrailingSlashes(QString path)
{
    while (path.size() > 1 && path.endsWith(QLatin1Char('/')))
        path.chop(1);
    return path;
}

} // namespace

QString readIniValue(const QString &file, const QString &section, const QString &key, bool useContentIni,
                     const QString &defaultValue)
{
    if (file.isEmpty())
        return defaultValue;
    if (useContentIni) {
        const auto map = readContentIniFile(file);
        if (!map)
            return defaultValue;
        const auto hit = map->constFind(ContentIni::lookupKey(section, key));
        return hit == map->constEnd() ? defaultValue : hit.value().toString();
    }
    const QVariant value = readPlatformIni(file, address(section, key));
    return value.isValid() ? value.toString() : defaultValue;
}

QStringList readIniList(const QString &file, const QString &section, const QString &key, const QString &delimiter,
                        bool useContentIni)
{
    if (useContentIni)
        return splitTrimmed(readIniValue(file, section, key, true), delimiter);
    if (file.isEmpty())
        return {};
    // The platform format has already split at commas.
    QStringList out;
    for (const QString &entry : readPlatformIni(file, address(section, key)).toStringList())
        out += splitTrimmed(entry, delimiter);
    return out;
}

QStringList readIniListValues(const QString &file, const QString &section, const QString &key,
                              const QString &valueSection, bool useContentIni)
{
    QStringList values;
    const QString from = valueSection.isEmpty() ? section : valueSection;
    for (const QString &entry : readIniList(file, section, key, QStringLiteral(","), useContentIni))
        values << readIniValue(file, from, entry, useContentIni);
    return values;
}

bool prependIniListValue(const QString &file, const QString &value, const QString &section, const QString &key)
{
    if (file.isEmpty())
        return false;
    forgetCached(file);
    // Written back in the encoding it was read in.
    QSettings settings(file, QSettings::IniFormat);
    settings.setIniCodec(platformCodecOf(file));
    QStringList list = readWritableList(settings, address(section, key));
    list.prepend(value);
    writeList(settings, address(section, key), list);
    settings.sync();
    if (settings.status() != QSettings::NoError) {
        logTrace(3, QStringLiteral("prependIniListValue: can't write %s"), file);
        return false;
    }
    return true;
}

bool removeIniListValue(const QString &file, const QString &stem, const QString &section, const QString &key)
{
    if (file.isEmpty() || !QFileInfo::exists(file))
        return false;
    forgetCached(file);
    // Written back in the encoding it was read in.
    QSettings settings(file, QSettings::IniFormat);
    settings.setIniCodec(platformCodecOf(file));
    QStringList kept;
    for (const QString &entry : readWritableList(settings, address(section, key)))
        if (QFileInfo(withoutTrailingSlashes(entry)).baseName() != stem)
            kept << entry;
    writeList(settings, address(section, key), kept);
    settings.sync();
    if (settings.status() != QSettings::NoError) {
        logTrace(3, QStringLiteral("removeIniListValue: can't write %s"), file);
        return false;
    }
    return true;
}

bool fileExists(const QString &path)
{
    return !path.isEmpty() && QFileInfo::exists(path);
}

QStringList listSubfolders(const QString &path, bool recursive)
{
    QStringList out;
    if (path.isEmpty())
        return out;
    QDirIterator it(path, QDir::Dirs | QDir::NoDotAndDotDot,
                    recursive ? QDirIterator::Subdirectories : QDirIterator::NoIteratorFlags);
    while (it.hasNext())
        out << it.next();
    return out;
}

QStringList listFileStems(const QString &folder, const QString &pattern)
{
    QStringList stems;
    if (folder.isEmpty())
        return stems;
    const QDir dir(folder);
    if (!dir.exists())
        return stems;
    // Case-sensitive, so that stem + the pattern's suffix names the file found.
    const QStringList files = dir.entryList(QStringList{pattern}, QDir::Files | QDir::CaseSensitive,
                                            QDir::Name | QDir::IgnoreCase);
    for (const QString &name : files)
        stems << QFileInfo(name).completeBaseName();
    return stems;
}

QStringList listInformationFiles(const QString &folder)
{
    const QDir dir(folder + QStringLiteral("/informations/"));
    if (folder.isEmpty() || !dir.exists())
        return {};
    // Made on systems that don't tell "x.INI" from "x.ini".
    QStringList names = dir.entryList(QStringList{QStringLiteral("*.ini")}, QDir::Files);
    std::sort(names.begin(), names.end(), [](const QString &a, const QString &b) {
        const int byStem = QFileInfo(a).completeBaseName().compare(QFileInfo(b).completeBaseName(), Qt::CaseInsensitive);
        return byStem != 0 ? byStem < 0 : a < b;
    });
    return names;
}

bool samePath(const QString &a, const QString &b)
{
    return QFileInfo(a).filePath().compare(QFileInfo(b).filePath(), Qt::CaseInsensitive) == 0;
}

IniReadCache::IniReadCache()
{
    if (!activeCache)
        activeCache = new ReadCache;
    ++activeCache->users;
}

IniReadCache::~IniReadCache()
{
    if (--activeCache->users == 0) {
        delete activeCache;
        activeCache = nullptr;
    }
}
