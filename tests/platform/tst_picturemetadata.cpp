#include "platform/PictureMetadata.h"

#include <QFile>
#include <QImage>
#include <QTemporaryDir>
#include <QTest>

#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wdeprecated-declarations"
#include <exiv2/exiv2.hpp>
#pragma GCC diagnostic pop

namespace {

QString writePicture(const QString &file, const char *format)
{
    QImage image(16, 9, QImage::Format_RGB32);
    image.fill(Qt::blue);
    if (!image.save(file, format))
        return QString();
    return file;
}

void editExif(const QString &file, const std::function<void(Exiv2::ExifData &)> &edit)
{
    auto picture = Exiv2::ImageFactory::open(QFile::encodeName(file).toStdString());
    picture->readMetadata();
    edit(picture->exifData());
    picture->writeMetadata();
}

void writeBytes(const QString &file, const QByteArray &bytes)
{
    QFile f(file);
    QVERIFY(f.open(QIODevice::WriteOnly));
    f.write(bytes);
}

} // namespace

class TestPictureMetadata : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;
    QString path(const QString &name) const { return m_dir.filePath(name); }

private slots:
    void orientationValues()
    {
        for (int value = 1; value <= 8; ++value) {
            const QString file = writePicture(path(QStringLiteral("o%1.jpg").arg(value)), "JPG");
            QVERIFY(!file.isEmpty());
            editExif(file, [&](Exiv2::ExifData &exif) { exif["Exif.Image.Orientation"] = uint16_t(value); });
            const auto orientation = readPictureOrientation(file);
            QVERIFY(orientation.has_value());
            QCOMPARE(int(*orientation), value);
        }
        QCOMPARE(rotationForOrientation(1), std::optional<int32_t>(0));
        QCOMPARE(rotationForOrientation(5), std::optional<int32_t>(0));
        QCOMPARE(rotationForOrientation(2), std::optional<int32_t>(90));
        QCOMPARE(rotationForOrientation(6), std::optional<int32_t>(90));
        QCOMPARE(rotationForOrientation(3), std::optional<int32_t>(180));
        QCOMPARE(rotationForOrientation(7), std::optional<int32_t>(180));
        QCOMPARE(rotationForOrientation(4), std::optional<int32_t>(270));
        QCOMPARE(rotationForOrientation(8), std::optional<int32_t>(270));
        QVERIFY(!rotationForOrientation(0));
        QVERIFY(!rotationForOrientation(9));
        QVERIFY(!rotationForOrientation(0x106));

        // Only a SHORT value counts as the tag.
        const QString wide = writePicture(path(QStringLiteral("wide.jpg")), "JPG");
        editExif(wide, [](Exiv2::ExifData &exif) {
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
        const QString dated = writePicture(path(QStringLiteral("dated.jpg")), "JPG");
        editExif(dated, [](Exiv2::ExifData &exif) {
            exif["Exif.Photo.DateTimeOriginal"] = std::string("2021:07:04 13:45:10");
            exif["Exif.Image.DateTime"] = std::string("2022:01:01 00:00:00"); // not the capture date
        });
        const auto metadata = readPictureMetadata(dated);
        QVERIFY(metadata.has_value());
        QCOMPARE(metadata->captureDateText, QStringLiteral("2021:07:04 13:45:10"));
        QCOMPARE(metadata->captureDate, QDateTime(QDate(2021, 7, 4), QTime(13, 45, 10)));
        QCOMPARE(readPictureCaptureDate(dated), metadata->captureDate);
        QVERIFY(!metadata->orientation.has_value());

        const QString blank = writePicture(path(QStringLiteral("blank.jpg")), "JPG");
        editExif(blank, [](Exiv2::ExifData &exif) { exif["Exif.Photo.DateTimeOriginal"] = std::string("0000:00:00 00:00:00"); });
        const auto zero = readPictureMetadata(blank);
        QVERIFY(zero.has_value());
        QCOMPARE(zero->captureDateText, QStringLiteral("0000:00:00 00:00:00"));
        QVERIFY(!zero->captureDate.isValid());

        const QString plain = writePicture(path(QStringLiteral("plain.png")), "PNG");
        const auto none = readPictureMetadata(plain);
        QVERIFY(none.has_value());
        QVERIFY(none->captureDateText.isEmpty());
        QVERIFY(!none->captureDate.isValid());
        QVERIFY(!none->orientation.has_value());
    }

    void unreadableFiles()
    {
        const QString text = path(QStringLiteral("text.jpg"));
        writeBytes(text, "hello, this is no picture\n");
        const QString empty = path(QStringLiteral("empty.jpg"));
        writeBytes(empty, QByteArray());
        // A JPEG cut off inside its Exif block.
        const QString whole = writePicture(path(QStringLiteral("whole.jpg")), "JPG");
        editExif(whole, [](Exiv2::ExifData &exif) {
            exif["Exif.Image.Orientation"] = uint16_t(6);
            exif["Exif.Photo.DateTimeOriginal"] = std::string("2021:07:04 13:45:10");
        });
        QFile wholeFile(whole);
        QVERIFY(wholeFile.open(QIODevice::ReadOnly));
        const QByteArray bytes = wholeFile.readAll();
        const QString cut = path(QStringLiteral("cut.jpg"));
        writeBytes(cut, bytes.left(40));
        QByteArray scrambled = bytes;
        for (int i = 24; i < qMin(scrambled.size(), 200); i += 3)
            scrambled[i] = char(0xA5);
        const QString noise = path(QStringLiteral("noise.jpg"));
        writeBytes(noise, scrambled);

        for (const QString &file : {text, empty, cut, path(QStringLiteral("missing.jpg")), m_dir.path(), QString()}) {
            const auto metadata = readPictureMetadata(file);
            if (metadata) {
                // Whatever survives in a damaged file must not be invented.
                QVERIFY(!metadata->orientation || *metadata->orientation == 6);
            }
            QVERIFY(!readPictureCaptureDate(file).isValid());
        }
        QVERIFY(!readPictureMetadata(text));
        QVERIFY(!readPictureMetadata(path(QStringLiteral("missing.jpg"))));
        QVERIFY(!readPictureMetadata(m_dir.path()));
        // The scrambled copy must come back without throwing; its content is anyone's guess.
        readPictureMetadata(noise);
    }
};

QTEST_GUILESS_MAIN(TestPictureMetadata)
#include "tst_picturemetadata.moc"
