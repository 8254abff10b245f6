#pragma once

#include <cstdint>
#include <vector>

// The signed distance field of a glyph's coverage, as map renderers read glyphs:
// 255 - 255 * (d / radius + cutoff), where d is the distance in pixels to the outline,
// negative inside. So the outline lies at 191, the inside above it.
std::vector<uint8_t> signedDistanceField(const std::vector<uint8_t> &coverage, int width, int height,
                                         double radius = 8.0, double cutoff = 0.25);

// The squared Euclidean distance transform of one line of samples, in place: each
// value becomes the least of (q - p)^2 + value[p] over all p.
void distanceTransform1D(std::vector<double> &values);
