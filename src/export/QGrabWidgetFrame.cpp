#include "export/QGrabWidgetFrame.h"

#include "app/Trace.h"

QGrabWidgetFrame::QGrabWidgetFrame(QObject *parent)
    : QObject(parent)
{
}

void QGrabWidgetFrame::start(const QString &exportFileName)
{
    m_base = exportFileName;
    m_started = QTime::currentTime();
    m_count = 0;
}

QString QGrabWidgetFrame::frameFileName(int index) const
{
    const QString time = QStringLiteral("%1%2%3").arg(m_started.hour()).arg(m_started.minute()).arg(m_started.second());
    return QStringLiteral("%1_frame_%2_%3.png").arg(m_base, time).arg(index, 8, 10, QLatin1Char('0'));
}

void QGrabWidgetFrame::exportNextFrame(int frameNumber, QImage *frame)
{
    const QString name = frameFileName(m_count++);
    logTrace(0, "save %s started", name);
    if (!frame || !frame->save(name, "PNG"))
        logTrace(3, "QGrabWidgetFrame::exportNextFrame: frame %d not saved to %s", frameNumber, name);
    emit frameExportFinished();
}

void QGrabWidgetFrame::finalizeExport()
{
    emit finalized();
}
