#include "WorldMaps.h"

#include "Raster.h"
#include "app/Trace.h"

#include <QFile>
#include <QPainter>
#include <QPainterPath>
#include <QRandomGenerator>
#include <QtMath>

#include <algorithm>
#include <cmath>

namespace {

QTransform degreesToPixels(int width, int height)
{
    QTransform t;
    t.scale(width / 360.0, -height / 180.0);
    t.translate(180.0, -90.0);
    return t;
}

double latitudeOfRow(int y, int height)
{
    return 90.0 - (y + 0.5) * 180.0 / height;
}

double smoothstep(double edge0, double edge1, double x)
{
    const double t = std::clamp((x - edge0) / (edge1 - edge0), 0.0, 1.0);
    return t * t * (3 - 2 * t);
}

// A colour for the per-pixel work, where QColor costs too much.
struct Rgb
{
    float r, g, b;
    constexpr Rgb(int red, int green, int blue) : r(float(red)), g(float(green)), b(float(blue)) {}
    constexpr Rgb(float red, float green, float blue, bool) : r(red), g(green), b(blue) {}
    explicit Rgb(QRgb c) : r(float(qRed(c))), g(float(qGreen(c))), b(float(qBlue(c))) {}
    Rgb scaled(double f) const { return {float(r * f), float(g * f), float(b * f), true}; }
    QRgb rgb() const
    {
        auto channel = [](float v) { return int(std::clamp(v + 0.5f, 0.0f, 255.0f)); };
        return qRgb(channel(r), channel(g), channel(b));
    }
};

Rgb mix(const Rgb &a, const Rgb &b, double t)
{
    const float f = float(std::clamp(t, 0.0, 1.0));
    return {a.r + (b.r - a.r) * f, a.g + (b.g - a.g) * f, a.b + (b.b - a.b) * f, true};
}

// Smooth value noise in 0..1, several octaves.
class Noise
{
public:
    explicit Noise(quint32 seed) : m_seed(seed) {}

    double at(double x, double y, int octaves) const
    {
        double sum = 0, weight = 0, amplitude = 1, frequency = 1;
        for (int o = 0; o < octaves; ++o) {
            sum += amplitude * value(x * frequency, y * frequency, o);
            weight += amplitude;
            amplitude *= 0.5;
            frequency *= 2.03;
        }
        return sum / weight;
    }

private:
    double lattice(int x, int y, int octave) const
    {
        quint32 h = quint32(x) * 374761393u + quint32(y) * 668265263u + quint32(octave) * 2246822519u + m_seed * 3266489917u;
        h = (h ^ (h >> 13)) * 1274126177u;
        return double(h ^ (h >> 16)) / 4294967295.0;
    }

    double value(double x, double y, int octave) const
    {
        const int xi = int(std::floor(x)), yi = int(std::floor(y));
        const double fx = smoothstep(0, 1, x - xi), fy = smoothstep(0, 1, y - yi);
        const double a = lattice(xi, yi, octave), b = lattice(xi + 1, yi, octave);
        const double c = lattice(xi, yi + 1, octave), d = lattice(xi + 1, yi + 1, octave);
        return (a + (b - a) * fx) * (1 - fy) + (c + (d - c) * fx) * fy;
    }

    quint32 m_seed;
};

// Noise of one scale over a whole picture, worked out every few pixels and
// interpolated between: the slow fields cost a fraction of the exact ones.
class NoiseField
{
public:
    NoiseField(const Noise &noise, int width, int height, double scale, int octaves)
        : m_columns(width / step + 2), m_rows(height / step + 2), m_values(size_t(m_columns) * size_t(m_rows))
    {
        for (int r = 0; r < m_rows; ++r)
            for (int c = 0; c < m_columns; ++c)
                m_values[size_t(r) * size_t(m_columns) + size_t(c)] = float(noise.at(c * step / scale, r * step / scale, octaves));
    }

