#pragma once

#include <QByteArray>

#include <memory>

class QIODevice;
class QTextDecoder;

// Reads a device line by line, whatever its line ends ("\n", "\r\n" or a lone "\r"),
// holding one chunk and one line at a time. A byte-order mark at the start is dropped;
// text in UTF-16 or UTF-32 comes out as UTF-8. A line longer than maxLength bytes is
// skipped whole: no line of a track file is that long.
class LineReader
{
public:
    LineReader(QIODevice &device, int maxLength);
    ~LineReader();

    // The next line without its end; false when the data is exhausted.
    bool next(QByteArray &line);

private:
    bool fill();

    QIODevice &m_device;
    std::unique_ptr<QTextDecoder> m_decoder;
    QByteArray m_chunk;
    int m_position = 0;
    int m_maxLength;
    bool m_skipLineFeed = false;
};
