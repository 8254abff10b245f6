#pragma once

#include <QString>

#include <cstdint>
#include <fstream>
#include <vector>

// The project/preset file container. Callers address values by section and key;
// the schema lives in the classes that save and load themselves through it.
// This base is the first, plain-stream writer of the format; the document always
// uses QProjectController, which overrides every operation.
class ProjectController
{
public:
    ProjectController();
    virtual ~ProjectController();

    ProjectController(const ProjectController &) = delete;
    ProjectController &operator=(const ProjectController &) = delete;

    virtual bool createProjectFile(QString fileName);
    virtual bool openProjectFile(QString fileName, bool forLoad);
    virtual bool writeProperty(QString section, QString key, QString value);
    virtual QString readProperty(QString section, QString key, QString defaultValue);
    virtual bool closeProjectFile();
    // The numbers n below `count`, ascending, for which a section `stem` + n holds
    // a key: the entries of a list stored as "keypoint0", "keypoint1", ... that a
    // file has, even when one in the middle is gone.
    virtual std::vector<int32_t> numberedSections(QString stem, int32_t count);

    uint32_t projectVersion() const { return m_projectVersion; }
    const QString &fileName() const { return m_fileName; }
    const QString &projectFileExtension() const { return m_projectFileExtension; }
    const QString &presetFileExtension() const { return m_presetFileExtension; }

protected:
    QString m_fileName;
    const QString m_projectFileExtension;
    const QString m_presetFileExtension;
    uint32_t m_projectVersion = 1;
    std::wofstream m_outStream;
};

namespace ProjectFormat {
inline const char *const projectIdentifier = "ZKGEO";
constexpr uint32_t currentVersion = 2;
constexpr uint32_t highestAcceptedVersion = 2;
inline const char *const projectExtension = "zkgeo";
inline const char *const presetExtension = "tmprs";
}