    double at(int x, int y) const
    {
        const int c = x / step, r = y / step;
        const double fx = double(x % step) / step, fy = double(y % step) / step;
        auto v = [&](int cc, int rr) { return double(m_values[size_t(rr) * size_t(m_columns) + size_t(cc)]); };
        return (v(c, r) * (1 - fx) + v(c + 1, r) * fx) * (1 - fy) + (v(c, r + 1) * (1 - fx) + v(c + 1, r + 1) * fx) * fy;
    }

private:
    static constexpr int step = 4;
    int m_columns, m_rows;
    std::vector<float> m_values;
};

// Squared Euclidean distance along one line: the lower envelope of parabolas
// (Felzenszwalb and Huttenlocher).
void distanceLine(const double *f, double *d, int n, std::vector<int> &v, std::vector<double> &z)
{
    int k = 0;
    v[0] = 0;
    z[0] = -1e30;
    z[1] = 1e30;
    auto cross = [&](int q, int p) { return ((f[q] + double(q) * q) - (f[p] + double(p) * p)) / (2.0 * (q - p)); };
    for (int q = 1; q < n; ++q) {
        double s = cross(q, v[size_t(k)]);
        while (s <= z[size_t(k)]) {
            --k;
            s = cross(q, v[size_t(k)]);
        }
        ++k;
        v[size_t(k)] = q;
        z[size_t(k)] = s;
        z[size_t(k) + 1] = 1e30;
    }
    k = 0;
    for (int q = 0; q < n; ++q) {
        while (z[size_t(k) + 1] < q)
            ++k;
        const int p = v[size_t(k)];
        d[q] = double(q - p) * double(q - p) + f[p];
    }
}

// Distance in pixels to the nearest pixel where target is set.
std::vector<float> distanceTo(const std::vector<quint8> &target, int w, int h)
{
    const double far = 1e20;
    std::vector<double> grid(target.size());
    for (size_t i = 0; i < target.size(); ++i)
        grid[i] = target[i] ? 0.0 : far;
    const int n = std::max(w, h);
    std::vector<double> in(static_cast<size_t>(n)), out(static_cast<size_t>(n)), z(static_cast<size_t>(n) + 1);
    std::vector<int> v(static_cast<size_t>(n));
    for (int x = 0; x < w; ++x) {
        for (int y = 0; y < h; ++y)
            in[size_t(y)] = grid[size_t(y) * size_t(w) + size_t(x)];
        distanceLine(in.data(), out.data(), h, v, z);
        for (int y = 0; y < h; ++y)
            grid[size_t(y) * size_t(w) + size_t(x)] = out[size_t(y)];
    }
    std::vector<float> result(target.size());
    for (int y = 0; y < h; ++y) {
        const double *row = grid.data() + size_t(y) * size_t(w);
        std::copy(row, row + w, in.begin());
        distanceLine(in.data(), out.data(), w, v, z);
        for (int x = 0; x < w; ++x)
            result[size_t(y) * size_t(w) + size_t(x)] = float(std::sqrt(out[size_t(x)]));
    }
    return result;
}

bool isIceCountry(const QString &name)
{
    return name == QLatin1String("Antarctica") || name == QLatin1String("Greenland");
}

void drawGraticule(QPainter &p, int w, int h, const QPen &pen, int step)
{
    p.setPen(pen);
    for (int lon = -180 + step; lon < 180; lon += step)
        p.drawLine(QPointF((lon + 180) * w / 360.0, 0), QPointF((lon + 180) * w / 360.0, h));
    for (int lat = -90 + step; lat < 90; lat += step)
        p.drawLine(QPointF(0, (90 - lat) * h / 180.0), QPointF(w, (90 - lat) * h / 180.0));
}

// An eight-pointed compass rose with "N" above, in the style of old sea charts.
void drawCompassRose(QPainter &p, QPointF centre, double radius, const QColor &ink)
{
    p.save();
    p.translate(centre);
    QColor faint = ink;
    faint.setAlphaF(0.55);
    p.setBrush(Qt::NoBrush);
    p.setPen(QPen(faint, radius * 0.012));
    p.drawEllipse(QPointF(), radius * 0.78, radius * 0.78);
    p.drawEllipse(QPointF(), radius * 0.72, radius * 0.72);
    for (int i = 0; i < 32; ++i) {
        p.save();
        p.rotate(i * 11.25);
        p.drawLine(QPointF(0, -radius * 0.72), QPointF(0, -radius * (i % 2 ? 0.75 : 0.78)));
        p.restore();
    }
    for (int i = 0; i < 8; ++i) {
        const double length = radius * (i % 2 ? 0.55 : 0.95);
        const double width = radius * (i % 2 ? 0.09 : 0.13);
        p.save();
        p.rotate(i * 45.0);
        QPainterPath left, right;
        left.moveTo(0, 0);
        left.lineTo(0, -length);
        left.lineTo(-width, -width);
        left.closeSubpath();
        right.moveTo(0, 0);
        right.lineTo(0, -length);
        right.lineTo(width, -width);
        right.closeSubpath();
        p.setPen(QPen(ink, radius * 0.01));
        p.setBrush(ink);
        p.drawPath(left);
        p.setBrush(QColor(240, 226, 194));
        p.drawPath(right);
        p.restore();
    }
    p.setBrush(ink);
    p.drawEllipse(QPointF(), radius * 0.04, radius * 0.04);
    QFont font(QStringLiteral("DejaVu Serif"));
    font.setPixelSize(int(radius * 0.26));
    font.setBold(true);
    p.setFont(font);
    p.setPen(ink);
    p.drawText(QRectF(-radius * 0.3, -radius * 1.32, radius * 0.6, radius * 0.34), Qt::AlignCenter, QStringLiteral("N"));
    p.restore();
}

} // namespace

