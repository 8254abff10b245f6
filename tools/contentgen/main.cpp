#include "ContactSheet.h"
#include "Tasks.h"
#include "app/Trace.h"

#include <QCommandLineParser>
#include <QFile>
#include <QGuiApplication>
#include <QTemporaryDir>

// Makes the program's content from the sources under content/, headless; each
// step rebuilds its output folder anew.
int main(int argc, char *argv[])
{
    // A build step has no screen and, often, no session.
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QTemporaryDir runtime;
    if (qEnvironmentVariableIsEmpty("XDG_RUNTIME_DIR") && runtime.isValid())
        qputenv("XDG_RUNTIME_DIR", QFile::encodeName(runtime.path()));
    QGuiApplication app(argc, argv);
    QCommandLineParser parser;
    parser.setApplicationDescription(QStringLiteral("Makes Tourlet's content from its sources."));
    parser.addHelpOption();
    parser.addPositionalArgument(QStringLiteral("step"),
                                 QStringLiteral("avatars, waypoints, masks, maps, presets, splash, icons or sheet"));
    parser.addOption({QStringLiteral("source"), QStringLiteral("Source folder (for sheet: the imgsrc folder)."), QStringLiteral("dir")});
    parser.addOption({QStringLiteral("out"), QStringLiteral("Output folder (for sheet: the PNG file)."), QStringLiteral("path")});
    parser.addOption({QStringLiteral("world"), QStringLiteral("GeoPackage with countries and provinces (maps)."), QStringLiteral("file")});
    parser.process(app);

    const QStringList args = parser.positionalArguments();
    const QString source = parser.value(QStringLiteral("source"));
    const QString out = parser.value(QStringLiteral("out"));
    if (args.size() != 1 || source.isEmpty() || out.isEmpty()) {
        logTrace(3, QStringLiteral("contentgen: give one step, --source and --out"));
        return 2;
    }
    const QString step = args.first();
    bool ok = false;
    if (step == QLatin1String("avatars"))
        ok = tasks::avatars(source, out);
    else if (step == QLatin1String("waypoints"))
        ok = tasks::waypoints(source, out);
    else if (step == QLatin1String("masks"))
        ok = tasks::masks(source, out);
    else if (step == QLatin1String("maps"))
        ok = tasks::maps(source, out, parser.value(QStringLiteral("world")));
    else if (step == QLatin1String("presets"))
        ok = tasks::altitudePresets(source, out);
    else if (step == QLatin1String("splash"))
        ok = tasks::splash(source, out);
    else if (step == QLatin1String("icons"))
        ok = tasks::icons(source, out);
    else if (step == QLatin1String("sheet"))
        ok = writeContactSheet(source, out);
    else
        logTrace(3, QStringLiteral("contentgen: unknown step %s"), step);
    return ok ? 0 : 1;
}
