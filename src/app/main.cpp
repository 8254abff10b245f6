#include "app/AppSettings.h"
#include "app/CommandLine.h"
#include "app/HostPrograms.h"
#include "app/Language.h"
#include "app/LogMessageHandler.h"
#include "app/SplashText.h"
#include "app/StartupChoices.h"
#include "app/Trace.h"
#include "app/Translators.h"
#include "app/gui/PainterPathRenderWidget.h"
#include "mapview/ProgramResources.h"
#include "app/gui/StartupSplash.h"
#include "mapview/MapView.h"
#include "platform/SingleInstance.h"

#include <QApplication>
#include <QDir>
#include <QIcon>
#include <QLibraryInfo>
#include <QQuickStyle>
#include <QResource>
#include <QTextStream>
#include <QTimer>
#include <QTranslator>

#include <memory>

namespace {

QStringList argumentList(int argc, char *argv[])
{
    QStringList arguments;
    for (int i = 0; i < argc; ++i)
        arguments << QString::fromLocal8Bit(argv[i]);
    return arguments;
}

} // namespace

int main(int argc, char *argv[])
{
    const QStringList rawArguments = argumentList(argc, argv);
    const StartSwitches switches = readStartSwitches(rawArguments);
    if (switches.help || switches.version) {
        QTextStream(stdout) << (switches.help ? usageText(QStringLiteral("tourlet")) : versionText());
        return 0;
    }

    // The data folder, and with it the log, is named after the program.
    QCoreApplication::setApplicationName(QStringLiteral("Tourlet"));
    auto instance = std::make_unique<SingleInstance>();
    if (switches.logging)
        qInstallMessageHandler(logMessageHandler);
    if (instance->isSecondInstance())
        return 0;

    AppSettings appSettings;
    Startup::chooseRenderLoop(switches, appSettings);

    QApplication app(argc, argv);
    const double scale = Startup::screenScale(QGuiApplication::primaryScreen());
    const QString programDir = QCoreApplication::applicationDirPath();

    Translators translators(appSettings, programDir);
    translators.install(static_cast<uint32_t>(language(appSettings)));
    const int languageIndex = LanguageTable::normalized(translators.current());

    auto splash = std::make_unique<StartupSplash>(StartupSplash::picturePath(programDir, scale), scale,
                                                  languageIndex, programDir);
    splash->showMessage(SplashMessage::Startup);

    const QStringList arguments = withoutStartSwitches(QCoreApplication::arguments());
    const QString openAtStart = fileToOpen(arguments);
    const bool hostFound = hostPrograms().findHost(parseHostArguments(arguments), appSettings);
    logTrace(0, QStringLiteral("main: host %s"), hostFound ? hostPrograms().hostName() : QStringLiteral("none"));

    QDir::setCurrent(programDir);
    QGuiApplication::setQuitOnLastWindowClosed(false);
    QCoreApplication::setApplicationName(QStringLiteral("Tourlet"));
    registerProgramResources(programDir);
    QApplication::setWindowIcon(QIcon(QStringLiteral(":/Qml/images/QZkGeo.png")));
    QQuickStyle::setStyle(QStringLiteral("Material"));

    auto qtTranslator = std::make_unique<QTranslator>();
    if (qtTranslator->load(QStringLiteral("qt_") + LanguageTable::longName(languageIndex),
                           QLibraryInfo::location(QLibraryInfo::TranslationsPath)))
        QCoreApplication::installTranslator(qtTranslator.get());

    auto mainWindow = std::make_unique<PainterPathRenderWidget>(scale);
    mainWindow->document().fields().hostName = hostPrograms().hostName();
    mainWindow->init();
    mainWindow->show();
    splash->finish(mainWindow.get());

    if (!openAtStart.isEmpty() && mainWindow->mapView()) {
        MapView *view = mainWindow->mapView();
        QTimer::singleShot(0, view, [view, openAtStart] { view->openFile(openAtStart); });
    }

    const int code = QApplication::exec();

    splash.reset();
    instance->release();
    mainWindow.reset();
    qtTranslator.reset();
    return code;
}
