#include "app/AppSettings.h"
#include "app/Translators.h"
#include "app/gui/PainterPathRenderWidget.h"
#include "mapview/MapView.h"
#include "mapview/ProgramResources.h"

#include <QApplication>
#include <QCursor>
#include <QGeoCoordinate>
#include <QDir>
#include <QQuickItem>
#include <QQuickStyle>
#include <QResource>
#include <QScreen>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QTextStream>
#include <QtTest>

#include <functional>
#include <memory>

// Builds the program's window as the program does, brings it into one state after
// the other through the same slots and clicks the user's actions reach, and saves
// what the map view shows as "<name>.png".
//
//   window-states OUTPUT_FOLDER TRACK_FILE [STATE...]
//   window-states --list
//
// Content ids count on through a process, as in a run of the program: a state that
// relies on them (the default waypoint symbol) wants a process of its own.

namespace {

constexpr int languageGerman = 0;
constexpr int languageJapanese = 6;

QTextStream &err()
{
    static QTextStream stream(stderr);
    return stream;
}

class Stage
{
public:
    Stage()
    {
        m_window = std::make_unique<PainterPathRenderWidget>(1.0);
        m_window->init();
        m_window->show();
        if (!QTest::qWaitForWindowExposed(m_window.get()))
            err() << "window-states: the window did not come up\n";
        settle();
    }

    MapView &view() const { return *m_window->mapView(); }
    PainterPathRenderWidget &window() const { return *m_window; }
    PainterPathRenderer_Controller &document() const { return m_window->document(); }

    QObject *find(const char *name) const { return view().rootObject()->findChild<QObject *>(name); }

    bool waitForPopup(const char *name) const
    {
        QObject *popup = find(name);
        return popup && QTest::qWaitFor([popup] { return popup->property("opened").toBool(); }, 5000);
    }

    void click(const char *name) const
    {
        auto *item = qobject_cast<QQuickItem *>(find(name));
        if (!item)
            return;
        const QPointF centre = item->mapToScene(QPointF(item->width() / 2, item->height() / 2));
        QTest::mouseClick(&view(), Qt::LeftButton, Qt::NoModifier, centre.toPoint());
    }

    // The three towns, the second one chosen and the settings panel open on `page`.
    bool editRoute(int page) const
    {
        if (!threeTowns())
            return false;
        QKeyPointItemsModel &waypoints = view().keyPointItemsModel();
        waypoints.setActiveKeyPointId(int(document().pathManager().active()->keyPoints[1].id));
        waypoints.setCurrentSettingsPage(page);
        view().rootObject()->setProperty("settingsOpen", true);
        return true;
    }

    // A short route through three towns, seen whole.
    bool threeTowns() const
    {
        QKeyPointItemsModel &waypoints = view().keyPointItemsModel();
        waypoints.addKeyPoint(8.3093, 47.0502, 0.0, QStringLiteral("Lucerne, Switzerland"));
        waypoints.addKeyPoint(8.5155, 47.1662, 0.0, QStringLiteral("Zug"));
        waypoints.addKeyPoint(8.5417, 47.3769, 0.0, QStringLiteral("Zurich"));
        const Path *path = document().pathManager().active();
        if (!path || path->keyPoints.size() != 3)
            return false;
        QObject *map = find("worldMap");
        if (!map)
            return false;
        map->setProperty("center", QVariant::fromValue(QGeoCoordinate(47.21, 8.50)));
        map->setProperty("zoomLevel", 10.2);
        return true;
    }

    bool openFile(const QString &fileName) const
    {
        QSignalSpy done(&view(), &MapView::hideWaitState);
        QSignalSpy failed(&view(), &MapView::showError);
        view().openFile(fileName);
        return QTest::qWaitFor([&] { return !done.isEmpty() || !failed.isEmpty(); }, 10000);
    }

    // The map alone at a zoom over a place; the vector map draws in about a second.
    bool showMap(double latitude, double longitude, double zoom) const
    {
        QObject *map = find("worldMap");
        if (!map)
            return false;
        map->setProperty("center", QVariant::fromValue(QGeoCoordinate(latitude, longitude)));
        map->setProperty("zoomLevel", zoom);
        QTest::qWait(1500);
        return true;
    }

    // Lets the map draw and transitions end.
    static void settle() { QTest::qWait(700); }

    // What the screen shows of the window, with every Qt Quick view embedded in it.
    bool save(const QString &fileName) const
    {
        // The pointer rests in a corner, where it hovers nothing.
        QCursor::setPos(m_window->mapToGlobal(QPoint(m_window->width() - 1, m_window->height() - 1)));
        settle();
        const QRect area(m_window->mapToGlobal(QPoint(0, 0)), m_window->size());
        QScreen *screen = QGuiApplication::primaryScreen();
        return screen && screen->grabWindow(0, area.x(), area.y(), area.width(), area.height()).save(fileName);
    }

private:
    std::unique_ptr<PainterPathRenderWidget> m_window;
};

struct State
{
    const char *name;
    std::function<bool(Stage &)> enter;
};

} // namespace

