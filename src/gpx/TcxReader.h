#pragma once

#include "gpx/TrackItemList.h"

#include <QString>

class QXmlStreamReader;

// Reads the trackpoints of a "TrainingCenterDatabase" root element: those of the first
// activity, all its laps in order, or of the first course, as one track.
class TcxReader
{
public:
    TcxReader(QXmlStreamReader &xml, TrackItemList &items) : m_xml(xml), m_items(items) {}

    // Expects the reader on the root's start element; true even for an empty document.
    bool read();

private:
    // Reads the first child of that name of the current element and its tracks; false
    // when there is none.
    bool readFirst(QLatin1String name);
    void readTracks(bool withLaps);
    void readTrack();
    void readTrackpoint();

    QXmlStreamReader &m_xml;
    TrackItemList &m_items;
    QString m_text;
};
