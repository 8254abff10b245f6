#include "platform/DesktopEntries.h"

#include <QDir>
#include <QDirIterator>
#include <QFile>
#include <QFileInfo>
#include <QHash>
#include <QSet>
#include <QStandardPaths>

#include <algorithm>

namespace {

const QString MainGroup = QStringLiteral("Desktop Entry");

// Resolves \s \n \t \r \\ (and \; in lists); any other escape stays as written, since
// the command line's own quoting still needs its backslashes.
QString unescape(const QString &raw, bool inList)
{
    QString out;
    out.reserve(raw.size());
    for (int i = 0; i < raw.size(); ++i) {
        const QChar c = raw.at(i);
        if (c != QLatin1Char('\\') || i + 1 == raw.size()) {
            out += c;
            continue;
        }
        const QChar next = raw.at(++i);
        switch (next.unicode()) {
        case 's': out += QLatin1Char(' '); break;
        case 'n': out += QLatin1Char('\n'); break;
        case 't': out += QLatin1Char('\t'); break;
        case 'r': out += QLatin1Char('\r'); break;
        case '\\': out += QLatin1Char('\\'); break;
        case ';':
            if (!inList)
                out += c;
            out += next;
            break;
        default: out += c; out += next;
        }
    }
    return out;
}

QStringList splitList(const QString &raw)
{
    QStringList items;
    QString item;
    for (int i = 0; i < raw.size(); ++i) {
        const QChar c = raw.at(i);
        if (c == QLatin1Char('\\') && i + 1 < raw.size()) {
            item += c;
            item += raw.at(++i);
        } else if (c == QLatin1Char(';')) {
            items << unescape(item, true);
            item.clear();
        } else {
            item += c;
        }
    }
    if (!item.isEmpty())
        items << unescape(item, true);
    items.removeAll(QString());
    return items;
}

bool isTrue(const QString &value)
{
    return value == QLatin1String("true") || value == QLatin1String("1");
}

// Unlocalized keys of the main group with their raw values; the first of a repeated key
// counts. Nothing when there is no main group.
std::optional<QHash<QString, QString>> readMainGroup(const QByteArray &text)
{
    QHash<QString, QString> values;
    bool seenMain = false;
    bool inMain = false;
    for (const QByteArray &rawLine : text.split('\n')) {
        const QString line = QString::fromUtf8(rawLine).trimmed();
        if (line.isEmpty() || line.startsWith(QLatin1Char('#')))
            continue;
        if (line.startsWith(QLatin1Char('[')) && line.endsWith(QLatin1Char(']'))) {
            // A repeated main group is malformed; only the first one is read.
            inMain = !seenMain && line.mid(1, line.size() - 2) == MainGroup;
            seenMain = seenMain || inMain;
            continue;
        }
        if (!inMain)
            continue;
        const int equals = line.indexOf(QLatin1Char('='));
        if (equals <= 0)
            continue;
        const QString key = line.left(equals).trimmed();
        if (key.contains(QLatin1Char('[')) || values.contains(key))
            continue;
        values.insert(key, line.mid(equals + 1).trimmed());
    }
    if (!seenMain)
        return std::nullopt;
    return values;
}

} // namespace

std::optional<DesktopEntry> DesktopEntry::parse(const QByteArray &text)
{
    const auto values = readMainGroup(text);
    if (!values)
        return std::nullopt;
    const auto string = [&](const char *key) { return unescape(values->value(QLatin1String(key)), false); };

    DesktopEntry entry;
    entry.type = string("Type");
    entry.name = string("Name");
    entry.exec = string("Exec");
    entry.tryExec = string("TryExec");
    entry.categories = splitList(values->value(QStringLiteral("Categories")));
    entry.mimeTypes = splitList(values->value(QStringLiteral("MimeType")));
    entry.hidden = isTrue(string("Hidden"));
    entry.noDisplay = isTrue(string("NoDisplay"));
    return entry;
}

