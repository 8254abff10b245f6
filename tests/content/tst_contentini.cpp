#include "ContentFiles.h"

#include "content/ContentIni.h"
#include "content/IniAccess.h"

#include <QSettings>
#include <QTemporaryDir>
#include <QTest>

#include <sys/stat.h>

class TestContentIni : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;
    QString path(const QString &name) const { return m_dir.filePath(name); }
    // Read by the content format, or by the platform one.
    static QString value(const QString &file, const QString &section, const QString &key, bool contentIni = true)
    {
        return readIniValue(file, section, key, contentIni, QStringLiteral("<absent>"));
    }
    static QStringList list(const QString &file, const QString &section, bool contentIni = true)
    {
        return readIniList(file, section, QStringLiteral("paths"), QStringLiteral(","), contentIni);
    }

private slots:
    void sectionAndKeyLines()
    {
        const QString file = path(QStringLiteral("lines.ini"));
        QVERIFY(writeFile(file,
                          "top=level\n"
                          "[Big Name]\n"
                          "[ Big  Name ]\n"
                          "b=2\n"
                          "[ Spaced Name ]\n"
                          "key = a = b\n"
                          "a b = c\n"
                          "empty =\n"
                          "Case=MiXed Value\n"
                          "dup=first\n"
                          "dup=second\n"
                          "  folder\\sub =  x  \n"
                          "link=a=b\n"
                          "[Tab\tbed]\n"
                          "t=after tab header\n"
                          "[a]]\n"
                          "z=bracket\n"));
        QCOMPARE(value(file, QString(), QStringLiteral("top")), QStringLiteral("level"));
        // Two blanks make no section: the key stays in the one before.
        QCOMPARE(value(file, QStringLiteral("Big Name"), QStringLiteral("b")), QStringLiteral("2"));
        QCOMPARE(value(file, QStringLiteral("Big  Name"), QStringLiteral("b")), QStringLiteral("<absent>"));
        const QString spaced = QStringLiteral("Spaced Name");
        QCOMPARE(value(file, spaced, QStringLiteral("key")), QStringLiteral("a = b"));
        QCOMPARE(value(file, spaced, QStringLiteral("a b")), QStringLiteral("<absent>"));
        QCOMPARE(value(file, spaced, QStringLiteral("empty")), QStringLiteral("<absent>"));
        // Key and section case don't matter, value case stays.
        QCOMPARE(value(file, QStringLiteral("SPACED name"), QStringLiteral("cASE")), QStringLiteral("MiXed Value"));
        QCOMPARE(value(file, spaced, QStringLiteral("dup")), QStringLiteral("second"));
        QCOMPARE(value(file, spaced, QStringLiteral("folder/sub")), QStringLiteral("x"));
        // The key takes the last "=" of a line without blanks around the first one.
        QCOMPARE(value(file, spaced, QStringLiteral("link=a")), QStringLiteral("b"));
        // A tab inside the brackets is no section either.
        QCOMPARE(value(file, spaced, QStringLiteral("t")), QStringLiteral("after tab header"));
        QCOMPARE(value(file, QStringLiteral("a]"), QStringLiteral("z")), QStringLiteral("bracket"));
    }

    void valuesStayAsWritten()
    {
        const QString file = path(QStringLiteral("values.ini"));
        QVERIFY(writeFile(file, "[main]\n"
                                "mixed=one;two, \"three\" 'four' C:\\dir\\file.png\n"
                                "quoted=\"quoted\"\n"
                                "hash=#FF0000 ; trailing\n"));
        const QString main = QStringLiteral("main");
        QCOMPARE(value(file, main, QStringLiteral("mixed")), QStringLiteral("one;two, \"three\" 'four' C:\\dir\\file.png"));
        QCOMPARE(value(file, main, QStringLiteral("hash")), QStringLiteral("#FF0000 ; trailing"));
        // The platform format reads the same lines its own way; QSettings shares one
        // parse per path between formats, and the content reads must not see it.
        QCOMPARE(value(file, main, QStringLiteral("quoted"), false), QStringLiteral("quoted"));
        QCOMPARE(value(file, main, QStringLiteral("hash"), false), QStringLiteral("#FF0000"));
        QCOMPARE(value(file, main, QStringLiteral("quoted")), QStringLiteral("\"quoted\""));
    }

    void encodingsAndLineEnds()
    {
        const QString text = QStringLiteral("[Grüße]\r\nname=Fähre ✈\rother=東京\n\n\n");
        QByteArray utf16le, utf16be;
        for (const QChar c : text) {
            utf16le += char(c.unicode() & 0xFF);
            utf16le += char(c.unicode() >> 8);
            utf16be += char(c.unicode() >> 8);
            utf16be += char(c.unicode() & 0xFF);
        }
        const QList<QPair<QString, QByteArray>> files = {
            {QStringLiteral("plain-utf8.ini"), text.toUtf8()},
            {QStringLiteral("bom-utf8.ini"), QByteArray("\xEF\xBB\xBF") + text.toUtf8()},
            {QStringLiteral("bom-utf16le.ini"), QByteArray("\xFF\xFE") + utf16le},
            {QStringLiteral("bom-utf16be.ini"), QByteArray("\xFE\xFF") + utf16be},
        };
        for (const auto &f : files) {
            const QString file = path(f.first);
            QVERIFY(writeFile(file, f.second));
            QCOMPARE(value(file, QStringLiteral("grüße"), QStringLiteral("NAME")), QStringLiteral("Fähre ✈"));
            QCOMPARE(value(file, QStringLiteral("Grüße"), QStringLiteral("other")), QStringLiteral("東京"));
        }
        // Bytes that are no UTF-8 are taken as Windows-1252, in both formats.
        const QString windows = path(QStringLiteral("cp1252.ini"));
        QVERIFY(writeFile(windows, "[main]\nname=F\xE4hre \x80\n"));
        QCOMPARE(value(windows, QStringLiteral("main"), QStringLiteral("name")), QStringLiteral("Fähre €"));
        QCOMPARE(value(windows, QStringLiteral("main"), QStringLiteral("name"), false), QStringLiteral("Fähre €"));
    }

    void damagedFilesGiveDefaults()
    {
        QByteArray garbage;
        for (int i = 0; i < 5000; ++i)
            garbage += char((i * 7919) % 256);
        const QList<QByteArray> bodies = {garbage, QByteArray(), QByteArray("["), QByteArray("=\n=\n[]\n[ ]"),
                                          QByteArray("\xFF\xFE\x00"), QByteArray("\xEF\xBB\xBF")};
        for (int i = 0; i < bodies.size(); ++i) {
            const QString file = path(QStringLiteral("damaged%1.ini").arg(i));
            QVERIFY(writeFile(file, bodies.at(i)));
            QCOMPARE(value(file, QStringLiteral("main"), QStringLiteral("type")), QStringLiteral("<absent>"));
            QCOMPARE(value(file, QStringLiteral("main"), QStringLiteral("type"), false), QStringLiteral("<absent>"));
        }
        // Things that are no small regular file are not read at all, cached or not.
        const QString folder = path(QStringLiteral("folder.ini"));
        QVERIFY(QDir().mkpath(folder));
        const QString fifo = path(QStringLiteral("pipe.ini"));
        QCOMPARE(::mkfifo(QFile::encodeName(fifo).constData(), 0600), 0);
        const QString huge = path(QStringLiteral("huge.ini"));
        QVERIFY(writeFile(huge, "[main]\ntype=png\n" + QByteArray(17 * 1024 * 1024, '\n')));
        IniReadCache cache;
        for (const QString &file : {folder, fifo, huge}) {
            for (bool contentIni : {true, false})
                QCOMPARE(value(file, QStringLiteral("main"), QStringLiteral("type"), contentIni), QStringLiteral("<absent>"));
        }

        // A long line is read, not cut.
        QSettings::SettingsMap map;
        ContentIni::parse(QByteArray(200000, 'x') + "=" + QByteArray(200000, ' ') + "y", map);
        QCOMPARE(map.size(), 1);
        QCOMPARE(map.first().toString(), QStringLiteral("y"));
    }

    void registeredFormatIsReadOnly()
    {
        const QString file = path(QStringLiteral("splash.ini"));
        const QByteArray original = "[Text]\nTitle=Hello, world; \"quoted\"\n";
        QVERIFY(writeFile(file, original));
        {
            QSettings settings(file, ContentIni::format());
            // Keys are stored lower-cased; QSettings itself compares them as given.
            QCOMPARE(settings.value(QStringLiteral("text/title")).toString(), QStringLiteral("Hello, world; \"quoted\""));
            settings.setValue(QStringLiteral("Text/Title"), QStringLiteral("changed"));
            settings.sync();
            QCOMPARE(settings.status(), QSettings::AccessError);
        }
        QFile f(file);
        QVERIFY(f.open(QIODevice::ReadOnly));
        QCOMPARE(f.readAll(), original);
    }

    void listsArePrependedAndRemoved()
    {
        const QString file = path(QStringLiteral("lists/tourletContent.ini"));
        const QString avatars = QStringLiteral("avatars"), paths = QStringLiteral("paths");
        const QString car = QStringLiteral("/data/userAvatars/u3d_car");
        const QString zurich = QStringLiteral("/data/userAvatars/u3d_Zürich(1)");
        QVERIFY(prependIniListValue(file, car, avatars, paths));
        QVERIFY(prependIniListValue(file, zurich, avatars, paths));
        QVERIFY(prependIniListValue(file, car, avatars, paths));
        QVERIFY(prependIniListValue(file, QStringLiteral("/maps/extra"), QStringLiteral("maps"), paths));
        // Written by the platform format, read back by both.
        QCOMPARE(list(file, avatars), QStringList({car, zurich, car}));
        QCOMPARE(list(file, avatars, false), QStringList({car, zurich, car}));

        // Removed by the last path component, every time it is there.
        QVERIFY(removeIniListValue(file, QStringLiteral("u3d_car"), avatars, paths));
        QCOMPARE(list(file, avatars), QStringList{zurich});
        QVERIFY(removeIniListValue(file, QStringLiteral("u3d_Zürich(1)"), avatars, paths));
        QVERIFY(list(file, avatars).isEmpty());
        QCOMPARE(list(file, QStringLiteral("maps")), QStringList{QStringLiteral("/maps/extra")});
        // An empty list is written as no key, so the next prepend starts clean.
        QVERIFY(prependIniListValue(file, QStringLiteral("/again"), avatars, paths));
        QCOMPARE(list(file, avatars), QStringList{QStringLiteral("/again")});

        QVERIFY(!removeIniListValue(path(QStringLiteral("lists/none.ini")), QStringLiteral("x"), avatars, paths));
        // Below a plain file no folder can be made.
        QVERIFY(!prependIniListValue(file + QStringLiteral("/x.ini"), QStringLiteral("v"), avatars, paths));
    }

    void informationFilesSortByStem()
    {
        const QString root = path(QStringLiteral("folders/"));
        for (const char *name : {"informations/b.ini", "informations/A.ini", "informations/c.INI", "informations/x.txt",
                                 "informations/z.v2.ini", "informations/a-b.ini"})
            QVERIFY(writeFile(root + QString::fromLatin1(name), "x"));
        // "a-b" after "A" although "-" comes before ".".
        QCOMPARE(listInformationFiles(root),
                 QStringList({QStringLiteral("A.ini"), QStringLiteral("a-b.ini"), QStringLiteral("b.ini"),
                              QStringLiteral("c.INI"), QStringLiteral("z.v2.ini")}));
    }

    void cachedReadsMatchFreshReads()
    {
        const QString file = path(QStringLiteral("cached.ini"));
        QVERIFY(writeFile(file, "[main]\nv=1\npaths=a,b\n"));
        IniReadCache cache;
        QCOMPARE(value(file, QStringLiteral("main"), QStringLiteral("V")), QStringLiteral("1"));
        QCOMPARE(value(file, QStringLiteral("main"), QStringLiteral("v"), false), QStringLiteral("1"));
        // A write through the layer is seen by the next read.
        QVERIFY(prependIniListValue(file, QStringLiteral("z"), QStringLiteral("main"), QStringLiteral("paths")));
        QCOMPARE(list(file, QStringLiteral("main")), QStringList({QStringLiteral("z"), QStringLiteral("a"), QStringLiteral("b")}));
        QCOMPARE(list(file, QStringLiteral("main"), false), QStringList({QStringLiteral("z"), QStringLiteral("a"), QStringLiteral("b")}));
    }
};

QTEST_GUILESS_MAIN(TestContentIni)
#include "tst_contentini.moc"
