#pragma once

#include <QString>

#include <cstdint>

class QSettings;

// User avatars: 3D avatars imported from zip archives (numbered picture series)
// into dataFolder + "/userAvatars", in the same layout as shipped content.

// True if the complete suffix of path is exactly "zip".
bool isZipAvatar(const QString &path);

// Unpacks the zip into a new folder "<dataFolder>/userAvatars/u3d_<zip base name>"
// (with "(1)", "(2)"... if taken), writes its item ini and enters the folder in
// "tourletContent.ini". On success outPicture is the first picture of the series.
// On failure the import error number tells why.
bool importZipAvatar(const QString &dataFolder, const QString &zipPath, QString &outPicture);

// Moves the pictures of avatars imported by old versions (<S>/<name>/) to
// <S>/ZK3D/<name>/ for each sub-folder S of folder. Does nothing the second time.
void migrateUserAvatars(const QString &folder);
// The same, and records folder under the settings key "userAvatars".
void migrateUserAvatars(const QString &folder, QSettings &settings);

// The error number of the last import: 0 none, else a system error number.
uint32_t importErrorNumber();
void clearImportError();
// The text for the error number; "noError" for 0.
QString importErrorText();

namespace ZipAvatarLimits {
// Larger entries are refused, and so are names that leave the target folder.
constexpr uint64_t maxEntrySize = 512ull * 1024 * 1024;
}

// Unpacks every entry of the open-able archive zipPath below targetFolder. Refuses
// (error 14, nothing written) absolute names, names with "..", and entries larger
// than maxEntrySize. Sets the import error number; used by importZipAvatar.
bool unpackZipArchive(const QString &zipPath, const QString &targetFolder,
                      uint64_t maxEntrySize = ZipAvatarLimits::maxEntrySize);
