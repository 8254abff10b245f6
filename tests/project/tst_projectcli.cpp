#include "CliRun.h"
#include "TestFiles.h"
#include "gpx/TrackFile.h"
#include "project/DocumentFile.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QDir>
#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QTemporaryDir>
#include <QTest>

#include <cmath>

namespace {

// Positions in order, each run of equal positions taken once.
QVector<QPointF> distinct(const QVector<QPointF> &all)
{
    QVector<QPointF> distinct;
    for (const auto &p : all)
        if (distinct.empty() || distinct.back() != p)
            distinct.push_back(p);
    return distinct;
}

QByteArray gpxTrack(int points, double step)
{
    QByteArray gpx = "<?xml version=\"1.0\"?>\n<gpx creator=\"logger\"><trk><trkseg>\n";
    for (int i = 0; i < points; ++i)
        gpx += "<trkpt lat=\"" + QByteArray::number(47.0 + 0.3 * std::sin(i * step), 'f', 7) + "\" lon=\"" +
               QByteArray::number(9.0 + i * step / 10, 'f', 7) + "\"/>\n";
    return gpx + "</trkseg></trk></gpx>\n";
}

QJsonObject json(const CliRun &run)
{
    return QJsonDocument::fromJson(run.out).object();
}

} // namespace

class TestProjectCli : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;
    QString path(const char *name) const { return m_dir.filePath(QString::fromLatin1(name)); }
    QString write(const char *name, const QByteArray &bytes) const { return writeTestFile(m_dir, QString::fromLatin1(name), bytes); }