struct WorldMaps::Grid
{
    int w = 0, h = 0;
    std::vector<quint8> land;       // 1 on land (antialiased edge above half)
    std::vector<float> toLand;      // pixels from the sea to the coast
    std::vector<float> toSea;       // pixels from land to the coast
    std::vector<quint8> ice;        // 1 on the ice countries
    QImage coverage;                // antialiased land, alpha only
    size_t at(int x, int y) const { return size_t(y) * size_t(w) + size_t(x); }
};

namespace {

// Numbers of the comma separated lines of a file; lines starting with '#' are comments.
bool readNumberTable(const QString &path, int columns, std::vector<std::vector<double>> &rows)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly | QIODevice::Text)) {
        logTrace(3, QStringLiteral("contentgen: can't read %s"), path);
        return false;
    }
    int lineNumber = 0;
    while (!file.atEnd()) {
        const QString line = QString::fromUtf8(file.readLine()).trimmed();
        ++lineNumber;
        if (line.isEmpty() || line.startsWith(QLatin1Char('#')))
            continue;
        const QStringList parts = line.split(QLatin1Char(','));
        std::vector<double> row;
        bool ok = parts.size() == columns + 1;
        for (int c = 1; ok && c < parts.size(); ++c)
            row.push_back(parts.at(c).toDouble(&ok));
        if (!ok) {
            logTrace(3, QStringLiteral("contentgen: %s line %d needs a name and %d numbers"), path, lineNumber, columns);
            return false;
        }
        rows.push_back(row);
    }
    return true;
}

} // namespace

WorldMaps::Climate WorldMaps::climateAt(double longitude, double latitude, double toSea, double noise) const
{
    double dry = 0.0;
    for (const DryLand &d : m_drylands) {
        const double dx = (longitude - d.longitude) / d.radiusLongitude, dy = (latitude - d.latitude) / d.radiusLatitude;
        const double r = std::sqrt(dx * dx + dy * dy) + (noise - 0.5) * 0.9;
        dry = std::max(dry, std::min(1.0, 1.35 * d.strength * (1 - smoothstep(0.25, 1.2, r))));
    }
    const double lat = std::fabs(latitude);
    return {dry, (1 - smoothstep(8, 14, lat)) * smoothstep(40, 160, toSea)};
}

bool WorldMaps::load(const QString &geoPackage, const QString &citiesCsv, const QString &drylandsCsv)
{
    m_countries.clear();
    m_provinces.clear();
    m_cities.clear();
    m_drylands.clear();
    if (!readGeoPackageLayer(geoPackage, QStringLiteral("countries"), QStringLiteral("NAME"), m_countries)
        || !readGeoPackageLayer(geoPackage, QStringLiteral("states_provinces"), QStringLiteral("admin"), m_provinces))
        return false;
    std::vector<std::vector<double>> cities, drylands;
    if (!readNumberTable(citiesCsv, 3, cities) || !readNumberTable(drylandsCsv, 5, drylands))
        return false;
    for (const auto &c : cities)
        m_cities.push_back({c[0], c[1], c[2]});
    for (const auto &d : drylands)
        m_drylands.push_back({d[0], d[1], d[2], d[3], d[4]});
    logTrace(0, QStringLiteral("contentgen: %d countries, %d provinces, %d cities"), int(m_countries.size()),
             int(m_provinces.size()), int(m_cities.size()));
    return !m_countries.empty();
}

