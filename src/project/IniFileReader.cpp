#include "project/IniFileReader.h"

#include "project/SettingsValue.h"

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

// Where the text of a line ends: before the '\n', and before a '\r' that comes
// with it, as files from Windows have them.
qint64 textEnd(const char *p, qint64 lineStart, qint64 lineEnd)
{
    return lineEnd > lineStart && p[lineEnd - 1] == '\r' ? lineEnd - 1 : lineEnd;
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

namespace {

uint32_t hashBytes(const char *p, uint32_t length)
{
    uint32_t h = 2166136261u;
    for (uint32_t i = 0; i < length; ++i)
        h = (h ^ uchar(p[i])) * 16777619u;
    return h;
}

// Latin-1 bytes of a name, false when it has characters beyond; no allocation for
// the short names of sections and keys.
bool latin1(const QString &text, char *buffer, int capacity, int &length)
{
    length = text.size();
    if (length > capacity)
        return false;
    const QChar *c = text.unicode();
    for (int i = 0; i < length; ++i) {
        if (c[i].unicode() > 0xFF)
            return false;
        buffer[i] = char(c[i].unicode());
    }
    return true;
}

} // namespace

const IniFileReader::Section *IniFileReader::find(const char *name, uint32_t length) const
{
    if (m_table.empty())
        return nullptr;
    const uint32_t h = hashBytes(name, length);
    const size_t mask = m_table.size() - 1;
    for (size_t i = h & mask; m_table[i].second; i = (i + 1) & mask) {
        if (m_table[i].first != h)
            continue;
        const Section &s = m_sections[m_table[i].second - 1];
        if (s.nameLength == length && std::memcmp(m_data + s.name, name, length) == 0)
            return &s;
    }
    return nullptr;
}

bool IniFileReader::insert(qint64 name, uint32_t length)
{
    if ((m_sections.size() + 1) * 2 > m_table.size()) {
        std::vector<std::pair<uint32_t, uint32_t>> old(std::max<size_t>(m_table.size() * 2, 1024));
        old.swap(m_table);
        const size_t mask = m_table.size() - 1;
        for (const auto &slot : old) {
            if (!slot.second)
                continue;
            size_t i = slot.first & mask;
            while (m_table[i].second)
                i = (i + 1) & mask;
            m_table[i] = slot;
        }
    }
    const uint32_t h = hashBytes(m_data + name, length);
    const size_t mask = m_table.size() - 1;
    size_t i = h & mask;
    for (; m_table[i].second; i = (i + 1) & mask) {
        if (m_table[i].first != h)
            continue;
        const Section &s = m_sections[m_table[i].second - 1];
        if (s.nameLength == length && std::memcmp(m_data + s.name, m_data + name, length) == 0)
            return false;
    }
    m_sections.push_back(Section{name, 0, 0, length});
    m_table[i] = {h, uint32_t(m_sections.size())};
    return true;
}

bool IniFileReader::parse(const QByteArray &data)
{
    const QByteArray copy = data;
    const bool ok = parse(copy.constData(), copy.size());
    m_own = copy;
    return ok;
}

bool IniFileReader::parse(LargeBuffer &&data)
{
    LargeBuffer own = std::move(data);
    const bool ok = parse(own.data(), qint64(own.size()));
    m_ownLarge = std::move(own);
    return ok;
}

bool IniFileReader::parse(const char *p, qint64 size)
{
    m_own.clear();
    m_ownLarge = LargeBuffer();
    m_data = p;
    m_size = size;
    m_sections.clear();
    m_table.clear();
    m_cached = nullptr;
    if (size >= 3 && std::memcmp(p, "\xEF\xBB\xBF", 3) == 0)
        return false;

    Section *range = nullptr;
    qint64 pos = 0;
    while (pos < size) {
        const char *newline = static_cast<const char *>(std::memchr(p + pos, '\n', size_t(size - pos)));
        const qint64 lineEnd = textEnd(p, pos, newline ? qint64(newline - p) : size);
        qint64 start = pos;
        pos = (newline ? qint64(newline - p) : size) + 1;
        while (start < lineEnd && isSpace(p[start]))
            ++start;
        if (start == lineEnd)
            continue;

        if (p[start] == '[') {
            const qint64 nameLength = lineEnd - start - 2;
            if (p[lineEnd - 1] != ']' || nameLength > 0xFFFF || !isPlainName(p + start + 1, int(nameLength))
                || (nameLength == 7 && qstrnicmp(p + start + 1, "general", 7) == 0))
                return false;
            if (!insert(start + 1, uint32_t(nameLength)))
                return false;
            range = &m_sections.back();
            range->begin = range->end = lineEnd;
            continue;
        }
        if (!range)
            return false;
        const char *equals = static_cast<const char *>(std::memchr(p + start, '=', size_t(lineEnd - start)));
        if (!equals || !isPlainName(p + start, int(equals - p - start)))
            return false;
        // The value: escapes stay on this line, quotes close on it, no comment follows.
        bool quoted = false;
        for (qint64 i = qint64(equals - p) + 1; i < lineEnd; ++i) {
            const char c = p[i];
            if (c == '\\') {
                if (++i >= lineEnd || p[i] == '\r')
                    return false;
            } else if (c == '"') {
                quoted = !quoted;
            } else if ((c == ';' && !quoted) || c == '\r') {
                return false;
            }
        }
        if (quoted)
            return false;
        // Sections are only added at a heading, so `range` is still the current one.
        range->end = lineEnd;
    }
    return true;
}

bool IniFileReader::value(const QString &section, const QString &key, QString &out) const
{
    char sectionName[256], keyName[256];
    int sectionLength = 0, keyLength = 0;
    if (!latin1(section, sectionName, int(sizeof sectionName), sectionLength)
        || !latin1(key, keyName, int(sizeof keyName), keyLength))
        return false;
    // A record's keys are read one after another: most lookups stay in the section
    // of the one before.
    const Section *found = m_cached;
    if (!found || found->nameLength != uint32_t(sectionLength)
        || std::memcmp(m_data + found->name, sectionName, size_t(sectionLength)) != 0)
        found = find(sectionName, uint32_t(sectionLength));
    if (!found)
        return false;

    const char *p = m_data;
    if (m_cached != found) {
        m_cached = found;
        m_lines.clear();
        qint64 pos = found->begin;
        while (pos < found->end) {
            const char *newline = static_cast<const char *>(std::memchr(p + pos, '\n', size_t(found->end - pos)));
            const qint64 lineEnd = textEnd(p, pos, newline ? qint64(newline - p) : found->end);
            qint64 start = pos;
            pos = (newline ? qint64(newline - p) : found->end) + 1;
            while (start < lineEnd && isSpace(p[start]))
                ++start;
            if (start == lineEnd)
                continue;
            const char *equals = static_cast<const char *>(std::memchr(p + start, '=', size_t(lineEnd - start)));
            m_lines.push_back(Line{start, qint64(equals - p), lineEnd});
        }
    }
    // The last line of the key counts, as later values replace earlier ones.
    qint64 from = -1, to = -1;
    for (const Line &line : m_lines) {
        if (line.equals - line.key == keyLength && std::memcmp(p + line.key, keyName, size_t(keyLength)) == 0) {
            from = line.equals + 1;
            to = line.end;
        }
    }
    if (from < 0)
        return false;

    // Most values are plain text: no escapes, quotes, lists or blanks at the ends.
    bool plain = to == from || (!isSpace(p[from]) && !isSpace(p[to - 1]));
    for (qint64 i = from; plain && i < to; ++i) {
        const char c = p[i];
        plain = c != '\\' && c != '"' && c != ',' && uchar(c) < 0x80;
    }
    if (plain && (to == from || p[from] != '@')) {
        out = QString::fromLatin1(p + from, int(to - from));
        return true;
    }

    QString text;
    QStringList list;
    const QVariant typed = unescapeValue(p, from, to, text, list) ? settingsValue(list) : settingsValue(text);
    if (!typed.isValid())
        return false;
    out = settingsValueText(typed);
    return true;
}

void IniFileReader::listSections(NumberedSections &out) const
{
    for (const Section &s : m_sections) {
        if (s.end > s.begin)
            out.add(m_data + s.name, int(s.nameLength));
    }
}

bool IniFileReader::unescapeValue(const char *str, qint64 from, qint64 to, QString &text, QStringList &list)
{
    static const char escapeCodes[][2] = {{'a', '\a'}, {'b', '\b'}, {'f', '\f'}, {'n', '\n'}, {'r', '\r'}, {'t', '\t'},
                                          {'v', '\v'}, {'"', '"'},  {'?', '?'},  {'\'', '\''}, {'\\', '\\'}};
    bool isList = false;
    bool chopAtEnd = true; // an escape cut off by the end keeps the blanks before it
    bool inQuotes = false;
    bool currentQuoted = false;
    qint64 i = from;
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
            qint64 j = i + 1;
            while (j < to && str[j] != '\\' && str[j] != '"' && str[j] != ',')
                ++j;
            text += QString::fromLatin1(str + i, int(j - i));
            i = j;
        }
    }
    if (!currentQuoted && chopAtEnd)
        chopTrailingSpaces(text, chopLimit);
    if (isList)
        list.append(text);
    return isList;
}
