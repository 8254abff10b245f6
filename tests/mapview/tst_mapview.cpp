#include "TestFiles.h"

#include "mapview/MapView.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QQuickItem>
#include <QSettings>
#include <QSignalSpy>
#include <QWidget>
#include <QtTest>

#include <cmath>

namespace {

// Answers the file dialogs in order and remembers what each was asked with.
class ScriptedDialogs : public FileDialogs
{
public:
    QStringList answers;
    QStringList asked; // "open" or "save", then a blank and the filter

    QString openFileName(const QString &, const QString &, const QString &filter) override
    {
        return answer(QStringLiteral("open"), filter);
    }
    QString saveFileName(const QString &, const QString &, const QString &filter) override
    {
        return answer(QStringLiteral("save"), filter);
    }

private:
    QString answer(const QString &kind, const QString &filter)
    {
        asked.append(kind + QLatin1Char(' ') + filter);
        return answers.isEmpty() ? QString() : answers.takeFirst();
    }
};

const QByteArray ride = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
                        "<gpx version=\"1.1\" creator=\"test\" xmlns=\"http://www.topografix.com/GPX/1/1\"><trk><trkseg>\n"
                        "<trkpt lat=\"51.050\" lon=\"13.700\"/><trkpt lat=\"51.053\" lon=\"13.706\"/>\n"
                        "<trkpt lat=\"51.058\" lon=\"13.711\"/><trkpt lat=\"51.061\" lon=\"13.719\"/>\n"
                        "<trkpt lat=\"51.066\" lon=\"13.724\"/>\n"
                        "</trkseg></trk></gpx>\n";

// A map view on the smallest interface, with settings and dialogs of its own.
struct Stage
{
    QTemporaryDir dir;
    QSettings store{dir.filePath(QStringLiteral("settings.ini")), QSettings::IniFormat};
    PainterPathRenderer_Controller document;
    QWidget window;
    MapView view{&document, nullptr, AppSettings(store)};
    ScriptedDialogs *dialogs = nullptr;

    Stage()
    {
        store.setValue(QStringLiteral("projectPath"), dir.path());
        auto scripted = std::make_unique<ScriptedDialogs>();
        dialogs = scripted.get();
        view.mainController().setFileDialogs(std::move(scripted));
        window.resize(800, 600);
        // The one connect that is meant to fail.
        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("No such slot MapView::setPathSettings")));
        QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("sender name: +'SignalList_Obj'")));
        view.init(&window, true, QUrl::fromLocalFile(QStringLiteral(TOURLET_TEST_DATA "/Stage.qml")));
    }

    QString file(const QString &name) const { return dir.filePath(name); }
    QString title() const { return window.windowTitle(); }
    // "track" for an opened track, "empty" for a new project, "route" otherwise.
    QString pathKind() const
    {
        const Path *path = document.pathManager().active();
        if (!path || path->keyPoints.empty())
            return QStringLiteral("empty");
        return path->isFixedTrack() ? QStringLiteral("track") : QStringLiteral("route");
    }
    bool waitForLoad()
    {
        QSignalSpy done(&view, &MapView::hideWaitState);
        return done.wait(5000);
    }
};

} // namespace

class tst_MapView : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase() { QCoreApplication::setApplicationName(QStringLiteral("Tourlet")); }

    void messageBoxActions_data();
    void messageBoxActions();
    void titleFollowsEditsSavesAndLoads();
    void failedLoadShowsError();
    void trackFromCommandLineOpensWithZoomFitted();
    void fittedZoom_data();
    void fittedZoom();
    void proposedSaveNames_data();
    void proposedSaveNames();
    void loadStateSkipsSmallSteps();
    void listTitlesAreKeysUntilStringsArrive();
    void signalListReachesSlots();
    void pointerHover_data();
    void pointerHover();
    void trackMarkerSlidesBetweenLockedEnds();
    void previewStopsOnClickAndRestoresTheView();
    void trackProjectLoadsOntoTheDefaultMap_data();
    void trackProjectLoadsOntoTheDefaultMap();
};

