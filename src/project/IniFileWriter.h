#pragma once

#include <QByteArray>
#include <QHash>
#include <QString>

#include <utility>
#include <vector>

// Collects "section/key" values and writes them as the settings ini format writes a
// new file: sections and keys in sorted order, keys and values escaped the same way,
// so the bytes are those of QSettings::IniFormat, without its cost per value.
class IniFileWriter
{
public:
    void setValue(const QString &section, const QString &key, const QString &value);
    bool isEmpty() const { return m_sections.empty(); }

    QByteArray toBytes() const;
    // Writes all at once through a temporary file; false when it isn't complete.
    bool save(const QString &fileName) const;

    // The escapes of the format, for keys (and section names) and for values.
    static void escapeKey(const QString &key, QByteArray &out);
    static void escapeValue(const QString &value, QByteArray &out);

private:
    struct Section
    {
        QString name;
        std::vector<std::pair<QString, QString>> entries; // in the order written
    };
    Section &section(const QString &name);

    std::vector<Section> m_sections;
    QHash<QString, size_t> m_index;
    size_t m_last = 0;
};
