#pragma once

#include <QPainterPath>
#include <QString>

#include <vector>

// One feature of a GeoPackage layer: its outline in degrees (x longitude,
// y latitude, odd-even filled so that holes stay open) and one text column.
struct GeoFeature
{
    QPainterPath outline;
    QString label;
};

// Reads the polygon or line geometries of one layer of a GeoPackage file.
// False with a trace line when the file, the layer or a geometry can't be read.
bool readGeoPackageLayer(const QString &file, const QString &layer, const QString &labelColumn,
                         std::vector<GeoFeature> &features);
