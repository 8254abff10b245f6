#pragma once

// Latitude within [-90, 90] and longitude within [-180, 180]; false for NaN.
bool isValidCoordinate(double lat, double lon);

// Great-circle distance in metres between (lat, lon) pairs in degrees, computed as
// QGeoCoordinate::distanceTo does; invalid coordinates give 0.
double geoDistance(double lat1, double lon1, double lat2, double lon2);

// For many distances from one place: compares by the haversine term, which grows
// with the distance, and turns only the result into metres.
class GeoDistanceFrom
{
public:
    GeoDistanceFrom(double lat, double lon);
    bool valid() const { return m_valid; }
    // The haversine term to (lat, lon); 0 when either point is invalid.
    double term(double lat, double lon) const;
    // A value never above term(lat, lon), made without trigonometry, to pass over points
    // that can't be nearer than one already found.
    double termAtLeast(double lat, double lon) const;
    static double termToMetres(double term);
    static double metresToTerm(double metres);

private:
    double m_lat;
    double m_lon;
    double m_cosLat;
    bool m_valid;
};
