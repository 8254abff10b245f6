#pragma once

#include "gpx/TrackItemList.h"

#include <QString>

class QXmlStreamReader;

// Reads the trackpoints of a "TrainingCenterDatabase" root element. Like the KML walk
// it descends into "Activity", "Lap" and "Course" and stops at the first end tag, so
// only the first lap of the first activity (or the first course) is read.
class TcxReader
{
public:
    TcxReader(QXmlStreamReader &xml, TrackItemList &items) : m_xml(xml), m_items(items) {}

    // Expects the reader on the root's start element; true even for an empty document.
    bool read();

private:
    void readActivities();
    void readCourses();
    void readTrack();
    void readTrackpoint();

    QXmlStreamReader &m_xml;
    TrackItemList &m_items;
    QString m_text;
};
