#pragma once

#include <QByteArray>
#include <QDir>
#include <QDirIterator>
#include <QFile>
#include <QMap>
#include <QString>
#include <QTemporaryDir>

// Writes a test input into a temporary folder and returns its path; a test
// without its input can't mean anything, so a failed write ends the run.
inline QString writeTestFile(const QTemporaryDir &dir, const QString &name, const QByteArray &bytes)
{
    const QString file = dir.filePath(name);
    QFile f(file);
    if (!f.open(QIODevice::WriteOnly) || f.write(bytes) != bytes.size())
        qFatal("cannot write test file %s", qPrintable(file));
    return file;
}

// Everything under a folder, by relative path: links with what they name, folders,
// and files with their permissions and bytes. Two equal snapshots mean nothing in
// the folder was touched.
inline QMap<QString, QByteArray> folderSnapshot(const QString &folder)
{
    QMap<QString, QByteArray> entries;
    QDirIterator it(folder, QDir::AllEntries | QDir::NoDotAndDotDot | QDir::Hidden | QDir::System,
                    QDirIterator::Subdirectories);
    while (it.hasNext()) {
        const QString name = it.next();
        const QFileInfo info = it.fileInfo();
        QByteArray entry = QByteArray::number(int(info.permissions()), 16);
        if (info.isSymLink()) {
            entry += " -> " + QFile::encodeName(info.symLinkTarget());
        } else if (info.isDir()) {
            entry += '/';
        } else {
            QFile file(name);
            entry += ':' + (file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray("unreadable"));
        }
        entries.insert(QDir(folder).relativeFilePath(name), entry);
    }
    return entries;
}
