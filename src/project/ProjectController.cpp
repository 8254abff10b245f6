#include "project/ProjectController.h"

#include "app/Trace.h"

#include <QFile>

#include <sstream>

ProjectController::ProjectController()
    : m_projectFileExtension(QString::fromLatin1(ProjectFormat::projectExtension))
    , m_presetFileExtension(QString::fromLatin1(ProjectFormat::presetExtension))
{
}

ProjectController::~ProjectController() = default;

bool ProjectController::createProjectFile(QString fileName)
{
    if (m_outStream.is_open()) {
        logTrace(3, QStringLiteral("ProjectController::createProjectFile - m_outStream still open"));
        closeProjectFile();
    }
    const std::string path = QFile::encodeName(fileName).toStdString();
    m_outStream.open(path, std::ios::out | std::ios::trunc);
    m_outStream.close();
    m_outStream.open(path, std::ios::out | std::ios::app);
    if (!m_outStream.is_open()) {
        m_fileName.clear();
        return false;
    }
    m_outStream << L"[header]\n";
    m_outStream << L"projecttype = " << ProjectFormat::projectIdentifier << L"\n";
    m_outStream << L"projectversion = " << ProjectFormat::currentVersion << L"\n";
    m_fileName = fileName;
    return true;
}

bool ProjectController::openProjectFile(QString fileName, bool forLoad)
{
    Q_UNUSED(forLoad)
    std::wifstream in(QFile::encodeName(fileName).toStdString());
    if (!in.is_open()) {
        m_fileName.clear();
        return false;
    }
    std::wstring line;
    std::getline(in, line);
    std::wistringstream words(line);
    std::wstring first, second;
    words >> first >> second;
    logTrace(0, QStringLiteral("ProjectController::openProjectFile -> read %s %s"),
             QString::fromStdWString(first), QString::fromStdWString(second));
    m_fileName = fileName;
    return true;
}

bool ProjectController::writeProperty(QString, QString, QString)
{
    if (!m_outStream.is_open())
        return false;
    m_outStream << L"test = Writing this to a file.\n";
    return true;
}

QString ProjectController::readProperty(QString, QString, QString defaultValue)
{
    return defaultValue;
}

std::vector<int32_t> ProjectController::numberedSections(QString, int32_t)
{
    return {};
}

bool ProjectController::closeProjectFile()
{
    m_outStream.close();
    return true;
}
