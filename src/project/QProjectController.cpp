#include "project/QProjectController.h"

#include "app/Trace.h"
#include "project/SettingsValue.h"

#include <QDateTime>
#include <QFile>
#include <QFileInfo>
#include <QSettings>
#include <QStringList>

namespace {

// The file's bytes in one piece; empty when it can't be read.
LargeBuffer readWholeFile(const QString &fileName)
{
    LargeBuffer bytes;
    QFile file(fileName);
    if (!file.open(QIODevice::ReadOnly))
        return bytes;
    const qint64 size = file.size();
    if (size <= 0 || !bytes.reserve(size_t(size)))
        return bytes;
    qint64 got = 0;
    while (got < size) {
        const qint64 n = file.read(bytes.data() + got, size - got);
        if (n <= 0)
            break;
        got += n;
    }
    bytes.resize(size_t(got));
    return bytes;
}

QString address(const QString &section, const QString &key)
{
    return QStringLiteral("%1/%2").arg(section, key);
}

// Every value of an existing file, as the container reads it, into `content`.
// False when the file can't be read whole: adding to it would lose the rest.
bool copyStoredValues(const QString &fileName, IniFileWriter &content)
{
    if (!QFileInfo(fileName).isReadable())
        return false;
    const QSettings stored(fileName, QSettings::IniFormat);
    if (stored.status() != QSettings::NoError)
        return false;
    for (const QString &key : stored.allKeys())
        content.setValue(QString(), key, settingsValueText(stored.value(key)));
    return true;
}

} // namespace

QProjectController::QProjectController() = default;

QProjectController::~QProjectController()
{
    closeProjectFile();
}

void QProjectController::writeFailed(const QString &reason)
{
    m_writeFailed = true;
    if (m_writeError.isEmpty())
        m_writeError = reason;
}

bool QProjectController::startWriting(const QString &fileName, std::unique_ptr<IniFileWriter> content)
{
    auto target = std::make_unique<AtomicFileWriter>(fileName);
    if (!target->open()) {
        writeFailed(target->errorString());
        return false;
    }
    content->setValue(QStringLiteral("Header"), QStringLiteral("projecttype"), QString::fromLatin1(ProjectFormat::projectIdentifier));
    content->setValue(QStringLiteral("Header"), QStringLiteral("projectversion"), QString::number(ProjectFormat::currentVersion));
    m_content = std::move(content);
    m_target = std::move(target);
    m_fileName = fileName;
    return true;
}

bool QProjectController::createProjectFile(QString fileName)
{
    if (!isIdle()) {
        logTrace(3, QStringLiteral("QProjectController::createProjectFile[%s] - writer/reader object always created"), fileName);
        return false;
    }
    m_writeFailed = false;
    m_writeError.clear();
    forgetReadFile();
    // The file that stands there now is replaced only by a complete new one, at the close.
    if (!startWriting(fileName, std::make_unique<IniFileWriter>())) {
        logTrace(3, QStringLiteral("QProjectController::createProjectFile: can't create file %s"), fileName);
        logTrace(3, QStringLiteral("QProjectController::createProjectFile[%s] - %s"), fileName, m_writeError);
        m_fileName.clear();
        return true;
    }
    return true;
}

bool QProjectController::openForAdding(const QString &fileName)
{
    forgetReadFile();
    auto content = std::make_unique<IniFileWriter>();
    if (QFileInfo(fileName).isFile() && !copyStoredValues(fileName, *content)) {
        writeFailed(QStringLiteral("the file can't be read"));
        logTrace(3, QStringLiteral("QProjectController::openProjectFile[%s] - the file can't be read, nothing is added"), fileName);
        return false;
    }
    if (!startWriting(fileName, std::move(content))) {
        logTrace(3, QStringLiteral("QProjectController::openProjectFile[%s] - can't write: %s"), fileName, m_writeError);
        return false;
    }
    return true;
}

