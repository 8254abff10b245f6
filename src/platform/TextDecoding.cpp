#include "platform/TextDecoding.h"

#include <QTextCodec>

namespace textdecoding {

QTextCodec *codecByMark(const QByteArray &start)
{
    return QTextCodec::codecForUtfText(start, nullptr);
}

QString decode(const QByteArray &bytes)
{
    if (QTextCodec *unicode = codecByMark(bytes))
        return unicode->toUnicode(bytes);
    return decodeUnmarked(bytes.constData(), bytes.size());
}

namespace {

QTextCodec *utf8()
{
    static QTextCodec *const codec = QTextCodec::codecForMib(106);
    return codec;
}

bool convertsCleanly(const QTextCodec::ConverterState &state)
{
    return state.invalidChars == 0 && state.remainingChars == 0;
}

} // namespace

bool isUtf8(const char *data, int size)
{
    QTextCodec::ConverterState state;
    utf8()->toUnicode(data, size, &state);
    return convertsCleanly(state);
}

QString decodeUnmarked(const char *data, int size)
{
    static QTextCodec *const windows1252 = QTextCodec::codecForName("windows-1252");
    QTextCodec::ConverterState state;
    const QString text = utf8()->toUnicode(data, size, &state);
    if (convertsCleanly(state))
        return text;
    return windows1252 ? windows1252->toUnicode(data, size) : QString::fromLatin1(data, size);
}

} // namespace textdecoding
