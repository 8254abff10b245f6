#include "platform/DesktopOpen.h"

#include "app/Trace.h"

#include <QDesktopServices>
#include <QUrl>

bool openWithDesktop(const QUrl &url)
{
    const bool opened = QDesktopServices::openUrl(url);
    logTrace(opened ? 0 : 3, QStringLiteral("openWithDesktop(%s) - %s"), url.toString(),
             opened ? "handed over" : "no program took it");
    return opened;
}
