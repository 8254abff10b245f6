#include "app/gui/ProgressView.h"

#include "project/PainterPathRenderer_Controller.h"

#include <QQmlContext>
#include <QQuickItem>
#include <QWidget>

ProgressView::ProgressView(PainterPathRenderer_Controller *document) : m_document(document)
{
}

ProgressView::~ProgressView()
{
    // The container would otherwise stay behind in the window, empty; by the time it
    // goes, it no longer refers to this view.
    if (m_container)
        m_container->deleteLater();
}

void ProgressView::init(QWidget *window)
{
    m_container = QWidget::createWindowContainer(this, window);
    m_windowSize = window->size();
    m_container->setMinimumSize(m_windowSize);
    m_container->setMaximumSize(m_windowSize);
    m_container->move(0, 0);
    setResizeMode(QQuickView::SizeRootObjectToView);

    rootContext()->setContextProperty(QStringLiteral("host"), this);
    setSource(QUrl(QStringLiteral("qrc:/Qml/ProgressView/ProgressView.qml")));
    m_container->hide();

    QQuickItem *root = rootObject();
    QObject *signals_ = root ? root->findChild<QObject *>(QStringLiteral("SignalList_Obj")) : nullptr;
    if (signals_) {
        connect(signals_, SIGNAL(abortProgress()), window, SLOT(abortProgress()));
        connect(signals_, SIGNAL(gotoBackground()), window, SLOT(gotoBackground()));
    }
}

double ProgressView::exportPosition() const
{
    return m_document ? m_document->exportProperties().position() : 0.0;
}

double ProgressView::scalingFactor() const
{
    return m_document ? m_document->scale() : 1.0;
}

void ProgressView::update()
{
    emit exportPositionChanged();
}

void ProgressView::setViewVisible(bool state)
{
    if (m_container)
        m_container->setVisible(state);
}

void ProgressView::resizeHost(int width, int height)
{
    m_windowSize = QSize(width, height);
    if (m_container) {
        m_container->setMinimumSize(m_windowSize);
        m_container->setMaximumSize(m_windowSize);
        m_container->move(0, 0);
    }
    emit windowSizeChanged();
}
