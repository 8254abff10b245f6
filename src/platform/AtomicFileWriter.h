#pragma once

#include <QSaveFile>
#include <QString>

// Replaces a file the careful way: the whole content goes into a temporary file in
// the same folder, is flushed to disk, and only then takes the target's place in one
// rename. Whatever fails on the way, the previous file stays exactly as it was and
// the temporary file goes. A symbolic link is written through to its target.
//
// Refused from the start: a target that is a folder or no regular file, and an
// existing file that nobody may write (even where the user's rights would allow it).
class AtomicFileWriter
{
public:
    explicit AtomicFileWriter(const QString &fileName);
    ~AtomicFileWriter();

    AtomicFileWriter(const AtomicFileWriter &) = delete;
    AtomicFileWriter &operator=(const AtomicFileWriter &) = delete;

    // Makes the temporary file. False with errorString() when it can't be.
    bool open();
    bool isOpen() const { return m_file.isOpen(); }

    // Where the content goes. Writes may come back short (a full disk, a size limit):
    // whoever writes must check what write() returns and call fail() on a short one.
    QIODevice &device() { return m_file; }
    bool write(const QByteArray &bytes);

    // Marks the content as incomplete, so that commit() refuses it. Without a
    // reason, the system's word on the call that just failed is kept.
    void fail(const QString &reason = QString());

    // Flushes, syncs and renames. False with errorString() when anything of it
    // failed; the target is then untouched.
    bool commit();
    // Drops the temporary file; the target is untouched.
    void cancel();

    const QString &fileName() const { return m_fileName; }
    QString errorString() const { return m_error; }

private:
    QString m_fileName;
    QSaveFile m_file;
    QString m_error;
    bool m_failed = false;
};
