#include "project/IniFileReader.h"

#include <QStringList>

#include <cstring>

namespace {

bool isKeyChar(char c)
{
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9') || c == '_' || c == '-' || c == '.';
}

bool isPlainName(const char *p, int length)
{
    if (length <= 0)
        return false;
    for (int i = 0; i < length; ++i) {
        if (!isKeyChar(p[i]))
            return false;
    }
    return true;
}

bool isSpace(char c)
{
    return c == ' ' || c == '\t';
}

void chopTrailingSpaces(QString &text, int limit)
{
    int n = text.size() - 1;
    while (n >= limit && (text.at(n) == QLatin1Char(' ') || text.at(n) == QLatin1Char('\t')))
        text.truncate(n--);
}

int hexValue(char c)
{
    if (c >= '0' && c <= '9')
        return c - '0';
    if (c >= 'a' && c <= 'f')
        return c - 'a' + 10;
    if (c >= 'A' && c <= 'F')
        return c - 'A' + 10;
    return -1;
}

} // namespace

bool IniFileReader::parse(const QByteArray &data)
{
    m_data = data;
    m_sections.clear();
    const char *p = m_data.constData();
    const int size = m_data.size();
    if (size >= 3 && std::memcmp(p, "\xEF\xBB\xBF", 3) == 0)
        return false;

    QByteArray current;
    Range *range = nullptr;
    int pos = 0;
    while (pos < size) {
        const char *newline = static_cast<const char *>(std::memchr(p + pos, '\n', size_t(size - pos)));
        const int lineEnd = newline ? int(newline - p) : size;
        int start = pos;
        pos = lineEnd + 1;
        while (start < lineEnd && isSpace(p[start]))
            ++start;
        if (start == lineEnd)
            continue;

        if (p[start] == '[') {
            const int nameLength = lineEnd - start - 2;
            if (p[lineEnd - 1] != ']' || !isPlainName(p + start + 1, nameLength)
                || (nameLength == 7 && qstrnicmp(p + start + 1, "general", 7) == 0))
                return false;
            current = QByteArray::fromRawData(p + start + 1, nameLength);
            if (m_sections.contains(current))
                return false;
            range = &m_sections[current];
            range->begin = range->end = start;
            continue;
        }
        if (!range)
            return false;
        const char *equals = static_cast<const char *>(std::memchr(p + start, '=', size_t(lineEnd - start)));
        if (!equals || !isPlainName(p + start, int(equals - p) - start))
            return false;
        // The value: escapes stay on this line, quotes close on it, no comment follows.
        bool quoted = false;
        for (int i = int(equals - p) + 1; i < lineEnd; ++i) {
            const char c = p[i];
            if (c == '\\') {
                if (++i >= lineEnd)
                    return false;
                if (p[i] == '\r')
                    return false;
            } else if (c == '"') {
                quoted = !quoted;
            } else if ((c == ';' && !quoted) || c == '\r') {
                return false;
            }
        }
        if (quoted)
            return false;
        range->end = lineEnd;
    }
    return true;
}

