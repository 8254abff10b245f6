#pragma once

#include "SoftRenderer.h"

#include <QColor>

// A small open two-door car of our own, built from a lofted body, boxes and
// cylinders. Metres: x forward, y left, z up, origin on the ground at the centre.
Model cabrioModel(const QColor &paint);
