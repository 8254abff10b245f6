#include "ContentFiles.h"

#include "content/ContentCatalogue.h"
#include "content/IniAccess.h"

#include <QSet>
#include <QTemporaryDir>
#include <QTest>

#include <algorithm>

// A small installation: shipped folders under imgsrc/, and a data folder with
// tourletContent.ini.
class TestCatalogue : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;
    QString m_root; // imgsrc/
    QString m_data; // data folder

    template <typename Item>
    static const Item *find(const std::vector<Item> &items, const QString &name)
    {
        for (const Item &item : items)
            if (item.name == name)
                return &item;
        return nullptr;
    }

private slots:
    void initTestCase()
    {
        QVERIFY(m_dir.isValid());
        m_root = m_dir.filePath(QStringLiteral("imgsrc/"));
        m_data = m_dir.filePath(QStringLiteral("data"));
        const QString avatars = m_root + QStringLiteral("avatars/");
        QVERIFY(writeFile(avatars + QStringLiteral("categories.ini"), "[main]\nsections=cars; planes;;\n"));
        QVERIFY(writeFile(avatars + QStringLiteral("Translation_EN.ini"),
                          "[cars]\nname=Cars\n[planes]\nname=Planes, Jets\n[noCat]\nname=Other\n[UTP]\nname=Travel set\n"
                          "[TEE]\nname=Extra set\n"));
        QVERIFY(writeFile(avatars + QStringLiteral("Translation_DE.ini"), "[cars]\nname=Autos\n[planes]\nname=Flugzeuge\n"));
        QVERIFY(writeItemIni(avatars, QStringLiteral("plane"), "type=png\ngName=planes\nallowRotation=true\nsymmetric=True\n"));
        QVERIFY(writeItemIni(avatars, QStringLiteral("3d_cabrio"),
                             "type=png\ngName=cars\ndisplayFormat=perspective\nanimated=true\n"));
        QVERIFY(writeItemIni(avatars, QStringLiteral("bike"), "type=gif\ndisplayFormat=Perspective\n"));
        QVERIFY(writeItemIni(avatars, QStringLiteral("van"), "type=png\ncPack=UTP\n"));
        QVERIFY(writeItemIni(avatars, QStringLiteral("car2"), "type=png\ngName=cars\nisUserContent=true\n"));
        QVERIFY(writeItemIni(avatars, QStringLiteral("ghost"), "type=png\ngName=unknownGroup\n"));
        QVERIFY(writeFile(avatars + QStringLiteral("informations/damaged.ini"), QByteArray("\x00\xFF[[==\n\x01", 8)));
        // The default tee folder, with its own group list.
        const QString tee = m_root + QStringLiteral("_shop/tee/");
        QVERIFY(writeFile(tee + QStringLiteral("categories.ini"), "[main]\nsections=boats;cars\n"));
        QVERIFY(writeFile(tee + QStringLiteral("Translation_EN.ini"), "[boats]\nname=Boats\n[cars]\nname=Cars\n"));
        QVERIFY(writeItemIni(tee, QStringLiteral("yacht"), "type=png\ncPack=TEE\ngName=boats\n"));
        QVERIFY(writeItemIni(tee, QStringLiteral("raft"), "type=png\ncPack=TEE\n"));

        const QString waypoints = m_root + QStringLiteral("waypoints/");
        QVERIFY(writeItemIni(waypoints, QStringLiteral("pin"), "type=png\nanimated=true\n"));
        QVERIFY(writeItemIni(waypoints, QStringLiteral("frame"),
                             "type=png\nmedia=true\nmediaCPOx=12.5px\nmediaCPOy=-3\nmediaW=1e2\nmediaH=abc\n"));
        QVERIFY(writeItemIni(waypoints, QStringLiteral("half"), "type=png\nmedia=true\nmediaCPOx=4\nmediaW=5\nmediaH=6\n"));
        QVERIFY(writeItemIni(waypoints, QStringLiteral("plainpin"), "type=png\nmedia=false\nmediaW=5\nmediaH=6\n"));
        QVERIFY(writeItemIni(m_dir.filePath(QStringLiteral("extra/wp/")), QStringLiteral("pin"), "type=svg\n"));

        const QString maps = m_root + QStringLiteral("maps/");
        // Made on another system: a translation in its code page and an ini suffix in capitals.
        QVERIFY(writeFile(maps + QStringLiteral("Translation_EN.ini"), "[Coast]\nname=C\xF4te \x96 Riviera\n"));
        QVERIFY(writeFile(maps + QStringLiteral("informations/Coast.INI"), "[main]\ntype=jpg\norigins=map.c\xF4te\n"));
        QVERIFY(writeItemIni(maps, QStringLiteral("world"), "type=jpg\nitem_main_category=world_shop\n"));

        const QString masks = m_root + QStringLiteral("masks/");
        QVERIFY(writeItemIni(masks, QStringLiteral("round"), "type=png\nguid={12345678-1234-1234-1234-123456789ABC}\n"));
        QVERIFY(writeItemIni(masks, QStringLiteral("plain"), "type=png\n"));

        QVERIFY(writeFile(m_data + QStringLiteral("/tourletContent.ini"),
                          "[waypoints]\npaths= " + m_dir.filePath(QStringLiteral("extra/wp")).toUtf8() + " , \n"));
    }

    void avatarsAndGroups()
    {
        ContentCatalogue catalogue;
        QVERIFY(catalogue.load(m_root, m_data));
        QCOMPARE(catalogue.groups(), QStringList({QStringLiteral("Cars"), QStringLiteral("Planes, Jets"),
                                                  QStringLiteral("Boats")}));
        const std::vector<AvatarItem> avatars = catalogue.avatars();
        QCOMPARE(int(avatars.size()), 9);
        QVERIFY(std::is_sorted(avatars.begin(), avatars.end(),
                               [](const AvatarItem &a, const AvatarItem &b) { return a.groupIndex < b.groupIndex; }));
        QSet<uint32_t> ids;
        for (const AvatarItem &a : avatars)
            ids << a.id;
        QCOMPARE(ids.size(), 9);

        // Perspective avatars live in a folder of their frames.
        const AvatarItem *cabrio = find(avatars, QStringLiteral("3d_cabrio"));
        QVERIFY(cabrio && cabrio->perspective == 1 && cabrio->animated == 1 && cabrio->groupIndex == 0);
        QCOMPARE(cabrio->thumbFile, m_root + QStringLiteral("avatars/ZK3D/3d_cabrio/3d_cabrio_1.png"));
        const AvatarItem *plane = find(avatars, QStringLiteral("plane"));
        QVERIFY(plane && plane->allowRotation && !plane->symmetric);
        QCOMPARE(plane->thumbFile, m_root + QStringLiteral("avatars/Icons/plane.png"));

        // Not exactly "perspective"; no gName and no pack: the "noCat" name, past the groups.
        const AvatarItem *bike = find(avatars, QStringLiteral("bike"));
        QVERIFY(bike && bike->perspective == 0);
        QCOMPARE(bike->groupName, QStringLiteral("Other"));
        QCOMPARE(bike->groupIndex, 3);
        QCOMPARE(find(avatars, QStringLiteral("van"))->groupName, QStringLiteral("Travel set"));
        // An unknown group key falls back as well; a damaged ini still makes an item.
        QCOMPARE(find(avatars, QStringLiteral("ghost"))->groupName, QStringLiteral("Other"));
        QCOMPARE(find(avatars, QStringLiteral("damaged"))->sourceFile, m_root + QStringLiteral("avatars/damaged."));

        // The tee folder's groups follow the shipped ones; its package is the fifth
        // scanned, after imgsrc/avatars and three empty _shop folders.
        const AvatarItem *yacht = find(avatars, QStringLiteral("yacht"));
        QVERIFY(yacht && yacht->packType == 2);
        QCOMPARE(yacht->groupIndex, 2);
        QCOMPARE(yacht->packageIndex, 4u);
        QCOMPARE(find(avatars, QStringLiteral("raft"))->groupName, QStringLiteral("Extra set"));
    }

    void noCatFallbackWithoutTranslations()
    {
        QTemporaryDir dir;
        const QString root = dir.filePath(QStringLiteral("imgsrc/"));
        QVERIFY(writeItemIni(root + QStringLiteral("avatars/"), QStringLiteral("lone"), "type=png\n"));
        ContentCatalogue catalogue;
        QVERIFY(catalogue.load(root, QString()));
        QCOMPARE(int(catalogue.avatars().size()), 1);
        QCOMPARE(catalogue.avatars().front().groupName, QString());
        QCOMPARE(catalogue.avatars().front().groupIndex, 0);
        QVERIFY(catalogue.contentIniPath().isEmpty());
    }

    void languageChoosesTranslation()
    {
        ContentCatalogue german;
        german.load(m_root, m_data, 0);
        QCOMPARE(german.groups().mid(0, 2), QStringList({QStringLiteral("Autos"), QStringLiteral("Flugzeuge")}));
        ContentCatalogue unknown;
        unknown.load(m_root, m_data, 9);
        QCOMPARE(unknown.groups().first(), QStringLiteral("Cars"));
    }

    void waypointsMapsMasks()
    {
        ContentCatalogue catalogue;
        catalogue.load(m_root, m_data);
        const std::vector<WaypointItem> waypoints = catalogue.waypoints();
        QCOMPARE(int(waypoints.size()), 5);
        // tourletContent.ini folders come first; the same stem twice makes two items.
        QCOMPARE(waypoints.at(0).sourceFile, m_dir.filePath(QStringLiteral("extra/wp/pin.svg")));
        QCOMPARE(waypoints.at(3).name, waypoints.at(0).name);
        QVERIFY(waypoints.at(3).id != waypoints.at(0).id);
        QVERIFY(waypoints.at(3).animated == 1);

        // Numbers as far as they go; the pairs only when both are given.
        const WaypointItem *frame = find(waypoints, QStringLiteral("frame"));
        QVERIFY(frame && frame->isMediaTemplate);
        QCOMPARE(frame->mediaCenterOffset.x, 12.5);
        QCOMPARE(frame->mediaCenterOffset.y, -3.0);
        QCOMPARE(frame->mediaSize.width, 100.0);
        QCOMPARE(frame->mediaSize.height, 0.0);
        const WaypointItem *half = find(waypoints, QStringLiteral("half"));
        QCOMPARE(half->mediaCenterOffset.x, 0.0);
        QCOMPARE(half->mediaSize.width, 5.0);
        QCOMPARE(find(waypoints, QStringLiteral("plainpin"))->mediaSize.width, 0.0);

        const std::vector<MapItem> maps = catalogue.maps();
        QCOMPARE(int(maps.size()), 2);
        QCOMPARE(maps.at(0).name, QStringLiteral("Côte – Riviera"));
        QCOMPARE(maps.at(0).elementId, QStringLiteral("map.côte"));
        QCOMPARE(maps.at(0).mainCategory, QStringLiteral("europe_shop"));
        QCOMPARE(maps.at(0).sourceFile, m_root + QStringLiteral("maps/Coast.jpg"));
        QCOMPARE(maps.at(1).mainCategory, QStringLiteral("world_shop"));

        const std::vector<MaskItem> masks = catalogue.masks();
        QCOMPARE(masks.at(0).guid, QStringLiteral("{00000000-0000-0000-0000-000000000000}"));
        QCOMPARE(masks.at(1).guid, QStringLiteral("{12345678-1234-1234-1234-123456789ABC}"));
        QCOMPARE(masks.at(1).fileName, QStringLiteral("round.png"));
    }

    void itemMapsFollowTheMask()
    {
        AvatarItem item;
        item.name = QStringLiteral("title");
        item.groupIndex = 3;
        item.groupName = QStringLiteral("Group");
        item.sourceFile = QStringLiteral("/c/a b.png");
        // Source alone brings the group name, title alone the group id.
        QCOMPARE(contentItemMap(item, ItemMapField::SourceFile),
                 (QVariantMap{{"groupeName", "Group"}, {"sourceFileName", "file:///c/a b.png"}}));
        QCOMPARE(contentItemMap(item, ItemMapField::Title), (QVariantMap{{"groupeId", 3}, {"title", "title"}}));
        QCOMPARE(contentFileUrl(QStringLiteral("C:/x.png")), QStringLiteral("file:///C:/x.png"));
    }

    void contentSetsAndRescan()
    {
        QTemporaryDir dir;
        const QString root = dir.filePath(QStringLiteral("imgsrc/"));
        const QString data = dir.filePath(QStringLiteral("data"));
        const QString shop = dir.filePath(QStringLiteral("host/ShopManager/"));
        QVERIFY(writeItemIni(root + QStringLiteral("avatars/"), QStringLiteral("base"), "type=png\n"));
        // The first set holds the UTP marker, the second the TEE marker and has it in its name.
        const QString teeSet = shop + QStringLiteral("Pack") + ContentCatalogue::teeMarker;
        QVERIFY(writeFile(shop + QStringLiteral("SetU/") + ContentCatalogue::utpMarker, ""));
        QVERIFY(writeItemIni(shop + QStringLiteral("SetU/Vehicles/"), QStringLiteral("bus"), "type=png\n"));
        QVERIFY(writeItemIni(shop + QStringLiteral("SetU/WayPoints/"), QStringLiteral("flag"), "type=png\n"));
        QVERIFY(writeFile(teeSet + QLatin1Char('/') + ContentCatalogue::teeMarker + QStringLiteral("/x"), ""));
        QVERIFY(writeItemIni(teeSet + QLatin1Char('/'), QStringLiteral("tram"), "type=png\n"));
        QVERIFY(writeFile(dir.filePath(QStringLiteral("data/tourletContent.ini")), "[maps]\npaths=/none\n"));

        ContentCatalogue catalogue;
        catalogue.setHostContentFolders({dir.filePath(QStringLiteral("host"))});
        QVERIFY(catalogue.load(root, data));
        QCOMPARE(catalogue.scanList(ContentCatalogue::Avatars),
                 QStringList({root + QStringLiteral("avatars/"), shop + QStringLiteral("SetU/Transport/"),
                              shop + QStringLiteral("SetU/Vehicles/"), shop + QStringLiteral("SetU/VehiclesOther/"),
                              teeSet + QLatin1Char('/')}));
        const std::vector<AvatarItem> first = catalogue.avatars();
        QCOMPARE(int(first.size()), 3);
        // A marker in the item's path classes it; a marker entry inside the set does not.
        QCOMPARE(find(first, QStringLiteral("bus"))->packType, 0u);
        QCOMPARE(find(first, QStringLiteral("tram"))->packType, 2u);
        QCOMPARE(int(catalogue.waypoints().size()), 1);

        // Nothing new: the re-scan changes nothing.
        catalogue.rescanAvatars();
        QCOMPARE(catalogue.avatars().front().id, first.front().id);

        // A newly installed avatar set is entered and scanned first; map sets and
        // damaged ones are not.
        const QString fresh = shop + QStringLiteral("SetNew");
        QVERIFY(writeFile(fresh + QStringLiteral("/Tourlet.ini"), "[main]\ncat=0\n"));
        QVERIFY(writeItemIni(fresh + QLatin1Char('/'), QStringLiteral("zeppelin"), "type=png\n"));
        QVERIFY(writeFile(shop + QStringLiteral("SetMaps/Tourlet.ini"), "[main]\ncat=2\n"));
        QVERIFY(writeFile(shop + QStringLiteral("SetBad/Tourlet.ini"), "[main]\ncat=zero\n"));
        catalogue.rescanAvatars();
        const std::vector<AvatarItem> second = catalogue.avatars();
        QCOMPARE(int(second.size()), 4);
        const uint32_t zeppelin = find(second, QStringLiteral("zeppelin"))->id;
        QCOMPARE(readIniList(catalogue.contentIniPath(), QStringLiteral("avatars"), QStringLiteral("paths"),
                             QStringLiteral(","), true),
                 QStringList{fresh});
        QCOMPARE(catalogue.scanList(ContentCatalogue::Avatars).first(), fresh + QLatin1Char('/'));

        // Known now, by its last path component: a second re-scan keeps the ids and the list.
        catalogue.rescanAvatars();
        QCOMPARE(find(catalogue.avatars(), QStringLiteral("zeppelin"))->id, zeppelin);
        QCOMPARE(catalogue.scanList(ContentCatalogue::Avatars).count(fresh + QLatin1Char('/')), 1);

        // A new load reads the entry from tourletContent.ini.
        ContentCatalogue reloaded;
        reloaded.setHostContentFolders({dir.filePath(QStringLiteral("host"))});
        reloaded.load(root, data);
        QCOMPARE(reloaded.avatars().size(), second.size());
    }
};

QTEST_GUILESS_MAIN(TestCatalogue)
#include "tst_catalogue.moc"
