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

#include <functional>

namespace {

QString writePicture(const QString &file, int width, int height)
{
    QImage image(width, height, QImage::Format_RGB32);
    image.fill(Qt::darkGreen);
    return image.save(file, "JPG") ? file : QString();
}

void editExif(const QString &file, const std::function<void(Exiv2::ExifData &)> &edit)
{
    auto picture = Exiv2::ImageFactory::open(QFile::encodeName(file).toStdString());
    picture->readMetadata();
    edit(picture->exifData());
    picture->writeMetadata();
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
        const QString dated = writePicture(path(QStringLiteral("dated.jpg")), 40, 30);
        editExif(dated, [](Exiv2::ExifData &exif) {
            exif["Exif.Photo.DateTimeOriginal"] = std::string("2018:06:01 12:30:45");
            exif["Exif.Image.Orientation"] = uint16_t(6);
        });
        // The pool looks at the low byte of the tag only.
        const QString highByte = writePicture(path(QStringLiteral("high.jpg")), 40, 30);
        editExif(highByte, [](Exiv2::ExifData &exif) { exif["Exif.Image.Orientation"] = uint16_t(0x0108); });
        const QString plain = writePicture(path(QStringLiteral("plain.jpg")), 40, 30);
        const QString odd = writePicture(path(QStringLiteral("odd.jpg")), 40, 30);
        editExif(odd, [](Exiv2::ExifData &exif) { exif["Exif.Image.Orientation"] = uint16_t(9); });

        PhotoPool pool;
        const PoolPhoto first = pool.add(dated, 40, 30);
        QVERIFY(first.id > 0);
        QCOMPARE(first.time, QStringLiteral("2018:06:01 12:30:45"));
        QCOMPARE(first.captureDate, QStringLiteral("2018:06:01 12:30:45"));
        QCOMPARE(first.orientation, 90);
        QCOMPARE(first.sizeW, 40);

        const PoolPhoto again = pool.add(dated, 1, 1);
        QCOMPARE(again.id, first.id);
        QCOMPARE(again.sizeW, 40);
        QCOMPARE(pool.photos.size(), size_t(1));

        QCOMPARE(pool.add(highByte, 40, 30).orientation, 270);
        const PoolPhoto undated = pool.add(plain, 40, 30);
        QCOMPARE(undated.time, QStringLiteral("00.00.00_00:00"));
        QVERIFY(undated.captureDate.isEmpty());
        QCOMPARE(undated.orientation, 0);
        QCOMPARE(pool.add(odd, 40, 30).orientation, 0);
        const PoolPhoto gone = pool.add(path(QStringLiteral("nowhere.jpg")), 0, 0);
        QCOMPARE(gone.time, QStringLiteral("00.00.00_00:00"));
        QCOMPARE(pool.photos.size(), size_t(5));
        QVERIFY(gone.id > undated.id);

        QVERIFY(pool.find(undated.id));
        pool.find(undated.id)->setSelected(true);
        pool.find(first.id)->setSelected(true);
        QCOMPARE(pool.selectedCount(), 2);
        pool.find(first.id)->setSelected(false);
        QCOMPARE(pool.selectedCount(), 1);
        QVERIFY(pool.remove(undated.id));
        QVERIFY(!pool.remove(undated.id));
        QCOMPARE(pool.selectedCount(), 0);

        QVERIFY(pool.setFullFrameCropping(true));
        QVERIFY(!pool.setFullFrameCropping(true));
        QVERIFY(!pool.setFullFrameBorderEffect(false));
    }

    void saveAndLoad()
    {
        const QString small = writePicture(path(QStringLiteral("small.jpg")), 64, 48);
        editExif(small, [](Exiv2::ExifData &exif) {
            exif["Exif.Photo.DateTimeOriginal"] = std::string("2020:01:02 03:04:05");
            exif["Exif.Image.Orientation"] = uint16_t(3);
        });
        const QString missing = path(QStringLiteral("missing.jpg"));

        PhotoPool pool;
        PoolPhoto stored = pool.add(small, 0, 0); // the size is to come from the picture on load
        pool.find(stored.id)->setSelected(true);
        pool.find(stored.id)->orderId = 7;
        pool.add(missing, 0, 0);
        pool.fullFrameBorderEffect = true;
        pool.fullFrameCropping = true;

        const QString file = path(QStringLiteral("pool.zkgeo"));
        QProjectController store;
        QVERIFY(store.createProjectFile(file));
        pool.Save(store);
        store.closeProjectFile();

        PhotoPool loaded;
        loaded.add(path(QStringLiteral("other.jpg")), 1, 1);
        QVERIFY(store.openProjectFile(file, true));
        loaded.Load(store);
        store.closeProjectFile();

        QCOMPARE(loaded.photos.size(), size_t(2));
        const PoolPhoto &a = loaded.photos[0];
        QCOMPARE(a.path, small);
        QVERIFY(a.id != stored.id); // ids are drawn anew
        QCOMPARE(a.flags, 1u);
        QCOMPARE(a.orderId, 7);
        QCOMPARE(a.sizeW, 64);
        QCOMPARE(a.sizeH, 48);
        QCOMPARE(a.time, QStringLiteral("2020:01:02 03:04:05"));
        QCOMPARE(a.captureDate, QStringLiteral("2020:01:02 03:04:05"));
        QCOMPARE(a.orientation, 180);
        const PoolPhoto &b = loaded.photos[1];
        QCOMPARE(b.path, missing);
        QCOMPARE(b.sizeW, 0);
        QCOMPARE(b.sizeH, 0);
        QVERIFY(loaded.fullFrameBorderEffect);
        QVERIFY(loaded.fullFrameCropping);
    }

    void sizeDecidesWhetherTheListIsReplaced()
    {
        const QString file = path(QStringLiteral("sizes.zkgeo"));
        QFile f(file);
        QVERIFY(f.open(QIODevice::WriteOnly));
        f.write("[Header]\nprojecttype=ZKGEO\nprojectversion=2\n"
                "[photopool]\nsize=0\n"
                "[photopool_item0]\npath=/nowhere/a.jpg\nsizeW=5\nsizeH=6\n");
        f.close();

        PhotoPool pool;
        pool.add(QStringLiteral("/kept.jpg"), 1, 1);
        QProjectController store;
        QVERIFY(store.openProjectFile(file, true));
        pool.Load(store);
        store.closeProjectFile();
        QCOMPARE(pool.photos.size(), size_t(1));
        QCOMPARE(pool.photos[0].path, QStringLiteral("/kept.jpg"));

        // A count larger than the stored items reads what is there and stops.
        QVERIFY(f.open(QIODevice::WriteOnly));
        f.write("[Header]\nprojecttype=ZKGEO\nprojectversion=2\n"
                "[photopool]\nsize=2000000000\n"
                "[photopool_item0]\npath=/nowhere/a.jpg\nsizeW=5\nsizeH=6\nflags=4294967295\n");
        f.close();
        QVERIFY(store.openProjectFile(file, true));
        pool.Load(store);
        store.closeProjectFile();
        QCOMPARE(pool.photos.size(), size_t(1));
        QCOMPARE(pool.photos[0].path, QStringLiteral("/nowhere/a.jpg"));
        QCOMPARE(pool.photos[0].sizeW, 5);
        QCOMPARE(pool.photos[0].flags, 0xFFFFFFFFu);
        QCOMPARE(pool.photos[0].time, QStringLiteral("00.00.00_00:00"));
    }
};

QTEST_GUILESS_MAIN(TestPhotoPool)
#include "tst_photopool.moc"
