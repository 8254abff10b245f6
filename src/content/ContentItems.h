#pragma once

#include <QString>
#include <QVariantMap>

#include <cstdint>

// Next run-time id of a content item; the first is 1. Shared with the items that
// the models add themselves. Ids are never written to disk.
uint32_t nextContentItemId();

// Fields common to avatars, waypoint symbols, maps and masks.
struct ContentItem
{
    uint32_t id = 0;
    int32_t groupIndex = 0;    // avatars only
    QString groupName;         // avatars only
    uint32_t packageIndex = 0; // position of the item's folder in its scan list
    QString name;
    QString type;              // media file extension without the dot
    QString fileName;          // masks only
    QString sourceFile;
    QString thumbFile;
    uint32_t packType = 0;     // 0 plain, 1 UTP set, 2 TEE set
};

struct AvatarItem : ContentItem
{
    uint32_t animated = 0;
    uint32_t perspective = 0;
    bool allowRotation = false;
    bool symmetric = false;
    int32_t defaultWidth = 120;
    bool isUserContent = false;
};

struct MediaOffset
{
    double x = 0.0;
    double y = 0.0;
};

struct MediaSize
{
    double width = 0.0;
    double height = 0.0;
};

struct WaypointItem : ContentItem
{
    uint32_t animated = 0;
    bool isMediaTemplate = false;
    MediaOffset mediaCenterOffset;
    MediaSize mediaSize;
};

struct MapItem : ContentItem
{
    QString elementId;
    QString mainCategory;
    QString widthWeight;
    QString background;
    QString origins;
};

struct MaskItem : ContentItem
{
    QString guid;
};

// Bits of the field mask of contentItemMap.
namespace ItemMapField {
constexpr uint32_t Id = 1;
constexpr uint32_t Title = 2;
constexpr uint32_t SourceFile = 4;
constexpr uint32_t ThumbFile = 8;
constexpr uint32_t Group = 16;
// The masks the lists use.
constexpr uint32_t MaskList = 11;
constexpr uint32_t WaypointList = 31;
constexpr uint32_t MapList = 26;
}

// The map the user interface gets for one item. Keys "groupeId" and "groupeName"
// are spelt that way on purpose; the interface reads them so.
QVariantMap contentItemMap(const ContentItem &item, uint32_t fieldMask);

// "file:///" URL of a local path, as the item maps carry them.
QString contentFileUrl(const QString &path);
