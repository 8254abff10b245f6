#include "project/BackupSave.h"

#include "app/Trace.h"

#include <QFile>
#include <QFileInfo>

QString backupFileName(const QString &fileName)
{
    return fileName + QStringLiteral(".bak");
}

bool saveWithBackup(const QString &fileName, const std::function<bool()> &write)
{
    const QString backup = backupFileName(fileName);
    bool haveBackup = QFileInfo(backup).isFile();
    if (haveBackup) {
        logTrace(1, QStringLiteral("saveWithBackup[%s] - keeping the backup of an unfinished save"), backup);
    } else if (QFile::exists(fileName) || QFileInfo::exists(backup)) {
        // The writer makes the file anew, so the previous one itself can be the
        // copy: moved aside, not duplicated byte by byte.
        QFile original(fileName);
        if (!original.rename(backup)) {
            // Without a copy the old file would be gone before the new one is written.
            logTrace(3, QStringLiteral("saveWithBackup[%s] - can't keep a copy as %s: %s; nothing saved"), fileName, backup,
                     original.errorString());
            return false;
        }
        haveBackup = true;
    }

    const bool written = write() && QFileInfo(fileName).isFile() && QFileInfo(fileName).size() > 0;
    if (!written) {
        if (haveBackup)
            logTrace(3, QStringLiteral("saveWithBackup[%s] - save failed, the previous version stays in %s"), fileName, backup);
        else
            logTrace(3, QStringLiteral("saveWithBackup[%s] - save failed"), fileName);
        return false;
    }
    if (haveBackup && !QFile::remove(backup))
        logTrace(3, QStringLiteral("saveWithBackup[%s] - saved, but can't remove %s"), fileName, backup);
    return true;
}
