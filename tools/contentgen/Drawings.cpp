#include "Drawings.h"

#include "app/Trace.h"
#include "content/ContentIni.h"

#include <QFile>
#include <QRegularExpression>

Drawings::Drawings(const QString &sourceFolder)
    : m_svgFolder(sourceFolder + QStringLiteral("/svg/"))
{
    QFile file(sourceFolder + QStringLiteral("/drawings.ini"));
    if (file.open(QIODevice::ReadOnly))
        ContentIni::parse(file.readAll(), m_values);
}

QString Drawings::value(const QString &stem, const QString &key, const QString &fallback) const
{
    return m_values.value(ContentIni::lookupKey(stem, key), fallback).toString();
}

bool Drawings::has(const QString &stem, const QString &key) const
{
    return m_values.contains(ContentIni::lookupKey(stem, key));
}

QByteArray Drawings::readSvgFile(const QString &name) const
{
    QFile file(m_svgFolder + name);
    if (!file.open(QIODevice::ReadOnly)) {
        logTrace(3, QStringLiteral("contentgen: missing drawing %s"), file.fileName());
        return QByteArray();
    }
    return file.readAll();
}

QByteArray Drawings::substitute(QByteArray text, const QString &stem, int depth) const
{
    static const QRegularExpression placeholder(QStringLiteral("\\{\\{([A-Za-z0-9_]+)\\}\\}"));
    QString out = QString::fromUtf8(text);
    for (int round = 0; round < 1000; ++round) {
        const QRegularExpressionMatch match = placeholder.match(out);
        if (!match.hasMatch())
            break;
        const QString key = match.captured(1);
        if (!has(stem, key)) {
            logTrace(3, QStringLiteral("contentgen: drawing of %s needs a value for {{%s}}"), stem, key);
            return QByteArray();
        }
        QString replacement = value(stem, key);
        if (replacement.startsWith(QLatin1Char('@'))) {
            if (depth > 4) {
                logTrace(3, QStringLiteral("contentgen: drawing of %s nests too deep"), stem);
                return QByteArray();
            }
            const QByteArray part = substitute(readSvgFile(replacement.mid(1)), stem, depth + 1);
            if (part.isEmpty())
                return QByteArray();
            replacement = QString::fromUtf8(part);
        }
        out.replace(match.capturedStart(), match.capturedLength(), replacement);
    }
    return out.toUtf8();
}

QByteArray Drawings::svg(const QString &stem, const QString &key) const
{
    const QString name = value(stem, key, key == QLatin1String("svg") ? stem + QStringLiteral(".svg") : QString());
    if (name.isEmpty())
        return QByteArray();
    const QByteArray text = readSvgFile(name);
    return text.isEmpty() ? text : substitute(text, stem, 0);
}