const WorldMaps::Grid &WorldMaps::grid(int width) const
{
    if (m_grid && m_grid->w == width)
        return *m_grid;
    m_grid = std::make_unique<Grid>();
    Grid &g = *m_grid;
    g.w = width;
    g.h = width / 2;
    g.coverage = QImage(g.w, g.h, QImage::Format_Alpha8);
    g.coverage.fill(0);
    QImage ice(g.w, g.h, QImage::Format_Alpha8);
    ice.fill(0);
    {
        QPainter p(&g.coverage);
        p.setRenderHint(QPainter::Antialiasing);
        p.setTransform(degreesToPixels(g.w, g.h));
        p.setPen(Qt::NoPen);
        p.setBrush(Qt::black);
        QPainter pi(&ice);
        pi.setTransform(degreesToPixels(g.w, g.h));
        pi.setPen(Qt::NoPen);
        pi.setBrush(Qt::black);
        for (const GeoFeature &f : m_countries) {
            p.drawPath(f.outline);
            if (isIceCountry(f.label))
                pi.drawPath(f.outline);
        }
    }
    g.land.resize(size_t(g.w) * size_t(g.h));
    g.ice.resize(g.land.size());
    std::vector<quint8> sea(g.land.size());
    for (int y = 0; y < g.h; ++y) {
        const uchar *row = g.coverage.constScanLine(y);
        const uchar *iceRow = ice.constScanLine(y);
        for (int x = 0; x < g.w; ++x) {
            g.land[g.at(x, y)] = row[x] >= 128 ? 1 : 0;
            sea[g.at(x, y)] = row[x] >= 128 ? 0 : 1;
            g.ice[g.at(x, y)] = iceRow[x] >= 128 ? 1 : 0;
        }
    }
    g.toLand = distanceTo(g.land, g.w, g.h);
    g.toSea = distanceTo(sea, g.w, g.h);
    return g;
}

WorldMaps::WorldMaps() = default;
WorldMaps::~WorldMaps() = default;

QImage WorldMaps::physical(int width) const
{
    const Grid &g = grid(width);
    const double px = width / 4096.0; // lengths below are given for a 4096 pixel map
    const NoiseField noise(Noise(7), g.w, g.h, 90.0 * px, 4);
    const NoiseField warpNoise(Noise(5), g.w, g.h, 260.0 * px, 5);
    const Rgb deep(28, 74, 122), shallow(104, 170, 212), coastWater(150, 200, 226);
    const Rgb forest(86, 140, 82), green(146, 180, 112), dry(214, 196, 146), tundra(170, 176, 150),
        iceColour(242, 246, 249);
    QImage image(g.w, g.h, QImage::Format_RGB32);
    for (int y = 0; y < g.h; ++y) {
        const double lat = std::fabs(latitudeOfRow(y, g.h));
        auto *row = reinterpret_cast<QRgb *>(image.scanLine(y));
        for (int x = 0; x < g.w; ++x) {
            const size_t i = g.at(x, y);
            const double n = noise.at(x, y);
            Rgb c(0, 0, 0);
            if (!g.land[i]) {
                const double near = std::exp(-g.toLand[i] / (28.0 * px));
                c = mix(deep, shallow, near * 0.55 + 0.12 * n);
                c = mix(c, coastWater, std::exp(-g.toLand[i] / (4.0 * px)) * 0.6);
                c = mix(c, deep.scaled(1 / 1.3), smoothstep(55, 85, lat) * 0.3);
            } else if (g.ice[i] || lat > 80) {
                c = mix(iceColour, Rgb(214, 226, 236), n * 0.6);
            } else {
                const double warp = warpNoise.at(x, y);
                const double dryness = climateAt((x + 0.5) * 360.0 / g.w - 180.0, latitudeOfRow(y, g.h), g.toSea[i] / px, warp).dry;
                c = mix(green, forest, (1 - smoothstep(0, 14, lat)) * 0.9 + smoothstep(48, 58, lat) * 0.5);
                c = mix(c, dry, dryness);
                c = mix(c, tundra, smoothstep(60, 70, lat));
                c = mix(c, iceColour, smoothstep(72, 80, lat));
                c = c.scaled(1 + 0.14 * (n - 0.5));
            }
            row[x] = c.rgb();
        }
    }
    QPainter p(&image);
    p.setRenderHint(QPainter::Antialiasing);
    drawGraticule(p, g.w, g.h, QPen(QColor(255, 255, 255, 46), 1.2 * px), 15);
    p.setTransform(degreesToPixels(g.w, g.h));
    p.setBrush(Qt::NoBrush);
    QPen border(QColor(255, 255, 255, 120), 1.1 * px);
    border.setCosmetic(true);
    for (const GeoFeature &f : m_countries) {
        p.setPen(border);
        p.drawPath(f.outline);
    }
    p.end();
    return image;
}