void tst_MapView::messageBoxActions_data()
{
    QTest::addColumn<int>("id");
    QTest::addColumn<QStringList>("answers"); // "project" and "track" name the stage's files
    QTest::addColumn<QStringList>("asked");   // "save", "open project", "open track"
    QTest::addColumn<QString>("pathAfter");
    QTest::addColumn<bool>("closes");

    QTest::newRow("0 saves, then loads a track")
        << 0 << QStringList{"project", "track"} << QStringList{"save", "open track"} << "track" << false;
    QTest::newRow("1009 does nothing") << 1009 << QStringList{"project", "track"} << QStringList{} << "empty" << false;
    QTest::newRow("-1 does nothing") << -1 << QStringList{"project"} << QStringList{} << "empty" << false;
    QTest::newRow("1008 saves, then loads a project")
        << 1008 << QStringList{"project", ""} << QStringList{"save", "open project"} << "empty" << false;
    QTest::newRow("1004 with the save cancelled stays open") << 1004 << QStringList{""} << QStringList{"save"} << "empty"
                                                            << false;
    QTest::newRow("1004 saves and closes") << 1004 << QStringList{"project"} << QStringList{"save"} << "empty" << true;
}

void tst_MapView::messageBoxActions()
{
    QFETCH(int, id);
    QFETCH(QStringList, answers);
    QFETCH(QStringList, asked);
    QFETCH(QString, pathAfter);
    QFETCH(bool, closes);

    Stage stage;
    const QString track = writeTestFile(stage.dir, QStringLiteral("ride.gpx"), ride);
    for (const QString &answer : answers)
        stage.dialogs->answers.append(answer == "project" ? stage.file("tour.zkgeo") : answer == "track" ? track : answer);
    QSignalSpy closed(&stage.view, &MapView::closeApp);

    stage.view.triggerMessageBoxAction(id);
    if (pathAfter == "track")
        QVERIFY(stage.waitForLoad());

    QStringList kinds;
    for (const QString &question : stage.dialogs->asked) {
        if (question.startsWith("save"))
            kinds << "save";
        else if (question.contains("*.zkgeo"))
            kinds << "open project";
        else if (question.contains("*.gpx"))
            kinds << "open track";
        else
            kinds << question;
    }
    QCOMPARE(kinds, asked);
    QCOMPARE(stage.pathKind(), pathAfter);
    QCOMPARE(closed.count(), closes ? 1 : 0);
    QCOMPARE(QFileInfo::exists(stage.file("tour.zkgeo")), asked.value(0) == "save" && answers.value(0) == "project");
}

void tst_MapView::titleFollowsEditsSavesAndLoads()
{
    Stage stage;
    QCOMPARE(stage.title(), QStringLiteral("Tourlet"));
    QVERIFY(!stage.view.projectModified());

    stage.view.setShowCompass(true);
    stage.view.setShowCompass(true);
    QCOMPARE(stage.title(), QStringLiteral("Tourlet *"));
    QVERIFY(stage.view.projectModified());

    stage.dialogs->answers << stage.file("trip.zkgeo");
    QVERIFY(stage.view.saveProject());
    QCOMPARE(stage.title(), QStringLiteral("Tourlet - trip"));
    QVERIFY(!stage.view.projectModified());

    stage.view.setShowCompass(false);
    QCOMPARE(stage.title(), QStringLiteral("Tourlet - trip *"));
    stage.view.openFile(stage.file("trip.zkgeo"));
    QVERIFY(stage.waitForLoad());
    QCOMPARE(stage.title(), QStringLiteral("Tourlet - trip"));
    QVERIFY(!stage.view.projectModified());
    QVERIFY(stage.view.showCompass()); // as saved, not as edited afterwards

    // A write that fails leaves title and flag as they were.
    stage.view.setShowCompass(false);
    stage.dialogs->answers << stage.file("missing-folder/trip.zkgeo");
    QVERIFY(!stage.view.saveProject());
    QCOMPARE(stage.title(), QStringLiteral("Tourlet - trip *"));
    QVERIFY(stage.view.projectModified());

    // Closing asks first: close without saving, save and close, cancel.
    QSignalSpy asked(&stage.view, &MapView::showMessageBox);
    QSignalSpy closed(&stage.view, &MapView::closeApp);
    stage.view.handleCloseApp();
    QCOMPARE(closed.count(), 0);
    QCOMPARE(asked.count(), 1);
    QCOMPARE(asked.first().mid(1), (QVariantList{1003, 1004, -1}));
}

void tst_MapView::failedLoadShowsError()
{
    Stage stage;
    stage.view.setStrings({{"strErrorCantLoadProject", "The file can't be opened."}});
    const QString junk = writeTestFile(stage.dir, QStringLiteral("notes.zkgeo"), "no project, no track\n");
    QSignalSpy errors(&stage.view, &MapView::showError);
    QSignalSpy hidden(&stage.view, &MapView::hideWaitState);

    stage.view.openFile(junk);
    QVERIFY(errors.wait(5000));
    QCOMPARE(errors.first().first().toString(), QStringLiteral("The file can't be opened."));
    QCOMPARE(hidden.count(), 0); // the wait state stays until something replaces it
    QCOMPARE(stage.pathKind(), QStringLiteral("empty"));
    QCOMPARE(stage.title(), QStringLiteral("Tourlet"));
}