std::optional<DesktopEntry> DesktopEntry::read(const QString &filePath, const QString &id)
{
    QFile file(filePath);
    if (!file.open(QIODevice::ReadOnly))
        return std::nullopt;
    // An entry is a few hundred bytes; anything far larger is no entry.
    constexpr qint64 MaxSize = 1 << 20;
    if (file.size() > MaxSize)
        return std::nullopt;
    auto entry = parse(file.readAll());
    if (entry) {
        entry->id = id;
        entry->filePath = filePath;
    }
    return entry;
}

namespace desktopentries {

QStringList applicationFolders()
{
    return QStandardPaths::standardLocations(QStandardPaths::ApplicationsLocation);
}

std::vector<DesktopEntry> applicationEntries()
{
    std::vector<DesktopEntry> entries;
    QSet<QString> seenIds;
    for (const QString &folder : applicationFolders()) {
        const QDir base(folder);
        QStringList files;
        QDirIterator it(folder, {QStringLiteral("*.desktop")}, QDir::Files, QDirIterator::Subdirectories);
        while (it.hasNext())
            files << it.next();

        QVector<QPair<QString, QString>> byId; // id, file
        for (const QString &file : files)
            byId.append({base.relativeFilePath(file).replace(QLatin1Char('/'), QLatin1Char('-')), file});
        std::sort(byId.begin(), byId.end());

        for (const auto &[id, file] : byId) {
            if (seenIds.contains(id))
                continue;
            seenIds.insert(id);
            auto entry = DesktopEntry::read(file, id);
            if (entry && !entry->hidden)
                entries.push_back(std::move(*entry));
        }
    }
    return entries;
}

std::optional<QStringList> splitCommandLine(const QString &exec)
{
    QStringList arguments;
    QString current;
    bool inArgument = false;
    bool quoted = false;
    for (int i = 0; i < exec.size(); ++i) {
        const QChar c = exec.at(i);
        if (quoted) {
            if (c == QLatin1Char('"')) {
                quoted = false;
            } else if (c == QLatin1Char('\\') && i + 1 < exec.size()
                       && QStringLiteral("\"`$\\").contains(exec.at(i + 1))) {
                current += exec.at(++i);
            } else {
                current += c;
            }
        } else if (c == QLatin1Char(' ') || c == QLatin1Char('\t') || c == QLatin1Char('\n')) {
            if (inArgument)
                arguments << current;
            current.clear();
            inArgument = false;
        } else if (c == QLatin1Char('"')) {
            quoted = true;
            inArgument = true;
        } else {
            current += c;
            inArgument = true;
        }
    }
    if (quoted)
        return std::nullopt;
    if (inArgument)
        arguments << current;
    if (arguments.isEmpty() || arguments.first().isEmpty())
        return std::nullopt;
    return arguments;
}

QStringList expandFieldCodes(const QStringList &arguments, const QString &file, const QString &name,
                             const QString &entryFile)
{
    QStringList expanded;
    bool filePlaced = false;
    for (const QString &argument : arguments) {
        QString out;
        bool hadCode = false;
        for (int i = 0; i < argument.size(); ++i) {
            const QChar c = argument.at(i);
            if (c != QLatin1Char('%') || i + 1 == argument.size()) {
                out += c;
                continue;
            }
            hadCode = true;
            switch (argument.at(++i).unicode()) {
            case '%': out += QLatin1Char('%'); break;
            case 'f':
            case 'F':
            case 'u':
            case 'U':
                if (!filePlaced)
                    out += file;
                filePlaced = true;
                break;
            case 'c': out += name; break;
            case 'k': out += entryFile; break;
            default: break; // %i without an icon of ours, and the deprecated codes
            }
        }
        if (!out.isEmpty() || !hadCode)
            expanded << out;
    }
    if (!filePlaced)
        expanded << file;
    return expanded;
}

QString resolveProgram(const QString &program)
{
    if (!program.contains(QLatin1Char('/')))
        return QStandardPaths::findExecutable(program);
    const QFileInfo info(program);
    if (info.isAbsolute() && info.isFile() && info.isExecutable())
        return info.absoluteFilePath();
    return QString();
}

} // namespace desktopentries
