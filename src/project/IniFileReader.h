#pragma once

#include <QByteArray>
#include <QHash>
#include <QString>

// Reads the settings ini format as QSettings::IniFormat reads it, for the files that
// this program writes and files of the same plain shape. `parse` declines (false)
// any file whose lines it can't read exactly as the store would: comments, keys or
// section names with escapes, lines that continue, keys outside a section, repeated
// sections. The caller then reads that file through QSettings.
class IniFileReader
{
public:
    enum class Lookup { Found, Missing, NeedsStore };

    bool parse(const QByteArray &data);

    // The value as text, lists joined with ','. NeedsStore for a value that reads as
    // a typed one (a leading '@'), which only the store itself knows how to convert.
    Lookup value(const QString &section, const QString &key, QString &out) const;

    // The value part of a line, unescaped and unquoted; true when it holds a list.
    static bool unescapeValue(const char *data, int from, int to, QString &text, QStringList &list);

private:
    struct Range
    {
        int begin = 0;
        int end = 0;
    };

    QByteArray m_data;
    QHash<QByteArray, Range> m_sections;
};
