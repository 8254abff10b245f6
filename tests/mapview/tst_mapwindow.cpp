#include "TestFiles.h"

#include "mapview/MapView.h"
#include "mapview/ProgramResources.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QGeoCoordinate>
#include <QQuickItem>
#include <QFileInfo>
#include <QResource>
#include <QSettings>
#include <QSignalSpy>
#include <QWidget>
#include <QtTest>

// The map view with the program's own interface, in a real window.
namespace {

QStringList warnings;
QtMessageHandler defaultHandler = nullptr;

void collectWarnings(QtMsgType type, const QMessageLogContext &context, const QString &message)
{
    if (type != QtDebugMsg && type != QtInfoMsg)
        warnings.append(message);
    if (type != QtDebugMsg)
        defaultHandler(type, context, message);
}

const QByteArray ride = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
                        "<gpx version=\"1.1\" creator=\"test\" xmlns=\"http://www.topografix.com/GPX/1/1\"><trk><trkseg>\n"
                        "<trkpt lat=\"47.370\" lon=\"8.540\"/><trkpt lat=\"47.380\" lon=\"8.550\"/>\n"
                        "<trkpt lat=\"47.392\" lon=\"8.561\"/><trkpt lat=\"47.401\" lon=\"8.572\"/>\n"
                        "</trkseg></trk></gpx>\n";

} // namespace

class tst_MapWindow : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase();
    void cleanup();
    void cleanupTestCase();

    void interfaceHandsOverItsStrings();
    void trackOpensOnTheMap();
    void previewCameraFollowsTheAvatar();
    void offlineMapShowsLandAndWater_data();
    void offlineMapShowsLandAndWater();
    void clickOnTheMapAddsAWaypointThatASaveKeeps();
    void failedLoadShowsTheErrorBox();

private:
    // Items of the map's scene whose object name begins with `name` that are on the map.
    int onMap(const char *name) const
    {
        QObject *map = m_view->rootObject()->findChild<QObject *>("worldMap");
        const auto items = map ? map->property("mapItems").value<QList<QObject *>>() : QList<QObject *>();
        return int(std::count_if(items.begin(), items.end(),
                                 [name](const QObject *item) { return item->objectName().startsWith(QLatin1String(name)); }));
    }
    // A popup of the interface is up.
    bool shown(const char *name) const
    {
        const QObject *popup = m_view->rootObject()->findChild<QObject *>(name);
        return popup && popup->property("visible").toBool();
    }
    bool waitForLoad()
    {
        QSignalSpy done(m_view.get(), &MapView::hideWaitState);
        return done.wait(10000);
    }

    QTemporaryDir m_dir;
    std::unique_ptr<QSettings> m_store;
    PainterPathRenderer_Controller m_document;
    QWidget m_window;
    std::unique_ptr<MapView> m_view;
};

void tst_MapWindow::initTestCase()
{
    QCoreApplication::setApplicationName(QStringLiteral("Tourlet"));
    defaultHandler = qInstallMessageHandler(collectWarnings);
    QVERIFY(registerProgramResources(QFileInfo(QStringLiteral(TOURLET_RESOURCE)).path()));

    m_store = std::make_unique<QSettings>(m_dir.filePath(QStringLiteral("settings.ini")), QSettings::IniFormat);
    m_view = std::make_unique<MapView>(&m_document, nullptr, AppSettings(*m_store));
    m_window.resize(1072, 603);
    m_view->init(&m_window, false);
    m_window.show();
    QVERIFY(QTest::qWaitForWindowExposed(&m_window));
    QVERIFY(m_view->rootObject());

    // The connect of setPathSettings fails on purpose: its two lines are the only
    // warnings the start may give.
    QCOMPARE(warnings.size(), 2);
    QVERIFY(warnings[0].contains(QLatin1String("No such slot MapView::setPathSettings(QVariant)")));
    QVERIFY(warnings[1].contains(QLatin1String("'SignalList_Obj'")));
    warnings.clear();
}

void tst_MapWindow::cleanup()
{
    QVERIFY2(warnings.isEmpty(), qPrintable(warnings.join(QLatin1Char('\n'))));
}

