#pragma once

#include "gpx/TrackItemList.h"

#include <QPointF>
#include <QString>

class QXmlStreamReader;

// What a GPX file says about itself in its root and metadata.
struct GpxHeader
{
    QString creator;
    QString time;         // kept as written
    QPointF boundsMin;    // x: "minlong", y: "minlat"
    QPointF boundsMax;    // x: "maxlong", y: "maxlat"
};

// Reads the children of a "gpx" root element: tracks, routes and waypoints.
class GpxReader
{
public:
    GpxReader(QXmlStreamReader &xml, TrackItemList &items, GpxHeader &header)
        : m_xml(xml), m_items(items), m_header(header)
    {
    }

    // Expects the reader on the root's start element. Returns true even when the
    // document ends early or holds nothing of use.
    bool read();

private:
    void readMetadata();
    void readTrack();
    void readRoute();
    void readPoint();

    QXmlStreamReader &m_xml;
    TrackItemList &m_items;
    GpxHeader &m_header;
    QString m_text;
};
