#pragma once

#include <QDateTime>
#include <QString>
#include <QtGlobal>

// The optional file log of Qt's messages, installed with qInstallMessageHandler when
// the program is started with "/logging". Each record opens and closes the file, so
// records from several threads need no lock.
namespace LogFile {
inline constexpr const char *FileName = "routeloom.log";
inline constexpr const char *BackupSuffix = ".bak";
// A log larger than this is moved to the backup before the next record is written.
inline constexpr qint64 RotationSize = 10000000;
} // namespace LogFile

// "[yyyy-MM-dd hh:mm:ss:zzz] [D] text" and so on. An info record keeps only its time
// stamp: the log format has always dropped the text of that type.
QString formatLogRecord(QtMsgType type, const QString &text, const QDateTime &time);

// Appends one line to directory/routeloom.log, creating the last level of directory
// if it is missing and rotating a log that has grown over the limit. Silently drops
// the line when the file can't be written.
void appendLogLine(const QString &directory, const QString &line);

// formatLogRecord with the current local time, then appendLogLine.
void writeLogRecord(const QString &directory, QtMsgType type, const QString &text);

// For qInstallMessageHandler: writes to the application's data folder.
void logMessageHandler(QtMsgType type, const QMessageLogContext &context, const QString &text);
