#include "path/TrackPoint.h"

KeyPoint keyPointFromTrack(const TrackPoint &p)
{
    KeyPoint key;
    key.setLongitude(p.longitude, true);
    key.setLatitude(p.latitude, true);
    if (p.hasAltitude)
        key.setAltitude(p.altitude, true);
    if (!p.name.isEmpty()) {
        key.name = p.name;
        key.properties.title = p.name;
    }
    return key;
}
