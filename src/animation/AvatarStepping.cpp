#include "animation/AvatarStepping.h"

#include "app/Trace.h"

#include <QImageReader>
#include <QUrl>

namespace {

QString localFile(const QString &source)
{
    if (source.startsWith(QLatin1String("file:"), Qt::CaseInsensitive))
        return QUrl(source).toLocalFile();
    return source;
}

}

int32_t AvatarStepping::interval(const PilotProperties &pilot)
{
    if (!pilot.hasFlag(PilotProperties::isAnimated))
        return everyEvent;
    const auto cached = m_delays.constFind(pilot.source);
    if (cached != m_delays.constEnd())
        return cached.value();

    int32_t delay = everyEvent;
    QImageReader reader(localFile(pilot.source));
    if (reader.canRead() && reader.imageCount() > 1) {
        reader.jumpToImage(0);
        delay = reader.nextImageDelay();
        logTrace(0, QStringLiteral("nextImageDelay = %d"), delay);
    }
    m_delays.insert(pilot.source, delay);
    return delay;
}

bool AvatarStepping::steps(size_t listSize, int32_t interval)
{
    if (interval == 0)
        return false;
    return int64_t(listSize) % int64_t(interval) == 0;
}
