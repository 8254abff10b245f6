#include "platform/AtomicFileWriter.h"

#include <QDir>
#include <QFileInfo>

#include <cerrno>
#include <cstring>
#include <fcntl.h>
#include <unistd.h>

namespace {

// What the system said about the call that just failed; Qt's own text is often
// just "Unknown error".
QString systemError(const QFileDevice &file)
{
    if (errno != 0)
        return QString::fromLocal8Bit(std::strerror(errno));
    return file.error() != QFileDevice::NoError ? file.errorString() : QStringLiteral("not all of it could be written");
}

} // namespace

AtomicFileWriter::AtomicFileWriter(const QString &fileName)
    : m_fileName(fileName)
    , m_file(fileName)
{
}

AtomicFileWriter::~AtomicFileWriter()
{
    cancel();
}

bool AtomicFileWriter::open()
{
    const QFileInfo target(m_fileName);
    if (target.exists() && !target.isFile()) {
        m_error = target.isDir() ? QStringLiteral("a folder of that name is in the way")
                                 : QStringLiteral("not a regular file");
        return false;
    }
    const QFileDevice::Permissions anyWrite = QFileDevice::WriteOwner | QFileDevice::WriteGroup | QFileDevice::WriteOther;
    if (target.exists() && !(target.permissions() & anyWrite)) {
        m_error = QStringLiteral("the file is read-only");
        return false;
    }
    errno = 0;
    if (!m_file.open(QIODevice::WriteOnly)) {
        m_error = QStringLiteral("no file can be made in %1 (%2)")
                      .arg(QDir::toNativeSeparators(target.absolutePath()), systemError(m_file));
        return false;
    }
    m_failed = false;
    m_error.clear();
    return true;
}

bool AtomicFileWriter::write(const QByteArray &bytes)
{
    if (m_failed)
        return false;
    errno = 0;
    if (m_file.write(bytes) != bytes.size()) {
        fail();
        return false;
    }
    return true;
}

void AtomicFileWriter::fail(const QString &reason)
{
    if (m_failed)
        return;
    m_failed = true;
    m_error = reason.isEmpty() ? systemError(m_file) : reason;
}

bool AtomicFileWriter::commit()
{
    if (!m_file.isOpen()) {
        if (m_error.isEmpty())
            m_error = QStringLiteral("not open");
        return false;
    }
    // The save file's own commit doesn't notice a failed flush of its buffer.
    errno = 0;
    if (!m_failed && !m_file.flush())
        fail();
    errno = 0;
    if (!m_failed && ::fsync(m_file.handle()) != 0)
        fail();
    if (m_failed) {
        cancel();
        return false;
    }
    errno = 0;
    if (!m_file.commit()) {
        m_error = systemError(m_file);
        return false;
    }
    // The rename itself reaches the disk with the folder.
    const QString written = QFileInfo(m_fileName).canonicalFilePath();
    const int folder = ::open(QFile::encodeName(QFileInfo(written).absolutePath()).constData(), O_RDONLY | O_DIRECTORY);
    if (folder >= 0) {
        ::fsync(folder);
        ::close(folder);
    }
    return true;
}

void AtomicFileWriter::cancel()
{
    if (!m_file.isOpen())
        return;
    m_file.cancelWriting();
    m_file.commit(); // removes the temporary file
}
