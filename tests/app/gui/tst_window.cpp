#include "app/ProgramFolder.h"
#include "app/gui/PainterPathRenderWidget.h"
#include "app/gui/ProgressView.h"
#include "mapview/MapView.h"

#include <QApplication>
#include <QDir>
#include <QPointer>
#include <QQuickItem>
#include <QQuickStyle>
#include <QResource>
#include <QScreen>
#include <QTemporaryDir>
#include <QtTest>

#include <memory>

namespace {

// Every warning of a run. The interface must load without any: the one expected is
// the connect of "setPathSettings", which the map view has no slot for.
QStringList warnings;
QtMessageHandler defaultHandler = nullptr;

void recordWarnings(QtMsgType type, const QMessageLogContext &context, const QString &text)
{
    if (type != QtDebugMsg && type != QtInfoMsg)
        warnings << text;
    defaultHandler(type, context, text);
}

// The warnings left when the expected connect warning (two lines from Qt) is taken out.
QStringList unexpectedWarnings(int *pathSettingsConnects = nullptr)
{
    QStringList unexpected;
    int connects = 0;
    for (int i = 0; i < warnings.size(); ++i) {
        if (warnings.at(i).contains(QLatin1String("No such slot MapView::setPathSettings(QVariant)"))) {
            ++connects;
            if (i + 1 < warnings.size() && warnings.at(i + 1).contains(QLatin1String("'SignalList_Obj'")))
                ++i;
            continue;
        }
        unexpected << warnings.at(i);
    }
    if (pathSettingsConnects)
        *pathSettingsConnects = connects;
    return unexpected;
}

} // namespace

class TestWindow : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<PainterPathRenderWidget> m_window;

    QSize expectedSize() const
    {
        const QRect available = QGuiApplication::primaryScreen()->availableGeometry();
        return QSize(available.width() - 16, available.height() - 39);
    }

private slots:
    void initTestCase()
    {
        // On top of the test library's own handler, which qExec has installed by now.
        defaultHandler = qInstallMessageHandler(recordWarnings);
        QVERIFY(QResource::registerResource(QStringLiteral(TOURLET_PROGRAM_DIR "/resource.rcc")));
        QDir::setCurrent(QStringLiteral(TOURLET_PROGRAM_DIR));
        m_window = std::make_unique<PainterPathRenderWidget>(1.0);
        setProgramFolder(QStringLiteral(TOURLET_PROGRAM_DIR));
        m_window->init();
        m_window->show();
        QVERIFY(QTest::qWaitForWindowExposed(m_window.get()));
        QTest::qWait(200);

        int connects = 0;
        const QStringList unexpected = unexpectedWarnings(&connects);
        QVERIFY2(unexpected.isEmpty(), qPrintable(unexpected.join(QLatin1String(" | "))));
        QCOMPARE(connects, 1);
        QVERIFY(m_window->mapView()->rootObject());
    }

    void cleanup()
    {
        const QStringList unexpected = unexpectedWarnings();
        QVERIFY2(unexpected.isEmpty(), qPrintable(unexpected.join(QLatin1String(" | "))));
    }

    void takesTheAvailableSizeAndIsFixed()
    {
        QCOMPARE(m_window->size(), expectedSize());
        QCOMPARE(m_window->minimumSize(), expectedSize());
        QCOMPARE(m_window->maximumSize(), expectedSize());
        QTRY_COMPARE(m_window->mapView()->container()->size(), expectedSize());
    }

    void exportProgressComesAndGoes()
    {
        auto &exportState = m_window->document().exportProperties();
        exportState.exportActive = true;
        m_window->showExportProgress();
        QPointer<ProgressView> progress = m_window->progressView();
        QVERIFY(progress);
        QVERIFY(progress->rootObject());
        QVERIFY(progress->container()->isVisible());
        QCOMPARE(progress->container()->size(), m_window->size());

        // The page's abort reaches the window.
        QSignalSpy aborted(m_window.get(), &PainterPathRenderWidget::exportAborted);
        QObject *signalList = progress->rootObject()->findChild<QObject *>(QStringLiteral("SignalList_Obj"));
        QVERIFY(signalList);
        QVERIFY(QMetaObject::invokeMethod(signalList, "abortProgress"));
        QCOMPARE(aborted.count(), 1);

        exportState.exportActive = false;
        m_window->showExportProgress();
        QCOMPARE(m_window->progressView(), nullptr);
        QTRY_VERIFY(progress.isNull());
    }

    void escapeLeavesFullScreen()
    {
        MapView *view = m_window->mapView();
        view->toggleFullScreen();
        QTRY_VERIFY(m_window->windowState() & Qt::WindowFullScreen);

        QSignalSpy leave(m_window.get(), &PainterPathRenderWidget::leaveFullscreen);
        QTest::keyClick(view, Qt::Key_Escape);
        QCOMPARE(leave.count(), 1);
        QTRY_VERIFY(!(m_window->windowState() & Qt::WindowFullScreen));
        QTRY_COMPARE(m_window->size(), expectedSize());
        QCOMPARE(m_window->maximumSize(), expectedSize());
    }

    void minimiseMakesTransparentAndActivationOpaque()
    {
        m_window->showMinimized();
        QCOMPARE(m_window->windowOpacity(), 0.0);
        QTRY_VERIFY(!m_window->isMinimized());
        QVERIFY(m_window->isVisible());

        QApplication::setActiveWindow(m_window.get());
        QEvent activation(QEvent::ActivationChange);
        QApplication::sendEvent(m_window.get(), &activation);
        QCOMPARE(m_window->windowOpacity(), 1.0);
    }

    // Last: a close that gets through ends the run's window.
    void closeIsIgnoredDuringAnExport()
    {
        QSignalSpy closeRequests(m_window.get(), &PainterPathRenderWidget::handleCloseApp);
        m_window->document().exportProperties().exportActive = true;
        QVERIFY(!m_window->close());
        QCOMPARE(closeRequests.count(), 0);
        QVERIFY(m_window->isVisible());

        // Without an export the map view decides; an unchanged project closes.
        m_window->document().exportProperties().exportActive = false;
        QVERIFY(!m_window->close());
        QCOMPARE(closeRequests.count(), 1);
        QTRY_VERIFY(!m_window->isVisible());
    }

    void cleanupTestCase()
    {
        m_window.reset();
    }
};

int main(int argc, char *argv[])
{
    // The run's settings and data stay in a folder of its own.
    QTemporaryDir home;
    qputenv("XDG_CONFIG_HOME", QFile::encodeName(home.filePath(QStringLiteral("config"))));
    qputenv("XDG_DATA_HOME", QFile::encodeName(home.filePath(QStringLiteral("data"))));
    if (qEnvironmentVariableIsEmpty("XDG_RUNTIME_DIR")) {
        QDir().mkpath(home.filePath(QStringLiteral("runtime")));
        QFile::setPermissions(home.filePath(QStringLiteral("runtime")), QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
        qputenv("XDG_RUNTIME_DIR", QFile::encodeName(home.filePath(QStringLiteral("runtime"))));
    }

    QApplication app(argc, argv);
    QApplication::setQuitOnLastWindowClosed(false);
    QQuickStyle::setStyle(QStringLiteral("Material"));
    TestWindow test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_window.moc"
