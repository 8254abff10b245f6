#include "CliRun.h"
#include "TestFiles.h"
#include "export/EncoderLibrary.h"
#include "export/ExportWorker.h"
#include "export/QGrabWidgetFrame.h"
#include "export/VideoComment.h"
#include "export/VidcoreInterface.h"

#include <QDir>
#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QPainter>
#include <QRandomGenerator>
#include <QProcess>
#include <QRegularExpression>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QTest>
#include <QThread>

#include <cmath>
#include <csignal>
#include <functional>
#include <string>

#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

namespace {

using FramePainter = std::function<void(int index, QImage &frame)>;

// Runs a tool to its end; the exit code, or -1 if it didn't run.
int runTool(const QString &program, const QStringList &args, QByteArray *out = nullptr, QByteArray *err = nullptr)
{
    QProcess p;
    p.start(program, args);
    if (!p.waitForFinished(60000) || p.exitStatus() != QProcess::NormalExit)
        return -1;
    if (out)
        *out = p.readAllStandardOutput();
    if (err)
        *err = p.readAllStandardError();
    return p.exitCode();
}

struct Probe
{
    QString formatName, codec, frameRate, comment;
    int width = 0, height = 0, frames = -1;
};

Probe probe(const QString &file)
{
    QByteArray out;
    Probe r;
    if (runTool(QStringLiteral("ffprobe"),
                {QStringLiteral("-v"), QStringLiteral("error"), QStringLiteral("-count_frames"),
                 QStringLiteral("-show_entries"),
                 QStringLiteral("stream=codec_name,width,height,r_frame_rate,nb_read_frames:format=format_name:"
                                "format_tags=comment"),
                 QStringLiteral("-of"), QStringLiteral("json"), file},
                &out)
        != 0)
        return r;
    const QJsonObject root = QJsonDocument::fromJson(out).object();
    const QJsonObject stream = root.value(QStringLiteral("streams")).toArray().first().toObject();
    const QJsonObject format = root.value(QStringLiteral("format")).toObject();
    r.formatName = format.value(QStringLiteral("format_name")).toString();
    r.comment = format.value(QStringLiteral("tags")).toObject().value(QStringLiteral("comment")).toString();
    r.codec = stream.value(QStringLiteral("codec_name")).toString();
    r.frameRate = stream.value(QStringLiteral("r_frame_rate")).toString();
    r.width = stream.value(QStringLiteral("width")).toInt();
    r.height = stream.value(QStringLiteral("height")).toInt();
    r.frames = stream.value(QStringLiteral("nb_read_frames")).toString().toInt();
    return r;
}

// Every frame of a film decoded to RGB.
QVector<QImage> decode(const QString &file, QSize size)
{
    QByteArray out;
    QVector<QImage> frames;
    if (runTool(QStringLiteral("ffmpeg"),
                {QStringLiteral("-v"), QStringLiteral("error"), QStringLiteral("-i"), file, QStringLiteral("-f"),
                 QStringLiteral("rawvideo"), QStringLiteral("-pix_fmt"), QStringLiteral("rgb24"), QStringLiteral("-")},
                &out)
        != 0)
        return frames;
    const int bytes = size.width() * size.height() * 3;
    for (int at = 0; at + bytes <= out.size(); at += bytes)
        frames.append(QImage(reinterpret_cast<const uchar *>(out.constData() + at), size.width(), size.height(),
                             size.width() * 3, QImage::Format_RGB888)
                          .copy());
    return frames;
}

// Names of the top-level boxes of an MP4 file, in file order.
QStringList topLevelBoxes(const QString &file)
{
    QStringList names;
    QFile f(file);
    if (!f.open(QIODevice::ReadOnly))
        return names;
    while (!f.atEnd()) {
        const qint64 start = f.pos();
        const QByteArray head = f.read(8);
        if (head.size() < 8)
            break;
        quint64 size = 0;
        for (int i = 0; i < 4; ++i)
            size = (size << 8) | uchar(head[i]);
        names << QString::fromLatin1(head.mid(4, 4));
        if (size == 1) { // 64-bit size follows
            size = 0;
            for (char c : f.read(8))
                size = (size << 8) | uchar(c);
        }
        if (size < 8 || !f.seek(start + qint64(size)))
            break;
    }
    return names;
}

bool near(QRgb a, QColor b, int tolerance)
{
    return qAbs(qRed(a) - b.red()) <= tolerance && qAbs(qGreen(a) - b.green()) <= tolerance
        && qAbs(qBlue(a) - b.blue()) <= tolerance;
}

QColor frameColour(int index)
{
    return QColor(20 + index * 4, 230 - index * 4, 128);
}

} // namespace

