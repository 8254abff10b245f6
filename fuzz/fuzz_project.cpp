// Opens any bytes as the program opens a project file, builds the events of a start
// of playback from what loaded, saves it and opens the saved file again, which
// must come back as a project.
#include "animation/AnimationEventList.h"
#include "animation/FlyInCamera.h"
#include "project/DocumentAnimationSource.h"
#include "project/DocumentFile.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QFile>
#include <QTemporaryDir>

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <memory>

namespace {
std::unique_ptr<QTemporaryDir> g_folder;
int g_run = 0;
}

extern "C" int LLVMFuzzerInitialize(int *, char ***)
{
    // The trace lines of damaged projects would drown the fuzzer's own output.
    qInstallMessageHandler([](QtMsgType, const QMessageLogContext &, const QString &) {});
    g_folder = std::make_unique<QTemporaryDir>();
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    // A name of its own for every input: the settings store caches files by name.
    const QString input = g_folder->filePath(QStringLiteral("in%1.zkgeo").arg(++g_run));
    const QString output = g_folder->filePath(QStringLiteral("out%1.zkgeo").arg(g_run));
    {
        QFile file(input);
        if (!file.open(QIODevice::WriteOnly))
            std::abort();
        file.write(reinterpret_cast<const char *>(data), qint64(size));
    }

    PainterPathRenderer_Controller document;
    if (openDocumentFile(document, input).status == DocumentOpenResult::Status::Project) {
        DocumentAnimationSource source(document);
        const double startZoom = FlyInCamera(source).prepareFlyIn();
        AnimationEventList events(source);
        events.updateDuration();
        events.build(source.linearAnimationDurations(), source.flyInSwitches().enabled, startZoom);

        if (!saveDocumentFile(document, output))
            std::abort();
        PainterPathRenderer_Controller reloaded;
        if (openDocumentFile(reloaded, output).status != DocumentOpenResult::Status::Project)
            std::abort();
    }
    QFile::remove(input);
    QFile::remove(output);
    return 0;
}