void tst_MapView::trackFromCommandLineOpensWithZoomFitted()
{
    Stage stage;
    const QString track = writeTestFile(stage.dir, QStringLiteral("ride.gpx"), ride);
    const ProjectFields newProject;
    const double viewWidth = newProject.visibleBoundariesBR.longitude - newProject.visibleBoundariesTL.longitude;
    const double viewHeight = newProject.visibleBoundariesTL.latitude - newProject.visibleBoundariesBR.latitude;

    stage.view.openFile(track);
    QVERIFY(stage.waitForLoad());

    QCOMPARE(stage.pathKind(), QStringLiteral("track"));
    QVERIFY(stage.view.keyPointsFixed());
    QCOMPARE(stage.title(), QStringLiteral("Tourlet - ride.gpx"));

    // The track fits the view at the new level, with the margin, and not one level closer.
    const int zoom = int(stage.view.currentZoomLevel());
    QVERIFY2(zoom > int(newProject.currentZoomLevel), qPrintable(QString::number(zoom)));
    const double trackWidth = 13.724 - 13.700, trackHeight = 51.066 - 51.050;
    const double scale = 0.85 * std::pow(2.0, newProject.currentZoomLevel - zoom);
    QVERIFY(trackWidth < viewWidth * scale && trackHeight < viewHeight * scale);
    QVERIFY(trackWidth >= viewWidth * scale / 2 || trackHeight >= viewHeight * scale / 2);
    // The interface applies the location settings after a load: they carry the same level.
    QCOMPARE(stage.view.locationSettings().value("zoomLevel").toDouble(), double(zoom));
    QCOMPARE(stage.view.centerPosition().latitude(), (51.050 + 51.066) / 2);
}

void tst_MapView::fittedZoom_data()
{
    QTest::addColumn<QSizeF>("target");
    QTest::addColumn<QSizeF>("current");
    QTest::addColumn<int>("zoom");
    QTest::addColumn<int>("expected");

    QTest::newRow("zero target: no zoom out, nothing to halve") << QSizeF(0, 0) << QSizeF(5, 5) << 10 << 10;
    QTest::newRow("zero target width") << QSizeF(0, 2) << QSizeF(5, 5) << 10 << 10;
    QTest::newRow("same extent stays") << QSizeF(2, 1) << QSizeF(2, 1) << 10 << 10;
    QTest::newRow("half as wide again: two levels out") << QSizeF(2, 1) << QSizeF(3, 1) << 10 << 8;
    QTest::newRow("a quarter: one level in") << QSizeF(4, 4) << QSizeF(1, 1) << 10 << 11;
    QTest::newRow("a single point: the closest level") << QSizeF(2, 1) << QSizeF(0, 0) << 10 << 20;
    QTest::newRow("wider than the world: the farthest level") << QSizeF(1, 1) << QSizeF(1e9, 1e9) << 3 << 0;
}

void tst_MapView::fittedZoom()
{
    QFETCH(QSizeF, target);
    QFETCH(QSizeF, current);
    QFETCH(int, zoom);
    QFETCH(int, expected);
    QCOMPARE(MapView::fittedZoom(target, current, zoom), expected);
}

void tst_MapView::proposedSaveNames_data()
{
    QTest::addColumn<QStringList>("titles");
    QTest::addColumn<QString>("expected");

    QTest::newRow("no key point") << QStringList{} << "/maps/tourlet_project_2024-05-06_07-08-09";
    QTest::newRow("one key point") << QStringList{"Dresden"} << "/maps/tourlet_project_2024-05-06_07-08-09";
    QTest::newRow("first and last") << QStringList{"Dresden", "Pirna", "Prag"} << "/maps/Dresden - Prag (2024-05-06_07-08-09)";
}

void tst_MapView::proposedSaveNames()
{
    QFETCH(QStringList, titles);
    QFETCH(QString, expected);
    std::vector<KeyPoint> keyPoints;
    for (const QString &title : titles) {
        keyPoints.emplace_back(13.7, 51.0, 0.0);
        keyPoints.back().properties.title = title;
    }
    const QDateTime now(QDate(2024, 5, 6), QTime(7, 8, 9));
    QCOMPARE(QMainController::proposedSaveName(QStringLiteral("/maps"), keyPoints, now), expected);
}

