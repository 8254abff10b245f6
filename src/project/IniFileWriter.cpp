#include "project/IniFileWriter.h"

#include "platform/AtomicFileWriter.h"

#include <QBuffer>
#include <QHash>

#include <algorithm>
#include <cerrno>
#include <cstring>

namespace {

const char hexDigits[] = "0123456789ABCDEF";

void appendLowerHex(uint value, std::string &out)
{
    out += QByteArray::number(value, 16).constData();
}

// The store's normal form of an address: no leading, trailing or doubled slashes.
QString normalized(const QString &address)
{
    QString result;
    result.reserve(address.size());
    for (const QChar c : address) {
        if (c == QLatin1Char('/') && (result.isEmpty() || result.endsWith(QLatin1Char('/'))))
            continue;
        result += c;
    }
    if (result.endsWith(QLatin1Char('/')))
        result.chop(1);
    return result;
}

} // namespace

void IniFileWriter::escapeKey(const QString &key, std::string &out)
{
    for (const QChar qc : key) {
        uint ch = qc.unicode();
        if (ch == '/') {
            out += '\\';
        } else if ((ch >= 'a' && ch <= 'z') || (ch >= 'A' && ch <= 'Z') || (ch >= '0' && ch <= '9') || ch == '_'
                   || ch == '-' || ch == '.') {
            out += char(ch);
        } else if (ch <= 0xFF) {
            out += '%';
            out += hexDigits[ch / 16];
            out += hexDigits[ch % 16];
        } else {
            out += "%U";
            char code[4];
            for (int i = 3; i >= 0; --i) {
                code[i] = hexDigits[ch % 16];
                ch >>= 4;
            }
            out.append(code, 4);
        }
    }
}

void IniFileWriter::escapeValue(const QString &value, std::string &out)
{
    const size_t start = out.size();
    // Most values are numbers or plain words: copied as they are.
    {
        const int length = value.size();
        const QChar *text = value.unicode();
        bool plain = length == 0 || (text[0] != QLatin1Char('@') && text[0] != QLatin1Char(' ') && text[length - 1] != QLatin1Char(' '));
        for (int i = 0; plain && i < length; ++i) {
            const ushort ch = text[i].unicode();
            plain = ch >= 0x20 && ch < 0x7F && ch != '"' && ch != '\\' && ch != ';' && ch != ',' && ch != '=';
        }
        if (plain) {
            out.resize(start + size_t(length));
            char *d = &out[start];
            for (int i = 0; i < length; ++i)
                d[i] = char(text[i].unicode());
            return;
        }
    }
    bool needsQuotes = false;
    bool escapeNextIfDigit = false;
    // A text that starts with '@' would read as a typed value: it is doubled. A
    // text holding a null character is marked as text.
    QString typed;
    const QString *source = &value;
    if (value.contains(QChar(0))) {
        typed = QStringLiteral("@String(") + value + QLatin1Char(')');
        source = &typed;
    } else if (value.startsWith(QLatin1Char('@'))) {
        typed = QLatin1Char('@') + value;
        source = &typed;
    }
    const int length = source->size();
    const QChar *text = source->unicode();
    for (int i = 0; i < length; ++i) {
        const uint ch = text[i].unicode();
        if (ch == ';' || ch == ',' || ch == '=')
            needsQuotes = true;
        if (escapeNextIfDigit && ((ch >= '0' && ch <= '9') || (ch >= 'a' && ch <= 'f') || (ch >= 'A' && ch <= 'F'))) {
            out += "\\x";
            appendLowerHex(ch, out);
            continue;
        }
        escapeNextIfDigit = false;
        switch (ch) {
        case '\0':
            out += "\\0";
            escapeNextIfDigit = true;
            break;
        case '\a':
            out += "\\a";
            break;
        case '\b':
            out += "\\b";
            break;
        case '\f':
            out += "\\f";
            break;
        case '\n':
            out += "\\n";
            break;
        case '\r':
            out += "\\r";
            break;
        case '\t':
            out += "\\t";
            break;
        case '\v':
            out += "\\v";
            break;
        case '"':
        case '\\':
            out += '\\';
            out += char(ch);
            break;
        default:
            if (ch <= 0x1F || ch >= 0x7F) {
                out += "\\x";
                appendLowerHex(ch, out);
                escapeNextIfDigit = true;
            } else {
                out += char(ch);
            }
        }
    }
    if (needsQuotes || (start < out.size() && (out[start] == ' ' || out.back() == ' '))) {
        out.insert(start, 1, '"');
        out += '"';
    }
}

