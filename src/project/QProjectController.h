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

private:
    void startWriter(const QString &fileName);

    std::unique_ptr<QSettings> m_writer;
    std::unique_ptr<QSettings> m_reader;
};
