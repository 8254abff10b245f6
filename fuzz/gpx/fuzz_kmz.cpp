// Loads any bytes as a ".kmz" file: archive opening, the choice of its document,
// its extraction into a temporary folder and its reading.
#include "FuzzConvert.h"
#include "FuzzQuiet.h"
#include "gpx/TrackFile.h"

#include <QFile>
#include <QTemporaryDir>

#include <cstddef>
#include <cstdint>

namespace {
QTemporaryDir *inputFolder = nullptr;
}

extern "C" int LLVMFuzzerInitialize(int *, char ***)
{
    silenceQtMessages();
    inputFolder = new QTemporaryDir;
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    const QString fileName = inputFolder->filePath(QStringLiteral("input.kmz"));
    QFile input(fileName);
    if (!input.open(QIODevice::WriteOnly | QIODevice::Truncate))
        return 0;
    input.write(reinterpret_cast<const char *>(data), qint64(size));
    input.close();

    TrackFile file;
    file.load(fileName);
    convertChosenItem(file, size);
    return 0;
}
