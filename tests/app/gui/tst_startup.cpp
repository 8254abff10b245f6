#include "app/AppSettings.h"
#include "app/CommandLine.h"
#include "app/HostPrograms.h"
#include "app/StartupChoices.h"
#include "platform/SingleInstance.h"

#include <QElapsedTimer>
#include <QFile>
#include <QProcess>
#include <QSettings>
#include <QSysInfo>
#include <QTemporaryDir>
#include <QtTest>

class TestStartup : public QObject
{
    Q_OBJECT

private:
    // Runs the program with TMPDIR pointing at folder, where the lock of a first
    // instance may lie; returns its exit code, or -1 when it had to be killed.
    static int runProgram(const QString &folder, const QStringList &arguments, QByteArray *output = nullptr)
    {
        QProcess program;
        QProcessEnvironment env = QProcessEnvironment::systemEnvironment();
        env.insert(QStringLiteral("TMPDIR"), folder);
        // A log or settings written by mistake stay in the test's folder.
        env.insert(QStringLiteral("XDG_DATA_HOME"), folder);
        env.insert(QStringLiteral("XDG_CONFIG_HOME"), folder);
        env.insert(QStringLiteral("QT_QPA_PLATFORM"), QStringLiteral("offscreen"));
        program.setProcessEnvironment(env);
        program.start(QStringLiteral(TOURLET_PROGRAM), arguments);
        if (!program.waitForFinished(10000)) {
            program.kill();
            program.waitForFinished();
            return -1;
        }
        if (output)
            *output = program.readAllStandardOutput();
        return program.exitStatus() == QProcess::NormalExit ? program.exitCode() : -1;
    }

private slots:
    void renderLoopChoice_data()
    {
        QTest::addColumn<QString>("stored");
        QTest::addColumn<bool>("noBlacklist");
        QTest::addColumn<QByteArray>("renderLoop"); // empty: left as the environment had it
        QTest::addColumn<QByteArray>("bugList");

        QTest::newRow("default basic") << QString() << false << QByteArray("basic") << QByteArray("zkopenglblacklist.json");
        QTest::newRow("threaded") << "threaded" << false << QByteArray("threaded") << QByteArray("zkopenglblacklist.json");
        QTest::newRow("windows") << "windows" << false << QByteArray("windows") << QByteArray("zkopenglblacklist.json");
        QTest::newRow("software sets nothing") << "software" << false << QByteArray() << QByteArray();
        QTest::newRow("match is exact") << "Threaded" << false << QByteArray() << QByteArray();
        QTest::newRow("/noblacklist touches nothing") << "threaded" << true << QByteArray() << QByteArray();
    }

    void renderLoopChoice()
    {
        QFETCH(QString, stored);
        QFETCH(bool, noBlacklist);
        QFETCH(QByteArray, renderLoop);
        QFETCH(QByteArray, bugList);

        QTemporaryDir dir;
        QSettings store(dir.filePath(QStringLiteral("settings.ini")), QSettings::IniFormat);
        if (!stored.isNull())
            store.setValue(SettingsKey::RenderLoop, stored);
        const AppSettings settings(store);

        // What the user's environment held before the start.
        const QByteArray before("from-environment");
        qputenv(Startup::RenderLoopVariable, before);
        qputenv(Startup::BugListVariable, before);

        StartSwitches switches;
        switches.noBlacklist = noBlacklist;
        Startup::chooseRenderLoop(switches, settings);

        QCOMPARE(qgetenv(Startup::RenderLoopVariable), renderLoop.isEmpty() ? before : renderLoop);
        QCOMPARE(qgetenv(Startup::BugListVariable), bugList.isEmpty() ? before : bugList);
        qunsetenv(Startup::RenderLoopVariable);
        qunsetenv(Startup::BugListVariable);
    }

    void scaleThreshold_data()
    {
        QTest::addColumn<int>("availableHeight");
        QTest::addColumn<double>("scale");
        QTest::newRow("at the threshold") << 1450 << 1.0;
        QTest::newRow("one above") << 1451 << 2.0;
    }

    void scaleThreshold()
    {
        QFETCH(int, availableHeight);
        QFETCH(double, scale);
        QCOMPARE(Startup::scaleForAvailableHeight(availableHeight), scale);
    }

