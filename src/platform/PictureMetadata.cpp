#include "platform/PictureMetadata.h"

#include <QFile>
#include <QFileInfo>

// The library's smart pointer type is still std::auto_ptr in this series.
#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wdeprecated-declarations"
#include <exiv2/exiv2.hpp>

#include <mutex>

namespace {

// Tag 274 of the main image and tag 36867 of the Exif sub-directory.
const char *const orientationKey = "Exif.Image.Orientation";
const char *const dateTimeOriginalKey = "Exif.Photo.DateTimeOriginal";

// The library writes warnings about odd files to stderr; the caller decides what
// the user sees, so keep it quiet.
void muteLibraryLog()
{
    static std::once_flag once;
    std::call_once(once, [] { Exiv2::LogMsg::setLevel(Exiv2::LogMsg::mute); });
}

PictureMetadata extract(Exiv2::ExifData &exif)
{
    PictureMetadata result;
    const auto orientation = exif.findKey(Exiv2::ExifKey(orientationKey));
    if (orientation != exif.end() && orientation->typeId() == Exiv2::unsignedShort && orientation->count() > 0)
        result.orientation = static_cast<uint16_t>(orientation->toLong(0));

    const auto date = exif.findKey(Exiv2::ExifKey(dateTimeOriginalKey));
    if (date != exif.end() && date->typeId() == Exiv2::asciiString) {
        QString text = QString::fromUtf8(date->toString().c_str());
        while (!text.isEmpty() && (text.endsWith(QChar(0)) || text.endsWith(QLatin1Char(' '))))
            text.chop(1);
        result.captureDateText = text;
        result.captureDate = QDateTime::fromString(text, QStringLiteral("yyyy:MM:dd HH:mm:ss"));
    }
    return result;
}

} // namespace

std::optional<PictureMetadata> readPictureMetadata(const QString &filePath)
{
    if (filePath.isEmpty() || !QFileInfo(filePath).isFile())
        return std::nullopt;
    muteLibraryLog();
    try {
        auto image = Exiv2::ImageFactory::open(QFile::encodeName(filePath).toStdString());
        if (!image.get())
            return std::nullopt;
        image->readMetadata();
        return extract(image->exifData());
    } catch (...) {
        // Damaged or unknown files end up here, in any of the library's error types.
        return std::nullopt;
    }
}

std::optional<uint16_t> readPictureOrientation(const QString &filePath)
{
    const auto metadata = readPictureMetadata(filePath);
    return metadata ? metadata->orientation : std::nullopt;
}

QDateTime readPictureCaptureDate(const QString &filePath)
{
    const auto metadata = readPictureMetadata(filePath);
    return metadata ? metadata->captureDate : QDateTime();
}

std::optional<int32_t> rotationForOrientation(uint32_t orientation)
{
    switch (orientation) {
    case 1: case 5: return 0;
    case 2: case 6: return 90;
    case 3: case 7: return 180;
    case 4: case 8: return 270;
    default: return std::nullopt;
    }
}

#pragma GCC diagnostic pop
