#include "gpx/KmzArchive.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QRegExp>
#include <QVector>

#include <zip.h>

#include <memory>
#include <vector>

namespace {

constexpr size_t bufferSize = 64 * 1024;

struct ArchiveCloser
{
    void operator()(zip_t *archive) const
    {
        if (zip_close(archive) != 0)
            zip_discard(archive);
    }
};

struct EntryCloser
{
    void operator()(zip_file_t *entry) const { zip_fclose(entry); }
};

bool writeEntry(zip_t *archive, zip_uint64_t index, uint64_t size, const QString &target, std::vector<char> &buffer)
{
    if (!QDir().mkpath(QFileInfo(target).path()))
        return false;
    std::unique_ptr<zip_file_t, EntryCloser> entry(zip_fopen_index(archive, index, 0));
    if (!entry)
        return false;
    QFile out(target);
    if (!out.open(QIODevice::WriteOnly | QIODevice::Truncate))
        return false;
    uint64_t written = 0;
    for (;;) {
        const zip_int64_t n = zip_fread(entry.get(), buffer.data(), buffer.size());
        if (n < 0)
            return false;
        if (n == 0)
            break;
        written += uint64_t(n);
        // The stated size is what was checked; an entry must not deliver more.
        if (written > size || out.write(buffer.data(), n) != n)
            return false;
    }
    return true;
}

} // namespace

bool KmzArchive::isSafeEntryName(const QString &name)
{
    if (name.startsWith(QLatin1Char('/')) || name.startsWith(QLatin1Char('\\')) || QDir::isAbsolutePath(name))
        return false;
    // Archives made by some tools use backslashes as separators.
    const QVector<QStringRef> parts = name.splitRef(QRegExp(QStringLiteral("[/\\\\]")));
    for (const QStringRef &part : parts) {
        if (part == QLatin1String(".."))
            return false;
    }
    return !name.contains(QChar(0));
}

bool KmzArchive::extract(const QString &archiveFileName, const QString &folder)
{
    int error = 0;
    std::unique_ptr<zip_t, ArchiveCloser> archive(zip_open(QFile::encodeName(archiveFileName).constData(), ZIP_RDONLY, &error));
    if (!archive)
        return false;

    const QString root = QDir::cleanPath(folder);
    std::vector<char> buffer(bufferSize);
    uint64_t total = 0;
    const zip_int64_t count = zip_get_num_entries(archive.get(), 0);
    for (zip_int64_t index = 0; index < count; ++index) {
        zip_stat_t stat;
        zip_stat_init(&stat);
        if (zip_stat_index(archive.get(), zip_uint64_t(index), 0, &stat) != 0)
            return false;
        if (!(stat.valid & ZIP_STAT_NAME) || !(stat.valid & ZIP_STAT_SIZE) || !stat.name)
            return false;
        const QString name = QString::fromUtf8(stat.name);
        if (!isSafeEntryName(name) || stat.size > maxEntrySize)
            return false;
        total += stat.size;
        if (total > maxTotalSize)
            return false;
        const QString target = root + QLatin1Char('/') + name;
        if (!QDir::cleanPath(target).startsWith(root + QLatin1Char('/')) && QDir::cleanPath(target) != root)
            return false;
        if (stat.size == 0) {
            if (!QDir().mkpath(target))
                return false;
        } else if (!writeEntry(archive.get(), zip_uint64_t(index), stat.size, target, buffer)) {
            return false;
        }
    }
    return true;
}
