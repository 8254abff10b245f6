#include "TestFiles.h"
#include "project/QProjectController.h"
#include "project/ValueParsers.h"

#include <QFile>
#include <QTemporaryDir>
#include <QTest>

class TestContainer : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;
    QString path(const char *name) const { return m_dir.filePath(QString::fromLatin1(name)); }
    QString write(const char *name, const QByteArray &text) const { return writeTestFile(m_dir, QString::fromLatin1(name), text); }

private slots:
    void awkwardValuesRoundTrip()
    {
        const QStringList values = {
            QStringLiteral("Zürich – 東京 ✈"), QStringLiteral("a=b"), QStringLiteral("x;y"),
            QStringLiteral("one, two,three"), QStringLiteral("\"quoted\" and 'single'"),
            QStringLiteral("C:\\path\\to\\file"), QStringLiteral("  padded  "),
            QStringLiteral("line1\nline2\r\nline3"), QStringLiteral("%percent% #hash [bracket]"),
            QString(), QStringLiteral("@Variant(junk)"), QStringLiteral("\t tab")};
        const QString file = path("awkward.zkgeo");
        QProjectController c;
        QVERIFY(c.createProjectFile(file));
        for (int i = 0; i < values.size(); ++i)
            QVERIFY(c.writeProperty(QStringLiteral("sec tion%1").arg(i), QStringLiteral("key=%1;,").arg(i), values.at(i)));
        QVERIFY(c.closeProjectFile());

        QVERIFY(c.openProjectFile(file, true));
        QCOMPARE(c.projectVersion(), 2u);
        for (int i = 0; i < values.size(); ++i)
            QCOMPARE(c.readProperty(QStringLiteral("sec tion%1").arg(i), QStringLiteral("key=%1;,").arg(i), QStringLiteral("absent")),
                     values.at(i));
        QCOMPARE(c.readProperty(QStringLiteral("nosuch"), QStringLiteral("key"), QStringLiteral("dflt")), QStringLiteral("dflt"));
        QVERIFY(c.closeProjectFile());
    }

    void headerChecksOnOpen_data()
    {
        QTest::addColumn<QByteArray>("text");
        QTest::addColumn<int>("version"); // -1: refused
        QTest::newRow("no project type") << QByteArray("[Header]\nprojectversion=2\n") << -1;
        QTest::newRow("type in lower case") << QByteArray("[Header]\nprojecttype=zkgeo\nprojectversion=2\n") << -1;
        QTest::newRow("newer version") << QByteArray("[Header]\nprojecttype=ZKGEO\nprojectversion=3\n") << -1;
        QTest::newRow("garbage") << QByteArray("\x00\xff\xfe[[[=\n=\n[Header\nprojecttype\n", 30) << -1;
        QTest::newRow("no version") << QByteArray("[Header]\nprojecttype=ZKGEO\n[a]\nb=c\n") << 0;
    }

    void headerChecksOnOpen()
    {
        QFETCH(QByteArray, text);
        QFETCH(int, version);
        const QString file = write("header.zkgeo", text);
        QProjectController c;
        QCOMPARE(c.openProjectFile(file, true), version >= 0);
        if (version >= 0) {
            QCOMPARE(c.projectVersion(), uint32_t(version));
            QCOMPARE(c.readProperty(QStringLiteral("a"), QStringLiteral("b"), QString()), QStringLiteral("c"));
        } else {
            // A failed header check keeps the reader until the close.
            QVERIFY(c.isReading());
            QVERIFY(!c.openProjectFile(file, true));
        }
        QVERIFY(c.closeProjectFile());
    }

    void stateRules()
    {
        const QString first = path("first.zkgeo");
        const QString second = path("second.zkgeo");
        QProjectController c;
        QVERIFY(!c.openProjectFile(path("missing.zkgeo"), true));
        QVERIFY(c.closeProjectFile()); // idle close changes nothing
        QVERIFY(c.readProperty(QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("d")).isEmpty());
        QVERIFY(!c.writeProperty(QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")));

        // One file at a time.
        QVERIFY(c.createProjectFile(first));
        QVERIFY(!c.createProjectFile(second));
        QVERIFY(!c.openProjectFile(second, true));
        QVERIFY(!QFile::exists(second));
        QVERIFY(c.writeProperty(QStringLiteral("s"), QStringLiteral("k"), QStringLiteral("2")));
        QVERIFY(c.closeProjectFile());
        QVERIFY(c.openProjectFile(first, true));
        QVERIFY(!c.openProjectFile(first, true));
        QCOMPARE(c.readProperty(QStringLiteral("s"), QStringLiteral("k"), QString()), QStringLiteral("2"));
        QVERIFY(!c.writeProperty(QStringLiteral("s"), QStringLiteral("k3"), QStringLiteral("3")));
        c.closeProjectFile();

        // Reopening for writing keeps what is there and lifts the header.
        const QString old = write("old.zkgeo", "[Header]\nprojecttype=ZKGEO\nprojectversion=1\n[keep]\nme=yes\n");
        QVERIFY(c.openProjectFile(old, false));
        QVERIFY(c.writeProperty(QStringLiteral("altprs.Main"), QStringLiteral("k"), QStringLiteral("v")));
        c.closeProjectFile();
        QVERIFY(c.openProjectFile(old, true));
        QCOMPARE(c.projectVersion(), 2u);
        QCOMPARE(c.readProperty(QStringLiteral("keep"), QStringLiteral("me"), QString()), QStringLiteral("yes"));
        QCOMPARE(c.readProperty(QStringLiteral("altprs.Main"), QStringLiteral("k"), QString()), QStringLiteral("v"));
        c.closeProjectFile();
    }

    void createReplacesAndUnwritableGoesOn()
    {
        const QString file = write("replace.zkgeo", "[old]\nvalue=1\n");
        QProjectController c;
        QVERIFY(c.createProjectFile(file));
        c.closeProjectFile();
        QVERIFY(c.openProjectFile(file, true));
        QCOMPARE(c.readProperty(QStringLiteral("old"), QStringLiteral("value"), QStringLiteral("gone")), QStringLiteral("gone"));
        c.closeProjectFile();

        // An unwritable place: create still answers true, every write then fails.
        QVERIFY(c.createProjectFile(path("no/such/dir/x.zkgeo")));
        QVERIFY(c.fileName().isEmpty());
        QVERIFY(!c.writeProperty(QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")));
        QVERIFY(c.closeProjectFile());
    }

    // What each parser makes of a text: the value, "not read" with the target kept, or the
    // message of the damaged number (which leaves the target too).
    void numberParsers_data()
    {
        QTest::addColumn<char>("parser");
        QTest::addColumn<QString>("text");
        QTest::addColumn<QString>("expected");
        const QString range = QStringLiteral("stoi argument out of range"), invalid = QStringLiteral("invalid stoi argument");
        QTest::newRow("int, empty") << 'i' << QString() << "not read, 7";
        QTest::newRow("int, blanks and tail") << 'i' << "  -42xyz" << "-42";
        QTest::newRow("int, largest") << 'i' << "2147483647" << "2147483647";
        QTest::newRow("int, smallest") << 'i' << "-2147483648" << "-2147483648";
        QTest::newRow("int, one too large") << 'i' << "2147483648" << range;
        QTest::newRow("int, far too large") << 'i' << "99999999999999999999999" << range;
        QTest::newRow("int, letters") << 'i' << "x1" << invalid;
        QTest::newRow("int, sign alone") << 'i' << "-" << invalid;
        QTest::newRow("uint, all bits") << 'u' << "4294967295" << "4294967295";
        QTest::newRow("uint, all bits after a blank") << 'u' << " 4294967295" << range;
        QTest::newRow("uint, one less") << 'u' << "4294967294" << range;
        QTest::newRow("ulong, beyond int") << 'l' << "3000000000" << "stol argument out of range";
        QTest::newRow("bool, 2") << 'b' << "2" << "1";
        QTest::newRow("bool, 0") << 'b' << "0" << "0";
        QTest::newRow("bool, word") << 'b' << "true" << invalid;
        QTest::newRow("double, empty") << 'd' << QString() << "not read, 7";
        QTest::newRow("double, exponent and tail") << 'd' << " 12.5e1 trailing" << "125";
        QTest::newRow("double, plus") << 'd' << "+0.25" << "0.25";
        QTest::newRow("double, too large") << 'd' << "1e999" << "stod argument out of range";
        QTest::newRow("double, two signs") << 'd' << "+-1" << "invalid stod argument";
    }

    void numberParsers()
    {
        QFETCH(char, parser);
        QFETCH(QString, text);
        QFETCH(QString, expected);
        int32_t i = 7;
        uint32_t u = 7;
        bool b = false;
        double d = 7;
        QString got;
        try {
            bool read = false;
            switch (parser) {
            case 'i': read = initInt(text, i), got = QString::number(i); break;
            case 'u': read = initUInt(text, u), got = QString::number(u); break;
            case 'l': read = initULong(text, u), got = QString::number(u); break;
            case 'b': read = initBool(text, b), got = QString::number(b); break;
            case 'd': read = initDouble(text, d), got = QString::number(d); break;
            }
            if (!read)
                got.prepend(QStringLiteral("not read, "));
        } catch (const DamagedNumberError &e) {
            got = QString::fromLatin1(e.what());
            QVERIFY(i == 7 && u == 7 && !b && d == 7);
        }
        QCOMPARE(got, expected);
    }

    void otherParsersKeepTheTargetWhenNothingIsRead()
    {
        QString s = QStringLiteral("keep");
        QVERIFY(!initString(QStringLiteral("same"), s, QStringLiteral("same")));
        QVERIFY(initString(QStringLiteral("new"), s));
        QCOMPARE(s, QStringLiteral("new"));
        int32_t w = 1, h = 2;
        QVERIFY(!initDimension(QStringLiteral("1920"), QString(), w, h));
        QCOMPARE(w, 1);
        QVERIFY(initDimension(QStringLiteral("1920"), QStringLiteral("1080"), w, h));
        QCOMPARE(QSize(w, h), QSize(1920, 1080));
    }

    void documentDoublesRoundToSixPlacesButCoordinatesStayExact()
    {
        double d = 0;
        QVERIFY(initDouble(formatDouble(1.23456789), d));
        QCOMPARE(d, 1.234568);
        for (double exact : {1.23456789, 0.1 + 0.2, -179.99999999999997}) {
            QVERIFY(initDouble(formatCoordinate(exact), d));
            QVERIFY(d == exact);
        }
    }
};

QTEST_GUILESS_MAIN(TestContainer)
#include "tst_container.moc"
