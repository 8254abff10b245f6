#pragma once

#include "gpx/TrackFile.h"
#include "gpx/TrackImport.h"
#include "path/Path.h"

#include <cstddef>

// What opening the file would do next: the chosen item becomes a path, with an
// aliasing setting taken from the input's size so that all four are exercised.
inline void convertChosenItem(TrackFile &file, size_t inputSize)
{
    const int chosen = file.selectItem();
    if (chosen < 0)
        return;
    Path path;
    TrackImport::toPath(file, chosen, path, uint32_t(inputSize % 4));
}
