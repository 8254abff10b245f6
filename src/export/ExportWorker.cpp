#include "export/ExportWorker.h"

#include "app/Trace.h"
#include "export/EncoderLibrary.h"
#include "export/VidcoreInterface.h"

#include <QThread>

#include <string>

namespace {

constexpr int32_t ExportBitRate = 40000000;

} // namespace

ExportWorker::ExportWorker(QObject *parent)
    : QObject(parent)
{
    qRegisterMetaType<QImage *>("QImage*");
}

ExportWorker::~ExportWorker()
{
    if (m_export)
        releaseLibrary();
}

QSize ExportWorker::exportSize(int width)
{
    int k = width > 0 ? int(width * 0.0625) : 0;
    if (k % 2)
        ++k;
    return QSize(16 * k, 9 * k);
}

bool ExportWorker::start(int width, int height, double frameRate, const QString &fileName, bool isMp4)
{
    Q_UNUSED(height) // the picture is always 16:9, set by the width
    if (m_export) {
        logTrace(3, "ExportWorker::start: an encoder exists already");
        return false;
    }
    m_error.clear();
    m_fileName = fileName;
    if (EncoderLibrary::owner()) {
        logTrace(3, "ExportWorker::start: the encoder library is in use by another export");
        m_error = QStringLiteral("another film is being made");
        return false;
    }
    // A fresh load each time: the encoder keeps global state.
    EncoderLibrary::release();
    if (!EncoderLibrary::load()) {
        m_error = QStringLiteral("the encoder library %1 can't be loaded").arg(EncoderLibrary::filePath());
        return false;
    }
    auto create = reinterpret_cast<VidcoreCreateExport>(EncoderLibrary::resolve("CreateExport"));
    if (!create) {
        logTrace(3, "ExportWorker::start: no entry CreateExport in %s", EncoderLibrary::filePath());
        m_error = QStringLiteral("the encoder library %1 is damaged").arg(EncoderLibrary::filePath());
        return false;
    }
    m_export = create(isMp4 ? VidcoreFormatMp4 : VidcoreFormatWmv);
    if (!m_export) {
        logTrace(3, "ExportWorker::start: CreateExport gave no encoder");
        m_error = QStringLiteral("the encoder library made no encoder");
        return false;
    }
    EncoderLibrary::setOwner(this);
    logTrace(0, "ExportWorker::start: thread %s",
             QString::number(reinterpret_cast<quintptr>(QThread::currentThreadId()), 16));

    VidcoreParameters record;
    m_export->operations->getParameters(m_export, &record);
    const QSize size = exportSize(width);
    record.sourceWidth = uint32_t(size.width());
    record.sourceHeight = uint32_t(size.height());
    record.sourceFrameRate = frameRate;
    record.targetWidth = uint32_t(size.width());
    record.targetHeight = uint32_t(size.height());
    record.targetFrameRate = frameRate;
    record.bitRate = ExportBitRate;
    const std::wstring name = fileName.toStdWString();
    const bool ready = m_export->operations->open(m_export, name.c_str(), &record);
    if (!ready) {
        logTrace(3, "ExportWorker::start: the encoder can't open %s at %dx%d", fileName, size.width(), size.height());
        m_error = QStringLiteral("the film %1 can't be made at %2 x %3: %4")
                      .arg(fileName)
                      .arg(size.width())
                      .arg(size.height())
                      .arg(encoderError());
    }
    return ready;
}

void ExportWorker::exportNextFrame(int frameNumber, QImage *frame)
{
    if (!m_export || !frame || frame->isNull()) {
        logTrace(3, "ExportWorker::exportNextFrame: frame %d skipped, no encoder or no picture", frameNumber);
        emit frameExportFinished();
        return;
    }
    VidcoreParameters record;
    m_export->operations->getParameters(m_export, &record);
    logTrace(0, "orig frame: %d, %d, %d", frame->width(), frame->height(), qint64(frame->sizeInBytes()));

    {
        // At the target size already, this is a shallow copy of the caller's frame. It must
        // be gone before frameExportFinished, or the next paint into the frame would detach it.
        QImage picture = frame->scaled(int(record.targetWidth), int(record.targetHeight), Qt::IgnoreAspectRatio,
                                       Qt::SmoothTransformation);
        if (picture.format() != QImage::Format_RGB32)
            picture = picture.convertToFormat(QImage::Format_RGB32);
        logTrace(0, "export frame: %d, %d, %d", picture.width(), picture.height(), qint64(picture.sizeInBytes()));

        if (!m_export->operations->writeFrame(m_export, picture.constBits(), uint32_t(picture.sizeInBytes()),
                                              VidcoreNextFrame))
            fail(QStringLiteral("the film %1 could not be written: %2").arg(m_fileName, encoderError()));
    }
    logTrace(0, "ExportWorker::exportNextFrame:end %d", frameNumber);
    emit frameExportFinished();
}

void ExportWorker::finalizeExport()
{
    if (m_export) {
        if (!m_export->operations->finish(m_export))
            fail(QStringLiteral("the film %1 could not be completed: %2").arg(m_fileName, encoderError()));
        m_export->operations->close(m_export);
    } else {
        logTrace(3, "QExporter::finishExport: m_export doesn't exist");
    }
    releaseLibrary();
    emit finalized();
}

QString ExportWorker::defaultExtension(bool isMp4)
{
    if (!EncoderLibrary::load())
        return QString();
    auto extension = reinterpret_cast<VidcoreDefaultExtension>(EncoderLibrary::resolve("DefaultExtension"));
    if (!extension)
        return QString();
    const wchar_t *text = extension(isMp4 ? VidcoreFormatMp4 : VidcoreFormatWmv);
    return text ? QString::fromWCharArray(text) : QString();
}

void ExportWorker::fail(const QString &reason)
{
    if (hasFailed())
        return;
    m_error = reason;
    logTrace(3, "ExportWorker: %s", reason);
    emit exportFailed(reason);
}

QString ExportWorker::encoderError() const
{
    const char *text = m_export && m_export->operations->errorText ? m_export->operations->errorText(m_export) : nullptr;
    return text && *text ? QString::fromUtf8(text) : QStringLiteral("the encoder gave no reason");
}

void ExportWorker::releaseLibrary()
{
    // Another worker's encoder isn't ours to destroy.
    if (!EncoderLibrary::owner() || EncoderLibrary::owner() == this)
        EncoderLibrary::release();
    m_export = nullptr;
}