IniFileReader::Lookup IniFileReader::value(const QString &section, const QString &key, QString &out) const
{
    const QByteArray sectionName = section.toLatin1();
    const auto found = m_sections.constFind(sectionName);
    if (found == m_sections.constEnd())
        return Lookup::Missing;
    const QByteArray keyName = key.toLatin1();
    if (QString::fromLatin1(keyName) != key)
        return Lookup::Missing;

    const char *p = m_data.constData();
    int from = -1, to = -1;
    int pos = found->begin;
    while (pos < found->end) {
        const char *newline = static_cast<const char *>(std::memchr(p + pos, '\n', size_t(found->end - pos)));
        const int lineEnd = newline ? int(newline - p) : found->end;
        int start = pos;
        pos = lineEnd + 1;
        while (start < lineEnd && isSpace(p[start]))
            ++start;
        if (start == lineEnd || p[start] == '[')
            continue;
        const int equals = int(static_cast<const char *>(std::memchr(p + start, '=', size_t(lineEnd - start))) - p);
        // The last line of the key counts, as later values replace earlier ones.
        if (equals - start == keyName.size() && std::memcmp(p + start, keyName.constData(), size_t(keyName.size())) == 0) {
            from = equals + 1;
            to = lineEnd;
        }
    }
    if (from < 0)
        return Lookup::Missing;

    // Most values are plain text: no escapes, quotes, lists or blanks at the ends.
    bool plain = to == from || (!isSpace(p[from]) && !isSpace(p[to - 1]));
    for (int i = from; plain && i < to; ++i) {
        const char c = p[i];
        plain = c != '\\' && c != '"' && c != ',' && uchar(c) < 0x80;
    }
    if (plain) {
        if (to > from && p[from] == '@')
            return Lookup::NeedsStore;
        out = QString::fromLatin1(p + from, to - from);
        return Lookup::Found;
    }

    QString text;
    QStringList list;
    if (unescapeValue(p, from, to, text, list)) {
        for (const QString &item : list) {
            if (item.startsWith(QLatin1Char('@')))
                return Lookup::NeedsStore;
        }
        out = list.join(QLatin1Char(','));
        return Lookup::Found;
    }
    if (text.startsWith(QLatin1Char('@')))
        return Lookup::NeedsStore;
    out = text;
    return Lookup::Found;
}

bool IniFileReader::unescapeValue(const char *str, int from, int to, QString &text, QStringList &list)
{
    static const char escapeCodes[][2] = {{'a', '\a'}, {'b', '\b'}, {'f', '\f'}, {'n', '\n'}, {'r', '\r'}, {'t', '\t'},
                                          {'v', '\v'}, {'"', '"'},  {'?', '?'},  {'\'', '\''}, {'\\', '\\'}};
    bool isList = false;
    bool chopAtEnd = true; // an escape cut off by the end keeps the blanks before it
    bool inQuotes = false;
    bool currentQuoted = false;
    int i = from;
    int chopLimit = 0;

    auto skipSpaces = [&] {
        while (i < to && isSpace(str[i]))
            ++i;
    };
    skipSpaces();
    chopLimit = text.size();
    while (i < to) {
        const char c = str[i];
        if (c == '\\') {
            ++i;
            if (i >= to) {
                chopAtEnd = false;
                break;
            }
            const char e = str[i++];
            bool known = false;
            for (const auto &code : escapeCodes) {
                if (e == code[0]) {
                    text += QLatin1Char(code[1]);
                    known = true;
                    break;
                }
            }
            if (known) {
                chopLimit = text.size();
                continue;
            }
            if (e == 'x') {
                if (i >= to) {
                    chopAtEnd = false;
                    break;
                }
                if (hexValue(str[i]) < 0) {
                    chopLimit = text.size();
                    continue;
                }
                uint value = 0;
                while (i < to && hexValue(str[i]) >= 0)
                    value = (value << 4) + uint(hexValue(str[i++]));
                text += QChar(ushort(value & 0xFFFF));
            } else if (e >= '0' && e <= '7') {
                uint value = uint(e - '0');
                while (i < to && str[i] >= '0' && str[i] <= '7')
                    value = (value << 3) + uint(str[i++] - '0');
                text += QChar(ushort(value & 0xFFFF));
            }
            chopLimit = text.size();
        } else if (c == '"') {
            ++i;
            currentQuoted = true;
            inQuotes = !inQuotes;
            if (!inQuotes) {
                skipSpaces();
                chopLimit = text.size();
            }
        } else if (c == ',' && !inQuotes) {
            if (!currentQuoted)
                chopTrailingSpaces(text, chopLimit);
            if (!isList) {
                isList = true;
                list.clear();
            }
            list.append(text);
            text.clear();
            currentQuoted = false;
            ++i;
            skipSpaces();
            chopLimit = text.size();
        } else {
            int j = i + 1;
            while (j < to && str[j] != '\\' && str[j] != '"' && str[j] != ',')
                ++j;
            text += QString::fromLatin1(str + i, j - i);
            i = j;
        }
    }
    if (!currentQuoted && chopAtEnd)
        chopTrailingSpaces(text, chopLimit);
    if (isList)
        list.append(text);
    return isList;
}
