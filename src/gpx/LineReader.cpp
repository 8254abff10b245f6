#include "gpx/LineReader.h"

#include "platform/TextDecoding.h"

#include <QIODevice>
#include <QTextCodec>

namespace {
constexpr qint64 chunkSize = 64 * 1024;
}

LineReader::LineReader(QIODevice &device, int maxLength) : m_device(device), m_maxLength(maxLength)
{
    const QByteArray start = device.peek(4);
    QTextCodec *unicode = textdecoding::codecByMark(start);
    if (!unicode)
        return;
    if (unicode->mibEnum() == 106)
        device.read(3);
    else
        m_decoder.reset(unicode->makeDecoder());
}

LineReader::~LineReader() = default;

bool LineReader::fill()
{
    m_position = 0;
    m_chunk = m_device.read(chunkSize);
    if (m_decoder && !m_chunk.isEmpty())
        m_chunk = m_decoder->toUnicode(m_chunk).toUtf8();
    return !m_chunk.isEmpty();
}

bool LineReader::next(QByteArray &line)
{
    line.resize(0);
    bool started = false;
    bool tooLong = false;
    for (;;) {
        if (m_position >= m_chunk.size() && !fill())
            return started && !tooLong;
        const char *const data = m_chunk.constData();
        const char *const end = data + m_chunk.size();
        const char *from = data + m_position;
        if (m_skipLineFeed) {
            m_skipLineFeed = false;
            if (*from == '\n') {
                ++m_position;
                continue;
            }
        }
        started = true;
        const char *p = from;
        while (p != end && *p != '\n' && *p != '\r')
            ++p;
        if (!tooLong) {
            if (line.size() + (p - from) > m_maxLength) {
                tooLong = true;
                line.resize(0);
            } else {
                line.append(from, int(p - from));
            }
        }
        if (p == end) {
            m_position = m_chunk.size();
            continue;
        }
        // A "\r" at the end of a chunk may be the first half of "\r\n".
        if (*p == '\r') {
            if (p + 1 == end)
                m_skipLineFeed = true;
            else if (p[1] == '\n')
                ++p;
        }
        m_position = int(p + 1 - data);
        if (!tooLong)
            return true;
        tooLong = false;
        started = false;
    }
}
