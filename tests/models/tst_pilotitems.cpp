#include "ZipFiles.h"
#include "../content/ContentFiles.h"

#include "content/ContentCatalogue.h"
#include "content/IniAccess.h"
#include "models/KeyPointItemsData.h"
#include "models/QPilotItemsModel.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QAbstractItemModelTester>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QSettings>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QTest>

namespace {

constexpr uint32_t allPoints = KeyPointItemsData::allPoints;

// A GIF of 1x1 pixel frames, put together byte by byte: Qt reads GIFs but can't write them.
QByteArray gif(int frames)
{
    QByteArray bytes("GIF89a\x01\x00\x01\x00\x80\x00\x00\x00\x00\x00\xff\xff\xff", 19);
    if (frames > 1)
        bytes += QByteArray("\x21\xff\x0bNETSCAPE2.0\x03\x01\x00\x00\x00", 19);
    for (int i = 0; i < frames; ++i) {
        bytes += QByteArray("\x21\xf9\x04\x00\x0a\x00\x00\x00", 8);
        bytes += QByteArray("\x2c\x00\x00\x00\x00\x01\x00\x01\x00\x00\x02\x02\x44\x01\x00", 15);
    }
    return bytes + ';';
}

class AnsweringDialogs : public PilotDialogs
{
public:
    QString answer;
    QString chooseAvatarFile(const QString &) override { return answer; }
};

// A small installation with four avatars in three groups, a data folder, the settings
// in an ini file, a document and the model watched by a tester.
struct Setup
{
    QTemporaryDir dir;
    QString data = dir.filePath(QStringLiteral("data"));
    QSettings store{dir.filePath(QStringLiteral("settings.ini")), QSettings::IniFormat};
    AppSettings settings{store};
    PainterPathRenderer_Controller document;
    ContentCatalogue &catalogue = document.catalogue();
    uint32_t activeKeyPointId = 0;
    PilotItemsData pilots{&document, settings, [this] { return activeKeyPointId; }};
    AnsweringDialogs *dialogs = new AnsweringDialogs;
    QPilotItemsModel model;
    QAbstractItemModelTester tester{&model, QAbstractItemModelTester::FailureReportingMode::Fatal};

    Setup()
    {
        const QString avatars = dir.filePath(QStringLiteral("imgsrc/avatars/"));
        writeFile(avatars + QStringLiteral("categories.ini"), "[main]\nsections=basic;cars;air\n");
        writeFile(avatars + QStringLiteral("Translation_EN.ini"),
                  "[basic]\nname=Basic\n[cars]\nname=Cars\n[air]\nname=Air\n");
        writeItemIni(avatars, QStringLiteral("01_no_avatar"), "type=png\ngName=basic\n");
        writeItemIni(avatars, QStringLiteral("3d_cabrio"),
                     "type=png\ngName=cars\ndisplayFormat=perspective\nallowRotation=true\n");
        writeItemIni(avatars, QStringLiteral("plane"), "type=png\ngName=air\nallowRotation=true\nsymmetric=true\n");
        writeItemIni(avatars, QStringLiteral("balloon"), "type=gif\ngName=air\nanimated=true\n");
        QDir().mkpath(data);
        settings.setPathSetting(SettingsKey::DynamicContentPath, data);
        catalogue.load(dir.filePath(QStringLiteral("imgsrc/")), data);

        pilots.setDialogs(std::unique_ptr<PilotDialogs>(dialogs));
        model.setData(&pilots);
        model.fill(catalogue, QStringLiteral("Browse"));
    }
    // A route of three key points, so three segments, the last without samples.
    Path &route()
    {
        Path &path = document.pathManager().activeChecked();
        for (int i = 0; i < 3; ++i)
            path.addKeyPoint(KeyPoint(i, i, 0.0), false);
        path.update();
        return path;
    }
    int rowOf(const QString &title) const { return pilots.rowOfTitle(title); }
    int idOf(const QString &title) const { return int(pilots.items().at(size_t(rowOf(title))).pilotId); }
    QVariant at(int row, int role) const { return model.index(row, 0).data(role); }
    QString current(const char *key) const { return model.currentPilot().value(QString::fromLatin1(key)).toString(); }
    void choose(int pilotId) { QVERIFY(QMetaObject::invokeMethod(&model, "changePilotItem", Q_ARG(int, pilotId))); }
};

} // namespace

