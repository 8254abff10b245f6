#pragma once

#include <QString>
#include <QStringList>

#include <cstdint>
#include <memory>
#include <vector>

struct zip;

// The documents of a KMZ, a zip archive: its top-level entries named "*.kml", the
// suffix in any case as on the systems these archives come from. The archive is
// untrusted: nothing else of it is unpacked, and a document only within maxEntrySize.
class KmzArchive
{
public:
    static constexpr uint64_t maxEntrySize = uint64_t(512) * 1024 * 1024;

    KmzArchive();
    ~KmzArchive();
    KmzArchive(const KmzArchive &) = delete;
    KmzArchive &operator=(const KmzArchive &) = delete;

    // False when the file can't be read as an archive.
    bool open(const QString &fileName);
    // The documents' entry names, sorted by name ignoring case.
    QStringList documents() const;
    // Writes the document at that place of documents() to a file; false when it is above
    // the size limit, damaged or can't be written.
    bool extractDocument(int document, const QString &targetFile) const;

private:
    struct Closer
    {
        void operator()(struct zip *archive) const;
    };
    struct Document
    {
        QString name;
        uint64_t index;
        uint64_t size;
    };

    std::unique_ptr<struct zip, Closer> m_archive;
    std::vector<Document> m_documents;
};
