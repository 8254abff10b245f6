#include "gpx/TrackItemList.h"

#include <cmath>

void TrackItemList::addPoint(double latitude, double longitude, double elevation, const QString &name)
{
    // An infinite or undefined coordinate would poison every later distance.
    if (m_items.empty() || !std::isfinite(latitude) || !std::isfinite(longitude))
        return;
    TrackItem &item = m_items.back();

    double previousLongitude = 0.0;
    double previousLatitude = 0.0;
    if (!item.points.isEmpty()) {
        const TrackPoint &previous = item.points.constLast();
        previousLongitude = previous.longitude;
        previousLatitude = previous.latitude;
    }

    const bool hasAltitude = elevation != -1.0 && std::isfinite(elevation);
    const double altitude = hasAltitude ? elevation : 0.0;
    if (longitude == previousLongitude && latitude == previousLatitude && !(altitude > 0.0) && name.isEmpty())
        return;

    TrackPoint point;
    point.longitude = longitude;
    point.latitude = latitude;
    point.altitude = altitude;
    point.hasAltitude = hasAltitude;
    point.name = name;
    item.points.append(std::move(point));
    item.bounds.include(longitude, latitude);
}