class TestPilotItems : public QObject
{
    Q_OBJECT

private slots:
    void listAndDefaultPilot()
    {
        Setup s;
        QCOMPARE(s.model.rowCount(), 5);
        QVERIFY(s.pilots.items().front().browseImage);
        QCOMPARE(s.at(0, QPilotItemsModel::TitleRole).toString(), QStringLiteral("Browse"));
        // The browse row belongs to the first avatar's group.
        QCOMPARE(s.at(0, QPilotItemsModel::PilotGroupNameRole).toString(), QStringLiteral("Basic"));
        QCOMPARE(s.model.pilotGroups(), QStringList({"Basic", "Cars", "Air"}));
        const int cabrio = s.rowOf(QStringLiteral("3d_cabrio"));
        QCOMPARE(s.at(cabrio, QPilotItemsModel::PilotStyleRole).toString(), QStringLiteral("perspective"));
        QVERIFY(s.at(cabrio, QPilotItemsModel::ImageSourceRole).toString().endsWith("ZK3D/3d_cabrio/3d_cabrio_1.png"));

        // Without a route the current pilot is the one new segments start from: the cabrio.
        QVERIFY(s.current("sourceFileName").endsWith(QStringLiteral("ZK3D/3d_cabrio/3d_cabrio")));
        Path &path = s.route();
        s.activeKeyPointId = path.keyPoints[0].id;
        QCOMPARE(path.pathSegments[1].pilot.source, s.current("sourceFileName"));
        QCOMPARE(s.model.currentPilot().value(QStringLiteral("displayFormat")).toString(), QStringLiteral("perspective"));
    }

    void choosingReachesTheActiveSegments_data()
    {
        QTest::addColumn<int>("activeIndex"); // key point index; -1 all points, -2 none
        QTest::addColumn<QList<int>>("changed");
        QTest::newRow("first point") << 0 << QList<int>{0};
        QTest::newRow("middle point") << 1 << QList<int>{1};
        QTest::newRow("last point: the segment that reaches it") << 2 << QList<int>{1};
        QTest::newRow("all points") << -1 << QList<int>{0, 1, 2};
        QTest::newRow("no active point: new segments only") << -2 << QList<int>{};
    }

    void choosingReachesTheActiveSegments()
    {
        QFETCH(int, activeIndex);
        QFETCH(QList<int>, changed);
        Setup s;
        Path &path = s.route();
        const PilotProperties before = path.pathSegments[0].pilot;
        s.activeKeyPointId = activeIndex == -1 ? allPoints : activeIndex == -2 ? 0 : path.keyPoints[size_t(activeIndex)].id;
        QSignalSpy current(&s.model, &QPilotItemsModel::currentPilotChanged);
        QSignalSpy modified(&s.model, &QPilotItemsModel::projectIsModified);

        s.choose(s.idOf(QStringLiteral("plane")));
        QVERIFY(QMetaObject::invokeMethod(&s.model, "changeCurrentPilotItemWidth", Q_ARG(double, 80.0)));
        QVERIFY(QMetaObject::invokeMethod(&s.model, "changeCurrentPilotItemRotation", Q_ARG(bool, false)));
        QCOMPARE(current.count(), 3);
        QCOMPARE(modified.count(), 3);

        const QString plane = s.pilots.items().at(size_t(s.rowOf(QStringLiteral("plane")))).sourceFileName;
        for (int i = 0; i < 3; ++i) {
            const PilotProperties &pilot = path.pathSegments[size_t(i)].pilot;
            if (changed.contains(i)) {
                QCOMPARE(pilot.source, plane);
                QCOMPARE(pilot.width, 80.0);
                QCOMPARE(pilot.flags, uint32_t(PilotProperties::symmetric));
            } else {
                QCOMPARE(pilot.source, before.source);
                QCOMPARE(pilot.width, before.width);
            }
        }
        // What the page shows is the record just written, wherever it went.
        QCOMPARE(s.current("sourceFileName"), plane);
        QCOMPARE(s.model.currentPilot().value(QStringLiteral("pilotWidth")).toDouble(), 80.0);
        QCOMPARE(defaultPilot().source == plane, changed.isEmpty());
    }

