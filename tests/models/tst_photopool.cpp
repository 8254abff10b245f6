#include "TestFiles.h"
#include "models/PhotoPool.h"
#include "project/QProjectController.h"

#include <QFile>
#include <QImage>
#include <QTemporaryDir>
#include <QTest>

#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wdeprecated-declarations"
#include <exiv2/exiv2.hpp>
#pragma GCC diagnostic pop

namespace {

// A small JPEG with the given capture date and orientation tag, each left out when empty or negative.
QString writePicture(const QString &file, int width, int height, const std::string &date = {}, int orientation = -1)
{
    QImage image(width, height, QImage::Format_RGB32);
    image.fill(Qt::darkGreen);
    if (!image.save(file, "JPG"))
        qFatal("cannot write %s", qPrintable(file));
    auto picture = Exiv2::ImageFactory::open(QFile::encodeName(file).toStdString());
    picture->readMetadata();
    if (!date.empty())
        picture->exifData()["Exif.Photo.DateTimeOriginal"] = date;
    if (orientation >= 0)
        picture->exifData()["Exif.Image.Orientation"] = uint16_t(orientation);
    picture->writeMetadata();
    return file;
}

} // namespace

class TestPhotoPool : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;
    QString path(const QString &name) const { return m_dir.filePath(name); }

private slots:
    void addingReadsTheIdentityOfThePicture()
    {
        const QString dated = writePicture(path(QStringLiteral("dated.jpg")), 40, 30, "2018:06:01 12:30:45", 6);
        PhotoPool pool;
        const PoolPhoto first = pool.add(dated, 40, 30);
        QCOMPARE(first.time, QStringLiteral("2018:06:01 12:30:45"));
        QCOMPARE(first.captureDate, QStringLiteral("2018:06:01 12:30:45"));
        QCOMPARE(first.orientation, 90);
        // The same picture again is the same photo.
        const PoolPhoto again = pool.add(dated, 1, 1);
        QCOMPARE(again.id, first.id);
        QCOMPARE(again.sizeW, 40);
        QCOMPARE(pool.photos.size(), size_t(1));

        const PoolPhoto undated = pool.add(writePicture(path(QStringLiteral("plain.jpg")), 40, 30), 40, 30);
        QCOMPARE(undated.time, QStringLiteral("00.00.00_00:00"));
        QVERIFY(undated.captureDate.isEmpty());
        QCOMPARE(undated.orientation, 0);
        // The pool looks at the low byte of the orientation only.
        QCOMPARE(pool.add(writePicture(path(QStringLiteral("high.jpg")), 40, 30, {}, 0x0108), 40, 30).orientation, 270);
        QCOMPARE(pool.add(writePicture(path(QStringLiteral("odd.jpg")), 40, 30, {}, 9), 40, 30).orientation, 0);
        const PoolPhoto gone = pool.add(path(QStringLiteral("nowhere.jpg")), 0, 0);
        QCOMPARE(gone.time, QStringLiteral("00.00.00_00:00"));
        QVERIFY(gone.id > undated.id);

        pool.find(undated.id)->setSelected(true);
        pool.find(first.id)->setSelected(true);
        QCOMPARE(pool.selectedCount(), 2);
        QVERIFY(pool.remove(undated.id));
        QVERIFY(!pool.remove(undated.id));
        QCOMPARE(pool.selectedCount(), 1);
    }

    void saveAndLoad()
    {
        const QString small = writePicture(path(QStringLiteral("small.jpg")), 64, 48, "2020:01:02 03:04:05", 3);
        const QString missing = path(QStringLiteral("missing.jpg"));
        PhotoPool pool;
        const PoolPhoto stored = pool.add(small, 0, 0); // the size is to come from the picture on load
        pool.find(stored.id)->setSelected(true);
        pool.find(stored.id)->orderId = 7;
        pool.add(missing, 0, 0);
        const QString file = path(QStringLiteral("pool.zkgeo"));
        QProjectController store;
        QVERIFY(store.createProjectFile(file));
        pool.Save(store);
        store.closeProjectFile();

        PhotoPool loaded;
        QVERIFY(store.openProjectFile(file, true));
        loaded.Load(store);
        store.closeProjectFile();
        QCOMPARE(loaded.photos.size(), size_t(2));
        const PoolPhoto &a = loaded.photos[0];
        QCOMPARE(a.path, small);
        QVERIFY(a.id != stored.id); // ids are drawn anew
        QCOMPARE(a.flags, 1u);
        QCOMPARE(a.orderId, 7);
        QCOMPARE(QSize(a.sizeW, a.sizeH), QSize(64, 48));
        QCOMPARE(a.time, QStringLiteral("2020:01:02 03:04:05"));
        QCOMPARE(a.orientation, 180);
        QCOMPARE(loaded.photos[1].path, missing);
        QCOMPARE(loaded.photos[1].sizeW, 0);
    }

    void sizeDecidesWhetherTheListIsReplaced()
    {
        PhotoPool pool;
        pool.add(QStringLiteral("/kept.jpg"), 1, 1);
        QProjectController store;
        const QByteArray header = "[Header]\nprojecttype=ZKGEO\nprojectversion=2\n";
        const QByteArray item = "[photopool_item0]\npath=/nowhere/a.jpg\nsizeW=5\nsizeH=6\nflags=4294967295\n";
        QVERIFY(store.openProjectFile(writeTestFile(m_dir, QStringLiteral("none.zkgeo"), header + "[photopool]\nsize=0\n" + item), true));
        pool.Load(store);
        store.closeProjectFile();
        QCOMPARE(pool.photos.size(), size_t(1));
        QCOMPARE(pool.photos[0].path, QStringLiteral("/kept.jpg"));

        // A count larger than the stored items reads what is there and stops.
        QVERIFY(store.openProjectFile(writeTestFile(m_dir, QStringLiteral("huge.zkgeo"), header + "[photopool]\nsize=2000000000\n" + item),
                                      true));
        pool.Load(store);
        store.closeProjectFile();
        QCOMPARE(pool.photos.size(), size_t(1));
        QCOMPARE(pool.photos[0].path, QStringLiteral("/nowhere/a.jpg"));
        QCOMPARE(pool.photos[0].sizeW, 5);
        QCOMPARE(pool.photos[0].flags, 0xFFFFFFFFu);
    }
};

QTEST_GUILESS_MAIN(TestPhotoPool)
#include "tst_photopool.moc"
