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

// What a tool printed, empty if it failed.
QByteArray toolOutput(const QString &program, const QStringList &args)
{
    QProcess p;
    p.start(program, args);
    if (!p.waitForFinished(60000) || p.exitStatus() != QProcess::NormalExit || p.exitCode() != 0)
        return QByteArray();
    return p.readAllStandardOutput();
}

// The film's first stream with the container's "format_name" and "comment" beside
// its own fields, the frames counted.
QVariantMap probe(const QString &file)
{
    const QJsonObject root = QJsonDocument::fromJson(toolOutput(
        QStringLiteral("ffprobe"),
        {"-v", "error", "-count_frames", "-show_entries",
         "stream=codec_name,width,height,r_frame_rate,nb_read_frames:format=format_name:format_tags=comment", "-of",
         "json", file})).object();
    QVariantMap fields = root.value(QStringLiteral("streams")).toArray().first().toObject().toVariantMap();
    const QJsonObject format = root.value(QStringLiteral("format")).toObject();
    fields.insert(QStringLiteral("format_name"), format.value(QStringLiteral("format_name")).toString());
    fields.insert(QStringLiteral("comment"), format.value(QStringLiteral("tags")).toObject().value(QStringLiteral("comment")).toString());
    return fields;
}

int framesOf(const QString &file)
{
    return probe(file).value(QStringLiteral("nb_read_frames")).toInt();
}

// Every frame of a film decoded to RGB.
QVector<QImage> decode(const QString &file, QSize size)
{
    const QByteArray out =
        toolOutput(QStringLiteral("ffmpeg"), {"-v", "error", "-i", file, "-f", "rawvideo", "-pix_fmt", "rgb24", "-"});
    QVector<QImage> frames;
    const int bytes = size.width() * size.height() * 3;
    for (int at = 0; at + bytes <= out.size(); at += bytes)
        frames.append(QImage(reinterpret_cast<const uchar *>(out.constData() + at), size.width(), size.height(),
                             size.width() * 3, QImage::Format_RGB888)
                          .copy());
    return frames;
}

