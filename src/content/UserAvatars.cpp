#include "content/UserAvatars.h"

#include "app/Trace.h"
#include "content/IniAccess.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QSettings>

#include <zip.h>

#include <limits>
#include <memory>
#include <vector>

namespace {

uint32_t importError = 0;

// System error numbers the import reports.
constexpr uint32_t errorFileNotFound = 2;
constexpr uint32_t errorPathNotFound = 3;
constexpr uint32_t errorOutOfMemory = 14;
constexpr uint32_t errorSeek = 25;
constexpr uint32_t errorOpenFailed = 110;
constexpr uint32_t errorFileCorrupt = 1392;

uint32_t errorForZipOpen(int zipError)
{
    switch (zipError) {
    case ZIP_ER_SEEK:
        return errorSeek;
    case ZIP_ER_NOENT:
        return errorPathNotFound;
    case ZIP_ER_MEMORY:
        return errorOutOfMemory;
    case ZIP_ER_NOZIP:
        return errorFileCorrupt;
    default:
        return errorOpenFailed;
    }
}

struct ZipCloser
{
    void operator()(zip_t *archive) const { zip_discard(archive); }
};
using ZipHandle = std::unique_ptr<zip_t, ZipCloser>;

struct ZipFileCloser
{
    void operator()(zip_file_t *file) const { zip_fclose(file); }
};

struct ZipEntry
{
    zip_uint64_t index = 0;
    QString name;
    zip_uint64_t size = 0;
    bool isFolder = false;
};

ZipHandle openZip(const QString &zipPath)
{
    int error = ZIP_ER_OK;
    zip_t *archive = zip_open(QFile::encodeName(zipPath).constData(), ZIP_RDONLY, &error);
    if (!archive) {
        importError = errorForZipOpen(error);
        logTrace(3, QStringLiteral("importZipAvatar: can't open %s (zip error %d)"), zipPath, error);
    }
    return ZipHandle(archive);
}

bool isSafeEntryName(const QString &name)
{
    if (name.isEmpty() || name.startsWith(QLatin1Char('/')) || name.startsWith(QLatin1Char('\\')))
        return false;
    if (name.size() > 1 && name.at(1) == QLatin1Char(':'))
        return false; // a drive letter
    QString parts = name;
    parts.replace(QLatin1Char('\\'), QLatin1Char('/'));
    for (const QString &part : parts.split(QLatin1Char('/')))
        if (part == QLatin1String(".."))
            return false;
    return true;
}

// Every entry of the archive, or false with error 14 if one is unsafe or too large.
bool listEntries(zip_t *archive, uint64_t maxEntrySize, std::vector<ZipEntry> &entries)
{
    const zip_int64_t count = zip_get_num_entries(archive, 0);
    for (zip_int64_t i = 0; i < count; ++i) {
        zip_stat_t stat;
        zip_stat_init(&stat);
        if (zip_stat_index(archive, zip_uint64_t(i), 0, &stat) != 0 || !(stat.valid & ZIP_STAT_NAME)) {
            importError = errorOutOfMemory;
            return false;
        }
        ZipEntry entry;
        entry.index = zip_uint64_t(i);
        entry.name = QString::fromUtf8(stat.name);
        entry.size = (stat.valid & ZIP_STAT_SIZE) ? stat.size : 0;
        entry.isFolder = entry.name.endsWith(QLatin1Char('/'));
        if (!isSafeEntryName(entry.name) || entry.size > maxEntrySize) {
            logTrace(3, QStringLiteral("importZipAvatar: refused entry %s"), entry.name);
            importError = errorOutOfMemory;
            return false;
        }
        entries.push_back(entry);
    }
    return true;
}

bool writeEntry(zip_t *archive, const ZipEntry &entry, const QString &target)
{
    if (entry.size >= zip_uint64_t(std::numeric_limits<int>::max()))
        return false;
    std::unique_ptr<zip_file_t, ZipFileCloser> in(zip_fopen_index(archive, entry.index, 0));
    if (!in)
        return false;
    QByteArray data;
    data.resize(int(entry.size));
    zip_int64_t got = zip_fread(in.get(), data.data(), entry.size);
    if (got < 0 || zip_uint64_t(got) != entry.size)
        return false;
    // The stored size must not lie: nothing may follow it.
    char probe;
    if (zip_fread(in.get(), &probe, 1) != 0)
        return false;
    QFile out(target);
    if (!out.open(QIODevice::WriteOnly | QIODevice::Truncate))
        return false;
    return out.write(data) == data.size() && out.flush();
}

bool extractEntries(zip_t *archive, const std::vector<ZipEntry> &entries, const QString &targetFolder)
{
    const QString root = QDir::cleanPath(targetFolder);
    QDir dir;
    for (const ZipEntry &entry : entries) {
        const QString path = QDir::cleanPath(root + QLatin1Char('/') + entry.name);
        if (!path.startsWith(root + QLatin1Char('/'))) {
            if (path == root && entry.isFolder)
                continue;
            importError = errorOutOfMemory;
            return false;
        }
        const bool ok = entry.isFolder ? dir.mkpath(path)
                                       : dir.mkpath(QFileInfo(path).path())
                                             && writeEntry(archive, entry, path);
        if (!ok) {
            logTrace(3, QStringLiteral("importZipAvatar: can't write %s"), path);
            importError = errorOutOfMemory;
            return false;
        }
    }
    return true;
}

QString freeTargetFolder(const QString &parent, const QString &baseName)
{
    const QString first = parent + QStringLiteral("/u3d_") + baseName;
    if (!QFileInfo::exists(first))
        return first;
    for (int n = 1;; ++n) {
        // Joined by hand: the names may hold "%1" themselves.
        const QString next = first + QLatin1Char('(') + QString::number(n) + QLatin1Char(')');
        if (!QFileInfo::exists(next))
            return next;
    }
}

// Frames named "<other>_<n>.png" get the avatar's name, which the catalogue
// builds their paths from.
QStringList alignFrameNames(const QString &pictureFolder, const QString &avatarName)
{
    QStringList stems = listFileStems(pictureFolder, QStringLiteral("*.png"));
    bool renamed = false;
    for (const QString &stem : stems) {
        const int cut = stem.lastIndexOf(QLatin1Char('_'));
        if (cut <= 0 || stem.left(cut) == avatarName)
            continue;
        bool numbered = false;
        stem.mid(cut + 1).toUInt(&numbered, 10);
        if (!numbered)
            continue;
        const QString to = pictureFolder + QLatin1Char('/') + avatarName + stem.mid(cut) + QStringLiteral(".png");
        if (!QFileInfo::exists(to))
            renamed |= QFile::rename(pictureFolder + QLatin1Char('/') + stem + QStringLiteral(".png"), to);
    }
    return renamed ? listFileStems(pictureFolder, QStringLiteral("*.png")) : stems;
}

bool writeAvatarIni(const QString &dataFolder, const QString &contentFolder, const QString &avatarName)
{
    const QString ini = contentFolder + QStringLiteral("/informations/") + avatarName + QStringLiteral(".ini");
    {
        QSettings settings(ini, QSettings::IniFormat);
        settings.beginGroup(QStringLiteral("main"));
        settings.setValue(QStringLiteral("animated"), QStringLiteral("false"));
        settings.setValue(QStringLiteral("type"), QStringLiteral("png"));
        settings.setValue(QStringLiteral("displayFormat"), QStringLiteral("perspective"));
        settings.setValue(QStringLiteral("allowRotation"), QStringLiteral("true"));
        settings.setValue(QStringLiteral("defaultWidth"), QStringLiteral("20"));
        settings.setValue(QStringLiteral("gName"), QStringLiteral("User3d"));
        settings.setValue(QStringLiteral("isUserContent"), QStringLiteral("true"));
        settings.endGroup();
        settings.sync();
        if (settings.status() != QSettings::NoError)
            return false;
    }
    return prependIniListValue(dataFolder + QStringLiteral("/tourletContent.ini"), contentFolder,
                               QStringLiteral("avatars"), QStringLiteral("paths"));
}

} // namespace

