#pragma once

#include "project/ProjectController.h"

#include <memory>

class QSettings;

// The ini container used by projects and altitude presets: one writer or one
// reader at a time, over QSettings in IniFormat.
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

    bool isIdle() const { return !m_writer && !m_reader; }
    bool isWriting() const { return m_writer != nullptr; }
    bool isReading() const { return m_reader != nullptr; }

    // Whether anything of the last write went wrong: no file could be made, a
    // property met no writer, or the store could not put the file on disk.
    // Cleared by the next create or open.
    bool lastWriteFailed() const { return m_writeFailed; }

private:
    void startWriter(const QString &fileName);

    std::unique_ptr<QSettings> m_writer;
    std::unique_ptr<QSettings> m_reader;
    bool m_writeFailed = false;
};
