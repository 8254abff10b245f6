#include "gpx/TrkReader.h"

#include "gpx/LineReader.h"
#include "platform/TextDecoding.h"

#include <QIODevice>
#include <QVector>

#include <limits>

namespace {
constexpr double unset = std::numeric_limits<double>::max();
constexpr QChar degreeSign(0x00BA);
// A point line is some 80 characters long.
constexpr int maxLineLength = 64 * 1024;
}

bool TrkReader::read(QIODevice &device)
{
    LineReader lines(device, maxLineLength);
    QByteArray bytes;
    while (lines.next(bytes)) {
        if (bytes.isEmpty())
            continue;
        // Decided line by line: one damaged line doesn't turn the rest into the wrong code page.
        const QString line = textdecoding::decodeUnmarked(bytes.constData(), bytes.size());
        readLine(QStringRef(&line));
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
