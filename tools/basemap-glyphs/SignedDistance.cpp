#include "SignedDistance.h"

#include <algorithm>
#include <cmath>

namespace {
// Stands for "no such pixel": large, yet finite, so that the envelope's arithmetic holds.
constexpr double far = 1e20;
}

void distanceTransform1D(std::vector<double> &f)
{
    // The lower envelope of the parabolas rooted at each sample (Felzenszwalb and
    // Huttenlocher, "Distance Transforms of Sampled Functions"), in linear time.
    const int n = int(f.size());
    if (n < 2)
        return;
    std::vector<int> roots(size_t(n), 0);
    std::vector<double> bounds(size_t(n) + 1, 0.0);
    const auto meet = [&f](int q, int r) {
        return ((f[size_t(q)] + double(q) * q) - (f[size_t(r)] + double(r) * r)) / (2.0 * (q - r));
    };
    int k = 0;
    bounds[0] = -far;
    bounds[1] = far;
    for (int q = 1; q < n; ++q) {
        double s = meet(q, roots[size_t(k)]);
        while (s <= bounds[size_t(k)]) {
            --k;
            s = meet(q, roots[size_t(k)]);
        }
        ++k;
        roots[size_t(k)] = q;
        bounds[size_t(k)] = s;
        bounds[size_t(k) + 1] = far;
    }
    std::vector<double> result(static_cast<size_t>(n));
    k = 0;
    for (int q = 0; q < n; ++q) {
        while (bounds[size_t(k) + 1] < q)
            ++k;
        const int r = roots[size_t(k)];
        result[size_t(q)] = double(q - r) * (q - r) + f[size_t(r)];
    }
    f = std::move(result);
}

namespace {

// Squared distances from every pixel to the nearest pixel that `seed` gives 0 for.
std::vector<double> squaredDistances(std::vector<double> grid, int width, int height)
{
    std::vector<double> line;
    for (int x = 0; x < width; ++x) {
        line.assign(size_t(height), 0.0);
        for (int y = 0; y < height; ++y)
            line[size_t(y)] = grid[size_t(y * width + x)];
        distanceTransform1D(line);
        for (int y = 0; y < height; ++y)
            grid[size_t(y * width + x)] = line[size_t(y)];
    }
    for (int y = 0; y < height; ++y) {
        line.assign(grid.begin() + y * width, grid.begin() + (y + 1) * width);
        distanceTransform1D(line);
        std::copy(line.begin(), line.end(), grid.begin() + y * width);
    }
    return grid;
}

}

std::vector<uint8_t> signedDistanceField(const std::vector<uint8_t> &coverage, int width, int height, double radius,
                                         double cutoff)
{
    const size_t n = size_t(width) * size_t(height);
    // Partly covered pixels count as lying part of a pixel away from the outline.
    std::vector<double> outside(n), inside(n);
    for (size_t i = 0; i < n; ++i) {
        const double a = coverage[i] / 255.0;
        outside[i] = coverage[i] == 0 ? far : std::pow(std::max(0.0, 0.5 - a), 2.0);
        inside[i] = coverage[i] == 255 ? far : std::pow(std::max(0.0, a - 0.5), 2.0);
    }
    outside = squaredDistances(std::move(outside), width, height);
    inside = squaredDistances(std::move(inside), width, height);

    std::vector<uint8_t> field(n);
    for (size_t i = 0; i < n; ++i) {
        const double d = std::clamp((std::sqrt(outside[i]) - std::sqrt(inside[i])) / radius, -1.0, 1.0);
        field[i] = uint8_t(std::clamp(std::round(255.0 - 255.0 * (d + cutoff)), 0.0, 255.0));
    }
    return field;
}
