#include "SoftRenderer.h"

#include "Raster.h"

#include <QPainter>
#include <QtMath>

#include <algorithm>
#include <cmath>
#include <limits>

namespace {

struct Projected
{
    float x, y, depth;
};

struct Buffers
{
    int w, h;
    std::vector<float> depth;
    std::vector<QVector3D> colour; // straight colour, 0..1
    std::vector<float> shadow;     // ground shadow coverage
    std::vector<bool> covered;

    Buffers(int w_, int h_)
        : w(w_), h(h_), depth(size_t(w_) * size_t(h_), -std::numeric_limits<float>::infinity()),
          colour(size_t(w_) * size_t(h_)), shadow(size_t(w_) * size_t(h_), 0.0f), covered(size_t(w_) * size_t(h_), false)
    {
    }
};

float edge(const Projected &a, const Projected &b, float x, float y)
{
    return (b.x - a.x) * (y - a.y) - (b.y - a.y) * (x - a.x);
}

// Calls fill(index, w0, w1, w2) for every pixel centre inside the triangle.
template <typename Fill>
void rasterise(const Projected (&v)[3], int w, int h, Fill fill)
{
    const float area = edge(v[0], v[1], v[2].x, v[2].y);
    if (std::fabs(area) < 1e-6f)
        return;
    const int x0 = std::max(0, int(std::floor(std::min({v[0].x, v[1].x, v[2].x}))));
    const int x1 = std::min(w - 1, int(std::ceil(std::max({v[0].x, v[1].x, v[2].x}))));
    const int y0 = std::max(0, int(std::floor(std::min({v[0].y, v[1].y, v[2].y}))));
    const int y1 = std::min(h - 1, int(std::ceil(std::max({v[0].y, v[1].y, v[2].y}))));
    const float inverse = 1.0f / area;
    for (int y = y0; y <= y1; ++y) {
        for (int x = x0; x <= x1; ++x) {
            const float px = x + 0.5f, py = y + 0.5f;
            // Inside when all three have the sign of the area.
            const float w0 = edge(v[1], v[2], px, py) * inverse;
            if (w0 < 0)
                continue;
            const float w1 = edge(v[2], v[0], px, py) * inverse;
            if (w1 < 0)
                continue;
            const float w2 = 1.0f - w0 - w1;
            if (w2 < 0)
                continue;
            fill(size_t(y) * size_t(w) + size_t(x), w0, w1, w2);
        }
    }
}

} // namespace

SoftRenderer::SoftRenderer(int size, double metresAcross, double elevationDegrees)
    : m_size(size), m_pixelsPerMetre(size / metresAcross), m_elevation(qDegreesToRadians(elevationDegrees))
{
}

