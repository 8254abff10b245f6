#pragma once

#include "app/AppSettings.h"
#include "content/ContentItems.h"
#include "models/PilotDialogs.h"
#include "path/PathSegment.h"

#include <QPointF>
#include <QSizeF>
#include <QString>
#include <QStringList>
#include <QVariantMap>

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <vector>

class ContentCatalogue;
class PainterPathRenderer_Controller;

// One avatar of the list.
struct PilotItem
{
    QString title;
    uint32_t pilotId = 0;
    bool browseImage = false;
    bool isAnimated = false;
    QString pilotStyle = QStringLiteral("2D"); // "perspective" or "2D"
    // Kept for the reader shared with the waypoint symbols; avatars don't use them.
    bool isMediaTemplate = false;
    QPointF mediaCenterOffset;
    QSizeF mediaSize{0.0, 0.0};
    QString sourceFileName;
    QString thumbFileName;
    int32_t pilotWidth = 120;
    bool pilotRotation = true;
    bool pilotSymmetric = false;
    int32_t pilotGroupId = 0;
    QString pilotGroupName;
    bool isUserContent = false;
    int32_t contentPackageID = 0;

    // The pilot record a segment gets when this avatar is chosen.
    PilotProperties toPilot() const;
};

// The avatars offered for the route's segments: row 0 lets the user browse for one of
// their own, then the catalogue's avatars in catalogue order; the user's own go in at
// row 2. A choice goes to the segment of the active key point, or to every segment when
// all points are active. Held by value by its owner; QPilotItemsModel shows it and tells
// the interface what changed.
class PilotItemsData
{
public:
    static const QString defaultAvatarTitle; // "3d_cabrio"
    static const QString noAvatarTitle;      // "01_no_avatar"
    static constexpr int userItemRow = 2;

    // `activeKeyPointId` names the active key point (KeyPointItemsData::allPoints for
    // all of them). `settings` gives the data folder and keeps the browse folder.
    PilotItemsData(PainterPathRenderer_Controller *document, const AppSettings &settings,
                   std::function<uint32_t()> activeKeyPointId);

    void setDialogs(std::unique_ptr<PilotDialogs> dialogs);

    // Replaces the list and the groups, and makes the default avatar the pilot of new segments.
    void fillPilotItems(const ContentCatalogue &catalogue, const QString &browseTitle);
    // Looks for avatar sets installed since and fills the list again.
    void refresh();

    const std::vector<PilotItem> &items() const { return m_items; }
    int rowCount() const { return int(m_items.size()); }
    // -1 for an id without a row.
    int rowOf(uint32_t pilotId) const;
    int rowOfTitle(const QString &title) const;
    QStringList pilotGroups() const { return m_pilotGroups; }

    // Keys groupId, groupName, groupIndex; empty until a group is chosen.
    const QVariantMap &activeGroup() const { return m_activeGroup; }
    // False when nothing changed.
    bool updateGroupById(int groupId);
    bool updateGroupByIndex(int row);

    bool isBrowseItem(uint32_t pilotId) const;
    // Applies the avatar of the row with this id; false for an unknown id or the browse row.
    bool changePilotItem(uint32_t pilotId);
    // Asks for a file of the user's own and applies it. Nothing when cancelled or when
    // it could not be used; then browseError() gives the key of the interface's text
    // that tells why (empty when cancelled).
    std::optional<PilotItem> browseUserPilot();
    QString browseError() const { return m_browseError; }
    // Puts an item made by browseUserPilot at userItemRow (or at the end of a shorter list).
    int insertUserItem(const PilotItem &item);

    // Both go to the active segments; false when no record changed.
    bool setCurrentPilotWidth(double width);
    bool setCurrentPilotRotation(bool on);

    // The pilot of the active segment (the first one when all are active), or the
    // default pilot without one. Keys displayFormat, pilotWidth, sourceFileName,
    // thumbFileName, animated, pilotRotation, pilotSymmetric.
    QVariantMap currentPilot() const;

    // Deletion, in steps so that the interface can let go of the pictures first.
    void setDeletePilotId(uint32_t pilotId) { m_deletePilotId = pilotId; }
    // Remembers the source of the chosen item (an unknown id keeps the one before) and
    // returns its row, -1 when there is none.
    int takeDeletion();
    // True when the remembered avatar is the current one.
    bool deletionIsCurrent() const;
    void removeRow(int row);
    // Removes the remembered avatar's folder below the data folder and its entry in
    // "tourletContent.ini". False when there is nothing to remove.
    bool removeDeletedAvatarFiles();

private:
    // The segments a choice goes to: those of the active scope on the active path.
    std::vector<PathSegment *> activeSegments() const;
    // True when a segment took it; the default pilot takes it in any case without one.
    bool applyPilot(const PilotProperties &pilot, const QString &trackingWord);
    std::optional<PilotProperties> pilotOfUserFile(const QString &file);
    QString dataFolder() const;
    static QString importErrorKey();

    PainterPathRenderer_Controller *m_document;
    AppSettings m_settings;
    std::function<uint32_t()> m_activeKeyPointId;
    std::unique_ptr<PilotDialogs> m_dialogs;
    std::vector<PilotItem> m_items;
    QStringList m_pilotGroups;
    QVariantMap m_activeGroup;
    QString m_browseTitle;
    QString m_browseError;
    uint32_t m_deletePilotId = 0;
    QString m_deletePath;
};
