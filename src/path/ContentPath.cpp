#include "path/ContentPath.h"

#include "app/ProgramFolder.h"

#include <QFileInfo>
#include <QUrl>

namespace {

const QString contentFolderName = QStringLiteral("imgsrc");
const QString fileUrlPrefix = QStringLiteral("file:///");

bool isSeparator(QChar c)
{
    return c == QLatin1Char('/') || c == QLatin1Char('\\');
}

// Prefers "imgsrc" as a whole folder name, so that a user folder such as
// "myimgsrc" further up does not cut the path short.
int contentFolderPosition(const QString &text)
{
    for (int from = 0;;) {
        const int at = text.indexOf(contentFolderName, from);
        if (at < 0)
            break;
        const int end = at + contentFolderName.size();
        if ((at == 0 || isSeparator(text.at(at - 1))) && (end == text.size() || isSeparator(text.at(end))))
            return at;
        from = at + 1;
    }
    return text.indexOf(contentFolderName);
}

} // namespace

QString rebaseContentPath(const QString &stored)
{
    const int at = contentFolderPosition(stored);
    const QString folder = programFolder();
    if (at < 0 || folder.isEmpty() || QFileInfo::exists(localFilePath(stored)))
        return stored;

    QString rest = stored.mid(at);
    rest.replace(QLatin1Char('\\'), QLatin1Char('/'));
    QString base = folder;
    base.replace(QLatin1Char('\\'), QLatin1Char('/'));
    if (!stored.startsWith(fileUrlPrefix))
        return base + QLatin1Char('/') + rest;
    // "file:///" + "C:/x" on one system, "file://" + "/opt/x" on another.
    if (base.startsWith(QLatin1Char('/')))
        return QStringLiteral("file://") + base + QLatin1Char('/') + rest;
    return fileUrlPrefix + base + QLatin1Char('/') + rest;
}

QString localFilePath(const QString &stored)
{
    if (!stored.startsWith(QLatin1String("file:"), Qt::CaseInsensitive))
        return stored;
    // Percent-encoded URLs decode through QUrl; plain "file:///%1" texts may hold
    // characters that QUrl reads differently, so fall back to cutting the scheme.
    const QString decoded = QUrl(stored).toLocalFile();
    if (!decoded.isEmpty() && QFileInfo::exists(decoded))
        return decoded;
    QString plain = stored.mid(5);
    while (plain.startsWith(QLatin1String("//")))
        plain.remove(0, 1);
    return plain;
}
