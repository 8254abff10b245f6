#pragma once

#include "project/IniFileReader.h"
#include "project/IniFileWriter.h"
#include "project/ProjectController.h"

#include <memory>

class QSettings;

// The ini container used by projects and altitude presets: one writer or one
// reader at a time, in the format of QSettings::IniFormat. A new file is written
// and a plain file (LF or CRLF lines) read by our own code, which gives the same
// bytes and values at a fraction of the cost; adding to an existing file and
// reading anything unusual go through QSettings itself.
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
    bool isWriting() const { return m_writer != nullptr || m_newFile != nullptr; }
    bool isReading() const { return m_reader != nullptr || m_plainFile != nullptr; }

    // A file read is kept after its close, so that reading the same unchanged file
    // again (the altitude theme after the project) doesn't parse it twice. This lets
    // it go.
    void forgetReadFile();

    // Whether anything of the last write went wrong: no file could be made, a
    // property met no writer, or the store could not put the file on disk.
    // Cleared by the next create or open.
    bool lastWriteFailed() const { return m_writeFailed; }

private:
    void startWriter(const QString &fileName);
    QString storeValue(const QString &address, const QString &defaultValue);

    std::unique_ptr<QSettings> m_writer;
    std::unique_ptr<QSettings> m_reader;
    std::unique_ptr<IniFileWriter> m_newFile;
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
};
