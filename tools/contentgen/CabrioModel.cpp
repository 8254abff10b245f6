#include "CabrioModel.h"

#include <QtMath>

#include <array>

#include <algorithm>
#include <cmath>

namespace {

const QColor interior(58, 42, 36);
const QColor leather(196, 160, 120);
const QColor tyre(30, 30, 32);
const QColor chrome(205, 208, 212);
const QColor darkTrim(40, 40, 44);

class Builder
{
public:
    Model model;

    void triangle(const QVector3D &a, const QVector3D &b, const QVector3D &c, const QColor &colour,
                  float shininess = 0.0f, float alpha = 1.0f, bool emissive = false)
    {
        const QVector3D n = QVector3D::crossProduct(b - a, c - a).normalized();
        smoothTriangle({a, b, c}, {n, n, n}, colour, shininess, alpha, emissive);
    }

    void smoothTriangle(std::array<QVector3D, 3> p, std::array<QVector3D, 3> n, const QColor &colour, float shininess,
                        float alpha = 1.0f, bool emissive = false)
    {
        ModelTriangle t;
        for (int i = 0; i < 3; ++i) {
            t.p[i] = p[size_t(i)];
            t.n[i] = n[size_t(i)];
        }
        t.colour = colour;
        t.shininess = shininess;
        t.alpha = alpha;
        t.emissive = emissive;
        model.push_back(t);
    }

    void quad(const QVector3D &a, const QVector3D &b, const QVector3D &c, const QVector3D &d, const QColor &colour,
              float shininess = 0.0f, float alpha = 1.0f, bool emissive = false)
    {
        triangle(a, b, c, colour, shininess, alpha, emissive);
        triangle(a, c, d, colour, shininess, alpha, emissive);
    }

    // An axis-aligned box, optionally tilted about the y axis (pitch, degrees) around its centre.
    void box(const QVector3D &centre, const QVector3D &size, const QColor &colour, float pitch = 0.0f,
             float shininess = 0.0f, bool emissive = false)
    {
        const float c = std::cos(qDegreesToRadians(pitch)), s = std::sin(qDegreesToRadians(pitch));
        auto corner = [&](float sx, float sy, float sz) {
            const QVector3D local(sx * size.x() / 2, sy * size.y() / 2, sz * size.z() / 2);
            return centre + QVector3D(local.x() * c - local.z() * s, local.y(), local.x() * s + local.z() * c);
        };
        const QVector3D p[8] = {corner(-1, -1, -1), corner(1, -1, -1), corner(1, 1, -1), corner(-1, 1, -1),
                                corner(-1, -1, 1),  corner(1, -1, 1),  corner(1, 1, 1),  corner(-1, 1, 1)};
        quad(p[0], p[1], p[2], p[3], colour, shininess, 1.0f, emissive);
        quad(p[4], p[5], p[6], p[7], colour, shininess, 1.0f, emissive);
        quad(p[0], p[1], p[5], p[4], colour, shininess, 1.0f, emissive);
        quad(p[1], p[2], p[6], p[5], colour, shininess, 1.0f, emissive);
        quad(p[2], p[3], p[7], p[6], colour, shininess, 1.0f, emissive);
        quad(p[3], p[0], p[4], p[7], colour, shininess, 1.0f, emissive);
    }

    // A square beam from a to b.
    void beam(const QVector3D &a, const QVector3D &b, float thickness, const QColor &colour, float shininess = 0.0f)
    {
        const QVector3D along = (b - a).normalized();
        QVector3D side = QVector3D::crossProduct(along, QVector3D(0, 0, 1));
        if (side.lengthSquared() < 1e-4f)
            side = QVector3D(0, 1, 0);
        side = side.normalized() * (thickness / 2);
        const QVector3D upward = QVector3D::crossProduct(side, along).normalized() * (thickness / 2);
        const QVector3D r[4] = {side + upward, -side + upward, -side - upward, side - upward};
        for (int i = 0; i < 4; ++i) {
            const int j = (i + 1) % 4;
            quad(a + r[i], b + r[i], b + r[j], a + r[j], colour, shininess);
        }
        quad(a + r[0], a + r[1], a + r[2], a + r[3], colour, shininess);
        quad(b + r[0], b + r[1], b + r[2], b + r[3], colour, shininess);
    }

