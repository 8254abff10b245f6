#pragma once

#include <QColor>
#include <QImage>
#include <QVector3D>

#include <vector>

// A triangle of a model in metres: x forward, y left, z up. Normals per corner
// give smooth shading; alpha below 1 is glass, drawn after everything opaque.
struct ModelTriangle
{
    QVector3D p[3];
    QVector3D n[3];
    QColor colour;
    float shininess = 0.0f; // 0 for matt surfaces
    float alpha = 1.0f;
    bool emissive = false;  // lamps: not shaded
};

using Model = std::vector<ModelTriangle>;

// Draws a model as the avatar sees the ground: a camera looking north at a fixed
// elevation, orthographic, with a soft ground shadow, on a transparent square.
class SoftRenderer
{
public:
    SoftRenderer(int size, double metresAcross, double elevationDegrees);

    // The model turned to heading (degrees clockwise from north).
    QImage render(const Model &model, double headingDegrees) const;

private:
    int m_size;
    int m_supersample = 3;
    double m_pixelsPerMetre;
    double m_elevation;
};