    void startSwitchesBeforeHostArguments_data()
    {
        QTest::addColumn<QStringList>("arguments");
        QTest::addColumn<bool>("logging");
        QTest::addColumn<QStringList>("hostArguments");
        QTest::addColumn<QString>("file");

        const QStringList host{QStringLiteral("1A2B"), QStringLiteral("editor")};
        QTest::newRow("host switches alone") << QStringList{"tourlet", "/h=?1A2B", "/k=?editor"} << false << host << QString();
        QTest::newRow("/logging in front") << QStringList{"tourlet", "/logging", "/h=?1A2B", "/k=?editor"} << true << host
                                           << QString();
        QTest::newRow("both switches around")
            << QStringList{"tourlet", "/noblacklist", "/h=?1A2B", "/logging", "/k=?editor", "/logging"} << true << host
            << QString();
        QTest::newRow("switches match case") << QStringList{"tourlet", "/Logging", "/h=?1A2B", "/k=?editor"} << false
                                             << QStringList() << QStringLiteral("/Logging");
        QTest::newRow("a file") << QStringList{"tourlet", "/logging", "/tmp/trip.zkgeo"} << true << QStringList()
                                << QStringLiteral("/tmp/trip.zkgeo");
        QTest::newRow("relative to the start folder") << QStringList{"tourlet", "trip.gpx"} << false << QStringList()
                                                      << QDir::current().absoluteFilePath(QStringLiteral("trip.gpx"));
        QTest::newRow("options are no files") << QStringList{"tourlet", "--fullscreen", "/tmp/a.gpx", "/tmp/b.gpx"}
                                              << false << QStringList() << QStringLiteral("/tmp/a.gpx");
        QTest::newRow("after -- all are files") << QStringList{"tourlet", "--", "-odd.gpx"} << false << QStringList()
                                                << QDir::current().absoluteFilePath(QStringLiteral("-odd.gpx"));
    }

    void startSwitchesBeforeHostArguments()
    {
        QFETCH(QStringList, arguments);
        QFETCH(bool, logging);
        QFETCH(QStringList, hostArguments);
        QFETCH(QString, file);

        QCOMPARE(readStartSwitches(arguments).logging, logging);
        const QStringList remaining = withoutStartSwitches(arguments);
        QCOMPARE(parseHostArguments(remaining), hostArguments);
        QCOMPARE(fileToOpen(remaining), file);
    }

    void secondInstanceExitsWhileFirstRuns()
    {
        QTemporaryDir tmp;
        SingleInstance first(QLatin1String(SingleInstance::ProgramKey), tmp.path());
        QVERIFY(!first.isSecondInstance());
        const QByteArray lockBefore = [&] {
            QFile f(first.lockFilePath());
            return f.open(QIODevice::ReadOnly) ? f.readAll() : QByteArray();
        }();
        QVERIFY(!lockBefore.isEmpty());

        QElapsedTimer clock;
        clock.start();
        QCOMPARE(runProgram(tmp.path(), {QStringLiteral("/logging")}), 0);
        QVERIFY2(clock.elapsed() < 5000, "the second instance should leave at once");

        // The first still holds its lock, untouched.
        QFile lock(first.lockFilePath());
        QVERIFY(lock.open(QIODevice::ReadOnly));
        QCOMPARE(lock.readAll(), lockBefore);
        QVERIFY(SingleInstance(QLatin1String(SingleInstance::ProgramKey), tmp.path()).isSecondInstance());

        // Help and version answer even then.
        QByteArray output;
        QCOMPARE(runProgram(tmp.path(), {QStringLiteral("--version")}, &output), 0);
        QVERIFY2(output.startsWith("Tourlet " TOURLET_VERSION), output.constData());
        QCOMPARE(runProgram(tmp.path(), {QStringLiteral("--help")}, &output), 0);
        QVERIFY2(output.contains("/logging"), output.constData());

        first.release();
        QVERIFY(!SingleInstance(QLatin1String(SingleInstance::ProgramKey), tmp.path()).isSecondInstance());
    }

    void lockOfADeadProcessDoesNotBlock()
    {
        QProcess gone;
        gone.start(QStringLiteral("true"), QStringList());
        QVERIFY(gone.waitForStarted());
        const qint64 pid = gone.processId();
        QVERIFY(gone.waitForFinished());

        QTemporaryDir tmp;
        const QString key = QStringLiteral("crashed-run");
        QFile lock(tmp.filePath(key + QStringLiteral(".lock")));
        QVERIFY(lock.open(QIODevice::WriteOnly));
        lock.write(QByteArray::number(pid) + "\ntourlet\n" + QSysInfo::machineHostName().toUtf8() + "\n");
        lock.close();

        QVERIFY(!SingleInstance(key, tmp.path()).isSecondInstance());
    }
};

QTEST_GUILESS_MAIN(TestStartup)
#include "tst_startup.moc"