QImage WorldMaps::oldPaper(int width) const
{
    const Grid &g = grid(width);
    const double px = width / 4096.0;
    const NoiseField noise(Noise(11), g.w, g.h, 160.0 * px, 5);
    const Noise grain(11);
    const Rgb paper(236, 220, 184), paperDark(196, 166, 118), sea(222, 214, 186), land(222, 196, 140),
        ink(92, 60, 30);
    QImage image(g.w, g.h, QImage::Format_RGB32);
    for (int y = 0; y < g.h; ++y) {
        auto *row = reinterpret_cast<QRgb *>(image.scanLine(y));
        for (int x = 0; x < g.w; ++x) {
            const size_t i = g.at(x, y);
            const double n = noise.at(x, y);
            const double fine = grain.at(x / (6.0 * px), y / (6.0 * px), 2);
            // Darker towards the edges of the sheet.
            const double ex = std::min(x, g.w - 1 - x) / (0.12 * g.w), ey = std::min(y, g.h - 1 - y) / (0.12 * g.h);
            const double vignette = 1 - smoothstep(0, 1, std::min({ex, ey, 1.0}));
            Rgb c(0, 0, 0);
            if (!g.land[i]) {
                c = mix(sea, paper, 0.3 + 0.4 * n);
                // Ripples drawn along the coast, fading out to sea.
                const double d = g.toLand[i] / px;
                if (d > 4 && d < 34) {
                    const double phase = std::fmod(d - 4, 8.0);
                    const double line = 1 - smoothstep(0.3, 1.1, std::fabs(phase - 4.0));
                    c = mix(c, ink, line * 0.38 * (1 - d / 34));
                }
            } else {
                c = mix(land, paper, 0.35 * n);
                c = mix(c, Rgb(196, 160, 100), std::exp(-g.toSea[i] / (5.0 * px)) * 0.6);
            }
            // An inked coastline on the edge between the two distance fields.
            const double edge = (g.land[i] ? g.toSea[i] : g.toLand[i]) - 0.5;
            c = mix(c, ink, (1 - smoothstep(0.5 * px, 1.6 * px, edge)) * 0.85);
            c = mix(c, paperDark, vignette * 0.65 + (n - 0.5) * 0.25);
            c = mix(c, paperDark, (fine - 0.5) * 0.18);
            row[x] = c.rgb();
        }
    }
    QPainter p(&image);
    p.setRenderHint(QPainter::Antialiasing);
    QPen grid(QColor(120, 84, 44, 90), 1.1 * px, Qt::DashLine);
    drawGraticule(p, g.w, g.h, grid, 15);
    // Equator and tropics stand out.
    p.setPen(QPen(QColor(120, 70, 30, 150), 1.6 * px));
    for (double lat : {0.0, 23.44, -23.44})
        p.drawLine(QPointF(0, (90 - lat) * g.h / 180.0), QPointF(g.w, (90 - lat) * g.h / 180.0));
    p.setTransform(degreesToPixels(g.w, g.h));
    QPen border(QColor(110, 70, 35, 150), 1.0 * px, Qt::DotLine);
    border.setCosmetic(true);
    p.setBrush(Qt::NoBrush);
    p.setPen(border);
    for (const GeoFeature &f : m_countries)
        p.drawPath(f.outline);
    p.resetTransform();
    drawCompassRose(p, QPointF((-148.0 + 180) * g.w / 360.0, (90 + 42.0) * g.h / 180.0), 150 * px, QColor(ink.rgb()));
    p.end();
    return image;
}