void tst_MapWindow::cleanupTestCase()
{
    m_view.reset();
    qInstallMessageHandler(defaultHandler);
}

void tst_MapWindow::interfaceHandsOverItsStrings()
{
    QVERIFY(!m_view->strHostStrings().isEmpty());
    const QVariantList languages = m_view->languageCBEntries();
    QCOMPARE(languages.size(), 7);
    int selected = 0;
    for (const QVariant &entry : languages) {
        QVERIFY(!entry.toMap().value("title").toString().startsWith(QLatin1String("str")));
        selected += entry.toMap().value("selected").toInt();
    }
    QCOMPARE(selected, 1);
    QCOMPARE(m_window.windowTitle(), QStringLiteral("Tourlet"));
}

void tst_MapWindow::trackOpensOnTheMap()
{
    const QString track = writeTestFile(m_dir, QStringLiteral("zurich.gpx"), ride);
    m_view->openFile(track);
    QTRY_VERIFY(shown("waitState"));
    QVERIFY(waitForLoad());

    QTRY_VERIFY(!shown("waitState"));
    QCOMPARE(m_window.windowTitle(), QStringLiteral("Tourlet - zurich.gpx"));
    QObject *map = m_view->rootObject()->findChild<QObject *>("worldMap");
    QVERIFY(map);
    QTRY_COMPARE(map->property("zoomLevel").toDouble(), m_view->currentZoomLevel());
    QVERIFY2(m_view->currentZoomLevel() > 10.0, qPrintable(QString::number(m_view->currentZoomLevel())));

    // The route and its waypoints are drawn: a line per segment, a marker per key point.
    const Path &path = *m_document.pathManager().active();
    QVERIFY(path.keyPoints.size() >= 2);
    QCOMPARE(onMap("routeSegment_"), int(path.pathSegments.size()));
    QCOMPARE(onMap("waypointMarker"), int(path.keyPoints.size()));
}

void tst_MapWindow::previewCameraFollowsTheAvatar()
{
    QObject *map = m_view->rootObject()->findChild<QObject *>("worldMap");
    QObject *avatar = m_view->rootObject()->findChild<QObject *>("avatarMarker");
    QVERIFY(map && avatar);
    m_view->setAnimationMode(1);
    m_view->startAnimation();
    QTRY_VERIFY(avatar->property("visible").toBool());
    // Past the pause at the first waypoint
    QTRY_COMPARE(m_view->animationEvent().value(QStringLiteral("type")).toString(), QStringLiteral("step"));

    // Frame after frame the avatar has moved on, and the map's centre is on it.
    struct Frame
    {
        QGeoCoordinate avatar;
        QGeoCoordinate centre;
    };
    // Sampled on this thread, a little longer apart than the film's frames.
    QList<Frame> frames;
    while (frames.size() < 20) {
        QTest::qWait(40);
        frames.append({avatar->property("coordinate").value<QGeoCoordinate>(),
                       map->property("center").value<QGeoCoordinate>()});
    }
    int moved = 0;
    for (int i = 1; i < frames.size(); ++i) {
        moved += frames[i].avatar != frames[i - 1].avatar;
        QVERIFY2(frames[i].avatar.distanceTo(frames[i].centre) < 100.0,
                 qPrintable(QString::number(frames[i].avatar.distanceTo(frames[i].centre))));
    }
    QVERIFY2(moved >= frames.size() / 2, qPrintable(QString::number(moved)));

    // Stopped, the map goes back to the view the user left.
    QSignalSpy restored(m_view.get(), &MapView::locationSettingsChanged);
    m_view->stopAnimation(true);
    QTRY_VERIFY(!avatar->property("visible").toBool());
    QTRY_VERIFY(!restored.isEmpty());
}

namespace {

// The world map's colours (content/basemap/style.json).
const QColor land(0xEF, 0xEB, 0xE3);
const QColor water(0xA9, 0xCB, 0xE0);
const QColor border(0x9A, 0x8F, 0x80);

bool near(const QColor &a, const QColor &b, int tolerance = 10)
{
    return std::abs(a.red() - b.red()) <= tolerance && std::abs(a.green() - b.green()) <= tolerance &&
           std::abs(a.blue() - b.blue()) <= tolerance;
}

} // namespace