// Plays the export controller: a frame goes out only when the previous one is done.
class Feeder : public QObject
{
    Q_OBJECT

public:
    Feeder(int frames, QSize size, FramePainter painter)
        : m_frames(frames)
        , m_frame(size, QImage::Format_RGB32)
        , m_painter(std::move(painter))
    {
    }

public slots:
    void next()
    {
        if (m_sent == m_frames) {
            emit finalizeExport();
            return;
        }
        m_painter(m_sent, m_frame);
        emit exportFrameThreaded(m_sent++, &m_frame);
    }

signals:
    void exportFrameThreaded(int frameNumber, QImage *frame);
    void finalizeExport();

private:
    int m_frames;
    int m_sent = 0;
    QImage m_frame;
    FramePainter m_painter;
};

class TestExport : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;
    QString path(const QString &name) const { return m_dir.filePath(name); }

    // A whole export on a worker thread; false if the worker refused to start or hung.
    static bool exportFilm(const QString &file, bool mp4, int frames, QSize frameSize, const FramePainter &painter)
    {
        auto *worker = new ExportWorker;
        if (!worker->start(frameSize.width(), frameSize.height(), 30.0, file, mp4)) {
            delete worker;
            return false;
        }
        QThread thread;
        worker->moveToThread(&thread);
        thread.start(QThread::InheritPriority);
        Feeder feeder(frames, frameSize, painter);
        connect(&feeder, &Feeder::exportFrameThreaded, worker, &ExportWorker::exportNextFrame);
        connect(&feeder, &Feeder::finalizeExport, worker, &ExportWorker::finalizeExport);
        connect(worker, &ExportWorker::frameExportFinished, &feeder, &Feeder::next);
        QSignalSpy finalized(worker, &ExportWorker::finalized);
        feeder.next();
        const bool done = finalized.wait(60000);
        thread.quit();
        thread.wait();
        delete worker;
        return done && finalized.count() == 1;
    }

    static void fill(int index, QImage &frame) { frame.fill(frameColour(index)); }

