#include "models/KeyPointImageItems.h"

namespace {

QVariantMap waypointMap(const WaypointItem &item)
{
    QVariantMap map = contentItemMap(item, ItemMapField::WaypointList);
    map.insert(QStringLiteral("animated"), item.animated != 0);
    map.insert(QStringLiteral("isMediaTemplate"), item.isMediaTemplate);
    map.insert(QStringLiteral("mediaCenterOffset"), QPointF(item.mediaCenterOffset.x, item.mediaCenterOffset.y));
    map.insert(QStringLiteral("mediaSize"), QSizeF(item.mediaSize.width, item.mediaSize.height));
    return map;
}

} // namespace

KeyPointImageItem KeyPointImageItem::fromMap(const QVariantMap &map)
{
    KeyPointImageItem item;
    item.title = map.value(QStringLiteral("title")).toString();
    item.keyPointImageItemId = map.value(QStringLiteral("id")).toUInt();
    item.browseImage = map.value(QStringLiteral("browseImage")).toBool();
    item.isAnimated = map.value(QStringLiteral("animated")).toBool();
    item.isMediaTemplate = map.value(QStringLiteral("isMediaTemplate")).toBool();
    item.mediaCenterOffset = map.value(QStringLiteral("mediaCenterOffset")).toPointF();
    item.mediaSize = map.value(QStringLiteral("mediaSize"), item.mediaSize).toSizeF();
    item.sourceFileName = map.value(QStringLiteral("sourceFileName")).toString();
    item.thumbFileName = map.value(QStringLiteral("thumbFileName")).toString();
    return item;
}

QVariantMap KeyPointImageItem::toMap() const
{
    return {{QStringLiteral("title"), title},
            {QStringLiteral("id"), keyPointImageItemId},
            {QStringLiteral("sourceFileName"), sourceFileName},
            {QStringLiteral("thumbFileName"), thumbFileName},
            {QStringLiteral("animated"), isAnimated},
            {QStringLiteral("isMediaTemplate"), isMediaTemplate},
            {QStringLiteral("mediaCenterOffset"), mediaCenterOffset},
            {QStringLiteral("mediaSize"), mediaSize},
            {QStringLiteral("browseImage"), browseImage}};
}

void KeyPointImageItems::fill(const std::vector<WaypointItem> &waypoints, const QString &browseTitle)
{
    m_items.clear();
    m_items.reserve(waypoints.size() + 1);
    const QVariantMap browse{{QStringLiteral("title"), browseTitle},
                             {QStringLiteral("id"), nextContentItemId()},
                             {QStringLiteral("browseImage"), true},
                             {QStringLiteral("animated"), false},
                             {QStringLiteral("sourceFileName"), QString()},
                             {QStringLiteral("thumbFileName"), QString()}};
    m_items.push_back(KeyPointImageItem::fromMap(browse));
    for (const WaypointItem &waypoint : waypoints)
        m_items.push_back(KeyPointImageItem::fromMap(waypointMap(waypoint)));
}

bool KeyPointImageItems::itemById(uint32_t id, QVariantMap &out) const
{
    for (const KeyPointImageItem &item : m_items) {
        if (item.keyPointImageItemId == id) {
            out = item.toMap();
            return true;
        }
    }
    return false;
}
