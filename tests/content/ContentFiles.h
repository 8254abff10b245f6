#pragma once

#include <QByteArray>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QString>

// Writes a test file, making its folders.
inline bool writeFile(const QString &path, const QByteArray &bytes)
{
    QDir().mkpath(QFileInfo(path).path());
    QFile f(path);
    if (!f.open(QIODevice::WriteOnly | QIODevice::Truncate))
        return false;
    return f.write(bytes) == bytes.size();
}

// "<folder>informations/<stem>.ini" with the lines given, in section main.
inline bool writeItemIni(const QString &folder, const QString &stem, const QByteArray &mainLines)
{
    return writeFile(folder + QStringLiteral("informations/") + stem + QStringLiteral(".ini"),
                     "[main]\n" + mainLines);
}
