#pragma once

#include "content/ContentItems.h"

#include <QString>
#include <QStringList>

#include <vector>

// The index of installed and user content: avatars, waypoint symbols, maps and
// masks, each described by a small ini file under "<folder>informations/".
class ContentCatalogue
{
public:
    // Names of the content-set folders. A path that contains one classes its
    // items as that pack; a content-set folder that holds an entry of this name
    // is the root of that set.
    static const QString utpMarker;
    static const QString teeMarker;

    enum Kind { Avatars = 0, Waypoints = 1, Maps = 2, Masks = 3 };

    // The content folders of the registered host programs; the content sets are
    // their "ShopManager" sub-folders. Empty when no host is known, and then the
    // sets are looked for under imageRoot + "_shop".
    void setHostContentFolders(const QStringList &folders) { m_hostContentFolders = folders; }

    // Scans everything once. imageRoot ends with "/" ("<program>/imgsrc/"); dataFolder is
    // the folder of downloaded and user content and may be empty. languageIndex picks
    // the translation ini files; userAvatarFolder defaults to dataFolder + "/userAvatars".
    bool load(const QString &imageRoot, const QString &dataFolder, int languageIndex = 1,
              const QString &userAvatarFolder = QString());

    // Adds avatar content sets installed since the load to "tourletContent.ini"
    // and, if there are any, scans the avatars again.
    void rescanAvatars();

    std::vector<AvatarItem> avatars() const { return m_avatars; }
    std::vector<WaypointItem> waypoints() const { return m_waypoints; }
    std::vector<MapItem> maps() const { return m_maps; }
    std::vector<MaskItem> masks() const { return m_masks; }
    QStringList groups() const { return m_groups; }

    const QString &utpRoot() const { return m_utpRoot; }
    const QString &teeRoot() const { return m_teeRoot; }
    const QString &contentIniPath() const { return m_contentIniPath; }
    const QString &imageRoot() const { return m_imageRoot; }

    // The folders scanned for one kind, in scan order; headFolders come first.
    QStringList scanList(Kind kind, const QStringList &headFolders = QStringList()) const;
    // The content-set folders of the registered hosts.
    QStringList contentSetFolders() const;

    static QString kindName(Kind kind);
    static QString languageSuffix(int languageIndex);

private:
    QString translationIni(const QString &folder) const;
    QString findSetRoot(const QString &marker) const;
    ContentItem scanItem(const QString &folder, const QString &stem, const QString &ini, uint32_t packageIndex) const;
    void readGroups(const QStringList &folders);
    void scanAvatars(const QStringList &folders);
    void scanWaypoints(const QStringList &folders);
    void scanMaps(const QStringList &folders);
    void scanMasks(const QStringList &folders);
    // pkg is the content folder the ini lies in.
    void fillAvatar(AvatarItem &item, const QString &pkg, const QString &iniPath) const;

    QString m_utpRoot;
    QString m_teeRoot;
    QString m_contentIniPath;
    QString m_imageRoot;
    QString m_dataFolder;
    QString m_languageSuffix = QStringLiteral("_EN");
    QStringList m_hostContentFolders;
    std::vector<AvatarItem> m_avatars;
    std::vector<WaypointItem> m_waypoints;
    std::vector<MapItem> m_maps;
    std::vector<MaskItem> m_masks;
    QStringList m_groups;
};
