#pragma once

#include <QString>

#include <cstdint>

// One picture of the photo pool. The capture date and the orientation come from
// the picture itself and are read again whenever a record is made or loaded.
struct PoolPhoto
{
    enum Flag : uint32_t { selected = 1 };

    int32_t id = 0;
    uint32_t flags = 0;
    int32_t orderId = 0;
    int32_t sizeW = 0;
    int32_t sizeH = 0;
    QString path;
    QString time;        // the picture's date text, or noPhotoTime()
    QString captureDate; // tag 36867 as stored in the picture; empty when absent
    int32_t orientation = 0; // degrees: 0, 90, 180 or 270

    PoolPhoto();

    bool isSelected() const { return (flags & selected) != 0; }
    void setSelected(bool on) { flags = on ? (flags | selected) : (flags & ~uint32_t(selected)); }

    // Takes the capture date and the orientation from the picture file; a file
    // without them (or no file) leaves both as they are.
    void readMetadata();
};

// "00.00.00_00:00", the time of a picture that has no date.
QString noPhotoTime();

// The next id of the process-wide photo counter; first value 1.
int32_t drawPhotoId();
