#pragma once

#include "gpx/TrackItemList.h"

class QIODevice;

// Reads the line format of ".trk" files. A track line starts with "T"; its position
// follows the tokens "A" (latitude) and "N" (longitude), its altitude the token "s".
// The hemisphere letters are not evaluated.
class TrkReader
{
public:
    explicit TrkReader(TrackItemList &items) : m_items(items) {}

    // Reads the rest of the device line by line. Lines that aren't track points are
    // skipped. A byte-order mark decides the encoding where there is one; else each line
    // is UTF-8 when valid, else the code page 1252 these files are written in.
    bool read(QIODevice &device);

private:
    void readLine(const QStringRef &line);

    TrackItemList &m_items;
};