QImage WorldMaps::night(int width) const
{
    const Grid &g = grid(width);
    const double px = width / 4096.0;
    const NoiseField noise(Noise(23), g.w, g.h, 80.0 * px, 4);
    const NoiseField warpNoise(Noise(5), g.w, g.h, 260.0 * px, 5); // the physical map's, so that its dry land stays dark
    const Rgb deep(3, 6, 16), nearCoast(10, 20, 40), landDark(14, 18, 28), landEdge(24, 32, 50);
    QImage image(g.w, g.h, QImage::Format_RGB32);
    for (int y = 0; y < g.h; ++y) {
        auto *row = reinterpret_cast<QRgb *>(image.scanLine(y));
        for (int x = 0; x < g.w; ++x) {
            const size_t i = g.at(x, y);
            const double n = noise.at(x, y);
            Rgb c(0, 0, 0);
            if (!g.land[i])
                c = mix(deep, nearCoast, std::exp(-g.toLand[i] / (25.0 * px)) * 0.9 + 0.08 * n);
            else
                c = mix(landDark, landEdge, std::exp(-g.toSea[i] / (3.0 * px)) * 0.8 + 0.15 * (n - 0.5));
            row[x] = c.rgb();
        }
    }

    // Lights: scattered dots over settled land, brighter near coasts, then the cities.
    std::vector<float> glow(size_t(g.w) * size_t(g.h), 0.0f);
    QRandomGenerator random(4242);
    auto addLight = [&](double x, double y, float amount) {
        const int xi = int(x), yi = int(y);
        if (xi >= 0 && yi >= 0 && xi < g.w && yi < g.h)
            glow[g.at(xi, yi)] += amount;
    };
    const QTransform toPixels = degreesToPixels(g.w, g.h);
    for (const GeoFeature &province : m_provinces) {
        if (isIceCountry(province.label))
            continue;
        const QRectF box = province.outline.boundingRect();
        const double area = std::max(1e-4, box.width() * box.height() * std::cos(qDegreesToRadians(box.center().y())));
        // Small provinces mark crowded land: more lights per square degree.
        const int count = int(std::clamp(14.0 * std::pow(area, 0.45), 3.0, 900.0));
        for (int k = 0; k < count; ++k) {
            const QPointF at(box.left() + random.generateDouble() * box.width(),
                             box.top() + random.generateDouble() * box.height());
            if (!province.outline.contains(at))
                continue;
            const QPointF p = toPixels.map(at);
            const int xi = std::clamp(int(p.x()), 0, g.w - 1), yi = std::clamp(int(p.y()), 0, g.h - 1);
            const double toSea = g.toSea[g.at(xi, yi)] / px;
            const Climate climate = climateAt(at.x(), at.y(), toSea, warpNoise.at(xi, yi));
            const double coast = std::exp(-toSea / 140.0);
            const double cold = 1 - smoothstep(52, 66, std::fabs(at.y()));
            const double settled = (0.2 + 0.8 * coast) * cold * (1 - 0.92 * climate.dry) * (1 - 0.85 * climate.jungle);
            if (random.generateDouble() > settled)
                continue;
            addLight(p.x(), p.y(), float(0.35 + 0.65 * random.generateDouble()));
        }
    }
    for (const City &city : m_cities) {
        const QPointF p = toPixels.map(QPointF(city.longitude, city.latitude));
        const double spread = 2.0 * px * std::sqrt(city.population / 100.0);
        const int dots = int(std::clamp(city.population / 40.0, 8.0, 600.0));
        for (int k = 0; k < dots; ++k) {
            const double r = spread * std::sqrt(-2 * std::log(std::max(1e-9, random.generateDouble())));
            const double a = random.generateDouble() * 2 * M_PI;
            addLight(p.x() + r * std::cos(a), p.y() + r * std::sin(a), float(0.6 + random.generateDouble()));
        }
    }
    // A wide warm halo and a small bright core around every light.
    for (float &v : glow)
        v = std::min(v, 1.0f);
    std::vector<float> halo = glow;
    raster::blurChannel(halo, g.w, g.h, std::max(1, int(4 * px)), 3);
    raster::blurChannel(glow, g.w, g.h, std::max(1, int(1 * px)), 1);
    for (int y = 0; y < g.h; ++y) {
        auto *row = reinterpret_cast<QRgb *>(image.scanLine(y));
        for (int x = 0; x < g.w; ++x) {
            const double haloV = std::min(1.0, halo[g.at(x, y)] * 6.0);
            const double coreV = std::min(1.0, glow[g.at(x, y)] * 2.5);
            Rgb base(row[x]);
            base = mix(base, Rgb(255, 170, 70), haloV * 0.55);
            base = mix(base, Rgb(255, 228, 160), coreV);
            row[x] = base.rgb();
        }
    }
    QPainter p(&image);
    p.setRenderHint(QPainter::Antialiasing);
    p.setTransform(toPixels);
    QPen border(QColor(70, 90, 130, 80), 0.8 * px);
    border.setCosmetic(true);
    p.setPen(border);
    p.setBrush(Qt::NoBrush);
    for (const GeoFeature &f : m_countries)
        p.drawPath(f.outline);
    p.end();
    return image;
}