bool isZipAvatar(const QString &path)
{
    return QFileInfo(path).completeSuffix() == QLatin1String("zip");
}

bool unpackZipArchive(const QString &zipPath, const QString &targetFolder, uint64_t maxEntrySize)
{
    importError = 0;
    ZipHandle archive = openZip(zipPath);
    if (!archive)
        return false;
    std::vector<ZipEntry> entries;
    if (!listEntries(archive.get(), maxEntrySize, entries))
        return false;
    if (!QDir().mkpath(targetFolder)) {
        importError = errorPathNotFound;
        return false;
    }
    return extractEntries(archive.get(), entries, targetFolder);
}

bool importZipAvatar(const QString &dataFolder, const QString &zipPath, QString &outPicture)
{
    importError = 0;
    ZipHandle archive = openZip(zipPath);
    if (!archive)
        return false;
    std::vector<ZipEntry> entries;
    if (!listEntries(archive.get(), ZipAvatarLimits::maxEntrySize, entries))
        return false;
    if (dataFolder.isEmpty() || !QFileInfo(dataFolder).isDir()) {
        logTrace(3, QStringLiteral("importZipAvatar: no data folder [%s]"), dataFolder);
        importError = errorPathNotFound;
        return false;
    }

    const QString parent = dataFolder + QStringLiteral("/userAvatars");
    const QString contentFolder = freeTargetFolder(parent, QFileInfo(zipPath).baseName());
    const QString avatarName = QFileInfo(contentFolder).fileName();
    const QString pictureFolder = contentFolder + QStringLiteral("/ZK3D/") + avatarName;
    QDir dir;
    for (const QString &level : {parent, contentFolder, contentFolder + QStringLiteral("/ZK3D"), pictureFolder,
                                 contentFolder + QStringLiteral("/informations")}) {
        if (!dir.exists(level) && !dir.mkdir(level)) {
            importError = errorPathNotFound;
            return false;
        }
    }
    if (!extractEntries(archive.get(), entries, pictureFolder))
        return false;
    archive.reset();

    const QStringList stems = alignFrameNames(pictureFolder, avatarName);
    if (stems.isEmpty()) {
        logTrace(3, QStringLiteral("importZipAvatar: no png pictures in %s"), zipPath);
        importError = errorFileNotFound;
        return false;
    }
    if (!writeAvatarIni(dataFolder, contentFolder, avatarName)) {
        importError = errorOutOfMemory;
        return false;
    }
    outPicture = pictureFolder + QLatin1Char('/') + stems.first() + QStringLiteral(".png");
    return true;
}