    // A wheel: tyre round the y axis, with a bright disc on its outer face.
    void wheel(const QVector3D &centre, float radius, float width, float outerSign)
    {
        const int segments = 28;
        const float inner = centre.y() - outerSign * width / 2, outer = centre.y() + outerSign * width / 2;
        for (int i = 0; i < segments; ++i) {
            const float a0 = float(2 * M_PI * i / segments), a1 = float(2 * M_PI * (i + 1) / segments);
            const QVector3D d0(std::cos(a0), 0, std::sin(a0)), d1(std::cos(a1), 0, std::sin(a1));
            auto at = [&](const QVector3D &d, float y, float r) {
                return QVector3D(centre.x() + d.x() * r, y, centre.z() + d.z() * r);
            };
            smoothTriangle({at(d0, inner, radius), at(d1, inner, radius), at(d1, outer, radius)}, {d0, d1, d1}, tyre, 6.0f);
            smoothTriangle({at(d0, inner, radius), at(d1, outer, radius), at(d0, outer, radius)}, {d0, d1, d0}, tyre, 6.0f);
            const QVector3D c(centre.x(), outer, centre.z());
            const QVector3D hubOut(centre.x(), outer + outerSign * 0.015f, centre.z());
            triangle(c, at(d0, outer, radius), at(d1, outer, radius), tyre);
            triangle(hubOut, at(d0, outer + outerSign * 0.01f, radius * 0.62f), at(d1, outer + outerSign * 0.01f, radius * 0.62f),
                     chrome, 30.0f);
            triangle(QVector3D(centre.x(), inner, centre.z()), at(d0, inner, radius), at(d1, inner, radius), tyre);
        }
    }
};

struct Station
{
    float x, halfWidth, bottom, top, cockpitDepth;
};

// Body outline along the car, front (+x) to rear; values between stations are interpolated.
const Station outline[] = {
    {2.18f, 0.66f, 0.36f, 0.60f, 0},    {2.10f, 0.80f, 0.30f, 0.70f, 0},   {1.90f, 0.87f, 0.26f, 0.77f, 0},
    {1.50f, 0.90f, 0.25f, 0.83f, 0},    {1.00f, 0.90f, 0.25f, 0.87f, 0},   {0.55f, 0.90f, 0.25f, 0.90f, 0},
    {0.46f, 0.90f, 0.25f, 0.90f, 0},    {0.44f, 0.90f, 0.25f, 0.90f, 0.50f}, {-0.98f, 0.90f, 0.25f, 0.90f, 0.50f},
    {-1.00f, 0.90f, 0.25f, 0.90f, 0},   {-1.50f, 0.90f, 0.25f, 0.89f, 0},  {-1.90f, 0.87f, 0.27f, 0.85f, 0},
    {-2.10f, 0.80f, 0.32f, 0.79f, 0},   {-2.18f, 0.70f, 0.38f, 0.72f, 0},
};

Station stationAt(float x)
{
    const size_t count = sizeof outline / sizeof outline[0];
    for (size_t i = 0; i + 1 < count; ++i) {
        const Station &a = outline[i], &b = outline[i + 1];
        if (x <= a.x && x >= b.x) {
            const float t = (a.x - x) / (a.x - b.x);
            auto mix = [t](float p, float q) { return p + (q - p) * t; };
            // The cockpit edge is a step, not a slope.
            const float depth = (a.cockpitDepth > 0 && b.cockpitDepth > 0) ? a.cockpitDepth : (t < 0.5f ? a.cockpitDepth : b.cockpitDepth);
            return {x, mix(a.halfWidth, b.halfWidth), mix(a.bottom, b.bottom), mix(a.top, b.top), depth};
        }
    }
    return outline[0];
}

struct SectionPoint
{
    float y, z;
    bool inside; // part of the open cockpit
};

// Half a cross-section, from the bottom centre round the side to the top centre.
std::vector<SectionPoint> crossSection(const Station &s)
{
    const float w = s.halfWidth, b = s.bottom, t = s.top;
    const float rim = 0.10f;
    std::vector<SectionPoint> points = {
        {0.0f, b, false},           {w * 0.80f, b, false},         {w * 0.96f, b + 0.04f, false},
        {w, b + 0.14f, false},      {w, b + 0.42f * (t - b), false}, {w * 0.995f, t - 0.12f, false},
        {w * 0.975f, t - 0.045f, false}, {w * 0.93f, t, false},
    };
    const float inner = w * 0.93f - rim;
    const float crown = 0.025f;
    if (s.cockpitDepth > 0) {
        points.push_back({inner, t, true});
        points.push_back({inner, t - s.cockpitDepth, true});
        points.push_back({0.0f, t - s.cockpitDepth, true});
    } else {
        points.push_back({inner, t + crown * 0.6f, false});
        points.push_back({inner * 0.5f, t + crown * 0.9f, false});
        points.push_back({0.0f, t + crown, false});
    }
    return points;
}

void addBody(Builder &b, const QColor &paint)
{
    std::vector<float> xs;
    for (float x = 2.18f; x > -2.18f; x -= 0.08f)
        xs.push_back(x);
    xs.push_back(-2.18f);
    // Keep the cockpit edges exact.
    for (float edge : {0.46f, 0.44f, -0.98f, -1.00f})
        xs.push_back(edge);
    std::sort(xs.begin(), xs.end(), std::greater<float>());
    xs.erase(std::unique(xs.begin(), xs.end(), [](float p, float q) { return std::fabs(p - q) < 0.005f; }), xs.end());

    std::vector<std::vector<QVector3D>> rings;
    std::vector<std::vector<bool>> inside;
    for (float x : xs) {
        const Station s = stationAt(x);
        std::vector<QVector3D> ring;
        std::vector<bool> flags;
        for (const SectionPoint &p : crossSection(s)) {
            ring.emplace_back(x, p.y, p.z);
            flags.push_back(p.inside);
        }
        rings.push_back(ring);
        inside.push_back(flags);
    }
    // Normals: average of the faces around each point, from neighbours on the ring and along the car.
    auto normalAt = [&](size_t r, size_t i, float side) {
        const auto &ring = rings[r];
        const QVector3D around = ring[std::min(i + 1, ring.size() - 1)] - ring[i > 0 ? i - 1 : 0];
        const QVector3D along = rings[r > 0 ? r - 1 : r][i] - rings[std::min(r + 1, rings.size() - 1)][i];
        QVector3D n = QVector3D::crossProduct(along, around).normalized();
        return QVector3D(n.x(), n.y() * side, n.z());
    };
    for (float side : {1.0f, -1.0f}) {
        auto mirror = [side](QVector3D p) { return QVector3D(p.x(), p.y() * side, p.z()); };
        for (size_t r = 0; r + 1 < rings.size(); ++r) {
            for (size_t i = 0; i + 1 < rings[r].size(); ++i) {
                const bool cockpit = inside[r][i + 1] || inside[r + 1][i + 1];
                const QColor colour = cockpit ? interior : paint;
                const float shine = cockpit ? 0.0f : 40.0f;
                const QVector3D p00 = mirror(rings[r][i]), p01 = mirror(rings[r][i + 1]);
                const QVector3D p10 = mirror(rings[r + 1][i]), p11 = mirror(rings[r + 1][i + 1]);
                const QVector3D n00 = normalAt(r, i, side), n01 = normalAt(r, i + 1, side);
                const QVector3D n10 = normalAt(r + 1, i, side), n11 = normalAt(r + 1, i + 1, side);
                if (cockpit) {
                    b.triangle(p00, p10, p11, colour);
                    b.triangle(p00, p11, p01, colour);
                } else {
                    b.smoothTriangle({p00, p10, p11}, {n00, n10, n11}, colour, shine);
                    b.smoothTriangle({p00, p11, p01}, {n00, n11, n01}, colour, shine);
                }
            }
        }
        // End caps.
        for (size_t end : {size_t(0), rings.size() - 1}) {
            const auto &ring = rings[end];
            for (size_t i = 1; i + 1 < ring.size(); ++i)
                b.triangle(mirror(ring[0]), mirror(ring[i]), mirror(ring[i + 1]), paint, 40.0f);
        }
    }
}

} // namespace

