#pragma once

#include "platform/LargeBuffer.h"

#include <QByteArray>
#include <QIODevice>
#include <QString>

#include <cstdint>
#include <string>
#include <vector>

class AtomicFileWriter;

// Collects "section/key" values and writes them as the settings ini format writes a
// new file: sections and keys in sorted order, keys and values escaped the same way,
// so the bytes are those of QSettings::IniFormat, without its cost per value.
class IniFileWriter
{
public:
    void setValue(const QString &section, const QString &key, const QString &value);
    bool isEmpty() const { return m_runs.empty(); }

    QByteArray toBytes() const;
    bool writeTo(QIODevice &device) const;
    // Everything into the file, which is left to commit; false, and the file
    // marked as failed, when the content isn't complete.
    bool writeInto(AtomicFileWriter &file) const;

    // The escapes of the format, for keys (and section names) and for values.
    static void escapeKey(const QString &key, std::string &out);
    static void escapeValue(const QString &value, std::string &out);

private:
    // Lines written one after the other into the same section. Each line is
    // "key=value\n", escaped at once into the common buffer of all lines.
    struct Run
    {
        uint32_t offset;
        uint32_t length;
        uint32_t section;
    };
    struct Line
    {
        uint32_t offset;
        uint32_t length;
        uint32_t keyLength;
    };
    uint32_t section(const QString &name);
    void add(uint32_t section, const QString &key, const QString &value);
    QString keyOf(const Line &line) const;
    bool keyLess(const Line &a, const Line &b) const;
    bool sameKey(const Line &a, const Line &b) const;

    std::vector<QString> m_sections;
    // Open addressing over m_sections: 1 + index, 0 for a free slot, and the hash.
    std::vector<std::pair<uint32_t, uint32_t>> m_table;
    uint32_t m_last = 0;
    std::vector<Run> m_runs; // in the order written
    // Keys that needed escapes, by the offset of their line.
    std::vector<std::pair<uint32_t, QString>> m_oddKeys;
    LargeBuffer m_lines;
    bool m_failed = false; // no memory for a line
    std::string m_scratch;
};
