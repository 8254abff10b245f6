#pragma once

#include <QByteArray>
#include <QSettings>
#include <QString>

// The tolerant, read-only ini format of content files and splash texts. Unlike
// QSettings::IniFormat it keeps values with commas, semicolons, quotes and
// backslashes exactly as written; keys are "section/key", lower-cased.
namespace ContentIni {

// The format handle, registered with QSettings on first use under the "ini"
// extension with case-insensitive keys. Writing through it always fails.
// Keys are stored lower-cased, and QSettings on Linux compares keys as given,
// so look them up lower-cased there (readIniValue does so itself). QSettings also
// keeps one parse per file path whatever the format, so a file that was read as
// QSettings::IniFormat in this process may come back parsed that way: readIniValue
// parses content files itself and is the safer road.
QSettings::Format format();

// Parses the text of one file into map. Never fails: lines that are neither a
// section header nor a key line are skipped. The encoding is that of a byte-order
// mark; without one UTF-8 when valid, else Windows-1252.
void parse(const QByteArray &data, QSettings::SettingsMap &map);

// The lookup key of section/key as the format stores it.
QString lookupKey(const QString &section, const QString &key);

}
