#include "gpx/GpxReader.h"

#include "gpx/XmlWalk.h"

using xmlwalk::isNamed;

bool GpxReader::read()
{
    m_header.creator = m_xml.attributes().value(QLatin1String("creator")).toString();
    while (m_xml.readNextStartElement()) {
        if (isNamed(m_xml, QLatin1String("trk")))
            readTrack();
        else if (isNamed(m_xml, QLatin1String("wpt"))) {
            if (m_items.lastItemType() != TrackItem::Waypoints)
                m_items.appendItem(TrackItem::Waypoints);
            readPoint();
        } else if (isNamed(m_xml, QLatin1String("rte")))
            readRoute();
        else if (isNamed(m_xml, QLatin1String("metadata")))
            readMetadata();
        else
            m_xml.skipCurrentElement();
    }
    return true;
}

void GpxReader::readMetadata()
{
    while (m_xml.readNextStartElement()) {
        if (isNamed(m_xml, QLatin1String("time"))) {
            xmlwalk::readText(m_xml, m_text);
            m_header.time = m_text;
        } else if (isNamed(m_xml, QLatin1String("bounds"))) {
            const QXmlStreamAttributes attributes = m_xml.attributes();
            m_header.boundsMin = QPointF(attributes.value(QLatin1String("minlong")).toDouble(),
                                         attributes.value(QLatin1String("minlat")).toDouble());
            m_header.boundsMax = QPointF(attributes.value(QLatin1String("maxlong")).toDouble(),
                                         attributes.value(QLatin1String("maxlat")).toDouble());
            m_xml.skipCurrentElement();
        } else {
            m_xml.skipCurrentElement();
        }
    }
}

void GpxReader::readTrack()
{
    m_items.dropEmptyLastItem();
    m_items.appendItem(TrackItem::Track);
    while (m_xml.readNextStartElement()) {
        if (!isNamed(m_xml, QLatin1String("trkseg"))) {
            m_xml.skipCurrentElement();
            continue;
        }
        while (m_xml.readNextStartElement()) {
            if (isNamed(m_xml, QLatin1String("trkpt")))
                readPoint();
            else
                m_xml.skipCurrentElement();
        }
    }
    m_items.dropEmptyLastItem();
}

void GpxReader::readRoute()
{
    m_items.dropEmptyLastItem();
    m_items.appendItem(TrackItem::Route);
    while (m_xml.readNextStartElement()) {
        if (isNamed(m_xml, QLatin1String("rtept")))
            readPoint();
        else
            m_xml.skipCurrentElement();
    }
    m_items.dropEmptyLastItem();
}

void GpxReader::readPoint()
{
    double longitude;
    double latitude;
    {
        // Released before the children are read, so that the reader's own attribute
        // list isn't shared and copied at the next element.
        const QXmlStreamAttributes attributes = m_xml.attributes();
        longitude = attributes.value(QLatin1String("lon")).toDouble();
        latitude = attributes.value(QLatin1String("lat")).toDouble();
    }
    double elevation = -1.0;
    QString name;
    while (m_xml.readNextStartElement()) {
        if (isNamed(m_xml, QLatin1String("ele")))
            elevation = xmlwalk::readNumber(m_xml, m_text);
        else if (isNamed(m_xml, QLatin1String("name"))) {
            xmlwalk::readText(m_xml, m_text);
            name = m_text;
        } else
            m_xml.skipCurrentElement();
    }
    m_items.addPoint(latitude, longitude, elevation, name);
}
