#include "models/PoolPhoto.h"

#include "path/ContentPath.h"
#include "platform/PictureMetadata.h"

namespace {
int32_t g_nextPhotoId = 1;
}

QString noPhotoTime()
{
    return QStringLiteral("00.00.00_00:00");
}

int32_t drawPhotoId()
{
    return g_nextPhotoId++;
}

PoolPhoto::PoolPhoto() : time(noPhotoTime()) {}

void PoolPhoto::readMetadata()
{
    const auto metadata = readPictureMetadata(localFilePath(path));
    if (!metadata)
        return;
    if (!metadata->captureDateText.isEmpty())
        captureDate = metadata->captureDateText;
    // Only the low byte of the tag counts for the pool.
    if (metadata->orientation) {
        if (const auto rotation = rotationForOrientation(*metadata->orientation & 0xFFu))
            orientation = *rotation;
    }
}
