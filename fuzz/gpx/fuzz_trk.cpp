// Feeds any bytes to the line reader of ".trk" files.
#include "FuzzQuiet.h"
#include "gpx/TrackFile.h"

#include <QBuffer>

#include <cstddef>
#include <cstdint>

extern "C" int LLVMFuzzerInitialize(int *, char ***)
{
    silenceQtMessages();
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    QByteArray bytes = QByteArray::fromRawData(reinterpret_cast<const char *>(data), int(size));
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::ReadOnly);
    TrackFile file;
    file.readTrk(&buffer);
    file.selectItem();
    return 0;
}
