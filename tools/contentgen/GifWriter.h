#pragma once

#include <QImage>
#include <QString>

#include <vector>

// Writes frames as one looping GIF with a shared palette. Pixels less than half
// opaque become transparent; GIF has no partial transparency.
bool writeGif(const QString &path, const std::vector<QImage> &frames, int delayMs);
