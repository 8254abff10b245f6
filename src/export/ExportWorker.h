#pragma once

#include <QImage>
#include <QMetaType>
#include <QObject>
#include <QSize>
#include <QString>

struct VidcoreExport;

// Hands frames to the encoder library. Started on the main thread, then moved to an
// export thread of its own; one frame is in flight at a time.
class ExportWorker : public QObject
{
    Q_OBJECT

public:
    explicit ExportWorker(QObject *parent = nullptr);
    ~ExportWorker() override;

    // Loads the library afresh and opens the film. The size is 16k x 9k derived from
    // width alone; height isn't used. False if an encoder exists already or can't open.
    bool start(int width, int height, double frameRate, const QString &fileName, bool isMp4);

    // File extension of the format without a dot, empty without library. Loads the
    // library and keeps it; not for use while an export runs.
    static QString defaultExtension(bool isMp4);

    // The film size for a frame width: width / 16 rounded down to an even k, 16k x 9k.
    static QSize exportSize(int width);

    bool hasEncoder() const { return m_export != nullptr; }

    // Whether the film of the last start is lost: it could not be opened, a frame or
    // its end could not be written (a full disk, a size limit). The file named at the
    // start is then untouched. Cleared by the next start.
    bool hasFailed() const { return !m_error.isEmpty(); }
    QString errorString() const { return m_error; }

public slots:
    void exportNextFrame(int frameNumber, QImage *frame);
    void finalizeExport();

signals:
    void frameExportFinished();
    void finalized();
    // Once per export, as soon as the film is known to be lost; the export should
    // stop. finalized() still follows finalizeExport().
    void exportFailed(const QString &reason);

private:
    void releaseLibrary();
    void fail(const QString &reason);
    QString encoderError() const;

    VidcoreExport *m_export = nullptr;
    QString m_fileName;
    QString m_error;
};

Q_DECLARE_METATYPE(QImage *)
