#pragma once

#include "GeoPackage.h"

#include <QImage>
#include <QString>

#include <memory>
#include <vector>

// A lit place for the night map: position in degrees, population in thousands.
struct City
{
    double longitude = 0.0;
    double latitude = 0.0;
    double population = 0.0;
};

// Equirectangular world maps (longitude -180..180, latitude 90..-90) in three
// styles, drawn from country and province outlines.
class WorldMaps
{
public:
    WorldMaps();
    ~WorldMaps();

    // Countries and provinces from the GeoPackage; cities as "name,lon,lat,thousands"
    // lines, dry regions as "name,lon,lat,radius lon,radius lat,strength" ellipses.
    bool load(const QString &geoPackage, const QString &citiesCsv, const QString &drylandsCsv);

    QImage physical(int width) const;
    QImage oldPaper(int width) const;
    QImage night(int width) const;

private:
    struct Grid;
    struct DryLand
    {
        double longitude, latitude, radiusLongitude, radiusLatitude, strength;
    }; // land mask and the fields made from it at one size
    const Grid &grid(int width) const;
    // How dry and how deep in a tropical forest a place is, 0..1; toSea in pixels of a 4096 pixel map.
    struct Climate
    {
        double dry;
        double jungle;
    };
    Climate climateAt(double longitude, double latitude, double toSea, double noise) const;

    std::vector<GeoFeature> m_countries;
    std::vector<GeoFeature> m_provinces;
    std::vector<City> m_cities;
    std::vector<DryLand> m_drylands;
    mutable std::unique_ptr<Grid> m_grid;
};