private slots:
    void initTestCase()
    {
        QVERIFY(m_dir.isValid());
        EncoderLibrary::setFolder(QStringLiteral(TOURLET_BIN_DIR));
        QVERIFY2(QFile::exists(EncoderLibrary::filePath()), qPrintable(EncoderLibrary::filePath()));
    }

    void sizeFollowsWidthAtSixteenByNine()
    {
        QCOMPARE(ExportWorker::exportSize(1920), QSize(1920, 1080));
        QCOMPARE(ExportWorker::exportSize(3840), QSize(3840, 2160));
        QCOMPARE(ExportWorker::exportSize(1000), QSize(992, 558));
        QCOMPARE(ExportWorker::exportSize(1279), QSize(1280, 720)); // 79 is odd: rounds up to 80
        QCOMPARE(ExportWorker::exportSize(16), QSize(32, 18));
        QVERIFY(ExportWorker::exportSize(15).isEmpty());
        QVERIFY(ExportWorker::exportSize(-5).isEmpty());

        // The height argument plays no part; the encoder gets the derived size.
        const QString file = path(QStringLiteral("größe 1000.mp4"));
        QVERIFY(exportFilm(file, true, 3, QSize(1000, 123), fill));
        QVERIFY(QFile::exists(file));
        const Probe p = probe(file);
        QCOMPARE(p.width, 992);
        QCOMPARE(p.height, 558);
        QCOMPARE(p.frames, 3);
    }

    void film_data()
    {
        QTest::addColumn<bool>("mp4");
        QTest::addColumn<QString>("codec");
        QTest::addColumn<QString>("container");
        QTest::newRow("mp4") << true << "h264" << "mp4";
        QTest::newRow("wmv") << false << "wmv2" << "asf";
    }

    void film()
    {
        QFETCH(bool, mp4);
        QFETCH(QString, codec);
        QFETCH(QString, container);
        const int frames = 45;
        const QString file = path(QStringLiteral("film.") + ExportWorker::defaultExtension(mp4));
        QVERIFY(exportFilm(file, mp4, frames, QSize(320, 180), fill));

        Probe p = probe(file);
        QCOMPARE(p.codec, codec);
        QVERIFY2(p.formatName.contains(container), qPrintable(p.formatName));
        QCOMPARE(p.width, 320);
        QCOMPARE(p.height, 180);
        QCOMPARE(p.frameRate, QStringLiteral("30/1"));
        QCOMPARE(p.frames, frames);
        QVERIFY(p.comment.isEmpty());
        if (mp4) {
            const QStringList boxes = topLevelBoxes(file);
            QVERIFY2(boxes.indexOf(QStringLiteral("moov")) >= 0
                         && boxes.indexOf(QStringLiteral("moov")) < boxes.indexOf(QStringLiteral("mdat")),
                     qPrintable(boxes.join(',')));
        }

        // Every frame arrives once and in order.
        const QVector<QImage> pictures = decode(file, QSize(320, 180));
        QCOMPARE(pictures.size(), frames);
        for (int i = 0; i < frames; ++i)
            QVERIFY2(near(pictures.at(i).pixel(160, 90), frameColour(i), 10),
                     qPrintable(QStringLiteral("frame %1 is %2").arg(i).arg(pictures.at(i).pixel(160, 90), 0, 16)));

        // The comment goes into the container; the pictures stay as they were.
        const QString text = VideoComment::text(QStringLiteral("1234"));
        QCOMPARE(text, QStringLiteral("ZkTourlet|Frame=1234"));
        QVERIFY(VideoComment::write(file, text));
        p = probe(file);
        QCOMPARE(p.comment, text);
        QCOMPARE(p.codec, codec);
        QCOMPARE(p.frames, frames);
        QCOMPARE(p.frameRate, QStringLiteral("30/1"));
        if (mp4)
            QVERIFY(topLevelBoxes(file).indexOf(QStringLiteral("moov")) < topLevelBoxes(file).indexOf(QStringLiteral("mdat")));
        QCOMPARE(QDir(m_dir.path()).entryList({QFileInfo(file).fileName() + QStringLiteral(".*")}), QStringList());
        // A second comment replaces the first.
        QVERIFY(VideoComment::write(file, VideoComment::text(QStringLiteral("7"))));
        QCOMPARE(probe(file).comment, QStringLiteral("ZkTourlet|Frame=7"));
        QCOMPARE(decode(file, QSize(320, 180)).size(), frames);
    }

    void otherAspectIsStretchedToFill()
    {
        // 4:3 frame: a green band over the top quarter, red left half, blue right half.
        const FramePainter paint = [](int, QImage &frame) {
            QPainter p(&frame);
            p.fillRect(0, 0, 200, 300, QColor(220, 20, 20));
            p.fillRect(200, 0, 200, 300, QColor(20, 20, 220));
            p.fillRect(0, 0, 400, 75, QColor(20, 200, 20));
        };
        const QString file = path(QStringLiteral("stretch.mp4"));
        QVERIFY(exportFilm(file, true, 2, QSize(400, 300), paint));
        const QVector<QImage> pictures = decode(file, QSize(416, 234));
        QCOMPARE(pictures.size(), 2);
        const QImage &f = pictures.first();
        const QColor red(220, 20, 20), blue(20, 20, 220), green(20, 200, 20);
        // Corners and edges are covered: no bars, no cut-off band.
        QVERIFY(near(f.pixel(3, 230), red, 30));
        QVERIFY(near(f.pixel(412, 230), blue, 30));
        QVERIFY(near(f.pixel(3, 3), green, 30));
        QVERIFY(near(f.pixel(412, 3), green, 30));
        // The band keeps its quarter of the height, the halves their half of the width.
        QVERIFY(near(f.pixel(100, 52), green, 30));
        QVERIFY(near(f.pixel(100, 64), red, 30));
        QVERIFY(near(f.pixel(200, 150), red, 30));
        QVERIFY(near(f.pixel(216, 150), blue, 30));
    }

    void onlyOneExportAtATime()
    {
        const QString file = path(QStringLiteral("first.mp4"));
        ExportWorker first;
        QVERIFY(first.start(320, 180, 30.0, file, true));
        QVERIFY(!first.start(320, 180, 30.0, path(QStringLiteral("again.mp4")), true));
        ExportWorker second;
        QVERIFY(!second.start(320, 180, 30.0, path(QStringLiteral("second.mp4")), false));
        QVERIFY(!QFile::exists(path(QStringLiteral("again.mp4"))));
        QVERIFY(!QFile::exists(path(QStringLiteral("second.mp4"))));
        // The refused one leaves the running encoder alone.
        second.finalizeExport();
        QVERIFY(first.hasEncoder());

        QImage frame(320, 180, QImage::Format_RGB32);
        // When the frame is handed back the worker holds no copy of it, so that the next
        // picture is painted in place instead of into a fresh buffer.
        int sharedOnReturn = 0;
        connect(&first, &ExportWorker::frameExportFinished, this, [&] { sharedOnReturn += frame.isDetached() ? 0 : 1; });
        for (int i = 0; i < 5; ++i) {
            fill(i, frame);
            first.exportNextFrame(i, &frame);
        }
        QCOMPARE(sharedOnReturn, 0);
        QSignalSpy finalized(&first, &ExportWorker::finalized);
        first.finalizeExport();
        QCOMPARE(finalized.count(), 1);
        QVERIFY(!first.hasEncoder());
        QVERIFY(!EncoderLibrary::isLoaded());
        QCOMPARE(probe(file).frames, 5);

        // Once finalized, the same worker may start again.
        QVERIFY(first.start(320, 180, 30.0, path(QStringLiteral("again.mp4")), false));
        first.finalizeExport();
        QCOMPARE(probe(path(QStringLiteral("again.mp4"))).codec, QStringLiteral("wmv2"));
    }

    void finalizeAndFramesWithoutEncoder()
    {
        ExportWorker worker;
        QSignalSpy finalized(&worker, &ExportWorker::finalized);
        QSignalSpy finished(&worker, &ExportWorker::frameExportFinished);
        QTest::ignoreMessage(QtDebugMsg, "QExporter::finishExport: m_export doesn't exist");
        worker.finalizeExport();
        QCOMPARE(finalized.count(), 1);

        // A frame without encoder, or no frame at all, still lets the loop go on.
        QImage frame(64, 36, QImage::Format_RGB32);
        worker.exportNextFrame(0, &frame);
        worker.exportNextFrame(1, nullptr);
        QCOMPARE(finished.count(), 2);
    }

    void destructorReleasesTheEncoder()
    {
        const QString file = path(QStringLiteral("dropped.mp4"));
        {
            ExportWorker worker;
            QVERIFY(worker.start(320, 180, 30.0, file, true));
            QImage frame(320, 180, QImage::Format_RGB32);
            fill(0, frame);
            worker.exportNextFrame(0, &frame);
        }
        QVERIFY(!QFile::exists(file)); // an unfinished film is dropped
        QVERIFY(!EncoderLibrary::isLoaded());
        QVERIFY(!EncoderLibrary::owner());
        const QString next = path(QStringLiteral("after.mp4"));
        QVERIFY(exportFilm(next, true, 4, QSize(320, 180), fill));
        QCOMPARE(probe(next).frames, 4);
    }

    void startFailuresLeaveNoFile()
    {
        const QString nowhere = path(QStringLiteral("no/such/folder/film.mp4"));
        QVERIFY(!exportFilm(nowhere, true, 1, QSize(320, 180), fill));
        QVERIFY(!QFile::exists(nowhere));

        const QString tiny = path(QStringLiteral("tiny.mp4"));
        QVERIFY(!exportFilm(tiny, true, 1, QSize(10, 10), fill));
        QVERIFY(!QFile::exists(tiny));

        const QString blocked = path(QStringLiteral("blocked.wmv"));
        QVERIFY(QDir().mkpath(blocked)); // a folder where the file should go
        QVERIFY(!exportFilm(blocked, false, 1, QSize(320, 180), fill));
        QVERIFY(QFileInfo(blocked).isDir());

        // Without the library nothing starts and the format has no extension.
        QTemporaryDir empty;
        EncoderLibrary::release();
        EncoderLibrary::setFolder(empty.path());
        const QString orphan = path(QStringLiteral("orphan.mp4"));
        QVERIFY(!exportFilm(orphan, true, 1, QSize(320, 180), fill));
        QVERIFY(!QFile::exists(orphan));
        QVERIFY(ExportWorker::defaultExtension(true).isEmpty());
        QVERIFY(!VideoComment::write(path(QStringLiteral("film.mp4")), QStringLiteral("x")));
        EncoderLibrary::setFolder(QStringLiteral(TOURLET_BIN_DIR));

        QCOMPARE(ExportWorker::defaultExtension(true), QStringLiteral("mp4"));
        QCOMPARE(ExportWorker::defaultExtension(false), QStringLiteral("wmv"));
        QVERIFY(EncoderLibrary::isLoaded()); // kept for the next query

        // A file that isn't a film keeps its content when a comment is asked for.
        const QString text = path(QStringLiteral("notes.mp4"));
        QFile f(text);
        QVERIFY(f.open(QIODevice::WriteOnly));
        f.write("not a film");
        f.close();
        QVERIFY(!VideoComment::write(text, QStringLiteral("x")));
        QVERIFY(f.open(QIODevice::ReadOnly));
        QCOMPARE(f.readAll(), QByteArray("not a film"));
    }

    // The worker tells at once when the film can't be written, and the place named at
    // the start stays as it was. Run in a child process under a file size limit.
    void workerReportsALostFilm()
    {
        const QString file = path(QStringLiteral("lost.mp4"));
        const pid_t child = fork();
        QVERIFY(child >= 0);
        if (child == 0) {
            std::signal(SIGXFSZ, SIG_IGN);
            const rlimit small{16 * 1024, 16 * 1024};
            setrlimit(RLIMIT_FSIZE, &small);
            ExportWorker worker;
            QSignalSpy failed(&worker, &ExportWorker::exportFailed);
            QSignalSpy finalized(&worker, &ExportWorker::finalized);
            if (!worker.start(640, 360, 30.0, file, true))
                _exit(2);
            QImage frame(640, 360, QImage::Format_RGB32);
            QRandomGenerator noise(3);
            int frames = 0;
            for (; frames < 300 && failed.isEmpty(); ++frames) {
                noise.fillRange(reinterpret_cast<quint32 *>(frame.bits()), int(frame.sizeInBytes() / 4));
                worker.exportNextFrame(frames, &frame);
            }
            worker.finalizeExport();
            const bool told = failed.count() == 1 && frames < 300 && worker.hasFailed()
                              && worker.errorString() == failed.first().first().toString()
                              && worker.errorString().contains(file);
            // Bits of the exit code: 1 no clear report, 2 no end, 4 something at the target.
            _exit((told ? 0 : 1) | (finalized.count() == 1 ? 0 : 2) | (QFile::exists(file) ? 4 : 0));
        }
        int status = 0;
        QCOMPARE(waitpid(child, &status, 0), child);
        QVERIFY(WIFEXITED(status));
        QCOMPARE(WEXITSTATUS(status), 0);
    }

    // An encode that fails exits with one line and changes nothing at its target, be
    // it a file, a link or a folder; one that works writes through a link.
    void encodeTouchesOnlyAFinishedFilm_data()
    {
        QTest::addColumn<QString>("format");
        QTest::addColumn<QString>("target");
        QTest::addColumn<bool>("limited");
        QTest::addColumn<int>("exitCode");
        QTest::newRow("mp4 over a file, size limit") << "mp4" << "file" << true << 1;
        QTest::newRow("wmv, size limit") << "wmv" << "none" << true << 1;
        QTest::newRow("mp4 through a link, size limit") << "mp4" << "link" << true << 1;
        QTest::newRow("mp4 through a dangling link") << "mp4" << "dangling link" << false << 1;
        QTest::newRow("wmv onto a folder") << "wmv" << "folder" << false << 1;
        QTest::newRow("mp4 through a link") << "mp4" << "link" << false << 0;
    }

    void encodeTouchesOnlyAFinishedFilm()
    {
        QFETCH(QString, format);
        QFETCH(QString, target);
        QFETCH(bool, limited);
        QFETCH(int, exitCode);
        QTemporaryDir dir;
        const QString out = dir.filePath(QStringLiteral("out.") + format);
        const QString film = dir.filePath(QStringLiteral("earlier film"));
        writeTestFile(dir, QStringLiteral("earlier film"), "an earlier film");
        if (target == QLatin1String("file"))
            writeTestFile(dir, QStringLiteral("out.") + format, "the previous file");
        else if (target == QLatin1String("link"))
            QVERIFY(QFile::link(film, out));
        else if (target == QLatin1String("dangling link"))
            QVERIFY(QFile::link(dir.filePath(QStringLiteral("gone/film.mp4")), out));
        else if (target == QLatin1String("folder"))
            QVERIFY(QDir().mkpath(out + QStringLiteral("/inside")));

        const QMap<QString, QByteArray> before = folderSnapshot(dir.path());
        const QStringList args = {QStringLiteral("encode"), QStringLiteral("--frames"), QStringLiteral("90"),
                                  QStringLiteral("--size"), QStringLiteral("640x360"), QStringLiteral("--format"),
                                  format, QStringLiteral("-o"), out};
        const CliRun run = limited ? runCliWithFileSizeLimit(64, args) : runCli(args);
        QCOMPARE(run.exitCode, exitCode);
        const QMap<QString, QByteArray> after = folderSnapshot(dir.path());
        if (exitCode != 0) {
            QCOMPARE(run.err.count('\n'), 1);
            QVERIFY2(run.err.contains(QFile::encodeName(QFileInfo(out).fileName())), run.err.constData());
            QCOMPARE(after, before);
            return;
        }
        QCOMPARE(after.keys(), before.keys());
        QVERIFY(QFileInfo(out).isSymLink());
        QCOMPARE(probe(out).frames, 90);
    }

    void libraryRefusesBadInput()
    {
        EncoderLibrary::release();
        QVERIFY(EncoderLibrary::load());
        auto create = reinterpret_cast<VidcoreCreateExport>(EncoderLibrary::resolve("CreateExport"));
        auto extension = reinterpret_cast<VidcoreDefaultExtension>(EncoderLibrary::resolve("DefaultExtension"));
        QVERIFY(create && extension);
        QVERIFY(!create(3));
        QCOMPARE(QString::fromWCharArray(extension(3)), QString());

        VidcoreExport *encoder = create(VidcoreFormatMp4);
        QVERIFY(encoder);
        const VidcoreOperations &op = *encoder->operations;
        VidcoreParameters record;
        op.getParameters(encoder, &record);
        QCOMPARE(record.bitRate, 40000000);
        QCOMPARE(record.targetFrameRate, 30.0);

        const QString file = path(QStringLiteral("direct.mp4"));
        const std::wstring name = file.toStdWString();
        const auto openWith = [&](uint32_t w, uint32_t h, double rate) {
            VidcoreParameters r = record;
            r.sourceWidth = r.targetWidth = w;
            r.sourceHeight = r.targetHeight = h;
            r.sourceFrameRate = r.targetFrameRate = rate;
            return op.open(encoder, name.c_str(), &r);
        };
        QVERIFY(!openWith(321, 180, 30.0));
        QVERIFY(!openWith(320, 0, 30.0));
        QVERIFY(!openWith(320, 180, 0.0));
        QVERIFY(!openWith(320, 180, std::nan("")));
        QVERIFY(!QFile::exists(file));
        QVERIFY(!op.open(encoder, nullptr, &record));

        QVERIFY(openWith(320, 180, 25.0));
        QVERIFY(!openWith(320, 180, 25.0)); // open already
        QImage frame(320, 180, QImage::Format_RGB32);
        frame.fill(Qt::gray);
        op.writeFrame(encoder, frame.constBits(), uint32_t(frame.sizeInBytes()) - 4, VidcoreNextFrame); // short: dropped
        op.writeFrame(encoder, nullptr, uint32_t(frame.sizeInBytes()), VidcoreNextFrame);
        op.writeFrame(encoder, frame.constBits(), uint32_t(frame.sizeInBytes()), VidcoreNextFrame);
        op.writeFrame(encoder, frame.constBits(), uint32_t(frame.sizeInBytes()), 0); // behind: taken as next
        op.finish(encoder);
        op.writeFrame(encoder, frame.constBits(), uint32_t(frame.sizeInBytes()), VidcoreNextFrame); // after the end
        op.finish(encoder);
        op.close(encoder);
        op.close(encoder);
        EncoderLibrary::release();

        const Probe p = probe(file);
        QCOMPARE(p.frames, 2);
        QCOMPARE(p.frameRate, QStringLiteral("25/1"));
    }

    void frameDumpsArePngs()
    {
        QGrabWidgetFrame dump;
        const QString base = path(QStringLiteral("dump"));
        dump.start(base);
        QSignalSpy finished(&dump, &QGrabWidgetFrame::frameExportFinished);
        QImage frame(48, 27, QImage::Format_RGB32);
        for (int i = 0; i < 3; ++i) {
            fill(i, frame);
            dump.exportNextFrame(i + 10, &frame);
        }
        QCOMPARE(finished.count(), 3);
        const QRegularExpression name(QRegularExpression::escape(base) + QStringLiteral("_frame_\\d{1,6}_0000000[0-2]\\.png"));
        for (int i = 0; i < 3; ++i) {
            const QString file = dump.frameFileName(i);
            QVERIFY2(name.match(file).hasMatch(), qPrintable(file));
            const QImage back(file);
            QCOMPARE(back.size(), QSize(48, 27));
            QVERIFY(near(back.pixel(5, 5), frameColour(i), 0));
        }
        QSignalSpy finalized(&dump, &QGrabWidgetFrame::finalized);
        dump.finalizeExport();
        QCOMPARE(finalized.count(), 1);
    }

    void commandLine()
    {
        const QString cli = QStringLiteral(TOURLET_BIN_DIR "/tourlet-cli");
        const QString file = path(QStringLiteral("cli.wmv"));
        QByteArray out, err;
        QCOMPARE(runTool(cli,
                         {QStringLiteral("encode"), QStringLiteral("--frames"), QStringLiteral("30"),
                          QStringLiteral("--size"), QStringLiteral("320x240"), QStringLiteral("--format"),
                          QStringLiteral("wmv"), QStringLiteral("--comment"), QStringLiteral("ZkTourlet|Frame=3"),
                          QStringLiteral("-o"), file},
                         &out, &err),
                 0);
        const QJsonObject result = QJsonDocument::fromJson(out).object();
        QCOMPARE(result.value(QStringLiteral("frames")).toInt(), 30);
        QCOMPARE(result.value(QStringLiteral("width")).toInt(), 320);
        QCOMPARE(result.value(QStringLiteral("height")).toInt(), 180);
        QVERIFY(result.value(QStringLiteral("seconds")).toDouble() > 0.0);
        QVERIFY(result.value(QStringLiteral("framesPerSecond")).toDouble() > 0.0);
        const Probe p = probe(file);
        QCOMPARE(p.codec, QStringLiteral("wmv2"));
        QCOMPARE(p.frames, 30);
        QCOMPARE(p.comment, QStringLiteral("ZkTourlet|Frame=3"));

        // Failures: exit 1, one line, no file.
        const QString missing = path(QStringLiteral("missing.mp4"));
        const QStringList encodeOne = {QStringLiteral("encode"), QStringLiteral("--frames"), QStringLiteral("2"),
                                       QStringLiteral("--size"), QStringLiteral("320x180"), QStringLiteral("-o")};
        QTemporaryDir alone;
        const QString lonely = alone.filePath(QStringLiteral("tourlet-cli"));
        QVERIFY(QFile::copy(cli, lonely));
        QCOMPARE(runTool(lonely, encodeOne + QStringList{missing}, &out, &err), 1);
        QCOMPARE(err.count('\n'), 1);
        QVERIFY2(err.contains("libvidcore.so"), err.constData());
        QVERIFY(!QFile::exists(missing));

        const QString unwritable = path(QStringLiteral("none/x.mp4"));
        QCOMPARE(runTool(cli, encodeOne + QStringList{unwritable}, &out, &err), 1);
        QCOMPARE(err.count('\n'), 1);
        QVERIFY(out.isEmpty());
        QVERIFY(!QFile::exists(unwritable));

        QCOMPARE(runTool(cli, {QStringLiteral("encode"), QStringLiteral("--frames"), QStringLiteral("0"),
                               QStringLiteral("-o"), missing}, &out, &err), 1);
        QCOMPARE(runTool(cli, {QStringLiteral("encode"), QStringLiteral("--frames"), QStringLiteral("2"),
                               QStringLiteral("--format"), QStringLiteral("avi"), QStringLiteral("-o"), missing}, &out, &err), 1);
        QVERIFY(!QFile::exists(missing));
    }
};

QTEST_GUILESS_MAIN(TestExport)
#include "tst_export.moc"
