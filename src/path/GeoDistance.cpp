#include "path/GeoDistance.h"

#include <QtMath>

#include <algorithm>
#include <cmath>
#include <limits>

namespace {
constexpr double earthMeanRadiusKm = 6371.0072;
}

bool isValidCoordinate(double lat, double lon)
{
    return lat >= -90.0 && lat <= 90.0 && lon >= -180.0 && lon <= 180.0;
}

double geoDistance(double lat1, double lon1, double lat2, double lon2)
{
    if (!isValidCoordinate(lat1, lon1) || !isValidCoordinate(lat2, lon2))
        return 0.0;
    return GeoDistanceFrom::termToMetres(GeoDistanceFrom(lat1, lon1).term(lat2, lon2));
}

GeoDistanceFrom::GeoDistanceFrom(double lat, double lon)
    : m_lat(lat), m_lon(lon), m_cosLat(std::cos(qDegreesToRadians(lat))), m_valid(isValidCoordinate(lat, lon))
{
}

double GeoDistanceFrom::term(double lat, double lon) const
{
    if (!m_valid || !isValidCoordinate(lat, lon))
        return 0.0; // as the distance of invalid coordinates: 0
    double hLat = std::sin(qDegreesToRadians(lat - m_lat) / 2.0);
    hLat *= hLat;
    double hLon = std::sin(qDegreesToRadians(lon - m_lon) / 2.0);
    hLon *= hLon;
    return hLat + m_cosLat * std::cos(qDegreesToRadians(lat)) * hLon;
}

double GeoDistanceFrom::termAtLeast(double lat, double lon) const
{
    if (!m_valid || !isValidCoordinate(lat, lon))
        return 0.0;
    // sin(t) >= t - t^3 / 6 for t >= 0, and cos moves by at most the angle it is moved by.
    const auto sinBelow = [](double t) { return t * (1 - t * t / 6); };
    const double dLat = std::fabs(qDegreesToRadians(lat - m_lat));
    double dLon = std::fabs(qDegreesToRadians(lon - m_lon));
    if (dLon > M_PI)
        dLon = 2 * M_PI - dLon;
    const double cosLat = std::max(0.0, m_cosLat - dLat);
    const double sLat = sinBelow(dLat / 2);
    const double sLon = sinBelow(dLon / 2);
    const double bound = sLat * sLat + m_cosLat * cosLat * sLon * sLon;
    return bound * (1 - 1e-9); // room for rounding
}

double GeoDistanceFrom::termToMetres(double term)
{
    if (term < 0)
        return 0.0;
    return 2 * std::asin(std::sqrt(term)) * earthMeanRadiusKm * 1000;
}

double GeoDistanceFrom::metresToTerm(double metres)
{
    if (!(metres < std::numeric_limits<double>::max()))
        return std::numeric_limits<double>::infinity();
    const double half = metres / (earthMeanRadiusKm * 1000) / 2;
    if (half >= M_PI / 2)
        return std::numeric_limits<double>::infinity();
    const double s = std::sin(half);
    return s * s;
}
