#include "CliCommand.h"

#include "export/EncoderLibrary.h"
#include "export/ExportWorker.h"
#include "export/VideoComment.h"
#include "platform/AtomicFileWriter.h"

#include <QDir>
#include <QElapsedTimer>
#include <QEventLoop>
#include <QFile>
#include <QFileInfo>
#include <QImage>
#include <QPainter>
#include <QRandomGenerator>
#include <QThread>

#include <cmath>

namespace {

constexpr double FrameRate = 30.0;

// Frames of a made-up flight: a textured landscape scrolling by, a marker on a wave
// and the frame number in segment digits (fonts need a GUI application).
class SyntheticFrames
{
public:
    explicit SyntheticFrames(QSize size)
        : m_size(size)
        , m_landscape(size.width() * 2, size.height(), QImage::Format_RGB32)
    {
        paintLandscape();
    }

    void draw(int index, QImage &frame) const
    {
        QPainter p(&frame);
        const int w = m_size.width();
        const int h = m_size.height();
        const int offset = (index * qMax(1, w / 200)) % w;
        p.drawImage(QPoint(0, 0), m_landscape, QRect(offset, 0, w, h));

        const double t = index / FrameRate;
        const QPointF marker(w * (0.5 + 0.35 * std::sin(t * 1.3)), h * (0.5 + 0.3 * std::sin(t * 2.1)));
        const double r = qMax(3.0, h / 30.0);
        p.setRenderHint(QPainter::Antialiasing);
        p.setPen(QPen(Qt::white, qMax(1.0, r / 4)));
        p.setBrush(QColor(220, 30, 40));
        p.drawEllipse(marker, r, r);
        p.setRenderHint(QPainter::Antialiasing, false);
        drawNumber(p, index);
    }

private:
    void paintLandscape()
    {
        QRandomGenerator random(7);
        QPainter p(&m_landscape);
        const int tile = qMax(8, m_size.height() / 12);
        for (int y = 0; y < m_landscape.height(); y += tile) {
            for (int x = 0; x < m_landscape.width(); x += tile) {
                const int g = 90 + int(random.bounded(80));
                p.fillRect(x, y, tile, tile, QColor(g - 40, g, g - 60));
            }
        }
        p.setRenderHint(QPainter::Antialiasing);
        for (int i = 0; i < 60; ++i) {
            p.setPen(QPen(QColor(240, 230, 200), 1 + random.bounded(4)));
            p.drawLine(QPointF(random.bounded(m_landscape.width()), random.bounded(m_landscape.height())),
                       QPointF(random.bounded(m_landscape.width()), random.bounded(m_landscape.height())));
        }
        p.setPen(Qt::NoPen);
        for (int i = 0; i < 400; ++i) {
            p.setBrush(QColor(40, 80 + int(random.bounded(60)), 150));
            const double r = 2 + random.bounded(tile / 2.0);
            p.drawEllipse(QPointF(random.bounded(m_landscape.width()), random.bounded(m_landscape.height())), r, r);
        }
    }

    void drawNumber(QPainter &p, int number) const
    {
        static const char *const segments[10] = {"abcdef", "bc", "abdeg", "abcdg", "bcfg",
                                                 "acdfg", "acdefg", "abc", "abcdefg", "abcdfg"};
        const QString digits = QString::number(number);
        const int s = qMax(2, m_size.height() / 120); // stroke
        const int dw = 4 * s, dh = 8 * s, gap = 2 * s;
        p.fillRect(0, 0, digits.size() * (dw + gap) + 2 * gap, dh + 2 * gap, Qt::black);
        for (int i = 0; i < digits.size(); ++i) {
            const int x = gap + i * (dw + gap), y = gap;
            for (const char *c = segments[digits.at(i).unicode() - '0']; *c; ++c) {
                QRect r;
                switch (*c) {
                case 'a': r = QRect(x, y, dw, s); break;
                case 'b': r = QRect(x + dw - s, y, s, dh / 2); break;
                case 'c': r = QRect(x + dw - s, y + dh / 2, s, dh / 2); break;
                case 'd': r = QRect(x, y + dh - s, dw, s); break;
                case 'e': r = QRect(x, y + dh / 2, s, dh / 2); break;
                case 'f': r = QRect(x, y, s, dh / 2); break;
                default: r = QRect(x, y + dh / 2 - s / 2, dw, s); break;
                }
                p.fillRect(r, Qt::yellow);
            }
        }
    }