bool QProjectController::openProjectFile(QString fileName, bool forLoad)
{
    if (!isIdle()) {
        logTrace(3, QStringLiteral("QProjectController::openProjectFile[%s] - writer/reader object always created"), fileName);
        return false;
    }
    m_writeFailed = false;
    m_writeError.clear();
    m_numbered.reset();
    if (!forLoad)
        return openForAdding(fileName);
    if (!QFile::exists(fileName)) {
        logTrace(3, QStringLiteral("QProjectController::openProjectFile for load: file %s doesn't exist"), fileName);
        return false;
    }
    m_fileName = fileName;
    const QFileInfo info(fileName);
    const qint64 modified = info.lastModified().toMSecsSinceEpoch();
    if (m_lastRead.reader && m_lastRead.name == info.absoluteFilePath() && m_lastRead.size == info.size()
        && m_lastRead.modified == modified) {
        m_plainFile = std::move(m_lastRead.reader);
    } else {
        forgetReadFile();
        auto plain = std::make_unique<IniFileReader>();
        if (plain->parse(readWholeFile(fileName))) {
            m_plainFile = std::move(plain);
            m_lastRead.name = info.absoluteFilePath();
            m_lastRead.size = info.size();
            m_lastRead.modified = modified;
        } else {
            m_reader = std::make_unique<QSettings>(fileName, QSettings::IniFormat);
        }
    }
    const QString found = readProperty(QStringLiteral("Header"), QStringLiteral("projecttype"), QString());
    if (found != QLatin1String(ProjectFormat::projectIdentifier)) {
        logTrace(3, QStringLiteral("ProjectController::openProjectFile:%s - no valid projectfile - wrong projectFileIndentifier %s."),
                 fileName, found);
        return false;
    }
    m_projectVersion = readProperty(QStringLiteral("Header"), QStringLiteral("projectversion"), QString()).toUInt();
    if (m_projectVersion > ProjectFormat::highestAcceptedVersion) {
        logTrace(3, QStringLiteral("ProjectController::openProjectFile:%s - no valid projectfile - wrong projectVersion %d"),
                 fileName, m_projectVersion);
        return false;
    }
    return true;
}

bool QProjectController::writeProperty(QString section, QString key, QString value)
{
    if (!m_content) {
        logTrace(3, QStringLiteral("QProjectController::writeProperty[%s]: writer object doesn't exist"), m_fileName);
        writeFailed(QStringLiteral("nothing is open for writing"));
        return false;
    }
    m_content->setValue(section, key, value);
    return true;
}

QString QProjectController::readProperty(QString section, QString key, QString defaultValue)
{
    if (m_plainFile) {
        QString value;
        return m_plainFile->value(section, key, value) ? value : defaultValue;
    }
    if (!m_reader) {
        logTrace(3, QStringLiteral("QProjectController::writeProperty: file %s doesn't exist"), m_fileName);
        return QString();
    }
    return storeValue(address(section, key), defaultValue);
}

QString QProjectController::storeValue(const QString &address, const QString &defaultValue)
{
    const QVariant value = m_reader->value(address);
    return value.isValid() ? settingsValueText(value) : defaultValue;
}

bool QProjectController::closeProjectFile()
{
    if (m_content) {
        if (!m_content->writeInto(*m_target) || !m_target->commit()) {
            logTrace(3, QStringLiteral("QProjectController::closeProjectFile[%s] - the file could not be written, the previous one stays: %s"),
                     m_fileName, m_target->errorString());
            writeFailed(m_target->errorString());
        }
        m_content.reset();
        m_target.reset();
    }
    m_reader.reset();
    m_numbered.reset();
    if (m_plainFile)
        m_lastRead.reader = std::move(m_plainFile);
    return true;
}

std::vector<int32_t> QProjectController::numberedSections(QString stem, int32_t count)
{
    if (!m_numbered) {
        m_numbered = std::make_unique<NumberedSections>();
        if (m_plainFile) {
            m_plainFile->listSections(*m_numbered);
        } else if (m_reader) {
            for (const QString &group : m_reader->childGroups())
                m_numbered->add(group);
        }
    }
    return m_numbered->below(stem, count);
}

void QProjectController::forgetReadFile()
{
    m_lastRead = ReadFile();
}
