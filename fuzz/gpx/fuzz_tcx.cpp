// Feeds any document to the TCX walk, whatever its root element, and then to the
// dispatching reader.
#include "FuzzQuiet.h"
#include "gpx/TcxReader.h"
#include "gpx/TrackFile.h"

#include <QBuffer>
#include <QXmlStreamReader>

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
    QXmlStreamReader xml(&buffer);
    TrackItemList items;
    if (xml.readNextStartElement())
        TcxReader(xml, items).read();

    buffer.seek(0);
    TrackFile file;
    file.readXml(&buffer);
    file.selectItem();
    return 0;
}