Model cabrioModel(const QColor &paint)
{
    Builder b;
    addBody(b, paint);

    // Wheels and the dark arches behind them.
    for (float x : {1.28f, -1.28f}) {
        for (float side : {1.0f, -1.0f}) {
            b.wheel(QVector3D(x, side * 0.80f, 0.33f), 0.33f, 0.22f, side);
            const int n = 14;
            for (int i = 0; i < n; ++i) {
                const float a0 = float(M_PI * i / n), a1 = float(M_PI * (i + 1) / n);
                const float y = side * 0.905f;
                auto p = [&](float a, float r) { return QVector3D(x + r * std::cos(a), y, 0.30f + r * std::sin(a)); };
                b.quad(p(a0, 0.36f), p(a1, 0.36f), p(a1, 0.42f), p(a0, 0.42f), darkTrim);
                b.triangle(QVector3D(x, y * 0.999f, 0.30f), p(a0, 0.36f), p(a1, 0.36f), QColor(16, 16, 18));
            }
        }
    }

    // Windscreen: tinted glass in a dark frame.
    const QVector3D bl(0.46f, 0.78f, 0.90f), br(0.46f, -0.78f, 0.90f), tl(0.16f, 0.70f, 1.26f), tr(0.16f, -0.70f, 1.26f);
    b.quad(bl, br, tr, tl, QColor(170, 205, 225), 60.0f, 0.45f);
    b.beam(bl, tl, 0.04f, darkTrim);
    b.beam(br, tr, 0.04f, darkTrim);
    b.beam(tl, tr, 0.04f, darkTrim);
    b.beam(QVector3D(0.46f, 0.80f, 0.91f), QVector3D(0.46f, -0.80f, 0.91f), 0.04f, chrome, 40.0f);

    // Seats: two in front, a bench behind.
    for (float y : {0.40f, -0.40f}) {
        b.box(QVector3D(-0.22f, y, 0.50f), QVector3D(0.55f, 0.50f, 0.14f), leather, 0, 8.0f);
        b.box(QVector3D(-0.52f, y, 0.80f), QVector3D(0.14f, 0.48f, 0.60f), leather, 14.0f, 8.0f);
        b.box(QVector3D(-0.60f, y, 1.16f), QVector3D(0.10f, 0.26f, 0.16f), leather, 14.0f, 8.0f);
    }
    b.box(QVector3D(-0.78f, 0, 0.50f), QVector3D(0.36f, 1.30f, 0.14f), leather, 0, 8.0f);
    b.box(QVector3D(-0.94f, 0, 0.72f), QVector3D(0.10f, 1.30f, 0.44f), leather, 10.0f, 8.0f);

    // Steering wheel in front of the left seat.
    const QVector3D hub(0.12f, 0.40f, 0.92f);
    const int spokes = 14;
    for (int i = 0; i < spokes; ++i) {
        const float a0 = float(2 * M_PI * i / spokes), a1 = float(2 * M_PI * (i + 1) / spokes);
        auto rim = [&](float a) {
            const float r = 0.17f;
            return hub + QVector3D(-0.35f * r * std::sin(a), r * std::cos(a), 0.94f * r * std::sin(a));
        };
        b.beam(rim(a0), rim(a1), 0.03f, darkTrim);
    }
    b.box(QVector3D(0.36f, 0, 0.84f), QVector3D(0.16f, 1.5f, 0.10f), darkTrim);

    // Folded roof behind the bench.
    b.box(QVector3D(-1.22f, 0, 0.95f), QVector3D(0.34f, 1.40f, 0.14f), QColor(46, 44, 44), 0, 4.0f);

    // Lamps, grille, bumpers, mirrors.
    for (float side : {1.0f, -1.0f}) {
        b.box(QVector3D(2.12f, side * 0.58f, 0.60f), QVector3D(0.10f, 0.26f, 0.10f), QColor(255, 250, 220), 0, 0, true);
        b.box(QVector3D(-2.15f, side * 0.60f, 0.66f), QVector3D(0.08f, 0.26f, 0.09f), QColor(210, 30, 30), 0, 0, true);
        b.box(QVector3D(0.42f, side * 0.98f, 0.98f), QVector3D(0.10f, 0.14f, 0.08f), paint, 0, 30.0f);
    }
    b.box(QVector3D(2.16f, 0, 0.50f), QVector3D(0.06f, 0.70f, 0.14f), darkTrim);
    b.beam(QVector3D(2.22f, 0.74f, 0.38f), QVector3D(2.22f, -0.74f, 0.38f), 0.07f, chrome, 50.0f);
    b.beam(QVector3D(-2.22f, 0.74f, 0.42f), QVector3D(-2.22f, -0.74f, 0.42f), 0.07f, chrome, 50.0f);
    return b.model;
}
