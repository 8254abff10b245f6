#include "CliRun.h"
#include "TestFiles.h"
#include "app/AppSettings.h"
#include "path/PathManager.h"
#include "project/DocumentFile.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QJsonDocument>
#include <QJsonObject>
#include <QSettings>
#include <QTemporaryDir>
#include <QTest>

namespace {

// One JSON object per line; empty when a line is no object.
QList<QJsonObject> lines(const QByteArray &out)
{
    QList<QJsonObject> objects;
    for (const QByteArray &line : out.split('\n')) {
        const QJsonDocument doc = QJsonDocument::fromJson(line);
        if (!line.isEmpty() && !doc.isObject())
            return {};
        if (!line.isEmpty())
            objects << doc.object();
    }
    return objects;
}

QStringList sortedKeys(const QJsonObject &object)
{
    QStringList keys = object.keys();
    keys.sort();
    return keys;
}

} // namespace

class TestEventsCli : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;
    QString m_project;

    CliRun events(const QStringList &options) const { return runCli(QStringList{"events", m_project} + options); }

private slots:
    void initTestCase()
    {
        // The user's settings, which the command reads, are this test's own.
        qputenv("XDG_CONFIG_HOME", QFile::encodeName(m_dir.filePath(QStringLiteral("config"))));

        // Three key points; legs of 3 and 6 seconds, so that the timeline at the
        // default factor is the natural 270 frames and the legs differ.
        PainterPathRenderer_Controller document;
        document.newProject();
        Path &path = document.pathManager().activeChecked();
        path.addKeyPoint(13.70, 51.05, 0.0, QStringLiteral("A"), false);
        path.addKeyPoint(13.75, 51.10, 0.0, QStringLiteral("B"), false);
        path.addKeyPoint(13.90, 51.30, 0.0, QStringLiteral("C"), true);
        path.keyPoints[0].properties.durationToNextKP = 3000;
        path.keyPoints[1].properties.durationToNextKP = 6000;
        document.fields().currentZoomLevel = 9.0;
        m_project = m_dir.filePath(QStringLiteral("tour.zkgeo"));
        QVERIFY(saveDocumentFile(document, m_project));
    }

    void summaryAndLines()
    {
        CliRun run = events({"--linear", "0", "--summary"});
        QCOMPARE(run.exitCode, 0);
        const QJsonObject summary = QJsonDocument::fromJson(run.out).object();
        QCOMPARE(sortedKeys(summary),
                 (QStringList{"counts", "durationText", "events", "pilotSteps", "stretch", "totalFrames"}));
        QCOMPARE(summary.value(QStringLiteral("durationText")).toString(), QStringLiteral("00m09s"));
        const QJsonObject counts = summary.value(QStringLiteral("counts")).toObject();
        QCOMPARE(counts.value(QStringLiteral("start")).toInt(), 1);
        QCOMPARE(counts.value(QStringLiteral("flyin")).toInt(), 0);
        int all = 0;
        for (const QString &type : counts.keys())
            all += counts.value(type).toInt();
        QCOMPARE(summary.value(QStringLiteral("events")).toInt(), all);

        run = events({"--linear", "0"});
        QCOMPARE(run.exitCode, 0);
        const QList<QJsonObject> events = lines(run.out);
        QCOMPARE(events.size(), all);
        int pilotSteps = 0;
        for (int i = 0; i < events.size(); ++i) {
            QCOMPARE(events[i].value(QStringLiteral("index")).toInt(), i);
            QCOMPARE(sortedKeys(events[i]), (QStringList{"cKpId", "index", "pathPosition", "stepAnimatedPilot", "type"}));
            pilotSteps += events[i].value(QStringLiteral("stepAnimatedPilot")).toBool() ? 1 : 0;
        }
        QCOMPARE(pilotSteps, summary.value(QStringLiteral("pilotSteps")).toInt());
        QCOMPARE(events.last().value(QStringLiteral("type")).toString(), QStringLiteral("end"));
    }

    void linearAndFlyInOptions()
    {
        // By duration the first leg has a third of the steps; the document's default,
        // linear timing, shares by distance, and the second leg is about four times as long.
        const auto stepsOfFirstLeg = [](const QList<QJsonObject> &events) {
            const QJsonValue first = events.value(1).value(QStringLiteral("cKpId"));
            int steps = 0;
            for (const QJsonObject &e : events)
                steps += e.value(QStringLiteral("type")).toString() == QLatin1String("step") &&
                         e.value(QStringLiteral("cKpId")) == first;
            return steps;
        };
        const int byDuration = stepsOfFirstLeg(lines(events({"--linear", "0"}).out));
        QVERIFY2(byDuration >= 91 && byDuration <= 92, qPrintable(QString::number(byDuration)));
        const int byDistance = stepsOfFirstLeg(lines(events({}).out));
        QVERIFY2(byDistance > 30 && byDistance < 80, qPrintable(QString::number(byDistance)));

        // The fly-in starts from the route's extent and ends at the user's zoom.
        const QList<QJsonObject> flying = lines(events({"--flyin", "1"}).out);
        QVERIFY(flying.size() > 151);
        QCOMPARE(sortedKeys(flying[1]), (QStringList{"bearing", "index", "tilt", "type", "zoom"}));
        QCOMPARE(flying[150].value(QStringLiteral("type")).toString(), QStringLiteral("flyin"));
        QVERIFY(flying[1].value(QStringLiteral("zoom")).toDouble() < 9.0);
        QCOMPARE(flying[150].value(QStringLiteral("zoom")).toDouble(), 9.0);
    }

    // The longest film is the stored choice unless the option overrides it; at five
    // minutes the timeline is 15 times the natural 270 frames, at one minute 1800.
    void longestFilm_data()
    {
        QTest::addColumn<QString>("stored");
        QTest::addColumn<QString>("option");
        QTest::addColumn<int>("totalFrames");
        QTest::newRow("nothing stored") << QString() << QString() << 4050;
        QTest::newRow("stored 1 min") << "0" << QString() << 1800;
        QTest::newRow("option over stored") << "0" << "3" << 4050;
        QTest::newRow("option 1 min") << QString() << "0" << 1800;
    }

    void longestFilm()
    {
        QFETCH(QString, stored);
        QFETCH(QString, option);
        QFETCH(int, totalFrames);
        {
            QSettings store(QSettings::NativeFormat, QSettings::UserScope, SettingsOrganisation, SettingsApplication);
            QVERIFY(store.fileName().startsWith(m_dir.path()));
            if (stored.isEmpty())
                store.remove(SettingsKey::MaxAnimationDuration);
            else
                AppSettings(store).setMaxAnimationDuration(stored.toInt());
        }
        const CliRun run = events(option.isEmpty() ? QStringList{"--summary"}
                                                   : QStringList{"--summary", "--max-duration", option});
        QCOMPARE(run.exitCode, 0);
        QCOMPARE(QJsonDocument::fromJson(run.out).object().value(QStringLiteral("totalFrames")).toInt(), totalFrames);
    }

    // Exit code 1, one line naming the trouble, nothing on standard output.
    void badInput_data()
    {
        QTest::addColumn<QStringList>("args");
        QTest::addColumn<QString>("named");
        QTest::newRow("no file") << QStringList{"events"} << "FILE";
        QTest::newRow("missing file") << QStringList{"events", "missing.zkgeo"} << "missing.zkgeo";
        QTest::newRow("no project") << QStringList{"events", "junk.txt", "--summary"} << "junk.txt";
        QTest::newRow("bad --linear") << QStringList{"events", "tour.zkgeo", "--linear", "2"} << "--linear";
        QTest::newRow("--flyin without value") << QStringList{"events", "tour.zkgeo", "--flyin"} << "--flyin";
        QTest::newRow("bad --max-duration") << QStringList{"events", "tour.zkgeo", "--max-duration", "5"}
                                            << "--max-duration";
    }

    void badInput()
    {
        QFETCH(QStringList, args);
        QFETCH(QString, named);
        writeTestFile(m_dir, QStringLiteral("junk.txt"), "neither a project nor a track\n");
        if (args.size() > 1)
            args[1] = m_dir.filePath(args[1]);
        const CliRun run = runCli(args);
        QCOMPARE(run.exitCode, 1);
        QVERIFY(run.out.isEmpty());
        QCOMPARE(run.err.count('\n'), 1);
        QVERIFY2(run.err.contains(named.toUtf8()), run.err.constData());
    }
};

QTEST_GUILESS_MAIN(TestEventsCli)
#include "tst_eventscli.moc"
