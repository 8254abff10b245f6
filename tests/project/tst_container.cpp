#include "project/QProjectController.h"
#include "project/ValueParsers.h"

#include <QFile>
#include <QTemporaryDir>
#include <QTest>

#include <limits>

class TestContainer : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;
    QString path(const char *name) const { return m_dir.filePath(QString::fromLatin1(name)); }
    static void writeText(const QString &file, const QByteArray &text)
    {
        QFile f(file);
        QVERIFY(f.open(QIODevice::WriteOnly));
        f.write(text);
    }

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
            QVERIFY(c.writeProperty(QStringLiteral("sec tion/%1").arg(i).section('/', 0, 0) + QString::number(i),
                                    QStringLiteral("key=%1;,").arg(i), values.at(i)));
        QVERIFY(c.closeProjectFile());

        QProjectController r;
        QVERIFY(r.openProjectFile(file, true));
        QCOMPARE(r.projectVersion(), 2u);
        for (int i = 0; i < values.size(); ++i)
            QCOMPARE(r.readProperty(QStringLiteral("sec tion") + QString::number(i), QStringLiteral("key=%1;,").arg(i),
                                    QStringLiteral("absent")),
                     values.at(i));
        QCOMPARE(r.readProperty(QStringLiteral("nosuch"), QStringLiteral("key"), QStringLiteral("dflt")), QStringLiteral("dflt"));
        QVERIFY(r.closeProjectFile());
    }

    void headerChecksOnOpen()
    {
        QProjectController c;
        QVERIFY(!c.openProjectFile(path("missing.zkgeo"), true));
        QVERIFY(c.isIdle());

        const QString noType = path("notype.zkgeo");
        writeText(noType, "[Header]\nprojectversion=2\n");
        QVERIFY(!c.openProjectFile(noType, true));
        QVERIFY(c.isReading()); // a failed header check keeps the reader until close
        QVERIFY(!c.openProjectFile(noType, true));
        QVERIFY(c.closeProjectFile());

        const QString lower = path("lower.zkgeo");
        writeText(lower, "[Header]\nprojecttype=zkgeo\nprojectversion=2\n");
        QVERIFY(!c.openProjectFile(lower, true));
        c.closeProjectFile();

        const QString v3 = path("v3.zkgeo");
        writeText(v3, "[Header]\nprojecttype=ZKGEO\nprojectversion=3\n");
        QVERIFY(!c.openProjectFile(v3, true));
        c.closeProjectFile();

        const QString v0 = path("v0.zkgeo");
        writeText(v0, "[Header]\nprojecttype=ZKGEO\n[a]\nb=c\n");
        QVERIFY(c.openProjectFile(v0, true));
        QCOMPARE(c.projectVersion(), 0u);
        QCOMPARE(c.readProperty(QStringLiteral("a"), QStringLiteral("b"), QString()), QStringLiteral("c"));
        c.closeProjectFile();

        const QString garbage = path("garbage.zkgeo");
        writeText(garbage, QByteArray("\x00\xff\xfe[[[=\n=\n[Header\nprojecttype\n", 30));
        QVERIFY(!c.openProjectFile(garbage, true));
        c.closeProjectFile();
    }

    void stateRules()
    {
        const QString first = path("first.zkgeo");
        const QString second = path("second.zkgeo");
        QProjectController c;
        QVERIFY(c.closeProjectFile()); // idle close changes nothing
        QVERIFY(c.isIdle());
        QVERIFY(c.readProperty(QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("d")).isEmpty());
        QVERIFY(!c.writeProperty(QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")));

        QVERIFY(c.createProjectFile(first));
        QVERIFY(c.writeProperty(QStringLiteral("s"), QStringLiteral("k"), QStringLiteral("1")));
        QVERIFY(!c.createProjectFile(second));
        QVERIFY(!c.openProjectFile(second, true));
        QVERIFY(!QFile::exists(second));
        QCOMPARE(c.fileName(), first); // the first file stays open
        QVERIFY(c.writeProperty(QStringLiteral("s"), QStringLiteral("k2"), QStringLiteral("2")));
        QVERIFY(c.closeProjectFile());

        QVERIFY(c.openProjectFile(first, true));
        QVERIFY(!c.openProjectFile(first, true));
        QCOMPARE(c.readProperty(QStringLiteral("s"), QStringLiteral("k2"), QString()), QStringLiteral("2"));
        QVERIFY(!c.writeProperty(QStringLiteral("s"), QStringLiteral("k3"), QStringLiteral("3")));
        c.closeProjectFile();

        // Reopening for writing keeps what is there and lifts the header.
        const QString old = path("old.zkgeo");
        writeText(old, "[Header]\nprojecttype=ZKGEO\nprojectversion=1\n[keep]\nme=yes\n");
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
        const QString file = path("replace.zkgeo");
        writeText(file, "[old]\nvalue=1\n");
        QProjectController c;
        QVERIFY(c.createProjectFile(file));
        c.closeProjectFile();
        QVERIFY(c.openProjectFile(file, true));
        QCOMPARE(c.readProperty(QStringLiteral("old"), QStringLiteral("value"), QStringLiteral("gone")), QStringLiteral("gone"));
        c.closeProjectFile();

        // An unwritable place: create still answers true, every write then fails.
        QVERIFY(c.createProjectFile(m_dir.filePath(QStringLiteral("no/such/dir/x.zkgeo"))));
        QVERIFY(c.fileName().isEmpty());
        QVERIFY(!c.writeProperty(QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")));
        QVERIFY(c.closeProjectFile());
    }

    void integerParsers()
    {
        int32_t i = 7;
        QVERIFY(!initInt(QString(), i));
        QCOMPARE(i, 7);
        QVERIFY(initInt(QStringLiteral("  -42xyz"), i));
        QCOMPARE(i, -42);
        QVERIFY(initInt(QStringLiteral("2147483647"), i));
        QCOMPARE(i, std::numeric_limits<int32_t>::max());
        QVERIFY(initInt(QStringLiteral("-2147483648"), i));
        QCOMPARE(i, std::numeric_limits<int32_t>::min());
        QVERIFY_EXCEPTION_THROWN(initInt(QStringLiteral("2147483648"), i), DamagedNumberError);
        QVERIFY_EXCEPTION_THROWN(initInt(QStringLiteral("4294967295"), i), DamagedNumberError);
        QVERIFY_EXCEPTION_THROWN(initInt(QStringLiteral("99999999999999999999999"), i), DamagedNumberError);
        QVERIFY_EXCEPTION_THROWN(initInt(QStringLiteral("abc"), i), DamagedNumberError);
        QVERIFY_EXCEPTION_THROWN(initInt(QStringLiteral("-"), i), DamagedNumberError);
        QCOMPARE(i, std::numeric_limits<int32_t>::min()); // a throw leaves the target

        try {
            initInt(QStringLiteral("x1"), i);
            QFAIL("no throw");
        } catch (const DamagedNumberError &e) {
            QCOMPARE(QByteArray(e.what()), QByteArray("invalid stoi argument"));
            QCOMPARE(int(e.kind()), int(DamagedNumberError::Kind::InvalidArgument));
        }
        try {
            uint32_t u = 0;
            initULong(QStringLiteral("3000000000"), u);
            QFAIL("no throw");
        } catch (const DamagedNumberError &e) {
            QCOMPARE(QByteArray(e.what()), QByteArray("stol argument out of range"));
        }

        uint32_t u = 5;
        QVERIFY(initUInt(QStringLiteral("4294967295"), u));
        QCOMPARE(u, std::numeric_limits<uint32_t>::max());
        QVERIFY_EXCEPTION_THROWN(initUInt(QStringLiteral(" 4294967295"), u), DamagedNumberError);
        QVERIFY_EXCEPTION_THROWN(initUInt(QStringLiteral("4294967294"), u), DamagedNumberError);
        QVERIFY(initUInt(QStringLiteral("17"), u));
        QCOMPARE(u, 17u);
        QVERIFY(!initULong(QString(), u));
        QCOMPARE(u, 17u);

        bool b = false;
        QVERIFY(initBool(QStringLiteral("2"), b));
        QVERIFY(b);
        QVERIFY(initBool(QStringLiteral("0"), b));
        QVERIFY(!b);
        QVERIFY(initBool(QStringLiteral("-1"), b));
        QVERIFY(b);
        QVERIFY_EXCEPTION_THROWN(initBool(QStringLiteral("true"), b), DamagedNumberError);

        int32_t w = 1, h = 2;
        QVERIFY(!initDimension(QStringLiteral("1920"), QString(), w, h));
        QCOMPARE(w, 1);
        QVERIFY(initDimension(QStringLiteral("1920"), QStringLiteral("1080"), w, h));
        QCOMPARE(w, 1920);
        QCOMPARE(h, 1080);
    }

    void doubleAndStringParsers()
    {
        double d = 1.5;
        QVERIFY(!initDouble(QString(), d));
        QCOMPARE(d, 1.5);
        QVERIFY(initDouble(QStringLiteral(" 12.5e1 trailing"), d));
        QCOMPARE(d, 125.0);
        QVERIFY(initDouble(QStringLiteral("+0.25"), d));
        QCOMPARE(d, 0.25);
        QVERIFY(initDouble(QStringLiteral("-3"), d));
        QCOMPARE(d, -3.0);
        QVERIFY_EXCEPTION_THROWN(initDouble(QStringLiteral("1e999"), d), DamagedNumberError);
        QVERIFY_EXCEPTION_THROWN(initDouble(QStringLiteral("x"), d), DamagedNumberError);
        QVERIFY_EXCEPTION_THROWN(initDouble(QStringLiteral("+-1"), d), DamagedNumberError);

        QString s = QStringLiteral("keep");
        QVERIFY(!initString(QString(), s));
        QCOMPARE(s, QStringLiteral("keep"));
        QVERIFY(initString(QStringLiteral("new"), s));
        QCOMPARE(s, QStringLiteral("new"));
        QVERIFY(!initString(QStringLiteral("same"), s, QStringLiteral("same")));
        QCOMPARE(s, QStringLiteral("new"));
    }

    void documentDoublesRoundToSixPlacesButCoordinatesStayExact()
    {
        const QString file = path("precision.zkgeo");
        const double value = 1.23456789;
        const double awkward = 0.1 + 0.2;
        QProjectController c;
        QVERIFY(c.createProjectFile(file));
        c.writeProperty(QStringLiteral("doc"), QStringLiteral("d"), formatDouble(value));
        c.writeProperty(QStringLiteral("pt"), QStringLiteral("x"), formatCoordinate(value));
        c.writeProperty(QStringLiteral("pt"), QStringLiteral("y"), formatCoordinate(awkward));
        c.writeProperty(QStringLiteral("pt"), QStringLiteral("z"), formatCoordinate(-179.99999999999997));
        c.writeProperty(QStringLiteral("doc"), QStringLiteral("neg"), formatInt(-5));
        c.writeProperty(QStringLiteral("doc"), QStringLiteral("all"), formatUInt(std::numeric_limits<uint32_t>::max()));
        c.closeProjectFile();

        QVERIFY(c.openProjectFile(file, true));
        double d = 0, x = 0, y = 0, z = 0;
        QVERIFY(initDouble(c.readProperty(QStringLiteral("doc"), QStringLiteral("d"), QString()), d));
        QCOMPARE(d, 1.234568);
        QVERIFY(initDouble(c.readProperty(QStringLiteral("pt"), QStringLiteral("x"), QString()), x));
        QVERIFY(initDouble(c.readProperty(QStringLiteral("pt"), QStringLiteral("y"), QString()), y));
        QVERIFY(initDouble(c.readProperty(QStringLiteral("pt"), QStringLiteral("z"), QString()), z));
        QVERIFY(x == value && y == awkward && z == -179.99999999999997);
        int32_t n = 0;
        QVERIFY(initInt(c.readProperty(QStringLiteral("doc"), QStringLiteral("neg"), QString()), n));
        QCOMPARE(n, -5);
        uint32_t all = 0;
        QVERIFY(initUInt(c.readProperty(QStringLiteral("doc"), QStringLiteral("all"), QString()), all));
        QCOMPARE(all, std::numeric_limits<uint32_t>::max());
        c.closeProjectFile();
    }
};

QTEST_GUILESS_MAIN(TestContainer)
#include "tst_container.moc"
