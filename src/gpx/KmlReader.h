#pragma once

#include "gpx/TrackItemList.h"

#include <QString>

class QXmlStreamReader;

// Reads the placemarks of a "kml" root element. The walk descends into "Document"
// and "Folder" and stops at the first end tag it meets, so of nested or sibling
// folders only the placemarks up to the end of the first one are read. Line strings and
// tracks ("Track", also inside "MultiTrack") make tracks, points waypoints.
class KmlReader
{
public:
    KmlReader(QXmlStreamReader &xml, TrackItemList &items) : m_xml(xml), m_items(items) {}

    // Expects the reader on the root's start element; true even for an empty document.
    bool read();

private:
    void readPlacemark();
    void readMultiGeometry();
    void readLineString();
    void readMultiTrack();
    void readTrack();
    void readPoint(const QString &name);
    void addLineCoordinates(const QString &text);

    QXmlStreamReader &m_xml;
    TrackItemList &m_items;
    QString m_text;
};
