#include "app/StartupChoices.h"

#include "app/AppSettings.h"
#include "app/CommandLine.h"
#include "app/Trace.h"

#include <QScreen>

namespace Startup {

bool applyRenderLoopChoice(const QString &value)
{
    if (value != QLatin1String("basic") && value != QLatin1String("threaded") && value != QLatin1String("windows"))
        return false;
    qputenv(BugListVariable, BugListFile);
    qputenv(RenderLoopVariable, value.toLatin1());
    return true;
}

void chooseRenderLoop(const StartSwitches &switches, const AppSettings &settings)
{
    if (switches.noBlacklist)
        return;
    const QString loop = settings.renderLoop();
    if (!applyRenderLoopChoice(loop))
        logTrace(1, QStringLiteral("Startup::chooseRenderLoop: '%s' is no render loop, Qt chooses"), loop);
}

double scaleForAvailableHeight(int availableHeight)
{
    return availableHeight > HighDensityHeight ? 2.0 : 1.0;
}

double screenScale(const QScreen *primaryScreen)
{
    return primaryScreen ? scaleForAvailableHeight(primaryScreen->availableGeometry().height()) : 1.0;
}

} // namespace Startup
