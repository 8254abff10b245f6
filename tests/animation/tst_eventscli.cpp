#include "CliRun.h"
#include "app/AppSettings.h"
#include "path/PathManager.h"
#include "project/DocumentFile.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QFile>
#include <QJsonDocument>
#include <QJsonObject>
#include <QSet>
#include <QSettings>
#include <QTemporaryDir>
#include <QTest>

#include <cmath>

namespace {

QList<QJsonObject> lines(const QByteArray &out)
{
    QList<QJsonObject> objects;
    for (const QByteArray &line : out.split('\n')) {
        if (line.isEmpty())
            continue;
        QJsonParseError error;
        const QJsonDocument doc = QJsonDocument::fromJson(line, &error);
        if (error.error != QJsonParseError::NoError || !doc.isObject())
            return {};
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
        CliRun run = runCli({QStringLiteral("events"), m_project, QStringLiteral("--linear"), QStringLiteral("0"),
                       QStringLiteral("--summary")});
        QCOMPARE(run.exitCode, 0);
        const QJsonObject summary = QJsonDocument::fromJson(run.out).object();
        const QJsonObject counts = summary.value(QStringLiteral("counts")).toObject();
        QCOMPARE(counts.value(QStringLiteral("start")).toInt(), 1);
        QCOMPARE(counts.value(QStringLiteral("end")).toInt(), 1);
        QCOMPARE(counts.value(QStringLiteral("flyin")).toInt(), 0);
        // 90 and 180 frames, each leg closed by its step at the next key point; the
        // step size may leave one more step on a leg.
        const int steps = counts.value(QStringLiteral("step")).toInt();
        QVERIFY2(steps >= 272 && steps <= 274, qPrintable(QString::number(steps)));
        QCOMPARE(summary.value(QStringLiteral("totalFrames")).toInt(), 4050); // 270 * 15
        QCOMPARE(summary.value(QStringLiteral("stretch")).toDouble(), 1.0);
        QCOMPARE(summary.value(QStringLiteral("durationText")).toString(), QStringLiteral("00m09s"));
        int all = 0;
        for (const QString &type : counts.keys())
            all += counts.value(type).toInt();
        QCOMPARE(summary.value(QStringLiteral("events")).toInt(), all);
        QVERIFY(summary.value(QStringLiteral("pilotSteps")).toInt() > 0);

        run = runCli({QStringLiteral("events"), m_project, QStringLiteral("--linear"), QStringLiteral("0")});
        QCOMPARE(run.exitCode, 0);
        const QList<QJsonObject> events = lines(run.out);
        QCOMPARE(events.size(), all);
        QSet<qint64> keys;
        int pilotSteps = 0;
        for (int i = 0; i < events.size(); ++i) {
            QCOMPARE(events[i].value(QStringLiteral("index")).toInt(), i);
            QCOMPARE(sortedKeys(events[i]),
                     (QStringList{"cKpId", "index", "pathPosition", "stepAnimatedPilot", "type"}));
            keys.insert(events[i].value(QStringLiteral("cKpId")).toVariant().toLongLong());
            pilotSteps += events[i].value(QStringLiteral("stepAnimatedPilot")).toBool() ? 1 : 0;
        }
        QCOMPARE(pilotSteps, summary.value(QStringLiteral("pilotSteps")).toInt());
        QCOMPARE(events.first().value(QStringLiteral("type")).toString(), QStringLiteral("start"));
        QCOMPARE(events.last().value(QStringLiteral("type")).toString(), QStringLiteral("end"));
        // 0 for start, end and the last key point, and the ids of the first two
        QCOMPARE(keys.size(), 3);
        QVERIFY(keys.contains(0));
    }

    void linearAndFlyInFlags()
    {
        // Durations give the first leg a third of the steps; linear timing shares
        // by distance, and the second leg is about four times as long as the first.
        const auto stepsOfFirstLeg = [](const QList<QJsonObject> &events) {
            const QJsonValue first = events.value(1).value(QStringLiteral("cKpId"));
            int steps = 0;
            for (const QJsonObject &e : events)
                steps += e.value(QStringLiteral("type")).toString() == QLatin1String("step") &&
                         e.value(QStringLiteral("cKpId")) == first;
            return steps;
        };
        CliRun run = runCli({QStringLiteral("events"), m_project, QStringLiteral("--linear"), QStringLiteral("0")});
        QCOMPARE(run.exitCode, 0);
        const int byDuration = stepsOfFirstLeg(lines(run.out));
        QVERIFY2(byDuration >= 91 && byDuration <= 92, qPrintable(QString::number(byDuration)));
        run = runCli({QStringLiteral("events"), m_project}); // the document's default is linear
        QCOMPARE(run.exitCode, 0);
        const int byDistance = stepsOfFirstLeg(lines(run.out));
        QVERIFY2(byDistance > 30 && byDistance < 80, qPrintable(QString::number(byDistance)));

        run = runCli({QStringLiteral("events"), m_project, QStringLiteral("--flyin"), QStringLiteral("1"),
                   QStringLiteral("--linear"), QStringLiteral("0")});
        QCOMPARE(run.exitCode, 0);
        const QList<QJsonObject> events = lines(run.out);
        QVERIFY(events.size() > 181);
        for (int i = 1; i <= 150; ++i) {
            QCOMPARE(events[i].value(QStringLiteral("type")).toString(), QStringLiteral("flyin"));
            QCOMPARE(sortedKeys(events[i]), (QStringList{"bearing", "index", "tilt", "type", "zoom"}));
        }
        // The fly-in starts from the route's extent and ends at the user's zoom.
        QVERIFY(events[1].value(QStringLiteral("zoom")).toDouble() < 9.0);
        QCOMPARE(events[150].value(QStringLiteral("zoom")).toDouble(), 9.0);
        QCOMPARE(events[1].value(QStringLiteral("bearing")).toDouble(), 60.0);
        QCOMPARE(events[151].value(QStringLiteral("type")).toString(), QStringLiteral("pause"));
        QCOMPARE(events[180].value(QStringLiteral("type")).toString(), QStringLiteral("pause"));
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
        QStringList args = {QStringLiteral("events"), m_project, QStringLiteral("--summary")};
        if (!option.isEmpty())
            args << QStringLiteral("--max-duration") << option;
        const CliRun run = runCli(args);
        QCOMPARE(run.exitCode, 0);
        QCOMPARE(QJsonDocument::fromJson(run.out).object().value(QStringLiteral("totalFrames")).toInt(), totalFrames);
    }

    void badInput()
    {
        CliRun run = runCli({QStringLiteral("events"), m_dir.filePath(QStringLiteral("missing.zkgeo"))});
        QVERIFY(run.exitCode != 0);
        QVERIFY(run.out.isEmpty());
        QCOMPARE(run.err.count('\n'), 1);

        run = runCli({QStringLiteral("events"), m_project, QStringLiteral("--linear"), QStringLiteral("2")});
        QVERIFY(run.exitCode != 0);
        QVERIFY(run.err.contains("--linear"));
        run = runCli({QStringLiteral("events"), m_project, QStringLiteral("--flyin")});
        QVERIFY(run.exitCode != 0);
        run = runCli({QStringLiteral("events"), m_project, QStringLiteral("--max-duration"), QStringLiteral("5")});
        QVERIFY(run.err.contains("--max-duration"));
        QVERIFY(run.exitCode != 0);
        run = runCli({QStringLiteral("events")});
        QVERIFY(run.exitCode != 0);

        const QString junk = m_dir.filePath(QStringLiteral("junk.txt"));
        QFile file(junk);
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.write("neither a project nor a track\n");
        file.close();
        run = runCli({QStringLiteral("events"), junk, QStringLiteral("--summary")});
        QVERIFY(run.exitCode != 0);
        QVERIFY(run.out.isEmpty());
    }
};

QTEST_GUILESS_MAIN(TestEventsCli)
#include "tst_eventscli.moc"
