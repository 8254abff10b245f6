#include "gpx/KmlReader.h"

#include "gpx/XmlWalk.h"

#include <QRegExp>
#include <QVector>

using xmlwalk::isNamed;

bool KmlReader::read()
{
    while (m_xml.readNextStartElement()) {
        if (isNamed(m_xml, QLatin1String("Placemark")))
            readPlacemark();
        else if (isNamed(m_xml, QLatin1String("Document")) || isNamed(m_xml, QLatin1String("Folder")))
            continue;
        else
            m_xml.skipCurrentElement();
    }
    m_items.dropEmptyLastItem();
    return true;
}

void KmlReader::readPlacemark()
{
    QString name;
    while (m_xml.readNextStartElement()) {
        if (isNamed(m_xml, QLatin1String("name"))) {
            xmlwalk::readText(m_xml, m_text);
            name = m_text;
        } else if (isNamed(m_xml, QLatin1String("LineString")))
            readLineString();
        else if (isNamed(m_xml, QLatin1String("Point")))
            readPoint(name);
        else if (isNamed(m_xml, QLatin1String("MultiGeometry")))
            readMultiGeometry();
        else if (isNamed(m_xml, QLatin1String("Track")))
            readTrack();
        else if (isNamed(m_xml, QLatin1String("MultiTrack")))
            readMultiTrack();
        else
            m_xml.skipCurrentElement();
    }
}

void KmlReader::readMultiGeometry()
{
    while (m_xml.readNextStartElement()) {
        if (isNamed(m_xml, QLatin1String("LineString")))
            readLineString();
        else if (isNamed(m_xml, QLatin1String("Track")))
            readTrack();
        else
            m_xml.skipCurrentElement();
    }
}

void KmlReader::readMultiTrack()
{
    while (m_xml.readNextStartElement()) {
        if (isNamed(m_xml, QLatin1String("Track")))
            readTrack();
        else
            m_xml.skipCurrentElement();
    }
}

// The track form of recording apps: one "coord" of "longitude latitude altitude" per
// position, between "when" elements that are not read. Joins the track being read, like
// a line string.
void KmlReader::readTrack()
{
    m_items.ensureTrackItem();
    while (m_xml.readNextStartElement()) {
        if (!isNamed(m_xml, QLatin1String("coord"))) {
            m_xml.skipCurrentElement();
            continue;
        }
        xmlwalk::readText(m_xml, m_text);
        const QString coord = m_text.simplified();
        const QVector<QStringRef> fields = coord.splitRef(QLatin1Char(' '));
        if (fields.size() < 2)
            continue;
        const double elevation = fields.size() > 2 ? fields.at(2).toDouble() : -1.0;
        m_items.addPoint(fields.at(1).toDouble(), fields.at(0).toDouble(), elevation, QString());
    }
}

void KmlReader::readLineString()
{
    m_items.ensureTrackItem();
    while (m_xml.readNextStartElement()) {
        if (isNamed(m_xml, QLatin1String("coordinates"))) {
            xmlwalk::readText(m_xml, m_text);
            addLineCoordinates(m_text);
        } else {
            m_xml.skipCurrentElement();
        }
    }
}

// Tuples are separated by line ends or single blanks (a tab is not a separator) and
// hold longitude, latitude and, optionally, elevation.
void KmlReader::addLineCoordinates(const QString &text)
{
    static const QRegExp separator(QStringLiteral("\n|\r\n|\r| "));
    const QVector<QStringRef> tuples = text.splitRef(separator, Qt::KeepEmptyParts);
    for (const QStringRef &tuple : tuples) {
        const QVector<QStringRef> fields = tuple.split(QLatin1Char(','));
        if (fields.size() < 2)
            continue;
        const double longitude = fields.at(0).toDouble();
        const double latitude = fields.at(1).toDouble();
        const double elevation = fields.size() > 2 ? fields.at(2).toDouble() : -1.0;
        m_items.addPoint(latitude, longitude, elevation, QString());
    }
}

void KmlReader::readPoint(const QString &name)
{
    if (m_items.lastItemType() != TrackItem::Waypoints)
        m_items.appendItem(TrackItem::Waypoints);
    while (m_xml.readNextStartElement()) {
        if (!isNamed(m_xml, QLatin1String("coordinates"))) {
            m_xml.skipCurrentElement();
            continue;
        }
        xmlwalk::readText(m_xml, m_text);
        const QVector<QStringRef> fields = m_text.splitRef(QLatin1Char(','));
        if (fields.size() < 2)
            continue;
        const double elevation = fields.size() == 3 ? fields.at(2).toDouble() : -1.0;
        m_items.addPoint(fields.at(1).toDouble(), fields.at(0).toDouble(), elevation, name);
    }
}