void tst_MapWindow::offlineMapShowsLandAndWater_data()
{
    QTest::addColumn<double>("zoom");
    QTest::addColumn<QGeoCoordinate>("centre");
    QTest::addColumn<QList<QGeoCoordinate>>("onLand");
    QTest::addColumn<QList<QGeoCoordinate>>("onWater");
    // A line that crosses a country border, or none
    QTest::addColumn<QList<QGeoCoordinate>>("acrossBorder");

    QTest::newRow("the world, zoom 2")
        << 2.0 << QGeoCoordinate(0, 10)
        << QList<QGeoCoordinate>{{50, -85}, {68, 150}, {-8, -40}, {-30, 118}, {-45, -69}}
        << QList<QGeoCoordinate>{{-20, -15}, {-15, 75}, {-40, 160}, {20, -45}} << QList<QGeoCoordinate>{};
    QTest::newRow("Marseille, zoom 8")
        << 8.0 << QGeoCoordinate(43.3, 5.4)
        << QList<QGeoCoordinate>{{43.55, 5.45}, {43.6, 4.9}, {43.5, 6.1}}
        << QList<QGeoCoordinate>{{43.05, 5.4}, {43.1, 4.8}, {43.0, 6.0}} << QList<QGeoCoordinate>{};
    // The Rhine between France and Germany, north of Basel
    QTest::newRow("the upper Rhine, zoom 6")
        << 6.0 << QGeoCoordinate(48.0, 7.6) << QList<QGeoCoordinate>{{48.3, 7.0}, {48.3, 8.3}}
        << QList<QGeoCoordinate>{} << QList<QGeoCoordinate>{{48.3, 7.3}, {48.3, 7.9}};
}

// No network: the map is the program's own, with land and water where they are.
void tst_MapWindow::offlineMapShowsLandAndWater()
{
    QFETCH(double, zoom);
    QFETCH(QGeoCoordinate, centre);
    QFETCH(QList<QGeoCoordinate>, onLand);
    QFETCH(QList<QGeoCoordinate>, onWater);
    QFETCH(QList<QGeoCoordinate>, acrossBorder);
    QVERIFY(!m_view->offlineMapStyle().isEmpty());
    QObject *map = m_view->rootObject()->findChild<QObject *>("worldMap");
    QVERIFY(map);
    map->setProperty("center", QVariant::fromValue(centre));
    map->setProperty("zoomLevel", zoom);

    const auto pointOf = [map](const QGeoCoordinate &place) {
        QPointF at;
        QMetaObject::invokeMethod(map, "fromCoordinate", Q_RETURN_ARG(QPointF, at), Q_ARG(QGeoCoordinate, place),
                                  Q_ARG(bool, false));
        return at.toPoint();
    };
    // Most of the 9 by 9 pixels around a place have the colour, in places away from the
    // country names.
    const auto mostly = [&](const QImage &shot, const QGeoCoordinate &place, const QColor &colour) {
        const QPoint at = pointOf(place);
        int matching = 0;
        for (int dy = -4; dy <= 4; ++dy)
            for (int dx = -4; dx <= 4; ++dx)
                matching += shot.rect().contains(at + QPoint(dx, dy)) && near(shot.pixelColor(at + QPoint(dx, dy)), colour, 12);
        return matching > 60;
    };
    // The map says nothing when its tiles are drawn: it is looked at until it is right.
    const auto rightEverywhere = [&] {
        const QImage shot = m_view->grabWindow();
        bool borderSeen = acrossBorder.isEmpty();
        for (int i = 0; i <= 100 && !borderSeen; ++i) {
            const QGeoCoordinate &a = acrossBorder[0], &b = acrossBorder[1];
            const QPoint p = pointOf(QGeoCoordinate(a.latitude(), a.longitude() + (b.longitude() - a.longitude()) * i / 100.0));
            borderSeen = shot.rect().contains(p) && near(shot.pixelColor(p), border, 25);
        }
        return borderSeen &&
               std::all_of(onLand.begin(), onLand.end(), [&](const auto &p) { return mostly(shot, p, land); }) &&
               std::all_of(onWater.begin(), onWater.end(), [&](const auto &p) { return mostly(shot, p, water); });
    };
    QTRY_VERIFY_WITH_TIMEOUT(rightEverywhere(), 10000);
}

