#include "gpx/GpxWriter.h"

#include "app/Trace.h"
#include "path/Path.h"
#include "project/ValueParsers.h"

#include <QFile>
#include <QXmlStreamWriter>

#include <algorithm>

namespace {

struct Corners
{
    double minLon, minLat, maxLon, maxLat;
};

// The path's extent; a path without one (all corners 0) takes that of its samples.
Corners cornersOf(const Path &path, const std::vector<CurvePoint> &samples)
{
    const KeyPoint &a = path.boundaryMin, &b = path.boundaryMax;
    const bool unset = a.longitude == 0 && a.latitude == 0 && b.longitude == 0 && b.latitude == 0;
    if (!unset || samples.empty()) {
        return {std::min(a.longitude, b.longitude), std::min(a.latitude, b.latitude),
                std::max(a.longitude, b.longitude), std::max(a.latitude, b.latitude)};
    }
    Corners c{samples.front().x, samples.front().y, samples.front().x, samples.front().y};
    for (const CurvePoint &p : samples) {
        c.minLon = std::min(c.minLon, p.x);
        c.maxLon = std::max(c.maxLon, p.x);
        c.minLat = std::min(c.minLat, p.y);
        c.maxLat = std::max(c.maxLat, p.y);
    }
    return c;
}

} // namespace

bool GpxWriter::write(const QString &fileName, const std::vector<CurvePoint> &samples, const Path &path)
{
    // A file marked read-only is left alone, even where the folder would allow removing it.
    if (QFile::exists(fileName)
        && (!(QFile::permissions(fileName) & QFileDevice::WriteOwner) || !QFile::remove(fileName)))
        return false;
    QFile file(fileName);
    if (!file.open(QIODevice::WriteOnly | QIODevice::Text)) {
        logTrace(0, QStringLiteral("File open error: %s"), file.errorString());
        return false;
    }
    QXmlStreamWriter xml(&file);
    xml.setAutoFormatting(true);
    xml.setCodec("UTF-8");
    xml.writeStartDocument(QStringLiteral("1.0"));
    xml.writeStartElement(QStringLiteral("gpx"));
    xml.writeAttribute(QStringLiteral("creator"), QStringLiteral("Tourlet"));

    const Corners corners = cornersOf(path, samples);
    xml.writeStartElement(QStringLiteral("metadata"));
    xml.writeStartElement(QStringLiteral("bounds"));
    xml.writeAttribute(QStringLiteral("minlong"), formatCoordinate(corners.minLon));
    xml.writeAttribute(QStringLiteral("minlat"), formatCoordinate(corners.minLat));
    xml.writeAttribute(QStringLiteral("maxlong"), formatCoordinate(corners.maxLon));
    xml.writeAttribute(QStringLiteral("maxlat"), formatCoordinate(corners.maxLat));
    xml.writeEndElement();
    xml.writeEndElement();

    xml.writeStartElement(QStringLiteral("rte"));
    for (const CurvePoint &sample : samples) {
        xml.writeStartElement(QStringLiteral("rtept"));
        xml.writeAttribute(QStringLiteral("lon"), formatCoordinate(sample.x));
        xml.writeAttribute(QStringLiteral("lat"), formatCoordinate(sample.y));
        if (sample.z > 0.0)
            xml.writeTextElement(QStringLiteral("ele"), formatCoordinate(sample.z));
        if (sample.correspondingKeyPoint != 0) {
            const int k = path.keyPointIndex(sample.correspondingKeyPoint);
            if (k >= 0) {
                const KeyPoint &key = path.keyPoints[size_t(k)];
                if (key.properties.enabled && !key.title().isEmpty())
                    xml.writeTextElement(QStringLiteral("name"), key.title());
            }
        }
        xml.writeEndElement();
    }
    xml.writeEndElement();
    xml.writeEndElement();
    xml.writeEndDocument();
    file.close();
    return true;
}