void tst_MapView::loadStateSkipsSmallSteps()
{
    Stage stage;
    stage.view.setStrings({{"strLoadProjectHint", "Loading"}});
    QSignalSpy shown(&stage.view, &MapView::showWaitState);
    const auto last = [&shown] { return shown.isEmpty() ? QString() : shown.last().first().toString(); };

    stage.view.triggerLoadState(3, 10.0);
    QCOMPARE(last(), QStringLiteral("Loading 10%"));
    stage.view.triggerLoadState(3, 10.9);
    QCOMPARE(shown.count(), 1);
    stage.view.triggerLoadState(3, 11.0);
    QCOMPARE(last(), QStringLiteral("Loading 11%"));
    stage.view.triggerLoadState(7, -1.0);
    QCOMPARE(last(), QStringLiteral("Loading 7"));
    stage.view.triggerLoadState(3, 0.2); // after a step without percentage any value shows
    QCOMPARE(last(), QStringLiteral("Loading 0%"));
    QCOMPARE(shown.count(), 4);
}

void tst_MapView::listTitlesAreKeysUntilStringsArrive()
{
    Stage stage;
    stage.store.setValue(QStringLiteral("GpxAliasing"), QStringLiteral("9"));
    const char *const lists[] = {"gpxAliasingCBEntries", "maxAnimationDurationCBEntries", "languageCBEntries"};

    QVariantMap texts;
    for (const char *list : lists) {
        const QVariantList entries = stage.view.property(list).toList();
        QVERIFY(!entries.isEmpty());
        for (const QVariant &entry : entries) {
            const QString title = entry.toMap().value("title").toString();
            QVERIFY2(title.startsWith("str"), list);
            texts.insert(title, QStringLiteral("text of ") + title);
        }
    }

    QSignalSpy languageList(&stage.view, &MapView::languageCBEntriesChanged);
    QVERIFY(stage.view.setProperty("strHostStrings", texts));
    // The interface answers a change of the language list by sending its strings again.
    QCOMPARE(languageList.count(), 0);
    for (const char *list : lists) {
        int selected = 0;
        for (const QVariant &entry : stage.view.property(list).toList()) {
            QVERIFY(entry.toMap().value("title").toString().startsWith("text of str"));
            selected += entry.toMap().value("selected").toInt();
        }
        // An aliasing of 9 lies outside its list: nothing is selected there.
        QCOMPARE(selected, qstrcmp(list, "gpxAliasingCBEntries") == 0 ? 0 : 1);
    }
}

void tst_MapView::signalListReachesSlots()
{
    Stage stage;
    QObject *signalList = stage.view.rootObject()->findChild<QObject *>("SignalList_Obj");
    QVERIFY(signalList);
    const QVariantMap pathSettings = stage.view.pathSettings();

    QVERIFY(QMetaObject::invokeMethod(signalList, "setShowCompass", Q_ARG(bool, true)));
    const QVariant greenPath = QVariantMap{{"color", "#00FF00"}, {"width", 12}};
    QVERIFY(QMetaObject::invokeMethod(signalList, "setPathSettings", Q_ARG(QVariant, greenPath)));
    QVERIFY(stage.view.showCompass());
    QCOMPARE(stage.title(), QStringLiteral("Tourlet *"));
    QCOMPARE(stage.view.pathSettings(), pathSettings);

    stage.dialogs->answers << stage.file("kept.zkgeo");
    QVERIFY(QMetaObject::invokeMethod(signalList, "saveProject"));
    QVERIFY(QFileInfo::exists(stage.file("kept.zkgeo")));
    QVERIFY(!stage.view.projectModified());
}

void tst_MapView::pointerHover_data()
{
    // A pointer `offset` metres north of a place on a route from (50, 10) to (50, 11):
    // on its first key point or halfway along it, with a hit radius of `radius` times
    // the offset.
    QTest::addColumn<bool>("halfway");
    QTest::addColumn<double>("radius");
    QTest::addColumn<QString>("hovered");
    QTest::newRow("key point inside the radius") << false << 1.001 << "keyPoint";
    QTest::newRow("key point exactly at the radius") << false << 1.0 << "nothing";
    QTest::newRow("radius zero") << false << 0.0 << "nothing";
    QTest::newRow("route inside the radius") << true << 1.5 << "route";
    QTest::newRow("route outside the radius") << true << 0.5 << "nothing";
}

