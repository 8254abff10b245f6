#include "gpx/TrkReader.h"

#include <QIODevice>
#include <QRegExp>
#include <QTextCodec>
#include <QVector>

#include <limits>

namespace {
constexpr double unset = std::numeric_limits<double>::max();
constexpr QChar degreeSign(0x00BA);
}

QString TrkReader::decode(const QByteArray &bytes)
{
    if (QTextCodec *unicode = QTextCodec::codecForUtfText(bytes, nullptr))
        return unicode->toUnicode(bytes);
    QTextCodec::ConverterState state;
    const QString text = QTextCodec::codecForMib(106)->toUnicode(bytes.constData(), bytes.size(), &state);
    if (state.invalidChars == 0 && state.remainingChars == 0)
        return text;
    if (QTextCodec *singleByte = QTextCodec::codecForName("windows-1252"))
        return singleByte->toUnicode(bytes);
    return QString::fromLatin1(bytes);
}

bool TrkReader::read(QIODevice &device)
{
    const QString text = decode(device.readAll());
    static const QRegExp lineEnd(QStringLiteral("\n|\r\n|\r"));
    const QVector<QStringRef> lines = text.splitRef(lineEnd, Qt::KeepEmptyParts);
    for (const QStringRef &line : lines) {
        if (!line.isEmpty())
            readLine(line);
    }
    return true;
}

void TrkReader::readLine(const QStringRef &line)
{
    const QVector<QStringRef> parts = line.split(degreeSign);
    if (parts.isEmpty() || parts.first().isEmpty() || parts.first().at(0) != QLatin1Char('T'))
        return;

    double latitude = unset;
    double longitude = unset;
    double altitude = 0.0;
    for (const QStringRef &part : parts) {
        const QVector<QStringRef> tokens = part.split(QLatin1Char(' '));
        if (tokens.size() < 2)
            continue;
        for (int i = 0; i + 1 < tokens.size(); ++i) {
            const QStringRef &token = tokens.at(i);
            if (token == QLatin1String("A"))
                latitude = tokens.at(i + 1).toDouble();
            else if (token == QLatin1String("N"))
                longitude = tokens.at(i + 1).toDouble();
            else if (token == QLatin1String("s"))
                altitude = tokens.at(i + 1).toDouble();
        }
    }
    if (latitude == unset || longitude == unset)
        return;
    m_items.ensureTrackItem();
    m_items.addPoint(latitude, longitude, altitude, QString());
}
