#include "ContentFiles.h"
#include "ZipFiles.h"

#include "content/ContentCatalogue.h"
#include "content/IniAccess.h"
#include "content/UserAvatars.h"

#include <QDirIterator>
#include <QSettings>
#include <QTemporaryDir>
#include <QTest>

#include <vector>

namespace {

QStringList entriesBelow(const QString &folder)
{
    QStringList out;
    QDirIterator it(folder, QDir::AllEntries | QDir::NoDotAndDotDot | QDir::Hidden, QDirIterator::Subdirectories);
    while (it.hasNext())
        out << it.next().mid(folder.size());
    out.sort();
    return out;
}

QStringList avatarPaths(const QString &data)
{
    return readIniList(data + QStringLiteral("/tourletContent.ini"), QStringLiteral("avatars"), QStringLiteral("paths"),
                       QStringLiteral(","), true);
}

} // namespace

class TestUserAvatars : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;
    QString path(const QString &name) const { return m_dir.filePath(name); }

private slots:
    void importTwiceAndScan()
    {
        QVERIFY(isZipAvatar(QStringLiteral("/a/car.zip")));
        QVERIFY(!isZipAvatar(QStringLiteral("/a/car.ZIP")));
        QVERIFY(!isZipAvatar(QStringLiteral("/a/car.tar.zip")));

        const QString data = path(QStringLiteral("data"));
        QVERIFY(QDir().mkpath(data));
        const QString zip = path(QStringLiteral("Car.zip"));
        QVERIFY(writeZip(zip, {{"car_2.png", "two"}, {"car_1.png", "one"}, {"readme.txt", "hello"}, {"extra/", ""},
                               {"extra/car_9.png", "nested"}}));
        clearImportError();
        QString picture;
        QVERIFY(importZipAvatar(data, zip, picture));
        QCOMPARE(importErrorText(), QStringLiteral("noError"));
        // The frames are renamed after the avatar; everything else stays as it was.
        const QString first = data + QStringLiteral("/userAvatars/u3d_Car");
        QCOMPARE(picture, first + QStringLiteral("/ZK3D/u3d_Car/u3d_Car_1.png"));
        QCOMPARE(entriesBelow(first + QStringLiteral("/ZK3D/u3d_Car")),
                 QStringList({"/extra", "/extra/car_9.png", "/readme.txt", "/u3d_Car_1.png", "/u3d_Car_2.png"}));
        QFile one(picture);
        QVERIFY(one.open(QIODevice::ReadOnly));
        QCOMPARE(one.readAll(), QByteArray("one"));

        // The same archive again gets a new name and leaves the first alone.
        QString again;
        QVERIFY(importZipAvatar(data, zip, again));
        const QString second = data + QStringLiteral("/userAvatars/u3d_Car(1)");
        QCOMPARE(again, second + QStringLiteral("/ZK3D/u3d_Car(1)/u3d_Car(1)_1.png"));
        QVERIFY(QFileInfo::exists(first + QStringLiteral("/ZK3D/u3d_Car/u3d_Car_2.png")));
        QCOMPARE(avatarPaths(data), QStringList({second, first}));

        // The next start finds both, as perspective user avatars whose frames exist.
        QTemporaryDir imageRoot;
        ContentCatalogue catalogue;
        QVERIFY(catalogue.load(imageRoot.path() + QLatin1Char('/'), data));
        const std::vector<AvatarItem> avatars = catalogue.avatars();
        QCOMPARE(int(avatars.size()), 2);
        for (const AvatarItem &a : avatars) {
            QVERIFY(a.perspective == 1 && a.isUserContent && a.allowRotation && a.animated == 0);
            QVERIFY2(QFileInfo::exists(a.thumbFile), qPrintable(a.thumbFile));
            QVERIFY(QFileInfo::exists(a.sourceFile + QStringLiteral("_2.png")));
        }
        QCOMPARE(avatars.at(0).name + avatars.at(1).name, QStringLiteral("u3d_Car(1)u3d_Car"));
    }

    void failedImports()
    {
        const QString data = path(QStringLiteral("fails"));
        QVERIFY(QDir().mkpath(data));
        QString picture = QStringLiteral("unchanged");

        const QString text = path(QStringLiteral("notes.zip"));
        QVERIFY(writeFile(text, "just some text, no archive\n"));
        QVERIFY(!importZipAvatar(data, text, picture));
        QCOMPARE(importErrorNumber(), 1392u);
        QVERIFY(!importZipAvatar(data, path(QStringLiteral("missing.zip")), picture));
        QCOMPARE(importErrorNumber(), 3u);

        const QString noPng = path(QStringLiteral("nopng.zip"));
        QVERIFY(writeZip(noPng, {{"a.jpg", "x"}, {"b.PNG.txt", "y"}}));
        QVERIFY(!importZipAvatar(data, noPng, picture));
        QCOMPARE(importErrorNumber(), 2u);
        QCOMPARE(picture, QStringLiteral("unchanged"));
        // The folder of a failed import stays, but the avatar is not entered.
        QVERIFY(QFileInfo::exists(data + QStringLiteral("/userAvatars/u3d_nopng/ZK3D/u3d_nopng/a.jpg")));
        QVERIFY(avatarPaths(data).isEmpty());

        // Names that look like format markers stay as they are.
        const QString percent = path(QStringLiteral("p%1.zip"));
        QVERIFY(writeZip(percent, {{"g_1.png", "x"}}));
        QVERIFY(importZipAvatar(data, percent, picture));
        QVERIFY(importZipAvatar(data, percent, picture));
        QCOMPARE(picture, data + QStringLiteral("/userAvatars/u3d_p%1(1)/ZK3D/u3d_p%1(1)/u3d_p%1(1)_1.png"));
        QVERIFY(QFileInfo::exists(picture));

        QVERIFY(!importZipAvatar(path(QStringLiteral("no/such/data")), percent, picture));
        QCOMPARE(importErrorNumber(), 3u);
    }

    void hostileArchivesWriteNothing()
    {
        const QString data = path(QStringLiteral("hostile"));
        QVERIFY(QDir().mkpath(data));
        const QList<ZipEntries> hostile = {
            {{"ok_1.png", "x"}, {"../escape.png", "evil"}},
            {{"ok_1.png", "x"}, {"sub/../../../escape.png", "evil"}},
            {{"/tmp/escape.png", "evil"}},
            {{"ok_1.png", "x"}, {"..\\escape.png", "evil"}},
            {{"C:/escape.png", "evil"}},
        };
        const QStringList before = entriesBelow(m_dir.path());
        for (int i = 0; i < hostile.size(); ++i) {
            const QString zip = path(QStringLiteral("hostile%1.zip").arg(i));
            QVERIFY(writeZip(zip, hostile.at(i)));
            QString picture;
            QVERIFY(!importZipAvatar(data, zip, picture));
            QCOMPARE(importErrorNumber(), 14u);
        }
        QStringList after = entriesBelow(m_dir.path());
        for (int i = 0; i < hostile.size(); ++i)
            after.removeAll(QStringLiteral("/hostile%1.zip").arg(i));
        QCOMPARE(after, before);

        // Entries above the size limit are refused before anything is written.
        const QString big = path(QStringLiteral("big.zip"));
        QVERIFY(writeZip(big, {{"a_1.png", QByteArray(4096, 'a')}}));
        const QString target = path(QStringLiteral("bigtarget"));
        QVERIFY(!unpackZipArchive(big, target, 1024));
        QVERIFY(!QFileInfo::exists(target));
        QVERIFY(unpackZipArchive(big, target, 4096));
        QCOMPARE(QFileInfo(target + QStringLiteral("/a_1.png")).size(), 4096);
    }

    void migrationMovesOldLayout()
    {
        const QString folder = path(QStringLiteral("migrate/userAvatars"));
        QVERIFY(writeFile(folder + QStringLiteral("/u3d_old/u3d_old/u3d_old_1.png"), "1"));
        QVERIFY(writeFile(folder + QStringLiteral("/u3d_old/informations/u3d_old.ini"), "[main]\n"));
        QVERIFY(writeFile(folder + QStringLiteral("/u3d_new/ZK3D/u3d_new/u3d_new_1.png"), "1"));
        migrateUserAvatars(folder);
        const QStringList once = entriesBelow(folder);
        QVERIFY(once.contains(QStringLiteral("/u3d_old/ZK3D/u3d_old/u3d_old_1.png")));
        QVERIFY(once.contains(QStringLiteral("/u3d_old/informations/u3d_old.ini")));
        QVERIFY(!once.contains(QStringLiteral("/u3d_old/u3d_old")));
        QVERIFY(once.contains(QStringLiteral("/u3d_new/ZK3D/u3d_new/u3d_new_1.png")));
        // Running again changes nothing and notes the folder in the settings.
        QSettings settings(path(QStringLiteral("migrate/settings.ini")), QSettings::IniFormat);
        migrateUserAvatars(folder, settings);
        QCOMPARE(entriesBelow(folder), once);
        QCOMPARE(settings.value(QStringLiteral("userAvatars")).toString(), folder);
        migrateUserAvatars(path(QStringLiteral("migrate/none")));
        QVERIFY(!QFileInfo::exists(path(QStringLiteral("migrate/none"))));
    }
};

QTEST_GUILESS_MAIN(TestUserAvatars)
#include "tst_useravatars.moc"
