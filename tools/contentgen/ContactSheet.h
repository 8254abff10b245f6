#pragma once

#include <QString>

// One PNG that shows the content of a program folder's "imgsrc": avatars with the
// directions of the perspective ones, symbols, masks, maps, altitude themes and
// the splash, each named. Kept small for the repository.
bool writeContactSheet(const QString &imageRoot, const QString &pngPath);