// Whether the index box of an MP4 file comes before its media data, so that playback
// can start before the whole file is read.
bool indexBeforeData(const QString &file)
{
    QFile f(file);
    if (!f.open(QIODevice::ReadOnly))
        return false;
    while (!f.atEnd()) {
        const qint64 start = f.pos();
        const QByteArray head = f.read(8);
        if (head.size() < 8)
            break;
        quint64 size = 0;
        for (int i = 0; i < 4; ++i)
            size = (size << 8) | uchar(head[i]);
        if (head.mid(4, 4) == "moov")
            return true;
        if (head.mid(4, 4) == "mdat")
            return false;
        if (size == 1) { // 64-bit size follows
            size = 0;
            for (char c : f.read(8))
                size = (size << 8) | uchar(c);
        }
        if (size < 8 || !f.seek(start + qint64(size)))
            break;
    }
    return false;
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
    static bool exportFilm(const QString &file, bool mp4, int frames, QSize frameSize,
                           const FramePainter &painter = fill)
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
        QCOMPARE(ExportWorker::exportSize(1000), QSize(992, 558));
        QCOMPARE(ExportWorker::exportSize(1279), QSize(1280, 720)); // 79 sixteenths is odd: rounds up to 80
        QVERIFY(ExportWorker::exportSize(15).isEmpty());
        QVERIFY(ExportWorker::exportSize(-5).isEmpty());
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
        QVERIFY(exportFilm(file, mp4, frames, QSize(320, 180)));

        const QVariantMap p = probe(file);
        QCOMPARE(p.value("codec_name").toString(), codec);
        QVERIFY2(p.value("format_name").toString().contains(container), qPrintable(p.value("format_name").toString()));
        QCOMPARE(p.value("width").toInt(), 320);
        QCOMPARE(p.value("r_frame_rate").toString(), QStringLiteral("30/1"));
        QVERIFY(!mp4 || indexBeforeData(file));

        // Every frame arrives once and in order.
        const QVector<QImage> pictures = decode(file, QSize(320, 180));
        QCOMPARE(pictures.size(), frames);
        for (int i = 0; i < frames; ++i)
            QVERIFY2(near(pictures.at(i).pixel(160, 90), frameColour(i), 10),
                     qPrintable(QStringLiteral("frame %1 is %2").arg(i).arg(pictures.at(i).pixel(160, 90), 0, 16)));

        // The comment goes into the container, a second one replaces the first, the
        // pictures stay as they were and no temporary file is left behind.
        QVERIFY(VideoComment::write(file, QStringLiteral("first")));
        QVERIFY(VideoComment::write(file, QStringLiteral("second")));
        QCOMPARE(probe(file).value("comment").toString(), QStringLiteral("second"));
        QCOMPARE(decode(file, QSize(320, 180)).size(), frames);
        QVERIFY(!mp4 || indexBeforeData(file));
        QCOMPARE(QDir(m_dir.path()).entryList({QFileInfo(file).fileName() + QStringLiteral(".*")}), QStringList());
    }

    // The encoder gets the size derived from the width, whatever the height.
    void otherAspectIsStretchedToFill()
    {
        // 4:3 frame: a green band over the top quarter, red left half, blue right half.
        const QColor red(220, 20, 20), blue(20, 20, 220), green(20, 200, 20);
        const FramePainter paint = [&](int, QImage &frame) {
            QPainter p(&frame);
            p.fillRect(0, 0, 200, 300, red);
            p.fillRect(200, 0, 200, 300, blue);
            p.fillRect(0, 0, 400, 75, green);
        };
        const QString file = path(QStringLiteral("größe 400.mp4"));
        QVERIFY(exportFilm(file, true, 2, QSize(400, 300), paint));
        QCOMPARE(probe(file).value("height").toInt(), 234);
        const QVector<QImage> pictures = decode(file, QSize(416, 234));
        QCOMPARE(pictures.size(), 2);
        const QImage &f = pictures.first();
        // Corners are covered: no bars, no cut-off band; the band keeps its quarter
        // of the height, the halves their half of the width.
        QVERIFY(near(f.pixel(3, 230), red, 30));
        QVERIFY(near(f.pixel(412, 3), green, 30));
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

        // When the frame is handed back the worker holds no copy of it, so that the next
        // picture is painted in place instead of into a fresh buffer.
        QImage frame(320, 180, QImage::Format_RGB32);
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
        QVERIFY(!EncoderLibrary::isLoaded());
        QCOMPARE(framesOf(file), 5);

        // Once finalized, the same worker may start again.
        QVERIFY(first.start(320, 180, 30.0, path(QStringLiteral("again.mp4")), false));
        first.finalizeExport();
        QCOMPARE(probe(path(QStringLiteral("again.mp4"))).value("codec_name").toString(), QStringLiteral("wmv2"));
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
        const QString next = path(QStringLiteral("after.mp4"));
        QVERIFY(exportFilm(next, true, 4, QSize(320, 180)));
        QCOMPARE(framesOf(next), 4);
    }

    void startFailuresLeaveNoFile()
    {
        const QString nowhere = path(QStringLiteral("no/such/folder/film.mp4"));
        QVERIFY(!exportFilm(nowhere, true, 1, QSize(320, 180)));
        QVERIFY(!QFile::exists(nowhere));
        const QString tiny = path(QStringLiteral("tiny.mp4"));
        QVERIFY(!exportFilm(tiny, true, 1, QSize(10, 10)));
        QVERIFY(!QFile::exists(tiny));

        // Without the library nothing starts and the format has no extension.
        QTemporaryDir empty;
        EncoderLibrary::release();
        EncoderLibrary::setFolder(empty.path());
        const QString orphan = path(QStringLiteral("orphan.mp4"));
        QVERIFY(!exportFilm(orphan, true, 1, QSize(320, 180)));
        QVERIFY(!QFile::exists(orphan));
        QVERIFY(ExportWorker::defaultExtension(true).isEmpty());
        EncoderLibrary::setFolder(QStringLiteral(TOURLET_BIN_DIR));
        QCOMPARE(ExportWorker::defaultExtension(false), QStringLiteral("wmv"));

        // A file that isn't a film keeps its content when a comment is asked for.
        const QString text = writeTestFile(m_dir, QStringLiteral("notes.mp4"), "not a film");
        QVERIFY(!VideoComment::write(text, QStringLiteral("x")));
        QFile f(text);
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
        const QString film = writeTestFile(dir, QStringLiteral("earlier film"), "an earlier film");
        if (target == QLatin1String("file"))
            writeTestFile(dir, QStringLiteral("out.") + format, "the previous file");
        else if (target == QLatin1String("link"))
            QVERIFY(QFile::link(film, out));
        else if (target == QLatin1String("dangling link"))
            QVERIFY(QFile::link(dir.filePath(QStringLiteral("gone/film.mp4")), out));
        else if (target == QLatin1String("folder"))
            QVERIFY(QDir().mkpath(out + QStringLiteral("/inside")));

        const QMap<QString, QByteArray> before = folderSnapshot(dir.path());
        const QStringList args = {"encode", "--frames", "90", "--size", "640x360", "--format", format, "-o", out};
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
        QCOMPARE(framesOf(out), 90);
    }

    void libraryRefusesBadInput()
    {
        EncoderLibrary::release();
        QVERIFY(EncoderLibrary::load());
        auto create = reinterpret_cast<VidcoreCreateExport>(EncoderLibrary::resolve("CreateExport"));
        QVERIFY(create);
        QVERIFY(!create(3));

        VidcoreExport *encoder = create(VidcoreFormatMp4);
        QVERIFY(encoder);
        const VidcoreOperations &op = *encoder->operations;
        VidcoreParameters record;
        op.getParameters(encoder, &record);
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
        QVERIFY(!openWith(320, 180, std::nan("")));
        QVERIFY(!op.open(encoder, nullptr, &record));
        QVERIFY(!QFile::exists(file));

        QVERIFY(openWith(320, 180, 25.0));
        QVERIFY(!openWith(320, 180, 25.0)); // open already
        QImage frame(320, 180, QImage::Format_RGB32);
        frame.fill(Qt::gray);
        const uint32_t bytes = uint32_t(frame.sizeInBytes());
        op.writeFrame(encoder, frame.constBits(), bytes - 4, VidcoreNextFrame); // short: dropped
        op.writeFrame(encoder, nullptr, bytes, VidcoreNextFrame);
        op.writeFrame(encoder, frame.constBits(), bytes, VidcoreNextFrame);
        op.writeFrame(encoder, frame.constBits(), bytes, 0); // behind: taken as next
        op.finish(encoder);
        op.writeFrame(encoder, frame.constBits(), bytes, VidcoreNextFrame); // after the end
        op.finish(encoder);
        op.close(encoder);
        op.close(encoder);
        EncoderLibrary::release();

        QCOMPARE(framesOf(file), 2);
        QCOMPARE(probe(file).value("r_frame_rate").toString(), QStringLiteral("25/1"));
    }

    void frameDumpsArePngs()
    {
        QGrabWidgetFrame dump;
        dump.start(path(QStringLiteral("dump")));
        QImage frame(48, 27, QImage::Format_RGB32);
        for (int i = 0; i < 3; ++i) {
            fill(i, frame);
            dump.exportNextFrame(i + 10, &frame);
        }
        // Numbered by the dump's own count, not by the frame number given.
        for (int i = 0; i < 3; ++i) {
            const QString file = dump.frameFileName(i);
            QVERIFY2(file.endsWith(QStringLiteral("_0000000%1.png").arg(i)), qPrintable(file));
            QVERIFY(near(QImage(file).pixel(5, 5), frameColour(i), 0));
        }
    }

    void commandLine()
    {
        const QString file = path(QStringLiteral("cli.wmv"));
        const CliRun run = runCli({"encode", "--frames", "30", "--size", "320x240", "--format", "wmv", "--comment",
                                   "ZkTourlet|Frame=3", "-o", file});
        QCOMPARE(run.exitCode, 0);
        const QJsonObject result = QJsonDocument::fromJson(run.out).object();
        QCOMPARE(result.value(QStringLiteral("frames")).toInt(), 30);
        QCOMPARE(result.value(QStringLiteral("height")).toInt(), 180);
        QVERIFY(result.value(QStringLiteral("framesPerSecond")).toDouble() > 0.0);
        QCOMPARE(framesOf(file), 30);
        QCOMPARE(probe(file).value("comment").toString(), QStringLiteral("ZkTourlet|Frame=3"));

        // Without the encoder library beside it: exit 1, one line naming it, no file.
        const QString missing = path(QStringLiteral("missing.mp4"));
        QTemporaryDir alone;
        const QString lonely = alone.filePath(QStringLiteral("tourlet-cli"));
        QVERIFY(QFile::copy(QStringLiteral(TOURLET_CLI), lonely));
        QProcess process;
        process.start(lonely, {"encode", "--frames", "2", "--size", "320x180", "-o", missing});
        QVERIFY(process.waitForFinished(60000));
        QCOMPARE(process.exitCode(), 1);
        const QByteArray err = process.readAllStandardError();
        QCOMPARE(err.count('\n'), 1);
        QVERIFY2(err.contains("libvidcore.so"), err.constData());

        QCOMPARE(runCli({"encode", "--frames", "0", "-o", missing}).exitCode, 1);
        QCOMPARE(runCli({"encode", "--frames", "2", "--format", "avi", "-o", missing}).exitCode, 1);
        QVERIFY(!QFile::exists(missing));
    }
};

QTEST_GUILESS_MAIN(TestExport)
#include "tst_export.moc"