void tst_MapWindow::failedLoadShowsTheErrorBox()
{
    const QString junk = writeTestFile(m_dir, QStringLiteral("junk.zkgeo"), "neither a project nor a track\n");
    QSignalSpy errors(m_view.get(), &MapView::showError);
    m_view->openFile(junk);
    QVERIFY(errors.wait(10000));

    const QString text = errors.first().first().toString();
    QVERIFY2(!text.isEmpty() && text != QLatin1String("strErrorCantLoadProject"), qPrintable(text));
    QTRY_VERIFY(shown("errorBox"));
    QVERIFY(!shown("waitState"));
}

void tst_MapWindow::clickOnTheMapAddsAWaypointThatASaveKeeps()
{
    // Saves go where the test says.
    class SaveHere : public FileDialogs
    {
    public:
        explicit SaveHere(QString name) : m_name(std::move(name)) {}
        QString openFileName(const QString &, const QString &, const QString &) override { return QString(); }
        QString saveFileName(const QString &, const QString &, const QString &) override { return m_name; }

    private:
        QString m_name;
    };
    const QString projectFile = m_dir.filePath(QStringLiteral("clicked.zkgeo"));
    m_view->mainController().setFileDialogs(std::make_unique<SaveHere>(projectFile));
    m_view->triggerMessageBoxAction(m_view->mainController().action(QStringLiteral("actionNewProject")));
    QTRY_COMPARE(onMap("waypointMarker"), 0);

    QObject *map = m_view->rootObject()->findChild<QObject *>("worldMap");
    auto *mapItem = qobject_cast<QQuickItem *>(map);
    QVERIFY(mapItem);
    const QPoint spot = mapItem->mapToScene(QPointF(mapItem->width() * 0.4, mapItem->height() * 0.6)).toPoint();
    QTest::mouseMove(m_view.get(), spot);
    QTest::mouseClick(m_view.get(), Qt::LeftButton, Qt::NoModifier, spot);
    QTRY_COMPARE(onMap("waypointMarker"), 1);

    QGeoCoordinate clicked;
    QVERIFY(QMetaObject::invokeMethod(map, "toCoordinate", Q_RETURN_ARG(QGeoCoordinate, clicked),
                                      Q_ARG(QPointF, mapItem->mapFromScene(spot)), Q_ARG(bool, false)));
    QVERIFY(m_view->projectModified());
    QVERIFY(m_view->saveProject());

    PainterPathRenderer_Controller reopened;
    QVERIFY(bool(reopened.LoadProject(projectFile)));
    const std::vector<KeyPoint> saved = reopened.pathManager().keyPoints();
    QCOMPARE(saved.size(), size_t(1));
    QVERIFY2(QGeoCoordinate(saved[0].latitude, saved[0].longitude).distanceTo(clicked) < 1.0,
             qPrintable(QStringLiteral("%1 %2").arg(saved[0].latitude).arg(saved[0].longitude)));

    // Opened again, the project shows its waypoint under its title.
    m_view->triggerMessageBoxAction(m_view->mainController().action(QStringLiteral("actionNewProject")));
    QTRY_COMPARE(onMap("waypointMarker"), 0);
    m_view->openFile(projectFile);
    QVERIFY(waitForLoad());
    QTRY_COMPARE(onMap("waypointMarker"), 1);
    QCOMPARE(m_view->keyPointItemsModel().rowCount(), 1);
    QCOMPARE(m_view->keyPointItemsModel().data(m_view->keyPointItemsModel().index(0, 0), Qt::UserRole + 1).toString(),
             saved[0].title());
}

QTEST_MAIN(tst_MapWindow)
#include "tst_mapwindow.moc"