private slots:
    void projectAndConvert()
    {
        const QString source = write("tour.zkgeo", "[Header]\nprojecttype=ZKGEO\nprojectversion=2\n"
                                                   "[animator]\nprojectTitle=Elbe\ncurvemode=1\npathtype=1\n"
                                                   "[keypoints]\nelements=2\n"
                                                   "[keypoint0]\nx=13.7\ny=51.05\nlongitude=13.7\nlatitude=51.05\nkppTitle=Dresden\n"
                                                   "family=Georgia\npointSize=24.5\nstyle=2\ncolor=#112233\nhasFrame=0\nhasShadow=1\n"
                                                   "[keypoint1]\nx=13.4\ny=52.5\nlongitude=13.4\nlatitude=52.5\nkppTitle=Berlin\n"
                                                   "[pathSegments]\nelements=2\n[pathsegment0]\npilot_width=77.5\n[pathsegment1]\n"
                                                   "[photopool]\nsize=1\n[photopool_item0]\npath=/gone/p.jpg\ntime=2019:05:04 10:11:12\n");
        const QString converted = path("converted.zkgeo");
        QCOMPARE(runCli({QStringLiteral("convert"), source, QStringLiteral("-o"), converted}).exitCode, 0);

        const CliRun run = runCli({QStringLiteral("project"), converted});
        QCOMPARE(run.exitCode, 0);
        const QJsonObject doc = json(run);
        QCOMPARE(doc.value(QStringLiteral("kind")).toString(), QStringLiteral("project"));
        QCOMPARE(doc.value(QStringLiteral("fields")).toObject().value(QStringLiteral("animator/projectTitle")).toString(),
                 QStringLiteral("Elbe"));
        const QJsonObject pathObject = doc.value(QStringLiteral("path")).toObject();
        QCOMPARE(pathObject.value(QStringLiteral("keyPointCount")).toInt(), 2);
        QCOMPARE(pathObject.value(QStringLiteral("segmentCount")).toInt(), 2);
        QVERIFY(pathObject.value(QStringLiteral("curvePointCount")).toInt() > 2);
        const QJsonObject first = pathObject.value(QStringLiteral("keyPoints")).toArray().at(0).toObject();
        QCOMPARE(first.value(QStringLiteral("title")).toString(), QStringLiteral("Dresden"));
        QCOMPARE(first.value(QStringLiteral("font")).toObject(),
                 (QJsonObject{{"family", "Georgia"}, {"pointSize", 24.5}, {"style", 2}, {"color", "#112233"},
                              {"hasFrame", false}, {"hasShadow", true}}));
        QCOMPARE(pathObject.value(QStringLiteral("segments")).toArray().at(0).toObject().value(QStringLiteral("pilot_width")).toDouble(),
                 77.5);
        const QJsonArray photos = doc.value(QStringLiteral("photoPool")).toArray();
        QCOMPARE(photos.size(), 1);
        QCOMPARE(photos.at(0).toObject().value(QStringLiteral("time")).toString(), QStringLiteral("2019:05:04 10:11:12"));
        // The converted file carries the altitude theme under its prefix.
        QCOMPARE(doc.value(QStringLiteral("altitudePreset")).toObject().value(QStringLiteral("version")).toString(),
                 QStringLiteral("0.0.0.5"));
    }

    void trackConvertsIntoAProject()
    {
        const QString track = write("alps.gpx", gpxTrack(4000, 0.002));
        CliRun run = runCli({QStringLiteral("project"), track});
        QCOMPARE(run.exitCode, 0);
        QCOMPARE(json(run).value(QStringLiteral("kind")).toString(), QStringLiteral("track"));

        const QString out = path("alps.zkgeo");
        run = runCli({QStringLiteral("convert"), track, QStringLiteral("-o"), out, QStringLiteral("--aliasing"), QStringLiteral("3")});
        QCOMPARE(run.exitCode, 0);
        QCOMPARE(json(run).value(QStringLiteral("kind")).toString(), QStringLiteral("track"));
        const int maxSamples = json(run).value(QStringLiteral("curvePointCount")).toInt();
        QVERIFY(maxSamples >= 4000);
        QVERIFY(QFile::exists(out));

        // Less thinning means more samples; a value out of the list is refused.
        run = runCli({QStringLiteral("convert"), track, QStringLiteral("-o"), path("thin.zkgeo"), QStringLiteral("--aliasing"),
                      QStringLiteral("2")});
        QCOMPARE(run.exitCode, 0);
        QVERIFY(json(run).value(QStringLiteral("curvePointCount")).toInt() < maxSamples);
        run = runCli({QStringLiteral("convert"), track, QStringLiteral("-o"), path("never.zkgeo"), QStringLiteral("--aliasing"),
                      QStringLiteral("4")});
        QVERIFY(run.exitCode != 0);
        QVERIFY(!QFile::exists(path("never.zkgeo")));
    }

    void failuresNameTheFile()
    {
        const QString foreign = write("notes.txt", "just some text\n");
        CliRun run = runCli({QStringLiteral("project"), foreign});
        QCOMPARE(run.exitCode, 1);
        QVERIFY(run.out.isEmpty());
        QVERIFY(run.err.contains("notes.txt"));
        QCOMPARE(run.err.count('\n'), 1);

        const QString damaged = write("damaged.zkgeo", "[Header]\nprojecttype=ZKGEO\nprojectversion=2\n[flyIn]\nduration=five\n");
        run = runCli({QStringLiteral("project"), damaged});
        QCOMPARE(run.exitCode, 2);
        QVERIFY(run.err.contains("damaged.zkgeo"));
        QVERIFY(run.err.contains("damaged number"));
        run = runCli({QStringLiteral("convert"), damaged, QStringLiteral("-o"), path("never.zkgeo")});
        QCOMPARE(run.exitCode, 2);
        QVERIFY(!QFile::exists(path("never.zkgeo")));

        QCOMPARE(runCli({QStringLiteral("convert"), foreign, QStringLiteral("-o"), path("never.zkgeo")}).exitCode, 1);
        QCOMPARE(runCli({QStringLiteral("convert"), foreign}).exitCode, 1);
    }

    void gpxOfAProjectReadsBackAsItsRoute()
    {
        PainterPathRenderer_Controller document;
        document.newProject();
        Path &route = document.pathManager().activeChecked();
        const QStringList titles{QStringLiteral("Dresden"), QStringLiteral("hidden"), QStringLiteral("Berlin")};
        const QPointF places[] = {{13.70, 51.05}, {13.10, 51.60}, {13.40, 52.50}};
        for (int i = 0; i < 3; ++i) {
            route.addKeyPoint(places[i].x(), places[i].y(), 0.0, titles[i], i == 2);
            route.keyPoints[size_t(i)].properties.title = titles[i];
        }
        route.keyPoints[1].properties.enabled = false;
        const QString project = path("route.zkgeo");
        QVERIFY(saveDocumentFile(document, project));

        const QString gpx = path("route.gpx");
        const CliRun run = runCli({QStringLiteral("gpx"), project, QStringLiteral("-o"), gpx});
        QCOMPARE(run.exitCode, 0);
        QCOMPARE(json(run).value(QStringLiteral("kind")).toString(), QStringLiteral("project"));

        // The route as the program opens the project, against what the GPX holds.
        PainterPathRenderer_Controller opened;
        QVERIFY(openDocumentFile(opened, project).ok());
        const std::vector<CurvePoint> samples = opened.pathManager().routeSamples();
        QVERIFY(samples.size() > 3);
        QCOMPARE(json(run).value(QStringLiteral("samples")).toInt(), int(samples.size()));
        TrackFile back;
        QVERIFY(back.load(gpx));
        QVERIFY(back.isOwnFile());
        QCOMPARE(int(back.items().size()), 1);
        QVector<QPointF> written, expected;
        QStringList names;
        for (const TrackPoint &p : back.items().front().points) {
            written << QPointF(p.longitude, p.latitude);
            if (!p.name.isEmpty())
                names << p.name;
        }
        for (const CurvePoint &c : samples)
            expected << QPointF(c.x, c.y);
        QCOMPARE(distinct(written), distinct(expected));
        QCOMPARE(names, (QStringList{QStringLiteral("Dresden"), QStringLiteral("Berlin")}));

        const CliRun missing = runCli({QStringLiteral("gpx"), project});
        QCOMPARE(missing.exitCode, 1);
        QCOMPARE(missing.err.count('\n'), 1);
    }

    // A write that fails exits non-zero with one line and leaves the folder as it was.
    void failedWritesChangeNothing_data()
    {
        QTest::addColumn<QString>("command");
        QTest::addColumn<bool>("folderInTheWay");
        QTest::newRow("convert, file size limit") << "convert" << false;
        QTest::newRow("gpx, file size limit") << "gpx" << false;
        QTest::newRow("track --write-gpx, file size limit") << "track" << false;
        QTest::newRow("convert onto a folder") << "convert" << true;
        QTest::newRow("gpx onto a folder") << "gpx" << true;
    }

    void failedWritesChangeNothing()
    {
        QFETCH(QString, command);
        QFETCH(bool, folderInTheWay);
        QTemporaryDir dir;
        const QString source = writeTestFile(dir, QStringLiteral("ride.gpx"), gpxTrack(400, 0.01));
        const QString target = dir.filePath(QStringLiteral("out"));
        if (folderInTheWay) {
            QVERIFY(QDir().mkpath(target));
            writeTestFile(dir, QStringLiteral("out/inside"), "stays");
        } else {
            writeTestFile(dir, QStringLiteral("out"), "the previous file");
        }
        const QStringList args{command, source, command == QLatin1String("track") ? QStringLiteral("--write-gpx") : QStringLiteral("-o"),
                               target};

        const QMap<QString, QByteArray> before = folderSnapshot(dir.path());
        const CliRun run = folderInTheWay ? runCli(args) : runCliWithFileSizeLimit(4, args);
        QCOMPARE(run.exitCode, 1);
        QCOMPARE(run.err.count('\n'), 1);
        QVERIFY2(run.err.contains(QFile::encodeName(target)), run.err.constData());
        QVERIFY(run.out.isEmpty());
        QCOMPARE(folderSnapshot(dir.path()), before);
    }
};

QTEST_GUILESS_MAIN(TestProjectCli)
#include "tst_projectcli.moc"