void tst_MapView::pointerHover()
{
    QFETCH(bool, halfway);
    QFETCH(double, radius);
    QFETCH(QString, hovered);
    Stage stage;
    Path &path = stage.document.pathManager().activeChecked();
    path.addKeyPoint(10.0, 50.0, 0.0, QStringLiteral("A"), false);
    path.addKeyPoint(11.0, 50.0, 0.0, QStringLiteral("B"), true);
    QVERIFY(path.curvePoints.size() > 10);

    // Halfway, the pointer stands north of the sample nearest to the middle; the
    // key point test alone (one key point, no route) decides the first rows.
    const CurvePoint middle = path.curvePoints[path.curvePoints.size() / 2];
    if (!halfway)
        path.curvePoints.clear();
    const QGeoCoordinate target = halfway ? QGeoCoordinate(middle.y, middle.x) : QGeoCoordinate(50.0, 10.0);
    const QGeoCoordinate pointer = target.atDistanceAndAzimuth(400.0, 0.0);
    stage.view.setMoveDistance(radius * pointer.distanceTo(target));

    const bool any = stage.view.mouseMoved(pointer.longitude(), pointer.latitude());
    const int marked = int(std::count_if(path.curvePoints.begin(), path.curvePoints.end(),
                                         [](const CurvePoint &sample) { return sample.tt != 0; }));
    const QString seen = stage.view.keypointHoveredID() != 0 ? QStringLiteral("keyPoint")
                         : stage.view.mouseOverPath()       ? QStringLiteral("route")
                                                            : QStringLiteral("nothing");
    QCOMPARE(seen, hovered);
    QCOMPARE(any, hovered != QLatin1String("nothing"));
    QCOMPARE(marked, hovered == QLatin1String("route") ? 1 : 0);
    if (hovered == QLatin1String("keyPoint"))
        QCOMPARE(uint32_t(stage.view.keypointHoveredID()), path.keyPoints.front().id);
    if (hovered == QLatin1String("route")) {
        QCOMPARE(stage.view.mouseOverPathPosition(), target);
        QVERIFY(std::abs(stage.view.mouseOverPathPositionPercentage() - 0.5) < 0.01);
    }

    // Moving away clears the hover and the mark.
    stage.view.mouseMoved(0.0, 0.0);
    QVERIFY(!stage.view.mouseOverPath() && stage.view.keypointHoveredID() == 0);
    QVERIFY(std::none_of(path.curvePoints.begin(), path.curvePoints.end(),
                         [](const CurvePoint &sample) { return sample.tt != 0; }));
}

void tst_MapView::trackMarkerSlidesBetweenLockedEnds()
{
    Stage stage;
    QByteArray withStop = ride;
    withStop.replace("<trk>", "<wpt lat=\"51.058\" lon=\"13.711\"><name>Stop</name></wpt><trk>");
    stage.view.openFile(writeTestFile(stage.dir, QStringLiteral("ride.gpx"), withStop));
    QVERIFY(stage.waitForLoad());
    const Path &path = *stage.document.pathManager().active();
    QCOMPARE(path.keyPoints.size(), size_t(3));
    stage.view.setMoveDistance(50.0);

    // The ends of a track are locked, the stop between them is not.
    const bool lockedAt[] = {true, false, true};
    for (int i : {0, 2, 1}) {
        const KeyPoint &point = path.keyPoints[size_t(i)];
        QVERIFY(stage.view.mouseMoved(point.x, point.y));
        QCOMPARE(uint32_t(stage.view.keypointHoveredID()), point.id);
        QCOMPARE(stage.view.markerLocked(), lockedAt[i]);
    }

    // Dragged towards the end, the stop's marker snaps to a sample of its two legs and
    // names both segments; dropped, the stop moves there and the drag ends.
    const KeyPoint stop = path.keyPoints[1];
    stage.view.markerMoved(13.7235, 51.0655);
    const QGeoCoordinate snapped = stage.view.mouseOverPathPosition();
    const auto onTrack = std::find_if(path.curvePoints.begin(), path.curvePoints.end(), [&](const CurvePoint &s) {
        return QGeoCoordinate(s.y, s.x) == snapped;
    });
    QVERIFY(onTrack != path.curvePoints.end() && onTrack != path.curvePoints.end() - 1);
    QVERIFY(snapped.distanceTo(QGeoCoordinate(51.066, 13.724)) < snapped.distanceTo(QGeoCoordinate(stop.y, stop.x)));
    QCOMPARE(uint32_t(stage.view.markerMoveSID1()), path.pathSegments[0].id);
    QCOMPARE(uint32_t(stage.view.markerMoveSID2()), path.pathSegments[1].id);

    stage.view.changeKeyPointPosition(int(stop.id), snapped.longitude(), snapped.latitude());
    QCOMPARE(QGeoCoordinate(path.keyPoints[1].y, path.keyPoints[1].x), snapped);
    QCOMPARE(stage.view.markerMoveSID1(), 0);
    QVERIFY(stage.view.projectModified());
}

