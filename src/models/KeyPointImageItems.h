#pragma once

#include "content/ContentItems.h"

#include <QPointF>
#include <QSizeF>
#include <QString>
#include <QVariantMap>

#include <cstdint>
#include <vector>

// One waypoint symbol of the list.
struct KeyPointImageItem
{
    QString title;
    uint32_t keyPointImageItemId = 0;
    bool browseImage = false;
    bool isAnimated = false;
    bool isMediaTemplate = false;
    QPointF mediaCenterOffset;
    QSizeF mediaSize{0.0, 0.0};
    QString sourceFileName;
    QString thumbFileName;

    // Keys "title", "id", "browseImage", "animated", "isMediaTemplate", "mediaCenterOffset",
    // "mediaSize", "sourceFileName", "thumbFileName"; a missing key gives the type's default.
    static KeyPointImageItem fromMap(const QVariantMap &map);
    QVariantMap toMap() const;
};

// The waypoint symbols offered for a key point: row 0 lets the user browse for a picture
// of their own, then the catalogue's symbols in catalogue order.
class KeyPointImageItems
{
public:
    // The symbol a new key point starts with. It depends on the catalogue's start order,
    // that is on the number of shipped avatars.
    static constexpr uint32_t defaultSymbolId = 21;

    // Replaces the list; the browse row takes the next content item id.
    void fill(const std::vector<WaypointItem> &waypoints, const QString &browseTitle);

    // The item's map (see KeyPointImageItem); false when no item has this id.
    bool itemById(uint32_t id, QVariantMap &out) const;

    const std::vector<KeyPointImageItem> &items() const { return m_items; }
    int size() const { return int(m_items.size()); }

private:
    std::vector<KeyPointImageItem> m_items;
};
