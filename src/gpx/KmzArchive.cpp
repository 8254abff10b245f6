#include "gpx/KmzArchive.h"

#include <QFile>

#include <zip.h>

#include <algorithm>

namespace {

constexpr size_t bufferSize = 64 * 1024;

struct EntryCloser
{
    void operator()(zip_file_t *entry) const { zip_fclose(entry); }
};

// At the top of the archive (some tools write backslashes as separators), not hidden,
// and not a folder: an entry of size 0 stands for one.
bool isDocument(const QString &name, uint64_t size)
{
    return size > 0 && name.endsWith(QLatin1String(".kml"), Qt::CaseInsensitive) && !name.startsWith(QLatin1Char('.'))
           && !name.contains(QLatin1Char('/')) && !name.contains(QLatin1Char('\\'));
}

} // namespace

void KmzArchive::Closer::operator()(zip_t *archive) const
{
    zip_discard(archive);
}

KmzArchive::KmzArchive() = default;
KmzArchive::~KmzArchive() = default;

bool KmzArchive::open(const QString &fileName)
{
    m_documents.clear();
    int error = 0;
    m_archive.reset(zip_open(QFile::encodeName(fileName).constData(), ZIP_RDONLY, &error));
    if (!m_archive)
        return false;
    const zip_int64_t count = zip_get_num_entries(m_archive.get(), 0);
    for (zip_int64_t index = 0; index < count; ++index) {
        zip_stat_t stat;
        zip_stat_init(&stat);
        if (zip_stat_index(m_archive.get(), zip_uint64_t(index), 0, &stat) != 0)
            return false;
        if (!(stat.valid & ZIP_STAT_NAME) || !(stat.valid & ZIP_STAT_SIZE) || !stat.name)
            return false;
        const QString name = QString::fromUtf8(stat.name);
        if (isDocument(name, stat.size))
            m_documents.push_back({name, uint64_t(index), stat.size});
    }
    std::sort(m_documents.begin(), m_documents.end(), [](const Document &a, const Document &b) {
        const int ignoringCase = a.name.compare(b.name, Qt::CaseInsensitive);
        return ignoringCase != 0 ? ignoringCase < 0 : a.name < b.name;
    });
    return true;
}

QStringList KmzArchive::documents() const
{
    QStringList names;
    for (const Document &document : m_documents)
        names << document.name;
    return names;
}

bool KmzArchive::extractDocument(int document, const QString &targetFile) const
{
    if (!m_archive || document < 0 || size_t(document) >= m_documents.size())
        return false;
    const Document &entry = m_documents[size_t(document)];
    if (entry.size > maxEntrySize)
        return false;
    std::unique_ptr<zip_file_t, EntryCloser> in(zip_fopen_index(m_archive.get(), entry.index, 0));
    if (!in)
        return false;
    QFile out(targetFile);
    if (!out.open(QIODevice::WriteOnly | QIODevice::Truncate))
        return false;
    std::vector<char> buffer(bufferSize);
    uint64_t written = 0;
    for (;;) {
        const zip_int64_t n = zip_fread(in.get(), buffer.data(), buffer.size());
        if (n < 0)
            return false;
        if (n == 0)
            break;
        written += uint64_t(n);
        // The stated size is what was checked; an entry must not deliver more.
        if (written > entry.size || out.write(buffer.data(), n) != n)
            return false;
    }
    return out.flush();
}
