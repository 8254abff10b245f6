#pragma once

#include <QDateTime>
#include <QImage>
#include <QObject>
#include <QString>

// Writes each frame of an export to a PNG instead of encoding it, for diagnosis.
// Drop-in for ExportWorker on the export thread: same slots and signals.
class QGrabWidgetFrame : public QObject
{
    Q_OBJECT

public:
    explicit QGrabWidgetFrame(QObject *parent = nullptr);

    // Keeps the export file name as the base of the picture names, and the time.
    void start(const QString &exportFileName);

    // "%1_frame_%2_%3.png": base, hour-minute-second of the start, running number.
    QString frameFileName(int index) const;

public slots:
    void exportNextFrame(int frameNumber, QImage *frame);
    void finalizeExport();

signals:
    void frameExportFinished();
    void finalized();

private:
    QString m_base;
    QTime m_started;
    int m_count = 0;
};
