#pragma once

#include <QDateTime>
#include <QString>

#include <cstdint>
#include <optional>

// The two EXIF values the program takes from a photograph.
struct PictureMetadata
{
    // Tag 274 (Orientation) when present with type SHORT.
    std::optional<uint16_t> orientation;
    // Tag 36867 (DateTimeOriginal) as stored, e.g. "2021:07:04 13:45:10"; empty when absent.
    QString captureDateText;
    // The same as a local date and time; invalid when absent or not a date.
    QDateTime captureDate;
};

// Reads the metadata of a picture file. A missing, unreadable or damaged file,
// or one that is no picture, gives no value; nothing is thrown or logged.
std::optional<PictureMetadata> readPictureMetadata(const QString &filePath);

// Shorthands of the above.
std::optional<uint16_t> readPictureOrientation(const QString &filePath);
QDateTime readPictureCaptureDate(const QString &filePath);

// Degrees to turn a picture for its orientation value: 1,5 -> 0; 2,6 -> 90;
// 3,7 -> 180; 4,8 -> 270; any other value gives none.
std::optional<int32_t> rotationForOrientation(uint32_t orientation);
