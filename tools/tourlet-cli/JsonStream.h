#pragma once

#include <QByteArray>
#include <QString>

#include <cstdint>
#include <vector>

// Writes one compact JSON document piece by piece, for outputs too large to build
// as a QJsonObject first. Numbers are written in their shortest form that reads
// back to the same double. Commas are placed by the writer.
class JsonStream
{
public:
    void reserve(int bytes) { m_out.reserve(bytes); }

    JsonStream &beginObject();
    JsonStream &endObject();
    JsonStream &beginArray();
    JsonStream &endArray();
    JsonStream &key(const char *name);

    JsonStream &value(double number);
    JsonStream &value(int64_t number);
    JsonStream &value(int32_t number) { return value(int64_t(number)); }
    JsonStream &value(uint32_t number) { return value(int64_t(number)); }
    JsonStream &value(bool flag);
    JsonStream &value(const QString &text);

    // The document so far; complete once every object and array is closed.
    const QByteArray &bytes() const { return m_out; }

private:
    void separate();

    QByteArray m_out;
    std::vector<bool> m_hasItems; // per open object or array: something written already
    bool m_afterKey = false;
};
