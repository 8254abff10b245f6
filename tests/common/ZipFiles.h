#pragma once

#include <QByteArray>
#include <QFile>
#include <QString>

#include <zip.h>

#include <utility>
#include <vector>

using ZipEntries = std::vector<std::pair<QByteArray, QByteArray>>; // name, content; a name ending in "/" is a folder

// Writes a zip archive with libzip; false when it can't.
inline bool writeZip(const QString &path, const ZipEntries &entries)
{
    int error = 0;
    zip_t *archive = zip_open(QFile::encodeName(path).constData(), ZIP_CREATE | ZIP_TRUNCATE, &error);
    if (!archive)
        return false;
    for (const auto &entry : entries) {
        if (entry.first.endsWith('/')) {
            if (zip_dir_add(archive, entry.first.constData(), ZIP_FL_ENC_UTF_8) < 0) {
                zip_discard(archive);
                return false;
            }
            continue;
        }
        zip_source_t *source = zip_source_buffer(archive, entry.second.constData(), zip_uint64_t(entry.second.size()), 0);
        if (!source || zip_file_add(archive, entry.first.constData(), source, ZIP_FL_ENC_UTF_8) < 0) {
            zip_source_free(source);
            zip_discard(archive);
            return false;
        }
    }
    return zip_close(archive) == 0;
}