void migrateUserAvatars(const QString &folder)
{
    QDir dir;
    for (const QString &sub : listSubfolders(folder, false)) {
        const QString name = QFileInfo(sub).fileName();
        const QString frames = sub + QStringLiteral("/ZK3D");
        dir.mkpath(frames);
        const QString old = sub + QLatin1Char('/') + name;
        if (QFileInfo(old).isDir() && !dir.rename(old, frames + QLatin1Char('/') + name))
            logTrace(3, QStringLiteral("migrateUserAvatars: can't move %s"), old);
    }
}

void migrateUserAvatars(const QString &folder, QSettings &settings)
{
    migrateUserAvatars(folder);
    settings.setValue(QStringLiteral("userAvatars"), folder);
}

uint32_t importErrorNumber()
{
    return importError;
}

void clearImportError()
{
    importError = 0;
}

QString importErrorText()
{
    switch (importError) {
    case 0:
        return QStringLiteral("noError");
    case errorFileNotFound:
        return QStringLiteral("The archive holds no PNG pictures.");
    case errorPathNotFound:
        return QStringLiteral("The file or the folder for user avatars could not be found.");
    case errorOutOfMemory:
        return QStringLiteral("The archive could not be unpacked: an entry is too large, unsafe or could not be written.");
    case errorSeek:
        return QStringLiteral("The archive could not be read: a seek failed.");
    case errorOpenFailed:
        return QStringLiteral("The archive could not be opened.");
    case errorFileCorrupt:
        return QStringLiteral("The file is not a valid zip archive.");
    default:
        return QStringLiteral("Error %1.").arg(importError);
    }
}