    QSize m_size;
    QImage m_landscape;
};

// Plays the export controller's part: one frame in flight, the next drawn only when
// the worker has taken the previous one, then the finalisation.
class FrameFeeder : public QObject
{
    Q_OBJECT

public:
    FrameFeeder(int frames, QSize size)
        : m_frames(frames)
        , m_source(size)
        , m_frame(size, QImage::Format_RGB32)
    {
    }

public slots:
    // After a failure no more frames go out; the worker is finalized at once.
    void stop() { m_frames = m_sent; }

    void next()
    {
        if (m_sent == m_frames) {
            emit finalizeExport();
            return;
        }
        m_source.draw(m_sent, m_frame);
        emit exportFrameThreaded(m_sent++, &m_frame);
    }

signals:
    void exportFrameThreaded(int frameNumber, QImage *frame);
    void finalizeExport();

private:
    int m_frames;
    int m_sent = 0;
    SyntheticFrames m_source;
    QImage m_frame;
};

struct EncodeOptions
{
    int frames = 0;
    QSize size{1920, 1080};
    bool mp4 = true;
    QString comment;
    bool hasComment = false;
    QString output;
    bool raw = false;
};

bool parseOptions(QStringList args, EncodeOptions &o, QString &error)
{
    QString value;
    o.raw = cli::takeFlag(args, QStringLiteral("--raw"));
    if (!cli::takeOption(args, QStringLiteral("--frames"), value, &error)) {
        if (error.isEmpty())
            error = QStringLiteral("--frames N is required");
        return false;
    }
    bool ok = false;
    o.frames = value.toInt(&ok);
    if (!ok || o.frames < 1) {
        error = QStringLiteral("--frames needs a positive number, not '%1'").arg(value);
        return false;
    }
    if (cli::takeOption(args, QStringLiteral("--size"), value, &error)) {
        const QStringList parts = value.split(QLatin1Char('x'));
        bool okW = false, okH = false;
        const int w = parts.size() == 2 ? parts.at(0).toInt(&okW) : 0;
        const int h = parts.size() == 2 ? parts.at(1).toInt(&okH) : 0;
        if (!okW || !okH || w < 1 || h < 1 || w > 16384 || h > 16384) {
            error = QStringLiteral("--size needs WxH with sides from 1 to 16384, not '%1'").arg(value);
            return false;
        }
        o.size = QSize(w, h);
    }
    if (!error.isEmpty())
        return false;
    if (cli::takeOption(args, QStringLiteral("--format"), value, &error)) {
        if (value != QLatin1String("mp4") && value != QLatin1String("wmv")) {
            error = QStringLiteral("--format is mp4 or wmv, not '%1'").arg(value);
            return false;
        }
        o.mp4 = value == QLatin1String("mp4");
    }
    o.hasComment = cli::takeOption(args, QStringLiteral("--comment"), o.comment, &error);
    if (!cli::takeOption(args, QStringLiteral("-o"), o.output, &error) && error.isEmpty())
        error = QStringLiteral("-o FILE is required");
    if (!error.isEmpty())
        return false;
    if (!args.isEmpty()) {
        error = QStringLiteral("unexpected argument '%1'").arg(args.first());
        return false;
    }
    if (!o.raw && ExportWorker::exportSize(o.size.width()).isEmpty()) {
        error = QStringLiteral("--size: a film needs frames at least 16 pixels wide");
        return false;
    }
    return true;
}

// The synthetic frames as raw BGRX bytes, so that other encoders can be fed the same
// picture. A file is replaced only when all frames are in it.
int writeRawFrames(const EncodeOptions &o)
{
    SyntheticFrames source(o.size);
    QImage frame(o.size, QImage::Format_RGB32);
    const auto nextFrame = [&](int index) {
        source.draw(index, frame);
        return QByteArray::fromRawData(reinterpret_cast<const char *>(frame.constBits()), int(frame.sizeInBytes()));
    };
    if (o.output == QLatin1String("-")) {
        QFile out;
        out.open(stdout, QIODevice::WriteOnly);
        for (int i = 0; i < o.frames; ++i) {
            if (out.write(nextFrame(i)) != frame.sizeInBytes())
                return cli::fail(QStringLiteral("cannot write to stdout: %1").arg(out.errorString()));
        }
        return out.flush() ? 0 : cli::fail(QStringLiteral("cannot write to stdout: %1").arg(out.errorString()));
    }
    AtomicFileWriter out(o.output);
    if (!out.open())
        return cli::fail(QStringLiteral("cannot write %1: %2").arg(o.output, out.errorString()));
    for (int i = 0; i < o.frames && out.write(nextFrame(i)); ++i) {
    }
    if (!out.commit())
        return cli::fail(QStringLiteral("cannot write %1, nothing was changed: %2").arg(o.output, out.errorString()));
    return 0;
}

int encode(const EncodeOptions &o)
{
    // The encoder touches the target only to put a complete film there, so nothing
    // on disk needs undoing when it fails.
    const QString target = QFileInfo(o.output).absoluteFilePath();
    if (!QFileInfo::exists(EncoderLibrary::filePath()))
        return cli::fail(QStringLiteral("encoder library not found: %1").arg(EncoderLibrary::filePath()));

    QElapsedTimer clock;
    clock.start();
    auto *worker = new ExportWorker;
    if (!worker->start(o.size.width(), o.size.height(), FrameRate, target, o.mp4)) {
        const QString reason = worker->errorString();
        delete worker;
        return cli::fail(reason);
    }

    QThread thread;
    worker->moveToThread(&thread);
    thread.start();
    FrameFeeder feeder(o.frames, o.size);
    QEventLoop loop;
    QObject::connect(&feeder, &FrameFeeder::exportFrameThreaded, worker, &ExportWorker::exportNextFrame);
    QObject::connect(&feeder, &FrameFeeder::finalizeExport, worker, &ExportWorker::finalizeExport);
    QObject::connect(worker, &ExportWorker::frameExportFinished, &feeder, &FrameFeeder::next);
    QObject::connect(worker, &ExportWorker::finalized, &loop, &QEventLoop::quit);
    QObject::connect(worker, &ExportWorker::exportFailed, &feeder, &FrameFeeder::stop);
    feeder.next();
    loop.exec();
    thread.quit();
    thread.wait();
    const QString failure = worker->errorString();
    delete worker;
    if (!failure.isEmpty())
        return cli::fail(failure);

    if (o.hasComment && !VideoComment::write(target, o.comment))
        return cli::fail(QStringLiteral("the film %1 is complete, but its comment could not be written").arg(target));
    const double seconds = clock.nsecsElapsed() / 1e9;
    const QSize film = ExportWorker::exportSize(o.size.width());
    cli::printJson({{QStringLiteral("frames"), o.frames},
                    {QStringLiteral("width"), film.width()},
                    {QStringLiteral("height"), film.height()},
                    {QStringLiteral("seconds"), seconds},
                    {QStringLiteral("framesPerSecond"), seconds > 0 ? o.frames / seconds : 0.0}});
    return 0;
}

} // namespace

CliCommand encodeCommand()
{
    return {"encode",
            "encode --frames N [--size WxH] [--format mp4|wmv] [--comment TEXT] [--raw] -o FILE\n"
            "      encodes N synthetic frames through the export worker; --raw writes the frames\n"
            "      as raw BGRX bytes instead (FILE '-' for stdout)",
            [](const QStringList &args) {
                EncodeOptions options;
                QString error;
                if (!parseOptions(args, options, error))
                    return cli::fail(error);
                return options.raw ? writeRawFrames(options) : encode(options);
            }};
}

#include "EncodeCommand.moc"