uint32_t IniFileWriter::section(const QString &name)
{
    if (m_last < m_sections.size() && m_sections[m_last] == name)
        return m_last;
    const uint32_t h = qHash(name);
    if ((m_sections.size() + 1) * 2 > m_table.size()) {
        std::vector<std::pair<uint32_t, uint32_t>> old(std::max<size_t>(m_table.size() * 2, 256));
        old.swap(m_table);
        const size_t mask = m_table.size() - 1;
        for (const auto &slot : old) {
            if (!slot.first)
                continue;
            size_t i = slot.second & mask;
            while (m_table[i].first)
                i = (i + 1) & mask;
            m_table[i] = slot;
        }
    }
    const size_t mask = m_table.size() - 1;
    size_t i = h & mask;
    for (; m_table[i].first; i = (i + 1) & mask) {
        if (m_table[i].second == h && m_sections[m_table[i].first - 1] == name) {
            m_last = m_table[i].first - 1;
            return m_last;
        }
    }
    m_last = uint32_t(m_sections.size());
    m_sections.push_back(name);
    m_table[i] = {m_last + 1, h};
    return m_last;
}

void IniFileWriter::setValue(const QString &sectionName, const QString &key, const QString &value)
{
    if (!sectionName.isEmpty() && !key.isEmpty() && !sectionName.contains(QLatin1Char('/'))
        && !key.contains(QLatin1Char('/'))) {
        add(section(sectionName), key, value);
        return;
    }
    // Slashes make groups: the first part of the address is the section.
    const QString address = normalized(sectionName + QLatin1Char('/') + key);
    if (address.isEmpty())
        return;
    const int slash = address.indexOf(QLatin1Char('/'));
    add(section(slash < 0 ? QString() : address.left(slash)), slash < 0 ? address : address.mid(slash + 1), value);
}

namespace {

// Appends a key that needs no escape as it is; false (and nothing appended) otherwise.
bool appendPlainKey(const QString &key, std::string &out)
{
    const int length = key.size();
    const QChar *text = key.unicode();
    for (int i = 0; i < length; ++i) {
        const ushort ch = text[i].unicode();
        if (!((ch >= 'a' && ch <= 'z') || (ch >= 'A' && ch <= 'Z') || (ch >= '0' && ch <= '9') || ch == '_' || ch == '-'
              || ch == '.'))
            return false;
    }
    const size_t start = out.size();
    out.resize(start + size_t(length));
    char *d = &out[start];
    for (int i = 0; i < length; ++i)
        d[i] = char(text[i].unicode());
    return true;
}

} // namespace

void IniFileWriter::add(uint32_t sectionIndex, const QString &key, const QString &value)
{
    const uint32_t offset = uint32_t(m_lines.size());
    m_scratch.clear();
    if (!appendPlainKey(key, m_scratch)) {
        escapeKey(key, m_scratch);
        m_oddKeys.emplace_back(offset, key);
    }
    m_scratch += '=';
    escapeValue(value, m_scratch);
    m_scratch += '\n';
    if (!m_lines.append(m_scratch.data(), m_scratch.size())) {
        m_failed = true;
        return;
    }
    const uint32_t length = uint32_t(m_scratch.size());
    if (!m_runs.empty() && m_runs.back().section == sectionIndex)
        m_runs.back().length += length;
    else
        m_runs.push_back(Run{offset, length, sectionIndex});
}

QString IniFileWriter::keyOf(const Line &line) const
{
    const auto odd = std::lower_bound(m_oddKeys.begin(), m_oddKeys.end(), line.offset,
                                      [](const std::pair<uint32_t, QString> &k, uint32_t offset) { return k.first < offset; });
    if (odd != m_oddKeys.end() && odd->first == line.offset)
        return odd->second;
    return QString::fromLatin1(m_lines.data() + line.offset, int(line.keyLength));
}

