#include "TestFiles.h"
#include "app/LogMessageHandler.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QStandardPaths>
#include <QTemporaryDir>
#include <QTest>

class TestLogHandler : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_home;

    static QByteArray readAll(const QString &file)
    {
        QFile f(file);
        return f.open(QIODevice::ReadOnly) ? f.readAll() : QByteArray();
    }
    static QString logIn(const QString &dir) { return dir + QStringLiteral("/routeloom.log"); }

private slots:
    void initTestCase()
    {
        QVERIFY(m_home.isValid());
        qputenv("HOME", QFile::encodeName(m_home.path()));
        qunsetenv("XDG_DATA_HOME");
        QStandardPaths::setTestModeEnabled(true);
    }

    void recordFormat()
    {
        const QDateTime t(QDate(2024, 3, 5), QTime(7, 8, 9, 12));
        QCOMPARE(formatLogRecord(QtWarningMsg, QStringLiteral("w"), t), QStringLiteral("[2024-03-05 07:08:09:012] [W] w"));
        QCOMPARE(formatLogRecord(QtCriticalMsg, QStringLiteral("c"), t), QStringLiteral("[2024-03-05 07:08:09:012] [C] c"));
        // Info records keep only the time stamp and its trailing blank.
        QCOMPARE(formatLogRecord(QtInfoMsg, QStringLiteral("lost"), t), QStringLiteral("[2024-03-05 07:08:09:012] "));
        // Placeholders in the text are not expanded again.
        QCOMPARE(formatLogRecord(QtDebugMsg, QStringLiteral("%1 %2 100%"), t), QStringLiteral("[2024-03-05 07:08:09:012] [D] %1 %2 100%"));
    }

    void appendsAndCreatesLastFolderLevel()
    {
        QTemporaryDir tmp;
        const QString dir = tmp.filePath(QStringLiteral("logs"));
        writeLogRecord(dir, QtWarningMsg, QStringLiteral("Zürich ✈ first"));
        writeLogRecord(dir, QtDebugMsg, QStringLiteral("second"));
        const QStringList lines = QString::fromUtf8(readAll(logIn(dir))).split(QLatin1Char('\n'));
        QCOMPARE(lines.size(), 3);
        QVERIFY(lines.at(0).endsWith(QStringLiteral("] [W] Zürich ✈ first")));
        QVERIFY(lines.at(1).endsWith(QStringLiteral("] [D] second")));

        // Only the last level is created.
        writeLogRecord(tmp.filePath(QStringLiteral("a/b")), QtDebugMsg, QStringLiteral("nowhere"));
        QVERIFY(!QFileInfo::exists(tmp.filePath(QStringLiteral("a"))));
    }

    void rotatesOnlyAboveTheLimit()
    {
        QTemporaryDir tmp;
        const QString log = logIn(tmp.path());
        const QString bak = log + QStringLiteral(".bak");
        {
            QFile f(log);
            QVERIFY(f.open(QIODevice::WriteOnly));
            QVERIFY(f.resize(LogFile::RotationSize)); // sparse: no 10 MB written
        }
        writeTestFile(tmp, QStringLiteral("routeloom.log.bak"), "old backup\n");

        // Exactly at the limit: appended to, not rotated.
        writeLogRecord(tmp.path(), QtDebugMsg, QStringLiteral("at limit"));
        const qint64 grown = QFileInfo(log).size();
        QCOMPARE(readAll(bak), QByteArray("old backup\n"));

        // The next record finds it larger: the log becomes the backup, the old backup is lost.
        writeLogRecord(tmp.path(), QtCriticalMsg, QStringLiteral("fresh start"));
        QCOMPARE(QFileInfo(bak).size(), grown);
        QVERIFY(readAll(bak).endsWith("] [D] at limit\n"));
        const QByteArray fresh = readAll(log);
        QCOMPARE(fresh.count('\n'), 1);
        QVERIFY(fresh.endsWith("] [C] fresh start\n"));
    }

    void unwritablePlacesDropTheLine()
    {
        QTemporaryDir tmp;
        // A folder that can't be made because a file is in the way.
        const QString blocker = writeTestFile(tmp, QStringLiteral("file"), QByteArray());
        writeLogRecord(blocker + QStringLiteral("/logs"), QtWarningMsg, QStringLiteral("x"));
        QCOMPARE(QFileInfo(blocker).size(), qint64(0));

        // The log name taken by a folder.
        const QString taken = tmp.filePath(QStringLiteral("taken"));
        QVERIFY(QDir().mkpath(logIn(taken)));
        writeLogRecord(taken, QtWarningMsg, QStringLiteral("x"));
        QVERIFY(QFileInfo(logIn(taken)).isDir());

        // No data folder at all: nothing lands at the file system root.
        const bool atRootBefore = QFileInfo::exists(QStringLiteral("/routeloom.log"));
        writeLogRecord(QString(), QtDebugMsg, QStringLiteral("no folder"));
        QCOMPARE(QFileInfo::exists(QStringLiteral("/routeloom.log")), atRootBefore);
    }

    void lockedFolderDropsTheLine()
    {
        QTemporaryDir tmp;
        const QString locked = tmp.filePath(QStringLiteral("locked"));
        QVERIFY(QDir().mkdir(locked));
        QVERIFY(QFile::setPermissions(locked, QFile::ReadOwner | QFile::ExeOwner));
        const bool writableAnyway = QFileInfo(locked).isWritable();
        writeLogRecord(locked, QtWarningMsg, QStringLiteral("x"));
        const bool written = QFileInfo::exists(logIn(locked));
        QFile::setPermissions(locked, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
        if (writableAnyway)
            QSKIP("running with rights that ignore folder permissions");
        QVERIFY(!written);
    }

    void installedHandlerWritesToDataFolder()
    {
        const QString dir = QStandardPaths::writableLocation(QStandardPaths::DataLocation);
        QVERIFY2(dir.startsWith(m_home.path()), qPrintable(dir));
        // The handler makes only the last level; the test home starts empty.
        QVERIFY(QDir().mkpath(QFileInfo(dir).path()));

        const QtMessageHandler previous = qInstallMessageHandler(logMessageHandler);
        qDebug("through %s", "qDebug");
        qWarning() << "a warning";
        qInstallMessageHandler(previous);

        const QStringList lines = QString::fromUtf8(readAll(logIn(dir))).split(QLatin1Char('\n'), Qt::SkipEmptyParts);
        QCOMPARE(lines.size(), 2);
        QVERIFY(lines.at(0).endsWith(QStringLiteral("] [D] through qDebug")));
        QVERIFY(lines.at(1).endsWith(QStringLiteral("] [W] a warning")));
    }
};

QTEST_GUILESS_MAIN(TestLogHandler)
#include "tst_loghandler.moc"