    void browsing_data()
    {
        QTest::addColumn<QString>("name"); // empty: cancelled
        QTest::addColumn<QByteArray>("content");
        QTest::addColumn<bool>("added");
        QTest::addColumn<bool>("animated");
        QTest::addColumn<QString>("style");
        QTest::newRow("cancelled") << QString() << QByteArray() << false << false << QString();
        QTest::newRow("one-frame gif") << "still dog.gif" << gif(1) << true << false << "2D";
        QTest::newRow("two-frame gif") << "dog.gif" << gif(2) << true << true << "2D";
        QTest::newRow("no picture") << "notes.png" << QByteArray("just text") << false << false << QString();
        QTest::newRow("zip of frames") << "car.zip" << QByteArray() << true << false << "perspective";
        QTest::newRow("no zip") << "fake.zip" << QByteArray("just text") << false << false << QString();
    }

    void browsing()
    {
        QFETCH(QString, name);
        QFETCH(QByteArray, content);
        QFETCH(bool, added);
        QFETCH(bool, animated);
        QFETCH(QString, style);
        Setup s;
        Path &path = s.route();
        s.activeKeyPointId = path.keyPoints[0].id;
        const PilotProperties before = path.pathSegments[0].pilot;
        const QString file = name.isEmpty() ? QString() : s.dir.filePath(QStringLiteral("mine/") + name);
        QVERIFY(QDir().mkpath(s.dir.filePath(QStringLiteral("mine"))));
        if (name == QLatin1String("car.zip"))
            QVERIFY(writeZip(file, {{"car_1.png", "frame one"}, {"car_2.png", "frame two"}}));
        else if (!file.isEmpty())
            QVERIFY(writeFile(file, content));
        s.dialogs->answer = file;
        const QString folderBefore = s.settings.pathSetting(SettingsKey::BrowseContentPath);
        const int rows = s.model.rowCount();
        QSignalSpy errors(&s.model, &QPilotItemsModel::showError);
        QSignalSpy modified(&s.model, &QPilotItemsModel::projectIsModified);

        s.choose(int(s.pilots.items().front().pilotId));

        QCOMPARE(s.model.rowCount(), rows + (added ? 1 : 0));
        QCOMPARE(modified.count(), added ? 1 : 0);
        QCOMPARE(errors.count(), added || name.isEmpty() ? 0 : 1);
        QCOMPARE(s.settings.pathSetting(SettingsKey::BrowseContentPath),
                 name.isEmpty() ? folderBefore : s.dir.filePath(QStringLiteral("mine")));
        if (!added) {
            QCOMPARE(path.pathSegments[0].pilot.source, before.source);
            return;
        }
        // The user's own go in below the browse row and the first avatar.
        QCOMPARE(s.at(2, QPilotItemsModel::TitleRole).toString(), QFileInfo(name).baseName());
        QVERIFY(s.at(2, QPilotItemsModel::IsUserContentRole).toBool());
        QCOMPARE(s.at(2, QPilotItemsModel::IsAnimatedRole).toBool(), animated);
        QCOMPARE(s.at(2, QPilotItemsModel::PilotStyleRole).toString(), style);
        const PilotProperties &pilot = path.pathSegments[0].pilot;
        QCOMPARE(pilot.hasFlag(PilotProperties::isAnimated), animated);
        QCOMPARE(pilot.thumb, s.at(2, QPilotItemsModel::ImageSourceRole).toString());
        QVERIFY(QFileInfo::exists(QUrl(pilot.thumb).toLocalFile()));
        if (style == QLatin1String("perspective"))
            QCOMPARE(pilot.source + QStringLiteral("_1.png"), pilot.thumb);
        else
            QCOMPARE(pilot.source, file);
    }

    void deletingTheAvatarInUse_data()
    {
        QTest::addColumn<QString>("name");
        QTest::addColumn<bool>("filesGo");
        QTest::newRow("imported zip") << "car.zip" << true;
        QTest::newRow("picture of one's own") << "dog.gif" << false;
    }