int main(int argc, char *argv[])
{
    QApplication app(argc, argv);
    const QStringList arguments = QCoreApplication::arguments();
    if (arguments.size() < 2 || (arguments[1] != QLatin1String("--list") && arguments.size() < 3)) {
        err() << "usage: window-states OUTPUT_FOLDER TRACK_FILE [STATE...] | window-states --list\n";
        return 2;
    }
    const QDir output(arguments[1]);
    const QString track = arguments.size() > 2 ? QFileInfo(arguments[2]).absoluteFilePath() : QString();
    // Named states only; all without names.
    const QStringList chosen = arguments.mid(3);
    QTemporaryDir scratch;
    const QString damaged = scratch.filePath(QStringLiteral("notes.gpx"));
    {
        QFile file(damaged);
        if (!file.open(QIODevice::WriteOnly) || file.write("Shopping list: bread, milk, a map\n") < 0)
            return 1;
    }

    const QString programDir = QCoreApplication::applicationDirPath();
    QCoreApplication::setApplicationName(QStringLiteral("Tourlet"));
    QDir::setCurrent(programDir);
    QGuiApplication::setQuitOnLastWindowClosed(false);
    if (!registerProgramResources(programDir)) {
        err() << "no resource.rcc in " << programDir << "\n";
        return 1;
    }
    QQuickStyle::setStyle(QStringLiteral("Material"));
    AppSettings settings;
    Translators translators(settings, programDir);

    const QList<State> states = {
        {"window", [](Stage &) { return true; }},
        {"track", [&](Stage &s) { return s.openFile(track); }},
        {"map-world", [](Stage &s) { return s.showMap(25.0, 10.0, 2.2); }},
        {"map-region", [](Stage &s) { return s.showMap(47.0, 9.0, 6.0); }},
        {"map-close", [](Stage &s) { return s.showMap(46.95, 7.6, 10.0); }},
        // Half-way between the second and the third town, the camera on the avatar.
        {"playback",
         [](Stage &s) {
             if (!s.threeTowns())
                 return false;
             s.find("worldMap")->setProperty("zoomLevel", 11.5);
             Stage::settle();
             s.view().setAnimationMode(1);
             s.view().startAnimation();
             QTest::qWait(4700);
             return s.view().animationRunning();
         }},
        {"film-settings",
         [](Stage &s) {
             if (!s.threeTowns())
                 return false;
             s.view().setAnimationMode(2);
             s.view().slotFlyInAnimation(true);
             s.click("filmSettingsButton");
             return true;
         }},
        {"avatar-page", [](Stage &s) { return s.editRoute(KeyPointItemsData::AvatarPage); }},
        {"waypoint-edit", [](Stage &s) { return s.editRoute(KeyPointItemsData::KeyPointPage); }},
        {"route-settings",
         [](Stage &s) {
             QVariantMap style = s.view().pathSettings();
             style[QStringLiteral("shadowEnabled")] = true;
             style[QStringLiteral("color")] = QStringLiteral("#1565C0");
             s.view().writePathSettings(style);
             return s.editRoute(KeyPointItemsData::PathPage);
         }},
        {"close-question",
         [](Stage &s) {
             s.view().projectIsModified();
             s.window().close();
             return s.waitForPopup("messageBox");
         }},
        {"language-menu",
         [](Stage &s) {
             s.click("languageButton");
             return true;
         }},
        {"export",
         [](Stage &s) {
             ExportProperties &progress = s.document().exportProperties();
             progress.exportActive = true;
             progress.totalFrames = 1800;
             progress.requiredFrameNumber = 738;
             s.window().showExportProgress();
             return true;
         }},
        {"close-question-de",
         [](Stage &s) {
             s.view().setLanguage(languageGerman);
             s.view().projectIsModified();
             s.window().close();
             return s.waitForPopup("messageBox");
         }},
        {"error-ja",
         [&](Stage &s) {
             s.view().setLanguage(languageJapanese);
             return s.openFile(damaged) && s.waitForPopup("errorBox");
         }},
    };

    if (arguments[1] == QLatin1String("--list")) {
        QTextStream out(stdout);
        for (const State &state : states)
            out << state.name << "\n";
        return 0;
    }

    int failures = 0;
    for (const State &state : states) {
        if (!chosen.isEmpty() && !chosen.contains(QLatin1String(state.name)))
            continue;
        translators.install(LanguageTable::English);
        Stage stage;
        const QString fileName = output.filePath(QString::fromLatin1(state.name) + QStringLiteral(".png"));
        if (!state.enter(stage) || !stage.save(fileName)) {
            err() << "window-states: " << state.name << " failed\n";
            ++failures;
        }
    }
    translators.install(LanguageTable::English);
    return failures == 0 ? 0 : 1;
}
