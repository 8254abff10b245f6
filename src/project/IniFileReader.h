#pragma once

#include "platform/LargeBuffer.h"
#include "project/NumberedSections.h"

#include <QByteArray>
#include <QString>
#include <QStringList>

#include <cstdint>
#include <vector>

// Reads the settings ini format as QSettings::IniFormat reads it, for the files that
// this program writes and files of the same plain shape, with LF or CRLF line
// ends. `parse` declines (false) any file whose lines it can't read exactly as the
// store would: comments, keys or section names with escapes, lines that continue,
// keys outside a section, repeated sections, a carriage return inside a line. The
// caller then reads that file through QSettings.
class IniFileReader
{
public:
    // The bytes must stay valid while the reader is used.
    bool parse(const char *data, qint64 size);
    bool parse(const QByteArray &data);
    bool parse(LargeBuffer &&data);

    // The value as the container reads it through the store: text, lists joined
    // with ',', typed values (a leading '@') converted. False when the key is
    // missing or its value is "@Invalid()".
    bool value(const QString &section, const QString &key, QString &out) const;

    // Adds every section that holds a key.
    void listSections(NumberedSections &out) const;

    // The value part of a line, unescaped and unquoted; true when it holds a list.
    static bool unescapeValue(const char *data, qint64 from, qint64 to, QString &text, QStringList &list);

private:
    struct Section
    {
        qint64 name;  // offset of the section's name
        qint64 begin; // its lines
        qint64 end;
        uint32_t nameLength;
    };
    struct Line
    {
        qint64 key;
        qint64 equals;
        qint64 end;
    };
    const Section *find(const char *name, uint32_t length) const;
    bool insert(qint64 name, uint32_t length);

    QByteArray m_own;
    LargeBuffer m_ownLarge;
    const char *m_data = nullptr;
    qint64 m_size = 0;
    std::vector<Section> m_sections;
    // Open addressing over m_sections: the name's hash and 1 + index, 0 for a free slot.
    std::vector<std::pair<uint32_t, uint32_t>> m_table;
    // The lines of the section read last: a record's keys are read one after another.
    mutable const Section *m_cached = nullptr;
    mutable std::vector<Line> m_lines;
};
