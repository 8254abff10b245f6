#include "JsonStream.h"

#include <charconv>
#include <cmath>
#include <cstdio>

void JsonStream::separate()
{
    if (m_afterKey) {
        m_afterKey = false;
        return;
    }
    if (!m_hasItems.empty()) {
        if (m_hasItems.back())
            m_out += ',';
        m_hasItems.back() = true;
    }
}

JsonStream &JsonStream::beginObject()
{
    separate();
    m_out += '{';
    m_hasItems.push_back(false);
    return *this;
}

JsonStream &JsonStream::endObject()
{
    m_out += '}';
    m_hasItems.pop_back();
    return *this;
}

JsonStream &JsonStream::beginArray()
{
    separate();
    m_out += '[';
    m_hasItems.push_back(false);
    return *this;
}

JsonStream &JsonStream::endArray()
{
    m_out += ']';
    m_hasItems.pop_back();
    return *this;
}

JsonStream &JsonStream::key(const char *name)
{
    separate();
    m_out += '"';
    m_out += name;
    m_out += "\":";
    m_afterKey = true;
    return *this;
}

JsonStream &JsonStream::value(double number)
{
    separate();
    // JSON has no infinities or NaN; QJsonDocument writes those as null too.
    if (!std::isfinite(number)) {
        m_out += "null";
        return *this;
    }
    char text[32];
    const auto written = std::to_chars(text, text + sizeof text, number);
    m_out.append(text, int(written.ptr - text));
    return *this;
}

JsonStream &JsonStream::value(int64_t number)
{
    separate();
    char text[24];
    const auto written = std::to_chars(text, text + sizeof text, number);
    m_out.append(text, int(written.ptr - text));
    return *this;
}

JsonStream &JsonStream::value(bool flag)
{
    separate();
    m_out += flag ? "true" : "false";
    return *this;
}

JsonStream &JsonStream::value(const QString &text)
{
    separate();
    m_out += '"';
    for (const char c : text.toUtf8()) {
        switch (c) {
        case '"': m_out += "\\\""; break;
        case '\\': m_out += "\\\\"; break;
        case '\n': m_out += "\\n"; break;
        case '\r': m_out += "\\r"; break;
        case '\t': m_out += "\\t"; break;
        default:
            if (uint8_t(c) < 0x20) {
                char escape[8];
                std::snprintf(escape, sizeof escape, "\\u%04x", unsigned(uint8_t(c)));
                m_out += escape;
            } else {
                m_out += c;
            }
        }
    }
    m_out += '"';
    return *this;
}
