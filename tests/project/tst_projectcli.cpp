#include "CliRun.h"
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
};

QTEST_GUILESS_MAIN(TestProjectCli)
#include "tst_projectcli.moc"
