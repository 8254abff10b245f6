#include "gpx/TcxReader.h"

#include "gpx/XmlWalk.h"

#include <limits>

using xmlwalk::isNamed;

namespace {
constexpr double unset = std::numeric_limits<double>::max();
}

bool TcxReader::read()
{
    while (m_xml.readNextStartElement()) {
        if (isNamed(m_xml, QLatin1String("Activities"))) {
            if (readFirst(QLatin1String("Activity")))
                break;
        } else if (isNamed(m_xml, QLatin1String("Courses"))) {
            if (readFirst(QLatin1String("Course")))
                break;
        } else {
            m_xml.skipCurrentElement();
        }
    }
    return true;
}

bool TcxReader::readFirst(QLatin1String name)
{
    while (m_xml.readNextStartElement()) {
        if (isNamed(m_xml, name)) {
            readTracks(true);
            return true;
        }
        m_xml.skipCurrentElement();
    }
    return false;
}

// An activity keeps its tracks in laps, a course directly.
void TcxReader::readTracks(bool withLaps)
{
    while (m_xml.readNextStartElement()) {
        if (withLaps && isNamed(m_xml, QLatin1String("Lap")))
            readTracks(false);
        else if (isNamed(m_xml, QLatin1String("Track")))
            readTrack();
        else
            m_xml.skipCurrentElement();
    }
}

void TcxReader::readTrack()
{
    while (m_xml.readNextStartElement()) {
        if (isNamed(m_xml, QLatin1String("Trackpoint")))
            readTrackpoint();
        else
            m_xml.skipCurrentElement();
    }
    m_items.dropEmptyLastItem();
}

void TcxReader::readTrackpoint()
{
    double latitude = unset;
    double longitude = unset;
    double altitude = 0.0;
    while (m_xml.readNextStartElement()) {
        if (isNamed(m_xml, QLatin1String("Position"))) {
            while (m_xml.readNextStartElement()) {
                if (isNamed(m_xml, QLatin1String("LatitudeDegrees")))
                    latitude = xmlwalk::readNumber(m_xml, m_text);
                else if (isNamed(m_xml, QLatin1String("LongitudeDegrees")))
                    longitude = xmlwalk::readNumber(m_xml, m_text);
                else
                    m_xml.skipCurrentElement();
            }
        } else if (isNamed(m_xml, QLatin1String("AltitudeMeters"))) {
            altitude = xmlwalk::readNumber(m_xml, m_text);
        } else {
            m_xml.skipCurrentElement();
        }
    }
    if (latitude == unset || longitude == unset)
        return;
    m_items.ensureTrackItem();
    m_items.addPoint(latitude, longitude, altitude, QString());
}
