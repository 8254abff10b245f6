#include "app/gui/PainterPathRenderWidget.h"

#include "app/ProgramFolder.h"
#include "app/SplashText.h"
#include "app/Trace.h"
#include "app/gui/ProgressView.h"
#include "app/gui/StartupSplash.h"
#include "mapview/MapView.h"

#include <QApplication>
#include <QCloseEvent>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QScreen>
#include <QVersionNumber>
#include <QWindow>

PainterPathRenderWidget::PainterPathRenderWidget(double scale) : QWidget(nullptr)
{
    setProgramFolder(QCoreApplication::applicationDirPath());
    m_document.setProgramVersion(programVersion());
    m_document.setScale(scale);
    qApp->installEventFilter(this);
}

PainterPathRenderWidget::~PainterPathRenderWidget()
{
    qApp->removeEventFilter(this);
}

QString PainterPathRenderWidget::programVersion()
{
    QVector<int> fields = QVersionNumber::fromString(QStringLiteral(TOURLET_VERSION)).segments();
    fields.resize(4);
    QStringList parts;
    for (int field : fields)
        parts << QString::number(field & 0xFFFF);
    return parts.join(QLatin1Char('.'));
}

void PainterPathRenderWidget::init()
{
    showSplashMessage(SplashMessage::LookingForUpdates);
    requestUpdate();
    m_minimumSize = QSize(600, 400);

    m_mapView = new MapView(&m_document);
    m_mapView->init(this, false);
    setMinimumSize(m_minimumSize);

    connect(this, &PainterPathRenderWidget::resizeHost, m_mapView, &MapView::resizeHost);
    connect(this, &PainterPathRenderWidget::handleCloseApp, m_mapView, &MapView::handleCloseApp);
    connect(m_mapView, &MapView::closeApp, this, &PainterPathRenderWidget::closeApp);
    connect(m_mapView, &MapView::requestUpdate, this, &PainterPathRenderWidget::requestUpdate);
    connect(m_mapView, &MapView::setFullScreen, this, &PainterPathRenderWidget::setFullScreen);
    connect(this, &PainterPathRenderWidget::leaveFullscreen, m_mapView, &MapView::leaveFullscreen);

    if (const QScreen *screen = QGuiApplication::primaryScreen()) {
        m_width = screen->availableGeometry().width() - m_frameWidth;
        m_height = screen->availableGeometry().height() - m_frameHeight;
    }
    applyFixedSize();

    auto *layout = new QHBoxLayout;
    layout->setSpacing(0);
    layout->setContentsMargins(0, 0, 0, 0);
    setLayout(layout);

    m_mapView->setMapVisible(true, true);
    setWindowFlags(windowFlags() & ~Qt::WindowSystemMenuHint);
}

void PainterPathRenderWidget::applyFixedSize()
{
    m_minimumSize = QSize(m_width, m_height);
    m_maximumSize = m_minimumSize;
    resize(m_minimumSize);
    setMinimumSize(m_minimumSize);
    setMaximumSize(m_maximumSize);
}

void PainterPathRenderWidget::showExportProgress()
{
    if (m_progressView) {
        if (pos() == QPoint(-width(), -height()))
            move(0, 0);
        disconnect(this, &PainterPathRenderWidget::setExportProgressVisible, m_progressView,
                   &ProgressView::setViewVisible);
        disconnect(m_mapView, nullptr, m_progressView, nullptr);
        m_progressView->deleteLater();
        m_progressView = nullptr;
    } else {
        m_progressView = new ProgressView(&m_document);
        m_progressView->init(this);
        connect(this, &PainterPathRenderWidget::setExportProgressVisible, m_progressView,
                &ProgressView::setViewVisible);
        // The map stage reports each exported frame once the exporter is part of it.
        if (m_mapView && m_mapView->metaObject()->indexOfSignal("updateExportProgress()") >= 0)
            connect(m_mapView, SIGNAL(updateExportProgress()), m_progressView, SLOT(update()));
    }
    emit setExportProgressVisible(m_document.exportProperties().exportActive);
}

void PainterPathRenderWidget::abortProgress()
{
    emit exportAborted();
}

// Instead of minimising: behind the other windows and transparent, the window keeps
// rendering, which an export needs. Activating it makes it opaque again.
void PainterPathRenderWidget::gotoBackground()
{
    lower();
    setWindowOpacity(0.0);
}

void PainterPathRenderWidget::closeApp()
{
    hide();
    QCoreApplication::quit();
}

void PainterPathRenderWidget::blockForUpdate()
{
}

void PainterPathRenderWidget::updateFinished(bool quit)
{
    if (quit)
        QCoreApplication::quit();
}

void PainterPathRenderWidget::requestUpdate()
{
    logTrace(0, QStringLiteral("PainterPathRenderWidget::requestUpdate - this build has no update client"));
}

void PainterPathRenderWidget::setFullScreen(bool fullScreen)
{
    // Window managers refuse full screen to a window of fixed size.
    if (fullScreen) {
        setMinimumSize(0, 0);
        setMaximumSize(QWIDGETSIZE_MAX, QWIDGETSIZE_MAX);
        window()->showFullScreen();
    } else {
        window()->showNormal();
        applyFixedSize();
    }
}

void PainterPathRenderWidget::keyPressEvent(QKeyEvent *)
{
}

void PainterPathRenderWidget::keyReleaseEvent(QKeyEvent *)
{
}

void PainterPathRenderWidget::resizeEvent(QResizeEvent *)
{
    emit resizeHost(width(), height());
}

void PainterPathRenderWidget::closeEvent(QCloseEvent *event)
{
    event->ignore();
    if (!m_document.exportProperties().exportActive)
        emit handleCloseApp();
}

void PainterPathRenderWidget::actionEvent(QActionEvent *)
{
}

void PainterPathRenderWidget::changeEvent(QEvent *event)
{
    if (event->type() == QEvent::ActivationChange && isActiveWindow()) {
        setWindowOpacity(1.0);
    } else if (event->type() == QEvent::WindowStateChange && (windowState() & Qt::WindowMinimized)) {
        if (windowOpacity() == 0.0)
            setWindowOpacity(1.0);
        else
            gotoBackground();
        // A minimised window stops rendering; it stays mapped instead.
        QMetaObject::invokeMethod(
            this, [this] { setWindowState(windowState() & ~Qt::WindowMinimized); }, Qt::QueuedConnection);
    }
    QWidget::changeEvent(event);
}

bool PainterPathRenderWidget::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() == QEvent::KeyPress && event->spontaneous() && ownsWindow(watched)
        && static_cast<QKeyEvent *>(event)->key() == Qt::Key_Escape)
        emit leaveFullscreen();
    return false;
}

bool PainterPathRenderWidget::ownsWindow(const QObject *object) const
{
    if (!object || !object->isWindowType())
        return false;
    const QWindow *own = windowHandle();
    for (auto *window = static_cast<const QWindow *>(object); window; window = window->parent()) {
        if (window == own)
            return true;
    }
    return false;
}
