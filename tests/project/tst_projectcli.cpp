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

#include <algorithm>
#include <cmath>

namespace {

void writeText(const QString &file, const QByteArray &text)
{
    QFile f(file);
    QVERIFY(f.open(QIODevice::WriteOnly));
    f.write(text);
}

// Positions in order, each run of equal positions taken once.
std::vector<std::pair<double, double>> positions(const std::vector<std::pair<double, double>> &all)
{
    std::vector<std::pair<double, double>> distinct;
    for (const auto &p : all)
        if (distinct.empty() || distinct.back() != p)
            distinct.push_back(p);
    return distinct;
}

} // namespace

class TestProjectCli : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;
    QString path(const char *name) const { return m_dir.filePath(QString::fromLatin1(name)); }

private slots:
    void projectAndConvert()
    {
        const QString source = path("tour.zkgeo");
        writeText(source, "[Header]\nprojecttype=ZKGEO\nprojectversion=2\n"
                          "[animator]\nprojectTitle=Elbe\ncurvemode=1\npathtype=1\ncurrentZoomLevel=8.5\n"
                          "[keypoints]\nelements=2\n"
                          "[keypoint0]\nx=13.7\ny=51.05\nlongitude=13.7\nlatitude=51.05\nkppTitle=Dresden\nkppDurationToNextKP=4000\n"
                          "family=Georgia\npointSize=24.5\nstyle=2\ncolor=#112233\nhasFrame=0\nhasShadow=1\nkppSize=1.5\n"
                          "kppImageSource=/symbols/pin.png\n"
                          "[keypoint1]\nx=13.4\ny=52.5\nlongitude=13.4\nlatitude=52.5\nkppTitle=Berlin\n"
                          "[pathSegments]\nelements=2\n[pathsegment0]\npilot_width=77.5\n[pathsegment1]\npilot_source=/b.png\n"
                          "[photopool]\nsize=1\n[photopool_item0]\npath=/gone/p.jpg\ntime=2019:05:04 10:11:12\n");
        const QString converted = path("converted.zkgeo");
        CliRun run = runCli({QStringLiteral("convert"), source, QStringLiteral("-o"), converted});
        QCOMPARE(run.exitCode, 0);
        QVERIFY(QFile::exists(converted));

        run = runCli({QStringLiteral("project"), converted});
        QCOMPARE(run.exitCode, 0);
        const QJsonObject doc = QJsonDocument::fromJson(run.out).object();
        const QJsonObject fields = doc.value(QStringLiteral("fields")).toObject();
        QCOMPARE(fields.value(QStringLiteral("animator/projectTitle")).toString(), QStringLiteral("Elbe"));
        QCOMPARE(fields.value(QStringLiteral("animator/currentZoomLevel")).toDouble(), 8.5);
        QCOMPARE(fields.value(QStringLiteral("animator/keyPointsLocked")).toBool(), false);
        QCOMPARE(fields.value(QStringLiteral("centerPosition/latitude")).toDouble(), 51.0541733);
        QCOMPARE(fields.value(QStringLiteral("path/color")).toString(), QStringLiteral("#FF0000"));
        const QJsonObject pathObject = doc.value(QStringLiteral("path")).toObject();
        QCOMPARE(pathObject.value(QStringLiteral("keyPointCount")).toInt(), 2);
        QCOMPARE(pathObject.value(QStringLiteral("segmentCount")).toInt(), 2);
        QVERIFY(pathObject.value(QStringLiteral("curvePointCount")).toInt() > 2);
        const QJsonObject first = pathObject.value(QStringLiteral("keyPoints")).toArray().at(0).toObject();
        QCOMPARE(first.value(QStringLiteral("title")).toString(), QStringLiteral("Dresden"));
        QCOMPARE(first.value(QStringLiteral("durationToNextKP")).toInt(), 4000);
        QCOMPARE(first.value(QStringLiteral("size")).toDouble(), 1.5);
        QCOMPARE(first.value(QStringLiteral("imageSource")).toString(), QStringLiteral("/symbols/pin.png"));
        QCOMPARE(first.value(QStringLiteral("font")).toObject(),
                 (QJsonObject{{"family", "Georgia"}, {"pointSize", 24.5}, {"style", 2}, {"color", "#112233"},
                              {"hasFrame", false}, {"hasShadow", true}}));
        const QJsonArray segments = pathObject.value(QStringLiteral("segments")).toArray();
        QCOMPARE(segments.at(0).toObject().value(QStringLiteral("pilot_width")).toDouble(), 77.5);
        QCOMPARE(segments.at(1).toObject().value(QStringLiteral("pilot_source")).toString(), QStringLiteral("/b.png"));
        const QJsonArray photos = doc.value(QStringLiteral("photoPool")).toArray();
        QCOMPARE(photos.size(), 1);
        QCOMPARE(photos.at(0).toObject().value(QStringLiteral("time")).toString(), QStringLiteral("2019:05:04 10:11:12"));
        // The converted file carries the altitude theme under its prefix.
        QCOMPARE(doc.value(QStringLiteral("altitudePreset")).toObject().value(QStringLiteral("boardColor")).toString(),
                 QStringLiteral("#0D0D0D"));
        QCOMPARE(doc.value(QStringLiteral("altitudePreset")).toObject().value(QStringLiteral("version")).toString(),
                 QStringLiteral("0.0.0.5"));
    }

    void trackConvertsIntoAProject()
    {
        QByteArray gpx = "<?xml version=\"1.0\"?>\n<gpx creator=\"logger\"><trk><trkseg>\n";
        double west = 1e9, east = -1e9, south = 1e9, north = -1e9;
        for (int i = 0; i < 4000; ++i) {
            const QByteArray lat = QByteArray::number(47.0 + 0.3 * std::sin(i * 0.002), 'f', 7);
            const QByteArray lon = QByteArray::number(9.0 + i * 0.0002, 'f', 7);
            west = std::min(west, lon.toDouble());
            east = std::max(east, lon.toDouble());
            south = std::min(south, lat.toDouble());
            north = std::max(north, lat.toDouble());
            gpx += "<trkpt lat=\"" + lat + "\" lon=\"" + lon + "\"><ele>700</ele></trkpt>\n";
        }
        gpx += "</trkseg></trk></gpx>\n";
        const QString track = path("alps.gpx");
        writeText(track, gpx);

        CliRun run = runCli({QStringLiteral("project"), track});
        QCOMPARE(run.exitCode, 0);
        const QJsonObject opened = QJsonDocument::fromJson(run.out).object();
        QCOMPARE(opened.value(QStringLiteral("kind")).toString(), QStringLiteral("track"));

        const QString out = path("alps.zkgeo");
        run = runCli({QStringLiteral("convert"), track, QStringLiteral("-o"), out, QStringLiteral("--aliasing"), QStringLiteral("3")});
        QCOMPARE(run.exitCode, 0);
        const QJsonObject converted = QJsonDocument::fromJson(run.out).object();
        QCOMPARE(converted.value(QStringLiteral("kind")).toString(), QStringLiteral("track"));
        const int maxSamples = converted.value(QStringLiteral("curvePointCount")).toInt();
        QVERIFY(maxSamples >= 4000);

        run = runCli({QStringLiteral("project"), out});
        QCOMPARE(run.exitCode, 0);
        const QJsonObject doc = QJsonDocument::fromJson(run.out).object();
        QCOMPARE(doc.value(QStringLiteral("kind")).toString(), QStringLiteral("project"));
        const QJsonObject pathObject = doc.value(QStringLiteral("path")).toObject();
        QCOMPARE(pathObject.value(QStringLiteral("pathType")).toInt(), 2);
        QCOMPARE(pathObject.value(QStringLiteral("curveMode")).toInt(), 1);
        QCOMPARE(pathObject.value(QStringLiteral("keyPointCount")).toInt(), 2);
        QCOMPARE(pathObject.value(QStringLiteral("curvePointCount")).toInt(), maxSamples);
        QCOMPARE(pathObject.value(QStringLiteral("segments")).toArray().at(0).toObject().value(QStringLiteral("samples")).toInt(),
                 maxSamples);
        const QJsonObject first = pathObject.value(QStringLiteral("keyPoints")).toArray().at(0).toObject();
        QCOMPARE(first.value(QStringLiteral("longitude")).toDouble(), 9.0);
        QCOMPARE(first.value(QStringLiteral("durationToNextKP")).toInt(), 3 * maxSamples);
        const QJsonObject fields = doc.value(QStringLiteral("fields")).toObject();
        QCOMPARE(fields.value(QStringLiteral("visibleBoundariesTL/longitude")).toDouble(), west);
        QCOMPARE(fields.value(QStringLiteral("visibleBoundariesTL/latitude")).toDouble(), north);
        QCOMPARE(fields.value(QStringLiteral("visibleBoundariesBR/longitude")).toDouble(), east);
        QCOMPARE(fields.value(QStringLiteral("visibleBoundariesBR/latitude")).toDouble(), south);
        QCOMPARE(fields.value(QStringLiteral("centerPosition/longitude")).toDouble(), (west + east) / 2);
        QCOMPARE(fields.value(QStringLiteral("centerPosition/latitude")).toDouble(), (south + north) / 2);

        // Less thinning means more samples; a value out of the list is refused.
        run = runCli({QStringLiteral("convert"), track, QStringLiteral("-o"), path("thin.zkgeo"), QStringLiteral("--aliasing"),
                   QStringLiteral("2")});
        QCOMPARE(run.exitCode, 0);
        QVERIFY(QJsonDocument::fromJson(run.out).object().value(QStringLiteral("curvePointCount")).toInt() < maxSamples);
        run = runCli({QStringLiteral("convert"), track, QStringLiteral("-o"), path("never.zkgeo"), QStringLiteral("--aliasing"),
                   QStringLiteral("4")});
        QVERIFY(run.exitCode != 0);
        QVERIFY(!QFile::exists(path("never.zkgeo")));
    }

    void failuresNameTheFile()
    {
        const QString foreign = path("notes.txt");
        writeText(foreign, "just some text\n");
        CliRun run = runCli({QStringLiteral("project"), foreign});
        QCOMPARE(run.exitCode, 1);
        QVERIFY(run.out.isEmpty());
        QVERIFY(run.err.contains("notes.txt"));
        QCOMPARE(run.err.count('\n'), 1);

        const QString damaged = path("damaged.zkgeo");
        writeText(damaged, "[Header]\nprojecttype=ZKGEO\nprojectversion=2\n[flyIn]\nduration=five\n");
        run = runCli({QStringLiteral("project"), damaged});
        QCOMPARE(run.exitCode, 2);
        QVERIFY(run.err.contains("damaged.zkgeo"));
        QVERIFY(run.err.contains("damaged number"));
        run = runCli({QStringLiteral("convert"), damaged, QStringLiteral("-o"), path("never.zkgeo")});
        QCOMPARE(run.exitCode, 2);
        QVERIFY(!QFile::exists(path("never.zkgeo")));

        run = runCli({QStringLiteral("convert"), foreign, QStringLiteral("-o"), path("never.zkgeo")});
        QCOMPARE(run.exitCode, 1);
        run = runCli({QStringLiteral("convert"), foreign});
        QCOMPARE(run.exitCode, 1);
    }

    void gpxOfAProjectReadsBackAsItsRoute()
    {
        PainterPathRenderer_Controller document;
        document.newProject();
        Path &route = document.pathManager().activeChecked();
        route.addKeyPoint(13.70, 51.05, 0.0, QStringLiteral("Dresden"), false);
        route.addKeyPoint(13.10, 51.60, 0.0, QStringLiteral("hidden"), false);
        route.addKeyPoint(13.40, 52.50, 0.0, QStringLiteral("Berlin"), true);
        route.keyPoints[0].properties.title = QStringLiteral("Dresden");
        route.keyPoints[1].properties.title = QStringLiteral("hidden");
        route.keyPoints[1].properties.enabled = false;
        route.keyPoints[2].properties.title = QStringLiteral("Berlin");
        const QString project = path("route.zkgeo");
        QVERIFY(saveDocumentFile(document, project));

        const QString gpx = path("route.gpx");
        const CliRun run = runCli({QStringLiteral("gpx"), project, QStringLiteral("-o"), gpx});
        QCOMPARE(run.exitCode, 0);
        const QJsonObject result = QJsonDocument::fromJson(run.out).object();
        QCOMPARE(result.value(QStringLiteral("kind")).toString(), QStringLiteral("project"));

        // The route as the program opens the project, against what the GPX holds.
        PainterPathRenderer_Controller opened;
        QVERIFY(openDocumentFile(opened, project).ok());
        const std::vector<CurvePoint> samples = opened.pathManager().routeSamples();
        QVERIFY(samples.size() > 3);
        QCOMPARE(result.value(QStringLiteral("samples")).toInt(), int(samples.size()));
        TrackFile back;
        QVERIFY(back.load(gpx));
        QVERIFY(back.isOwnFile());
        QCOMPARE(int(back.items().size()), 1);
        std::vector<std::pair<double, double>> written, expected;
        QStringList names;
        for (const TrackPoint &p : back.items().front().points) {
            written.emplace_back(p.longitude, p.latitude);
            if (!p.name.isEmpty())
                names << p.name;
        }
        for (const CurvePoint &c : samples)
            expected.emplace_back(c.x, c.y);
        QVERIFY(positions(written) == positions(expected));
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
        QByteArray track = "<?xml version=\"1.0\"?>\n<gpx creator=\"logger\"><trk><trkseg>\n";
        for (int i = 0; i < 400; ++i)
            track += "<trkpt lat=\"" + QByteArray::number(47.0 + i * 1e-3) + "\" lon=\"" + QByteArray::number(9.0 + i * 1e-3)
                     + "\"/>\n";
        track += "</trkseg></trk></gpx>\n";
        const QString source = dir.filePath(QStringLiteral("ride.gpx"));
        writeText(source, track);
        const QString target = dir.filePath(QStringLiteral("out"));
        if (folderInTheWay) {
            QVERIFY(QDir().mkpath(target));
            writeText(target + QStringLiteral("/inside"), "stays");
        } else {
            writeText(target, "the previous file");
        }
        const QStringList args = command == QLatin1String("track")
            ? QStringList{command, source, QStringLiteral("--write-gpx"), target}
            : QStringList{command, source, QStringLiteral("-o"), target};

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
