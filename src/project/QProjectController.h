#pragma once

#include "platform/AtomicFileWriter.h"
#include "project/IniFileReader.h"
#include "project/IniFileWriter.h"
#include "project/ProjectController.h"

#include <memory>

class QSettings;

// The ini container used by projects and altitude presets: one writer or one
// reader at a time, in the format of QSettings::IniFormat. Files are written by our
// own code, which gives the bytes of the store at a fraction of the cost, and a
// plain file (LF or CRLF lines) is read by it too; anything unusual is read through
// QSettings itself.
//
// Nothing reaches the disk before the close: the whole content then goes into a
// temporary file that replaces the file in one rename, so a write that fails on the
// way leaves the previous file exactly as it was. Adding to an existing file reads
// its values first and writes them back with the new ones.
class QProjectController : public ProjectController
{
public:
    QProjectController();
    ~QProjectController() override;

    bool createProjectFile(QString fileName) override;
    bool openProjectFile(QString fileName, bool forLoad) override;
    bool writeProperty(QString section, QString key, QString value) override;
    QString readProperty(QString section, QString key, QString defaultValue) override;
    bool closeProjectFile() override;
    std::vector<int32_t> numberedSections(QString stem, int32_t count) override;

    bool isIdle() const { return !isWriting() && !isReading(); }
    bool isWriting() const { return m_content != nullptr; }
    bool isReading() const { return m_reader != nullptr || m_plainFile != nullptr; }

    // A file read is kept after its close, so that reading the same unchanged file
    // again (the altitude theme after the project) doesn't parse it twice. This lets
    // it go.
    void forgetReadFile();

    // Whether anything of the last write went wrong: no file could be made, a
    // property met no writer, or the file could not be put on disk. Cleared by the
    // next create or open. lastWriteError() tells why.
    bool lastWriteFailed() const { return m_writeFailed; }
    QString lastWriteError() const { return m_writeError; }

private:
    bool startWriting(const QString &fileName, std::unique_ptr<IniFileWriter> content);
    bool openForAdding(const QString &fileName);
    void writeFailed(const QString &reason);
    QString storeValue(const QString &address, const QString &defaultValue);

    std::unique_ptr<QSettings> m_reader;
    std::unique_ptr<IniFileWriter> m_content;
    std::unique_ptr<AtomicFileWriter> m_target;
    std::unique_ptr<IniFileReader> m_plainFile;
    std::unique_ptr<NumberedSections> m_numbered; // of the file being read, made when first asked
    struct ReadFile
    {
        QString name;
        qint64 size = -1;
        qint64 modified = 0;
        std::unique_ptr<IniFileReader> reader;
    };
    ReadFile m_lastRead;
    bool m_writeFailed = false;
    QString m_writeError;
};