// Keys sort as the texts they stand for; plain keys are their own bytes, and an
// escaped key holds a '%' or '\', which no plain key does.
bool IniFileWriter::keyLess(const Line &a, const Line &b) const
{
    const char *pa = m_lines.data() + a.offset;
    const char *pb = m_lines.data() + b.offset;
    if (!m_oddKeys.empty()
        && (std::memchr(pa, '%', a.keyLength) || std::memchr(pa, '\\', a.keyLength) || std::memchr(pb, '%', b.keyLength)
            || std::memchr(pb, '\\', b.keyLength)))
        return keyOf(a) < keyOf(b);
    const int c = std::memcmp(pa, pb, std::min(a.keyLength, b.keyLength));
    return c < 0 || (c == 0 && a.keyLength < b.keyLength);
}

// Escaping is one to one, so equal keys have equal bytes.
bool IniFileWriter::sameKey(const Line &a, const Line &b) const
{
    return a.keyLength == b.keyLength
        && std::memcmp(m_lines.data() + a.offset, m_lines.data() + b.offset, a.keyLength) == 0;
}

bool IniFileWriter::writeTo(QIODevice &device) const
{
    std::vector<uint32_t> order(m_sections.size());
    for (uint32_t i = 0; i < order.size(); ++i)
        order[i] = i;
    std::sort(order.begin(), order.end(), [this](uint32_t a, uint32_t b) { return m_sections[a] < m_sections[b]; });

    // The runs grouped by section, each group in the order written.
    std::vector<uint32_t> first(m_sections.size() + 1, 0);
    for (const Run &r : m_runs)
        ++first[r.section + 1];
    for (size_t i = 1; i < first.size(); ++i)
        first[i] += first[i - 1];
    std::vector<uint32_t> grouped(m_runs.size());
    {
        std::vector<uint32_t> next(first.begin(), first.end() - 1);
        for (uint32_t i = 0; i < m_runs.size(); ++i)
            grouped[next[m_runs[i].section]++] = i;
    }

    constexpr size_t chunk = 1 << 22;
    std::string out;
    out.reserve(chunk + 4096);
    std::vector<Line> lines;
    const char *data = m_lines.data();
    bool firstSection = true;
    for (const uint32_t s : order) {
        if (!firstSection)
            out += '\n';
        firstSection = false;
        std::string heading;
        escapeKey(m_sections[s], heading);
        if (heading.empty())
            out += "[General]";
        else if (qstricmp(heading.c_str(), "general") == 0)
            out += "[%General]";
        else
            out += '[' + heading + ']';
        out += '\n';

        // Values escape their line ends and keys their '=': both mark the line.
        lines.clear();
        for (uint32_t g = first[s]; g < first[s + 1]; ++g) {
            const Run &run = m_runs[grouped[g]];
            uint32_t pos = run.offset;
            const uint32_t end = run.offset + run.length;
            while (pos < end) {
                const char *eq = static_cast<const char *>(std::memchr(data + pos, '=', end - pos));
                const char *nl = static_cast<const char *>(std::memchr(eq, '\n', size_t(data + end - eq)));
                const uint32_t next = uint32_t(nl - data) + 1;
                lines.push_back(Line{pos, next - pos, uint32_t(eq - data) - pos});
                pos = next;
            }
        }
        // Equal keys keep their order of writing; the last one written counts.
        const auto less = [this](const Line &a, const Line &b) { return keyLess(a, b); };
        if (lines.size() > 32)
            std::stable_sort(lines.begin(), lines.end(), less);
        for (size_t i = 1; i < lines.size() && lines.size() <= 32; ++i) {
            const Line line = lines[i];
            size_t j = i;
            for (; j > 0 && keyLess(line, lines[j - 1]); --j)
                lines[j] = lines[j - 1];
            lines[j] = line;
        }
        for (size_t i = 0; i < lines.size(); ++i) {
            if (i + 1 < lines.size() && sameKey(lines[i + 1], lines[i]))
                continue;
            out.append(data + lines[i].offset, lines[i].length);
        }
        if (out.size() >= chunk) {
            if (device.write(out.data(), qint64(out.size())) != qint64(out.size()))
                return false;
            out.clear();
        }
    }
    return device.write(out.data(), qint64(out.size())) == qint64(out.size());
}

QByteArray IniFileWriter::toBytes() const
{
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    writeTo(buffer);
    return bytes;
}

bool IniFileWriter::writeInto(AtomicFileWriter &file) const
{
    if (m_failed) {
        file.fail(QStringLiteral("not enough memory for the content"));
        return false;
    }
    errno = 0; // what the failed write leaves there is the reason
    if (!writeTo(file.device())) {
        file.fail();
        return false;
    }
    return true;
}
