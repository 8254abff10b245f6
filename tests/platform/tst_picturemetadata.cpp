#include "TestFiles.h"
#include "platform/PictureMetadata.h"

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

QString writePicture(const QString &file, const char *format, const std::function<void(Exiv2::ExifData &)> &edit = {})
{
    QImage image(16, 9, QImage::Format_RGB32);
    image.fill(Qt::blue);
    if (!image.save(file, format))
        qFatal("cannot write %s", qPrintable(file));
    if (edit) {
        auto picture = Exiv2::ImageFactory::open(QFile::encodeName(file).toStdString());
        picture->readMetadata();
        edit(picture->exifData());
        picture->writeMetadata();
    }
    return file;
}

} // namespace

class TestPictureMetadata : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;
    QString path(const QString &name) const { return m_dir.filePath(name); }

private slots:
    void orientation()
    {
        for (uint32_t unknown : {0u, 9u, 0x106u})
            QVERIFY(!rotationForOrientation(unknown));

        // Only a SHORT value counts as the tag.
        const QString wide = writePicture(path(QStringLiteral("wide.jpg")), "JPG", [](Exiv2::ExifData &exif) {
            Exiv2::ULongValue value;
            value.value_.push_back(6);
            exif.add(Exiv2::ExifKey("Exif.Image.Orientation"), &value);
        });
        const auto metadata = readPictureMetadata(wide);
        QVERIFY(metadata.has_value());
        QVERIFY(!metadata->orientation.has_value());
    }

    void captureDate()
    {
        const QString dated = writePicture(path(QStringLiteral("dated.jpg")), "JPG", [](Exiv2::ExifData &exif) {
            exif["Exif.Photo.DateTimeOriginal"] = std::string("2021:07:04 13:45:10");
            exif["Exif.Image.DateTime"] = std::string("2022:01:01 00:00:00"); // not the capture date
        });
        const auto metadata = readPictureMetadata(dated);
        QVERIFY(metadata.has_value());
        QCOMPARE(metadata->captureDateText, QStringLiteral("2021:07:04 13:45:10"));
        QCOMPARE(metadata->captureDate, QDateTime(QDate(2021, 7, 4), QTime(13, 45, 10)));

        // A zero date is kept as text but is no date.
        const auto zero = readPictureMetadata(writePicture(path(QStringLiteral("blank.jpg")), "JPG", [](Exiv2::ExifData &exif) {
            exif["Exif.Photo.DateTimeOriginal"] = std::string("0000:00:00 00:00:00");
        }));
        QCOMPARE(zero->captureDateText, QStringLiteral("0000:00:00 00:00:00"));
        QVERIFY(!zero->captureDate.isValid());
    }

    void unreadableFiles()
    {
        const QString text = writeTestFile(m_dir, QStringLiteral("text.jpg"), "hello, this is no picture\n");
        const QString empty = writeTestFile(m_dir, QStringLiteral("empty.jpg"), QByteArray());
        // A JPEG cut off inside its Exif block, and one with the block scrambled.
        const QString whole = writePicture(path(QStringLiteral("whole.jpg")), "JPG", [](Exiv2::ExifData &exif) {
            exif["Exif.Image.Orientation"] = uint16_t(6);
            exif["Exif.Photo.DateTimeOriginal"] = std::string("2021:07:04 13:45:10");
        });
        QFile wholeFile(whole);
        QVERIFY(wholeFile.open(QIODevice::ReadOnly));
        QByteArray bytes = wholeFile.readAll();
        const QString cut = writeTestFile(m_dir, QStringLiteral("cut.jpg"), bytes.left(40));
        for (int i = 24; i < qMin(bytes.size(), 200); i += 3)
            bytes[i] = char(0xA5);
        const QString noise = writeTestFile(m_dir, QStringLiteral("noise.jpg"), bytes);

        for (const QString &file : {text, empty, cut, path(QStringLiteral("missing.jpg")), m_dir.path(), QString()}) {
            // Whatever survives in a damaged file must not be invented.
            const auto metadata = readPictureMetadata(file);
            QVERIFY(!metadata || !metadata->orientation || *metadata->orientation == 6);
            QVERIFY(!readPictureCaptureDate(file).isValid());
        }
        QVERIFY(!readPictureMetadata(text));
        QVERIFY(!readPictureMetadata(m_dir.path()));
        readPictureMetadata(noise); // must come back without throwing; its content is anyone's guess
    }
};

QTEST_GUILESS_MAIN(TestPictureMetadata)
#include "tst_picturemetadata.moc"
