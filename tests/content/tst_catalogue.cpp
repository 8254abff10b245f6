#include "ContentFiles.h"

#include "content/ContentCatalogue.h"
#include "content/IniAccess.h"

#include <QSet>
#include <QTemporaryDir>
#include <QTest>

#include <algorithm>

// A small installation: shipped folders under imgsrc/, two content sets of a
// host under host/ShopManager/, and a data folder with tourletContent.ini.
class TestCatalogue : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;
    QString m_root;  // imgsrc/
    QString m_data;  // data folder
    QString m_host;  // host content folder

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
        m_host = m_dir.filePath(QStringLiteral("host/"));
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
        QVERIFY(writeItemIni(waypoints, QStringLiteral("notype"), "animated=yes\n"));
        QVERIFY(writeItemIni(m_dir.filePath(QStringLiteral("extra/wp/")), QStringLiteral("pin"), "type=svg\n"));

        const QString maps = m_root + QStringLiteral("maps/");
        // Made on another system: a translation in its code page and an ini suffix in capitals.
        QVERIFY(writeFile(maps + QStringLiteral("Translation_EN.ini"),
                          "[world]\nname=World, political\n[Coast]\nname=C\xF4te \x96 Riviera\n"));
        QVERIFY(writeFile(maps + QStringLiteral("informations/Coast.INI"), "[main]\ntype=jpg\norigins=map.c\xF4te\n"));
        QVERIFY(writeItemIni(maps, QStringLiteral("world"),
                             "type=jpg\nitem_main_category=world_shop\norigins=map.world\nbackground=#A0B0C0\nwidthWeight=1.25\n"));
        QVERIFY(writeItemIni(maps, QStringLiteral("alps"), "type=jpg\norigins=map.alps\n"));

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
        QSet<QString> cars;
        for (const AvatarItem &a : avatars)
            if (a.groupIndex == 0)
                cars << a.name;
        QCOMPARE(cars, QSet<QString>({QStringLiteral("3d_cabrio"), QStringLiteral("car2")}));

        const AvatarItem *cabrio = find(avatars, QStringLiteral("3d_cabrio"));
        QVERIFY(cabrio);
        QCOMPARE(cabrio->perspective, 1u);
        QCOMPARE(cabrio->animated, 1u);
        QCOMPARE(cabrio->sourceFile, m_root + QStringLiteral("avatars/ZK3D/3d_cabrio/3d_cabrio"));
        QCOMPARE(cabrio->thumbFile, m_root + QStringLiteral("avatars/ZK3D/3d_cabrio/3d_cabrio_1.png"));
        QCOMPARE(cabrio->groupName, QStringLiteral("Cars"));
        QCOMPARE(cabrio->defaultWidth, 120);
        QCOMPARE(cabrio->packageIndex, 0u);

        const AvatarItem *plane = find(avatars, QStringLiteral("plane"));
        QVERIFY(plane && plane->allowRotation && !plane->symmetric && plane->perspective == 0);
        QCOMPARE(plane->groupIndex, 1);
        QCOMPARE(plane->sourceFile, m_root + QStringLiteral("avatars/plane.png"));
        QCOMPARE(plane->thumbFile, m_root + QStringLiteral("avatars/Icons/plane.png"));

        // Not exactly "perspective"; no gName and no pack: the "noCat" name, past the groups.
        const AvatarItem *bike = find(avatars, QStringLiteral("bike"));
        QVERIFY(bike && bike->perspective == 0);
        QCOMPARE(bike->sourceFile, m_root + QStringLiteral("avatars/bike.gif"));
        QCOMPARE(bike->groupName, QStringLiteral("Other"));
        QCOMPARE(bike->groupIndex, 3);
        QCOMPARE(bike->packType, 0u);
        const AvatarItem *van = find(avatars, QStringLiteral("van"));
        QVERIFY(van && van->packType == 1 && van->groupName == QStringLiteral("Travel set"));
        // An unknown group key falls back as well; a damaged ini still makes an item.
        QCOMPARE(find(avatars, QStringLiteral("ghost"))->groupName, QStringLiteral("Other"));
        const AvatarItem *damaged = find(avatars, QStringLiteral("damaged"));
        QVERIFY(damaged && damaged->type.isEmpty());
        QCOMPARE(damaged->sourceFile, m_root + QStringLiteral("avatars/damaged."));
        QVERIFY(find(avatars, QStringLiteral("car2"))->isUserContent);

        const AvatarItem *yacht = find(avatars, QStringLiteral("yacht"));
        QVERIFY(yacht && yacht->packType == 2);
        QCOMPARE(yacht->groupName, QStringLiteral("Boats"));
        QCOMPARE(yacht->groupIndex, 2);
        QCOMPARE(yacht->sourceFile, m_root + QStringLiteral("_shop/tee/yacht.png"));
        // Scan list: imgsrc/avatars, three empty _shop folders, then _shop/tee.
        QCOMPARE(yacht->packageIndex, 4u);
        QCOMPARE(find(avatars, QStringLiteral("raft"))->groupName, QStringLiteral("Extra set"));

        QSet<uint32_t> ids;
        for (const AvatarItem &a : avatars)
            ids << a.id;
        QCOMPARE(ids.size(), 9);
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
        QVERIFY(catalogue.groups().isEmpty());
        QVERIFY(catalogue.contentIniPath().isEmpty());
        QVERIFY(catalogue.waypoints().empty() && catalogue.maps().empty() && catalogue.masks().empty());
    }

    void languageChoosesTranslation()
    {
        ContentCatalogue german;
        german.load(m_root, m_data, 0);
        QCOMPARE(german.groups().mid(0, 2), QStringList({QStringLiteral("Autos"), QStringLiteral("Flugzeuge")}));
        ContentCatalogue unknown;
        unknown.load(m_root, m_data, 9);
        QCOMPARE(unknown.groups().first(), QStringLiteral("Cars"));
        QCOMPARE(ContentCatalogue::languageSuffix(6), QStringLiteral("_JA"));
        QCOMPARE(ContentCatalogue::languageSuffix(-1), QStringLiteral("_EN"));
    }

    void waypointsMapsMasks()
    {
        ContentCatalogue catalogue;
        catalogue.load(m_root, m_data);
        QCOMPARE(catalogue.contentIniPath(), m_data + QStringLiteral("/tourletContent.ini"));
        const std::vector<WaypointItem> waypoints = catalogue.waypoints();
        QCOMPARE(int(waypoints.size()), 6);
        // tourletContent.ini folders come first; the same stem twice makes two items.
        QCOMPARE(waypoints.at(0).name, QStringLiteral("pin"));
        QCOMPARE(waypoints.at(0).packageIndex, 0u);
        QCOMPARE(waypoints.at(0).sourceFile, m_dir.filePath(QStringLiteral("extra/wp/pin.svg")));
        const WaypointItem *pin = nullptr;
        for (const WaypointItem &w : waypoints)
            if (w.name == QLatin1String("pin") && w.packageIndex == 1)
                pin = &w;
        QVERIFY(pin && pin->animated == 1 && pin->id != waypoints.at(0).id);

        const WaypointItem *frame = find(waypoints, QStringLiteral("frame"));
        QVERIFY(frame && frame->isMediaTemplate);
        QCOMPARE(frame->mediaCenterOffset.x, 12.5);
        QCOMPARE(frame->mediaCenterOffset.y, -3.0);
        QCOMPARE(frame->mediaSize.width, 100.0);
        QCOMPARE(frame->mediaSize.height, 0.0);
        const WaypointItem *half = find(waypoints, QStringLiteral("half"));
        QCOMPARE(half->mediaCenterOffset.x, 0.0); // only one of the pair given
        QCOMPARE(half->mediaSize.width, 5.0);
        const WaypointItem *plainPin = find(waypoints, QStringLiteral("plainpin"));
        QVERIFY(!plainPin->isMediaTemplate && plainPin->mediaSize.width == 0.0);
        const WaypointItem *noType = find(waypoints, QStringLiteral("notype"));
        QVERIFY(noType->animated == 0 && noType->sourceFile.endsWith(QLatin1String("notype.")));
        QCOMPARE(noType->groupIndex, 0);

        const std::vector<MapItem> maps = catalogue.maps();
        QCOMPARE(int(maps.size()), 3);
        QCOMPARE(maps.at(0).name, QString()); // "alps" has no translation
        QCOMPARE(maps.at(0).mainCategory, QStringLiteral("europe_shop"));
        QCOMPARE(maps.at(0).elementId, QStringLiteral("map.alps"));
        QCOMPARE(maps.at(1).name, QStringLiteral("Côte – Riviera"));
        QCOMPARE(maps.at(1).elementId, QStringLiteral("map.côte"));
        QCOMPARE(maps.at(1).sourceFile, m_root + QStringLiteral("maps/Coast.jpg"));
        const MapItem &world = maps.at(2);
        QCOMPARE(world.name, QStringLiteral("World, political"));
        QCOMPARE(world.mainCategory, QStringLiteral("world_shop"));
        QCOMPARE(world.elementId, QStringLiteral("map.world"));
        QCOMPARE(world.origins, QStringLiteral("map.world"));
        QCOMPARE(world.background, QStringLiteral("#A0B0C0"));
        QCOMPARE(world.widthWeight, QStringLiteral("1.25"));
        QCOMPARE(world.sourceFile, m_root + QStringLiteral("maps/world.jpg"));

        const std::vector<MaskItem> masks = catalogue.masks();
        QCOMPARE(int(masks.size()), 2);
        QCOMPARE(masks.at(0).guid, QStringLiteral("{00000000-0000-0000-0000-000000000000}"));
        QCOMPARE(masks.at(1).guid, QStringLiteral("{12345678-1234-1234-1234-123456789ABC}"));
        QCOMPARE(masks.at(1).fileName, QStringLiteral("round.png"));
        QVERIFY(catalogue.avatars().front().fileName.isEmpty());
    }

    void itemMapsFollowTheMask()
    {
        AvatarItem item;
        item.id = 7;
        item.name = QStringLiteral("title");
        item.groupIndex = 3;
        item.groupName = QStringLiteral("Group");
        item.sourceFile = QStringLiteral("/c/a b.png");
        item.thumbFile = QStringLiteral("/c/Icons/a b.png");
        const QVariantMap all = contentItemMap(item, ItemMapField::WaypointList);
        QCOMPARE(all.keys(), QStringList({QStringLiteral("groupeId"), QStringLiteral("groupeName"), QStringLiteral("id"),
                                          QStringLiteral("sourceFileName"), QStringLiteral("thumbFileName"),
                                          QStringLiteral("title")}));
        QCOMPARE(all.value(QStringLiteral("id")).toUInt(), 7u);
        QCOMPARE(all.value(QStringLiteral("sourceFileName")).toString(), QStringLiteral("file:///c/a b.png"));
        QCOMPARE(all.value(QStringLiteral("thumbFileName")).toString(), QStringLiteral("file:///c/Icons/a b.png"));
        QCOMPARE(all.value(QStringLiteral("groupeId")).toInt(), 3);
        QCOMPARE(all.value(QStringLiteral("groupeName")).toString(), QStringLiteral("Group"));
        QCOMPARE(contentItemMap(item, ItemMapField::MaskList).keys(),
                 QStringList({QStringLiteral("groupeId"), QStringLiteral("id"), QStringLiteral("thumbFileName"),
                              QStringLiteral("title")}));
        QCOMPARE(contentItemMap(item, ItemMapField::MapList).keys(),
                 QStringList({QStringLiteral("groupeId"), QStringLiteral("groupeName"), QStringLiteral("thumbFileName"),
                              QStringLiteral("title")}));
        // Source alone brings the group name, title alone the group id.
        QCOMPARE(contentItemMap(item, ItemMapField::SourceFile).keys(),
                 QStringList({QStringLiteral("groupeName"), QStringLiteral("sourceFileName")}));
        QCOMPARE(contentItemMap(item, ItemMapField::Title).keys(),
                 QStringList({QStringLiteral("groupeId"), QStringLiteral("title")}));
        QVERIFY(contentItemMap(item, 0).isEmpty());
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
        QCOMPARE(catalogue.utpRoot(), shop + QStringLiteral("SetU"));
        QCOMPARE(catalogue.teeRoot(), teeSet);
        QCOMPARE(catalogue.scanList(ContentCatalogue::Avatars),
                 QStringList({root + QStringLiteral("avatars/"), shop + QStringLiteral("SetU/Transport/"),
                              shop + QStringLiteral("SetU/Vehicles/"), shop + QStringLiteral("SetU/VehiclesOther/"),
                              teeSet + QLatin1Char('/')}));
        QCOMPARE(catalogue.scanList(ContentCatalogue::Masks), QStringList{root + QStringLiteral("masks/")});
        const std::vector<AvatarItem> first = catalogue.avatars();
        QCOMPARE(int(first.size()), 3);
        // A marker in the item's path classes it; a marker entry inside the set does not.
        QCOMPARE(find(first, QStringLiteral("bus"))->packType, 0u);
        QCOMPARE(find(first, QStringLiteral("tram"))->packType, 2u);
        QCOMPARE(int(catalogue.waypoints().size()), 1);

        // Nothing new: the re-scan changes nothing.
        catalogue.rescanAvatars();
        QCOMPARE(catalogue.avatars().front().id, first.front().id);

        // A newly installed avatar set is entered and scanned first.
        const QString fresh = shop + QStringLiteral("SetNew");
        QVERIFY(writeFile(fresh + QStringLiteral("/Tourlet.ini"), "[main]\ncat=0\n"));
        QVERIFY(writeItemIni(fresh + QLatin1Char('/'), QStringLiteral("zeppelin"), "type=png\n"));
        QVERIFY(writeFile(shop + QStringLiteral("SetMaps/Tourlet.ini"), "[main]\ncat=2\n"));
        QVERIFY(writeFile(shop + QStringLiteral("SetBad/Tourlet.ini"), "[main]\ncat=zero\n"));
        catalogue.rescanAvatars();
        const std::vector<AvatarItem> second = catalogue.avatars();
        QCOMPARE(int(second.size()), 4);
        const AvatarItem *zeppelin = find(second, QStringLiteral("zeppelin"));
        QVERIFY(zeppelin);
        QCOMPARE(zeppelin->packageIndex, 0u);
        QVERIFY(find(second, QStringLiteral("base"))->id > first.back().id);
        QCOMPARE(readIniList(catalogue.contentIniPath(), QStringLiteral("avatars"), QStringLiteral("paths"),
                             QStringLiteral(","), true),
                 QStringList{fresh});
        QCOMPARE(catalogue.scanList(ContentCatalogue::Avatars).first(), fresh + QLatin1Char('/'));
        QCOMPARE(catalogue.scanList(ContentCatalogue::Avatars).count(fresh + QLatin1Char('/')), 1);

        // Known now, by its last path component: a second re-scan keeps the ids.
        catalogue.rescanAvatars();
        QCOMPARE(find(catalogue.avatars(), QStringLiteral("zeppelin"))->id, zeppelin->id);

        // A new load reads the entry from tourletContent.ini.
        ContentCatalogue reloaded;
        reloaded.setHostContentFolders({dir.filePath(QStringLiteral("host"))});
        reloaded.load(root, data);
        QCOMPARE(reloaded.avatars().size(), second.size());
    }
};

QTEST_GUILESS_MAIN(TestCatalogue)
#include "tst_catalogue.moc"
