#include "mapview/ProgramResources.h"

#include "app/Trace.h"

#include <QDir>
#include <QFile>
#include <QResource>

namespace {
const QString styleResource = QStringLiteral(":/basemap/style.json");
QtMessageHandler nextHandler = nullptr;

// The vector map's renderer reports its notes as warnings, marked "[ INFO ]" or
// "[ DEBUG ]": they go on as the debug messages they are.
void demoteRendererNotes(QtMsgType type, const QMessageLogContext &context, const QString &text)
{
    if (type == QtWarningMsg &&
        (text.startsWith(QLatin1String("[ INFO ]")) || text.startsWith(QLatin1String("[ DEBUG ]"))))
        type = QtDebugMsg;
    if (nextHandler)
        nextHandler(type, context, text);
    else if (type != QtDebugMsg)
        qt_message_output(type, context, text);
}
}

bool registerProgramResources(const QString &programFolder)
{
    const QDir folder(programFolder);
    const bool interface = QResource::registerResource(folder.filePath(QStringLiteral("resource.rcc")));
    if (!QFile::exists(styleResource) &&
        !QResource::registerResource(folder.filePath(QStringLiteral("basemap.rcc"))))
        logTrace(2, QStringLiteral("registerProgramResources - no world map in %s"), folder.path());
    // The vector map draws in the scene's own thread only: Qt Quick renders on the
    // main thread then, unless the user chose otherwise.
    if (QFile::exists(styleResource) && !qEnvironmentVariableIsSet("QSG_RENDER_LOOP"))
        qputenv("QSG_RENDER_LOOP", "basic");
    static const bool filtering = [] {
        nextHandler = qInstallMessageHandler(demoteRendererNotes);
        return true;
    }();
    Q_UNUSED(filtering)
    return interface;
}

QString offlineWorldMapStyle()
{
    return QFile::exists(styleResource) ? QStringLiteral("qrc:///basemap/style.json") : QString();
}
