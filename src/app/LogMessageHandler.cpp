#include "app/LogMessageHandler.h"

#include <QDir>
#include <QFile>
#include <QStandardPaths>
#include <QTextStream>

namespace {

// Nothing in here may log through Qt: this runs inside the message handler.
void rotate(QFile &log)
{
    const QString path = log.fileName();
    const QString backup = path + QLatin1String(LogFile::BackupSuffix);
    log.close();
    QFile::remove(backup);
    // Same outcome as copying and removing, without writing the old log twice.
    if (!QFile::rename(path, backup)) {
        QFile::copy(path, backup);
        QFile::remove(path);
    }
}

} // namespace

QString formatLogRecord(QtMsgType type, const QString &text, const QDateTime &time)
{
    QString line = time.toString(QStringLiteral("[yyyy-MM-dd hh:mm:ss:zzz] "));
    switch (type) {
    case QtDebugMsg: line += QStringLiteral("[D] %1").arg(text); break;
    case QtWarningMsg: line += QStringLiteral("[W] %1").arg(text); break;
    case QtCriticalMsg: line += QStringLiteral("[C] %1").arg(text); break;
    case QtFatalMsg: line += QStringLiteral("[F] %1").arg(text); break;
    default: break;
    }
    return line;
}

void appendLogLine(const QString &directory, const QString &line)
{
    if (directory.isEmpty())
        return;
    if (!QDir(directory).exists())
        QDir().mkdir(directory);

    QFile log(directory + QLatin1Char('/') + QLatin1String(LogFile::FileName));
    if (!log.open(QIODevice::WriteOnly | QIODevice::Append))
        return;
    if (log.size() > LogFile::RotationSize) {
        rotate(log);
        if (!log.open(QIODevice::WriteOnly | QIODevice::Append))
            return;
    }

    QTextStream out(&log);
    out.setCodec("UTF-8");
    out << line << Qt::endl;
}

void writeLogRecord(const QString &directory, QtMsgType type, const QString &text)
{
    appendLogLine(directory, formatLogRecord(type, text, QDateTime::currentDateTime()));
}

void logMessageHandler(QtMsgType type, const QMessageLogContext &context, const QString &text)
{
    Q_UNUSED(context)
    writeLogRecord(QStandardPaths::writableLocation(QStandardPaths::DataLocation), type, text);
}