QTEST_MAIN(tst_MapView)
#include "tst_mapview.moc"

void tst_MapView::previewStopsOnClickAndRestoresTheView()
{
    Stage stage;
    stage.view.openFile(writeTestFile(stage.dir, QStringLiteral("ride.gpx"), ride));
    QVERIFY(stage.waitForLoad());
    ProjectFields &fields = stage.document.fields();
    fields.flyInEnabled = true;
    fields.currentZoomLevel = 16.0;
    fields.currentBearing = 10.0;
    // The view, larger than the ride, as the map reported it.
    stage.document.setViewBoundaries(KeyPoint(13.66, 51.11, 0.0), KeyPoint(13.76, 51.01, 0.0));
    stage.view.setAnimationMode(1);

    // Control+Space plays; the fly-in zooms out to the whole ride first.
    QKeyEvent play(QEvent::KeyPress, Qt::Key_Space, Qt::ControlModifier);
    QCoreApplication::sendEvent(&stage.view, &play);
    QVERIFY(stage.view.animationRunning());
    QVERIFY(fields.currentZoomLevel < 16.0);
    QTRY_COMPARE(stage.view.animationEvent().value(QStringLiteral("type")).toString(), QStringLiteral("flyin"));
    QVERIFY(stage.view.avatarPose().value(QStringLiteral("valid")).toBool());
    QVERIFY(stage.view.animationCamera().value(QStringLiteral("zoomLevel")).toDouble() < 16.0);

    // Neither a click nor the keys stop the film while an export runs.
    QMouseEvent release(QEvent::MouseButtonRelease, QPointF(5, 5), Qt::LeftButton, Qt::NoButton, Qt::NoModifier);
    stage.view.setExportRunning(true);
    QCoreApplication::sendEvent(&stage.view, &release);
    QCoreApplication::sendEvent(&stage.view, &play);
    QTest::qWait(400);
    QVERIFY(stage.view.animationRunning());
    stage.view.setExportRunning(false);

    // A click stops it after 300 ms, and the next tick brings the user's view back.
    QSignalSpy restored(&stage.view, &MapView::locationSettingsChanged);
    QCoreApplication::sendEvent(&stage.view, &release);
    QTest::qWait(100);
    QVERIFY(stage.view.animationRunning());
    QTRY_VERIFY(!stage.view.animationRunning());
    QTRY_VERIFY(!restored.isEmpty());
    QCOMPARE(fields.currentZoomLevel, 16.0);
    QCOMPARE(stage.view.locationSettings().value(QStringLiteral("zoomLevel")).toDouble(), 16.0);
    QCOMPARE(stage.view.locationSettings().value(QStringLiteral("bearing")).toDouble(), 10.0);
}

void tst_MapView::trackProjectLoadsOntoTheDefaultMap_data()
{
    QTest::addColumn<QString>("saved");
    QTest::addColumn<QString>("loaded");
    QTest::newRow("a catalogue map") << "pseudeo:map:alps" << "osm:layer:0";
    QTest::newRow("a map this installation lacks stays") << "???esri:topo" << "???esri:topo";
    QTest::newRow("too short to be a map") << "osm" << "osm";
}

void tst_MapView::trackProjectLoadsOntoTheDefaultMap()
{
    QFETCH(QString, saved);
    QFETCH(QString, loaded);
    Stage stage;
    stage.view.openFile(writeTestFile(stage.dir, QStringLiteral("ride.gpx"), ride));
    QVERIFY(stage.waitForLoad());
    stage.document.fields().backgroundMap = saved;
    stage.dialogs->answers << stage.file(QStringLiteral("ride.zkgeo"));
    QVERIFY(stage.view.saveProject());

    stage.view.openFile(stage.file(QStringLiteral("ride.zkgeo")));
    QVERIFY(stage.waitForLoad());
    QCOMPARE(stage.view.backgroundChooser().backgroundMap(), loaded);
    QVERIFY(!stage.view.projectModified());
}
