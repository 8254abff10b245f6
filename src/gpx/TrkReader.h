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

    // Reads the rest of the device. Lines that aren't track points are skipped.
    bool read(QIODevice &device);

    // The text of a file: a byte-order mark decides when there is one, then UTF-8 when
    // the bytes are valid UTF-8, else the single-byte code page 1252 these files are written in.
    static QString decode(const QByteArray &bytes);

private:
    void readLine(const QStringRef &line);

    TrackItemList &m_items;
};
