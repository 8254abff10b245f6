#pragma once

#include "gpx/GpxReader.h"
#include "gpx/TrackItemList.h"
#include "gpx/TrackRecords.h"

#include <QPointF>
#include <QString>
#include <QXmlStreamReader>

#include <vector>

class QIODevice;

// A recorded journey read from a GPX, KML, KMZ, TCX or TRK file, as a list of items
// (tracks, routes, groups of waypoints) in file order. Point times are not read.
class TrackFile
{
public:
    explicit TrackFile(bool writable = false) : m_writable(writable) {}

    // Reads the file into items(). The suffix "kmz" (exactly so) means a zipped KML,
    // "trk" in any case the line format; anything else is XML told apart by its root
    // element. False when the file can't be opened or read, or yields no item.
    bool load(const QString &fileName);

    // The parsers on their own, for data that is already open. Both clear what an
    // earlier read left and return false only when the data isn't of a known kind.
    bool readXml(QIODevice *device);
    bool readTrk(QIODevice *device);

    // Picks the item that becomes the path: the first track, else the last item, which
    // turns into a fixed GPX path when it holds more than 100 points. Returns its index
    // into items(), -1 when there are no items.
    int selectItem();

    const std::vector<TrackItem> &items() const { return m_items.items(); }
    const QString &creator() const { return m_header.creator; }
    const QString &time() const { return m_header.time; }
    // The bounds of a GPX file's metadata as written there: x longitude, y latitude.
    QPointF boundsTopLeft() const { return m_header.boundsMin; }
    QPointF boundsBottomRight() const { return m_header.boundsMax; }
    // A file that this program wrote itself.
    bool isOwnFile() const { return m_header.creator == QLatin1String("Tourlet"); }
    bool isWritable() const { return m_writable; }

private:
    bool loadKmz(const QString &fileName);

    QXmlStreamReader m_xml;
    GpxHeader m_header;
    TrackItemList m_items;
    bool m_writable;
};
