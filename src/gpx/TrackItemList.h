#pragma once

#include "gpx/TrackRecords.h"

#include <vector>

// The items that a reader fills, with the few operations that every format shares.
class TrackItemList
{
public:
    std::vector<TrackItem> &items() { return m_items; }
    const std::vector<TrackItem> &items() const { return m_items; }
    void clear() { m_items.clear(); }

    void appendItem(int32_t type) { m_items.emplace_back(type); }
    // Type of the last item, 0 when there is none.
    int32_t lastItemType() const { return m_items.empty() ? 0 : m_items.back().type; }
    // Starts a track unless the last item already is one, so that the pieces of a
    // file that carry no item boundaries of their own run into one track.
    void ensureTrackItem()
    {
        if (lastItemType() != TrackItem::Track)
            appendItem(TrackItem::Track);
    }
    void dropEmptyLastItem()
    {
        if (!m_items.empty() && m_items.back().points.isEmpty())
            m_items.pop_back();
    }

    // Appends a point to the last item; -1.0 as elevation means none. A point equal in
    // position to the one before it is dropped unless it has a positive altitude or a name.
    void addPoint(double latitude, double longitude, double elevation, const QString &name);

private:
    std::vector<TrackItem> m_items;
};
