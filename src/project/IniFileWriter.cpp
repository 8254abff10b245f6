#include "project/IniFileWriter.h"

#include <QSaveFile>

#include <algorithm>
#include <cstring>

namespace {

const char hexDigits[] = "0123456789ABCDEF";

void appendLowerHex(uint value, QByteArray &out)
{
    out += QByteArray::number(value, 16);
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

void IniFileWriter::escapeKey(const QString &key, QByteArray &out)
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

void IniFileWriter::escapeValue(const QString &value, QByteArray &out)
{
    const int start = out.size();
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
    if (needsQuotes || (start < out.size() && (out.at(start) == ' ' || out.at(out.size() - 1) == ' '))) {
        out.insert(start, '"');
        out += '"';
    }
}

IniFileWriter::Section &IniFileWriter::section(const QString &name)
{
    if (m_last < m_sections.size() && m_sections[m_last].name == name)
        return m_sections[m_last];
    const auto found = m_index.constFind(name);
    if (found != m_index.constEnd()) {
        m_last = *found;
    } else {
        m_last = m_sections.size();
        m_index.insert(name, m_last);
        m_sections.push_back(Section{name, {}});
    }
    return m_sections[m_last];
}

void IniFileWriter::setValue(const QString &sectionName, const QString &key, const QString &value)
{
    if (!sectionName.isEmpty() && !key.isEmpty() && !sectionName.contains(QLatin1Char('/'))
        && !key.startsWith(QLatin1Char('/')) && !key.endsWith(QLatin1Char('/')) && !key.contains(QLatin1String("//"))) {
        section(sectionName).entries.emplace_back(key, value);
        return;
    }
    // Slashes make groups: the first part of the address is the section.
    const QString address = normalized(sectionName + QLatin1Char('/') + key);
    if (address.isEmpty())
        return;
    const int slash = address.indexOf(QLatin1Char('/'));
    if (slash < 0)
        section(QString()).entries.emplace_back(address, value);
    else
        section(address.left(slash)).entries.emplace_back(address.mid(slash + 1), value);
}

QByteArray IniFileWriter::toBytes() const
{
    std::vector<const Section *> order;
    order.reserve(m_sections.size());
    size_t estimate = 0;
    for (const Section &s : m_sections) {
        order.push_back(&s);
        estimate += 16 + s.entries.size() * 32;
    }
    std::sort(order.begin(), order.end(), [](const Section *a, const Section *b) { return a->name < b->name; });

    QByteArray out;
    out.reserve(int(std::min<size_t>(estimate, 1u << 30)));
    std::vector<const std::pair<QString, QString> *> entries;
    bool first = true;
    for (const Section *s : order) {
        if (!first)
            out += '\n';
        first = false;
        QByteArray heading;
        escapeKey(s->name, heading);
        if (heading.isEmpty())
            out += "[General]";
        else if (qstricmp(heading.constData(), "general") == 0)
            out += "[%General]";
        else
            out += '[' + heading + ']';
        out += '\n';

        entries.clear();
        for (const auto &entry : s->entries)
            entries.push_back(&entry);
        // Equal keys keep their order of writing; the last one written counts.
        std::stable_sort(entries.begin(), entries.end(), [](const auto *a, const auto *b) { return a->first < b->first; });
        for (size_t i = 0; i < entries.size(); ++i) {
            if (i + 1 < entries.size() && entries[i + 1]->first == entries[i]->first)
                continue;
            escapeKey(entries[i]->first, out);
            out += '=';
            escapeValue(entries[i]->second, out);
            out += '\n';
        }
    }
    return out;
}

bool IniFileWriter::save(const QString &fileName) const
{
    const QByteArray bytes = toBytes();
    QSaveFile file(fileName);
    if (!file.open(QIODevice::WriteOnly))
        return false;
    if (file.write(bytes) != bytes.size()) {
        file.cancelWriting();
        file.commit();
        return false;
    }
    return file.commit();
}
