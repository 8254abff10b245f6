#include "content/ContentIni.h"

#include "platform/TextDecoding.h"

#include <QIODevice>
#include <QRegExp>
#include <QVector>

namespace ContentIni {

namespace {

// A section name holds single blanks between words only: "[ Big  Name ]" is no section.
const char *const sectionPattern = "\\[\\s*(\\S+( \\S+)*)\\s*\\]";
const char *const keyPattern = "\\s*(\\S+)\\s*=\\s*(\\S((\\s|\\S)*\\S)?)\\s*";

bool readDevice(QIODevice &device, QSettings::SettingsMap &map)
{
    parse(device.readAll(), map);
    return true;
}

bool refuseWrite(QIODevice &, const QSettings::SettingsMap &)
{
    return false;
}

} // namespace

QSettings::Format format()
{
    static const QSettings::Format registered =
        QSettings::registerFormat(QStringLiteral("ini"), readDevice, refuseWrite, Qt::CaseInsensitive);
    return registered;
}

QString lookupKey(const QString &section, const QString &key)
{
    QString full = section.isEmpty() ? key : section + QLatin1Char('/') + key;
    // The same key normalisation QSettings applies to a lookup.
    QString out;
    out.reserve(full.size());
    for (const QChar c : full) {
        if (c == QLatin1Char('/') && (out.isEmpty() || out.endsWith(QLatin1Char('/'))))
            continue;
        out += c;
    }
    if (out.endsWith(QLatin1Char('/')))
        out.chop(1);
    return out.toLower();
}

void parse(const QByteArray &data, QSettings::SettingsMap &map)
{
    const QString text = textdecoding::decode(data);
    const QStringList lines = text.split(QRegExp(QStringLiteral("(\\r\\n)|\\r|\\n")), Qt::SkipEmptyParts);
    QRegExp section(QString::fromLatin1(sectionPattern));
    QRegExp keyLine(QString::fromLatin1(keyPattern));
    QString current;
    for (const QString &line : lines) {
        if (section.exactMatch(line)) {
            current = section.cap(1) + QLatin1Char('/');
            continue;
        }
        if (!keyLine.exactMatch(line))
            continue;
        // Backslashes in keys count as separators on every system.
        QString key = keyLine.cap(1);
        key.replace(QLatin1Char('\\'), QLatin1Char('/'));
        map.insert((current + key).toLower(), keyLine.cap(2));
    }
}

} // namespace ContentIni
