#pragma once

#include <QString>

#include <cstdint>

// Unpacks a KMZ (a zip archive) into a folder. The archive is untrusted: an entry whose
// name is absolute or climbs out of the folder, or whose size is above maxEntrySize,
// fails, and the first failed entry ends the extraction.
class KmzArchive
{
public:
    static constexpr uint64_t maxEntrySize = uint64_t(512) * 1024 * 1024;
    // Many entries just under the limit would still fill the disk: the entry that
    // takes the sum above this fails too.
    static constexpr uint64_t maxTotalSize = uint64_t(2048) * 1024 * 1024;

    // Entries of size 0 become folders, all others files. Returns false when the archive
    // can't be opened or an entry failed; what was written before stays in the folder.
    static bool extract(const QString &archiveFileName, const QString &folder);

    // Whether an entry name stays inside the folder it is unpacked to.
    static bool isSafeEntryName(const QString &name);
};
