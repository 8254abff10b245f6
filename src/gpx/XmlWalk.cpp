#include "gpx/XmlWalk.h"

namespace xmlwalk {

void readText(QXmlStreamReader &xml, QString &buffer)
{
    buffer.resize(0);
    if (!xml.isStartElement())
        return;
    for (;;) {
        switch (xml.readNext()) {
        case QXmlStreamReader::Characters:
        case QXmlStreamReader::EntityReference:
            buffer += xml.text();
            break;
        case QXmlStreamReader::EndElement:
            return;
        case QXmlStreamReader::ProcessingInstruction:
        case QXmlStreamReader::Comment:
            break;
        case QXmlStreamReader::StartElement:
            xml.raiseError(QStringLiteral("Expected character data."));
            return;
        default:
            if (xml.atEnd() || xml.hasError())
                return;
            break;
        }
    }
}

double readNumber(QXmlStreamReader &xml, QString &buffer)
{
    readText(xml, buffer);
    return buffer.toDouble();
}

} // namespace xmlwalk
