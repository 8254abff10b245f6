#pragma once

#include <QByteArray>
#include <QString>

class QTextCodec;

// Text files made on desktop systems carry no word on their encoding: a byte-order
// mark names it where there is one; without, valid UTF-8 is read as UTF-8 and
// anything else as Windows-1252, the code page such files were written in.
namespace textdecoding {

// The Unicode codec named by a byte-order mark at the start of bytes, or null.
QTextCodec *codecByMark(const QByteArray &start);

// The whole text of a file by the rules above.
QString decode(const QByteArray &bytes);

// Whether bytes without a byte-order mark are to be read as UTF-8.
bool isUtf8(const char *data, int size);

// A piece of text known to have no byte-order mark: UTF-8 when valid, else Windows-1252.
QString decodeUnmarked(const char *data, int size);

} // namespace textdecoding
