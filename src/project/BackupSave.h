#pragma once

#include <QString>

#include <functional>

// Runs `write` over `fileName` without risking the previous file: when the file
// exists it is first moved to `fileName` + ".bak" (`write` makes the file anew),
// and that copy is removed only after `write` has reported success and the new
// file is in place. On any
// failure the copy stays and the failure is logged. A ".bak" that is already
// there is left alone: only an unfinished save leaves one behind, so it holds the
// last complete version. Returns whether the new file was written.
bool saveWithBackup(const QString &fileName, const std::function<bool()> &write);

QString backupFileName(const QString &fileName);
