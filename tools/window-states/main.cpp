#include "app/AppSettings.h"
#include "app/Translators.h"
#include "app/gui/PainterPathRenderWidget.h"
#include "mapview/MapView.h"

#include <QApplication>
#include <QCursor>
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
//   window-states OUTPUT_FOLDER TRACK_FILE

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

    bool openFile(const QString &fileName) const
    {
        QSignalSpy done(&view(), &MapView::hideWaitState);
        QSignalSpy failed(&view(), &MapView::showError);
        view().openFile(fileName);
        return QTest::qWaitFor([&] { return !done.isEmpty() || !failed.isEmpty(); }, 10000);
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
    if (arguments.size() != 3) {
        err() << "usage: window-states OUTPUT_FOLDER TRACK_FILE\n";
        return 2;
    }
    const QDir output(arguments[1]);
    const QString track = QFileInfo(arguments[2]).absoluteFilePath();
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
    if (!QResource::registerResource(QStringLiteral("resource.rcc"))) {
        err() << "no resource.rcc in " << programDir << "\n";
        return 1;
    }
    QQuickStyle::setStyle(QStringLiteral("Material"));
    AppSettings settings;
    Translators translators(settings, programDir);

    const QList<State> states = {
        {"window", [](Stage &) { return true; }},
        {"track", [&](Stage &s) { return s.openFile(track); }},
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

    int failures = 0;
    for (const State &state : states) {
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
