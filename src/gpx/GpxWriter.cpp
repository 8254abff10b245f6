#include "gpx/GpxWriter.h"

#include "app/Trace.h"
#include "path/Path.h"
#include "platform/AtomicFileWriter.h"
#include "project/ValueParsers.h"

#include <QXmlStreamWriter>

bool GpxWriter::write(const QString &fileName, const std::vector<CurvePoint> &samples, const Path &path,
                      QString *error)
{
    // The previous file is replaced only by a complete new one.
    AtomicFileWriter file(fileName);
    if (!file.open()) {
        logTrace(0, QStringLiteral("File open error: %s"), file.errorString());
        if (error)
            *error = file.errorString();
        return false;
    }
    QXmlStreamWriter xml(&file.device());
    xml.setAutoFormatting(true);
    xml.setCodec("UTF-8");
    xml.writeStartDocument(QStringLiteral("1.0"));
    xml.writeStartElement(QStringLiteral("gpx"));
    xml.writeAttribute(QStringLiteral("creator"), QStringLiteral("Tourlet"));

    const Path::Extent corners = path.extent();
    xml.writeStartElement(QStringLiteral("metadata"));
    xml.writeStartElement(QStringLiteral("bounds"));
    xml.writeAttribute(QStringLiteral("minlong"), formatCoordinate(corners.west));
    xml.writeAttribute(QStringLiteral("minlat"), formatCoordinate(corners.south));
    xml.writeAttribute(QStringLiteral("maxlong"), formatCoordinate(corners.east));
    xml.writeAttribute(QStringLiteral("maxlat"), formatCoordinate(corners.north));
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
    if (xml.hasError())
        file.fail();
    if (!file.commit()) {
        logTrace(3, QStringLiteral("GpxWriter::write[%s] - not written, the previous file stays: %s"), fileName, file.errorString());
        if (error)
            *error = file.errorString();
        return false;
    }
    return true;
}