QImage SoftRenderer::render(const Model &model, double headingDegrees) const
{
    const int big = m_size * m_supersample;
    Buffers buffers(big, big);
    const double heading = qDegreesToRadians(headingDegrees);
    // Car axes in the world (X east, Y north, Z up).
    const QVector3D forward(float(std::sin(heading)), float(std::cos(heading)), 0.0f);
    const QVector3D left(-float(std::cos(heading)), float(std::sin(heading)), 0.0f);
    const QVector3D up(0.0f, float(std::sin(m_elevation)), float(std::cos(m_elevation)));
    const QVector3D toViewer(0.0f, -float(std::cos(m_elevation)), float(std::sin(m_elevation)));
    const QVector3D light = QVector3D(-0.45f, -0.35f, 1.0f).normalized();
    const QVector3D halfway = (light + toViewer).normalized();
    const float scale = float(m_pixelsPerMetre * m_supersample);
    const float centre = big / 2.0f;

    auto toWorld = [&](const QVector3D &p) { return forward * p.x() + left * p.y() + QVector3D(0, 0, p.z()); };
    auto project = [&](const QVector3D &world) {
        return Projected{centre + scale * world.x(), centre - scale * QVector3D::dotProduct(world, up),
                         QVector3D::dotProduct(world, toViewer)};
    };

    // The shadow on the ground, cast along the light by the body: small high
    // parts would throw loose specks beside it.
    for (const ModelTriangle &t : model) {
        if (t.alpha < 0.5f || std::max({t.p[0].z(), t.p[1].z(), t.p[2].z()}) > 1.0f)
            continue;
        Projected v[3];
        for (int i = 0; i < 3; ++i) {
            QVector3D world = toWorld(t.p[i]);
            world -= light * (world.z() / light.z());
            v[i] = project(world);
        }
        rasterise(v, big, big, [&](size_t at, float, float, float) { buffers.shadow[at] = 1.0f; });
    }

    auto shade = [&](const ModelTriangle &t, const QVector3D (&normals)[3], const QVector3D &base, float w0, float w1,
                     float w2, const QVector3D &faceNormal) {
        if (t.emissive)
            return base;
        QVector3D n = normals[0] * w0 + normals[1] * w1 + normals[2] * w2;
        n /= std::sqrt(QVector3D::dotProduct(n, n));
        if (QVector3D::dotProduct(faceNormal, toViewer) < 0)
            n = -n;
        if (QVector3D::dotProduct(n, toViewer) < 0)
            n = faceNormal * (QVector3D::dotProduct(faceNormal, toViewer) < 0 ? -1.0f : 1.0f);
        const float diffuse = std::max(0.0f, QVector3D::dotProduct(n, light));
        const float sky = 0.5f + 0.5f * n.z();
        QVector3D c = base * (0.30f + 0.22f * sky + 0.62f * diffuse);
        if (t.shininess > 0) {
            const float spec = std::pow(std::max(0.0f, QVector3D::dotProduct(n, halfway)), t.shininess);
            c += QVector3D(1, 1, 1) * (0.55f * spec);
        }
        return c;
    };

    for (int pass = 0; pass < 2; ++pass) {
        for (const ModelTriangle &t : model) {
            const bool glass = t.alpha < 1.0f;
            if (glass != (pass == 1))
                continue;
            Projected v[3];
            QVector3D world[3];
            for (int i = 0; i < 3; ++i) {
                world[i] = toWorld(t.p[i]);
                v[i] = project(world[i]);
            }
            const QVector3D faceNormal = QVector3D::crossProduct(world[1] - world[0], world[2] - world[0]).normalized();
            const QVector3D normals[3] = {toWorld(t.n[0]), toWorld(t.n[1]), toWorld(t.n[2])};
            const QVector3D base(float(t.colour.redF()), float(t.colour.greenF()), float(t.colour.blueF()));
            rasterise(v, big, big, [&](size_t at, float w0, float w1, float w2) {
                const float depth = w0 * v[0].depth + w1 * v[1].depth + w2 * v[2].depth;
                if (depth <= buffers.depth[at])
                    return;
                const QVector3D c = shade(t, normals, base, w0, w1, w2, faceNormal);
                if (glass) {
                    buffers.colour[at] = buffers.covered[at] ? buffers.colour[at] * (1 - t.alpha) + c * t.alpha : c;
                    if (!buffers.covered[at])
                        buffers.depth[at] = depth; // glass alone still counts as covered
                    buffers.covered[at] = true;
                    return;
                }
                buffers.depth[at] = depth;
                buffers.colour[at] = c;
                buffers.covered[at] = true;
            });
        }
    }

    // Down-sample: coverage becomes alpha; the blurred shadow lies under the car.
    std::vector<float> shadowAlpha(size_t(m_size) * size_t(m_size));
    QImage image(m_size, m_size, QImage::Format_ARGB32_Premultiplied);
    const int ss = m_supersample;
    for (int y = 0; y < m_size; ++y) {
        auto *row = reinterpret_cast<QRgb *>(image.scanLine(y));
        for (int x = 0; x < m_size; ++x) {
            QVector3D sum;
            float hits = 0, shade = 0;
            for (int sy = 0; sy < ss; ++sy) {
                for (int sx = 0; sx < ss; ++sx) {
                    const size_t at = size_t(y * ss + sy) * size_t(big) + size_t(x * ss + sx);
                    shade += buffers.shadow[at];
                    if (buffers.covered[at]) {
                        sum += buffers.colour[at];
                        hits += 1;
                    }
                }
            }
            const float n = float(ss * ss);
            const float alpha = hits / n;
            // Premultiplied: the average over all samples with empty ones black.
            const QVector3D c = sum / n;
            auto channel = [](float v) { return int(std::clamp(v, 0.0f, 1.0f) * 255.0f + 0.5f); };
            row[x] = qRgba(channel(std::min(c.x(), alpha)), channel(std::min(c.y(), alpha)),
                           channel(std::min(c.z(), alpha)), channel(alpha));
            shadowAlpha[size_t(y) * size_t(m_size) + size_t(x)] = 0.38f * shade / n;
        }
    }
    raster::blurChannel(shadowAlpha, m_size, m_size, std::max(1, m_size / 90), 3);
    QImage shadow(m_size, m_size, QImage::Format_ARGB32_Premultiplied);
    for (int y = 0; y < m_size; ++y) {
        auto *row = reinterpret_cast<QRgb *>(shadow.scanLine(y));
        for (int x = 0; x < m_size; ++x)
            row[x] = qRgba(0, 0, 0, int(std::clamp(shadowAlpha[size_t(y) * size_t(m_size) + size_t(x)], 0.0f, 1.0f) * 255.0f + 0.5f));
    }
    QPainter painter(&shadow);
    painter.drawImage(0, 0, image);
    painter.end();
    return shadow;
}