    void deletingTheAvatarInUse()
    {
        QFETCH(QString, name);
        QFETCH(bool, filesGo);
        Setup s;
        Path &path = s.route();
        s.activeKeyPointId = allPoints;
        const QString file = s.dir.filePath(name);
        QVERIFY(filesGo ? writeZip(file, {{"car_1.png", "frame"}}) : writeFile(file, gif(1)));
        s.dialogs->answer = file;
        s.choose(int(s.pilots.items().front().pilotId));
        const int id = s.at(2, QPilotItemsModel::PilotIdRole).toInt();
        const QString imported = s.data + QStringLiteral("/userAvatars/u3d_car");
        const QString ini = s.data + QStringLiteral("/tourletContent.ini");
        QCOMPARE(QFileInfo::exists(imported), filesGo);

        QVERIFY(QMetaObject::invokeMethod(&s.model, "setDeletePilotID", Q_ARG(int, id)));
        s.model.deleteUserPilot();
        QCOMPARE(s.pilots.rowOf(uint32_t(id)), -1);
        const QString none = s.pilots.items().at(size_t(s.rowOf(QStringLiteral("01_no_avatar")))).sourceFileName;
        QCOMPARE(s.current("sourceFileName"), none);
        QCOMPARE(path.pathSegments[2].pilot.source, none);
        // The interface lets go of the pictures first.
        QCOMPARE(QFileInfo::exists(imported), filesGo);
        QTRY_COMPARE_WITH_TIMEOUT(QFileInfo::exists(imported), false, 2000);
        QTest::qWait(QPilotItemsModel::deleteDelayMs + 100);
        QVERIFY(QFileInfo::exists(file));
        QVERIFY(readIniList(ini, QStringLiteral("avatars"), QStringLiteral("paths"), QStringLiteral(","), true).isEmpty());
    }

    void groups()
    {
        Setup s;
        QSignalSpy changed(&s.model, &QPilotItemsModel::activeGroupChanged);
        const int plane = s.rowOf(QStringLiteral("plane"));
        const int balloon = s.rowOf(QStringLiteral("balloon"));
        const int firstAir = std::min(plane, balloon);
        const auto byIndex = [&](int row) { QMetaObject::invokeMethod(&s.model, "updateGroupByIndex", Q_ARG(int, row)); };
        const auto byId = [&](int id) { QMetaObject::invokeMethod(&s.model, "updateGroupById", Q_ARG(int, id)); };

        byIndex(std::max(plane, balloon));
        QCOMPARE(changed.count(), 1);
        QCOMPARE(s.model.activeGroup(), QVariantMap({{"groupName", "Air"}, {"groupId", 2}, {"groupIndex", firstAir}}));
        byIndex(firstAir);
        byIndex(s.model.rowCount());
        byId(2);
        byId(7);
        QCOMPARE(changed.count(), 1);
        // Group 0 is found like any other; the browse row belongs to it.
        byId(0);
        QCOMPARE(changed.count(), 2);
        QCOMPARE(s.model.activeGroup().value(QStringLiteral("groupIndex")).toInt(), 0);
    }

    void signalListOfTheInterface()
    {
        QQmlEngine engine;
        QQmlComponent component(&engine, QUrl::fromLocalFile(QStringLiteral(TOURLET_PILOT_SIGNAL_LIST)));
        QObject holder;
        QObject *list = component.create();
        QVERIFY2(list, qPrintable(component.errorString()));
        list->setParent(&holder);
        Setup s;
        Path &path = s.route();
        s.activeKeyPointId = path.keyPoints[1].id;
        s.model.connectSignalList(&holder);
        QSignalSpy reset(&s.model, &QAbstractItemModel::modelReset);

        QVERIFY(QMetaObject::invokeMethod(list, "changePilotItem", Q_ARG(int, s.idOf(QStringLiteral("balloon")))));
        QVERIFY(path.pathSegments[1].pilot.hasFlag(PilotProperties::isAnimated));
        QVERIFY(QMetaObject::invokeMethod(list, "changeCurrentPilotItemWidth", Q_ARG(double, 55.0)));
        QCOMPARE(path.pathSegments[1].pilot.width, 55.0);
        QVERIFY(QMetaObject::invokeMethod(list, "refresh"));
        QCOMPARE(reset.count(), 1);
        QCOMPARE(s.model.rowCount(), 5);
    }
};

QTEST_MAIN(TestPilotItems)
#include "tst_pilotitems.moc"
