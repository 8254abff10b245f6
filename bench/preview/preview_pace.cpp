#include "app/AppSettings.h"
#include "app/gui/PainterPathRenderWidget.h"
#include "mapview/MapView.h"
#include "mapview/ProgramResources.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QApplication>
#include <QDir>
#include <QElapsedTimer>
#include <QGeoCoordinate>
#include <QQuickItem>
#include <QQuickStyle>
#include <QResource>
#include <QTextStream>
#include <QtTest>

#include <cmath>

// Plays a route of 200 waypoints in the program's window, the camera keeping the
// avatar centred, and counts for 10 seconds what reaches the screen: frames swapped,
// events shown, and the frames that show an event not shown before.
//
//   preview-pace [SECONDS]
//   preview-pace --first-screen    how long until the map's first screen is painted

int main(int argc, char *argv[])
{
    QApplication app(argc, argv);
    QTextStream out(stdout);
    qInstallMessageHandler([](QtMsgType type, const QMessageLogContext &, const QString &text) {
        if (type >= QtWarningMsg)
            QTextStream(stderr) << text << '\n';
    });
    const bool firstScreen = argc > 1 && QByteArray(argv[1]) == "--first-screen";
    const int seconds = argc > 1 && !firstScreen ? std::max(1, atoi(argv[1])) : 10;
    QCoreApplication::setApplicationName(QStringLiteral("Tourlet"));
    QDir::setCurrent(QCoreApplication::applicationDirPath());
    if (!registerProgramResources(QCoreApplication::applicationDirPath())) {
        out << "no resource.rcc beside the program\n";
        return 1;
    }
    QQuickStyle::setStyle(QStringLiteral("Material"));

    QElapsedTimer start;
    start.start();
    PainterPathRenderWidget window(1.0);
    window.init();
    window.show();
    if (!QTest::qWaitForWindowExposed(&window)) {
        out << "the window did not come up\n";
        return 1;
    }
    MapView &view = *window.mapView();
    if (firstScreen) {
        // Painted when the middle of the view shows the world map's land or water.
        const auto painted = [&view] {
            const QImage shot = view.grabWindow();
            const QColor c = shot.pixelColor(shot.width() / 2, shot.height() / 2);
            const auto near = [&c](const QColor &b) {
                return std::abs(c.red() - b.red()) < 10 && std::abs(c.green() - b.green()) < 10 &&
                       std::abs(c.blue() - b.blue()) < 10;
            };
            return near(QColor(0xEF, 0xEB, 0xE3)) || near(QColor(0xA9, 0xCB, 0xE0));
        };
        const qint64 shown = start.elapsed();
        while (!painted() && start.elapsed() < 10000)
            QTest::qWait(20);
        out << "window shown after " << shown << " ms, map painted after " << start.elapsed() << " ms\n";
        return 0;
    }

    // 200 waypoints on a winding way through the Alps, some 2 km apart.
    QElapsedTimer clock;
    clock.start();
    for (int i = 0; i < 200; ++i) {
        const double t = i / 199.0;
        view.keyPointItemsModel().addKeyPoint(7.0 + 3.0 * t, 46.5 + 0.2 * std::sin(t * 25.0), 0.0,
                                              QStringLiteral("Stop %1").arg(i + 1));
    }
    out << "route of 200 waypoints made in " << clock.elapsed() << " ms\n";
    if (QObject *map = view.rootObject()->findChild<QObject *>(QStringLiteral("worldMap"))) {
        map->setProperty("center", QVariant::fromValue(QGeoCoordinate(46.5, 7.0)));
        map->setProperty("zoomLevel", 12.0);
    }
    QTest::qWait(500);
    view.setAnimationMode(1);

    int swaps = 0, distinct = 0, events = 0;
    int lastShown = -1, current = -1;
    QObject::connect(&view, &MapView::animationEventChanged, [&] {
        ++events;
        current = view.animationEvent().value(QStringLiteral("index")).toInt();
    });
    QObject::connect(&view, &QQuickWindow::frameSwapped, [&] {
        ++swaps;
        if (current != lastShown) {
            ++distinct;
            lastShown = current;
        }
    });
    view.startAnimation();
    clock.restart();
    QTest::qWait(seconds * 1000);
    const double elapsed = clock.elapsed() / 1000.0;
    view.stopAnimation(false);

    out << QStringLiteral("%1 s at %2x%3: %4 events/s, %5 frames/s swapped, %6 distinct frames/s\n")
               .arg(elapsed, 0, 'f', 1)
               .arg(view.width())
               .arg(view.height())
               .arg(events / elapsed, 0, 'f', 1)
               .arg(swaps / elapsed, 0, 'f', 1)
               .arg(distinct / elapsed, 0, 'f', 1);
    return 0;
}
