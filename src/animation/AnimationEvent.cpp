#include "animation/AnimationEvent.h"

namespace EventKey {
const QString index = QStringLiteral("index");
const QString type = QStringLiteral("type");
const QString cKpId = QStringLiteral("cKpId");
const QString pathPosition = QStringLiteral("pathPosition");
const QString stepAnimatedPilot = QStringLiteral("stepAnimatedPilot");
const QString zoom = QStringLiteral("zoom");
const QString bearing = QStringLiteral("bearing");
const QString tilt = QStringLiteral("tilt");
const QString transition = QStringLiteral("transition");
const QString file = QStringLiteral("file");
const QString fileUrl = QStringLiteral("fileUrl");
const QString opacity = QStringLiteral("opacity");
const QString orientation = QStringLiteral("orientation");
const QString mpePosition = QStringLiteral("mpePosition");
const QString width = QStringLiteral("width");
const QString height = QStringLiteral("height");
}

QString AnimationEvent::typeName(Type type)
{
    switch (type) {
    case Type::Start: return QStringLiteral("start");
    case Type::FlyIn: return QStringLiteral("flyin");
    case Type::Pause: return QStringLiteral("pause");
    case Type::Step: return QStringLiteral("step");
    case Type::MediaPoint: return QStringLiteral("mediaPoint");
    case Type::End: return QStringLiteral("end");
    }
    return QString();
}

QString AnimationEvent::transitionName(Transition transition)
{
    switch (transition) {
    case Transition::FadeIn: return QStringLiteral("fadein");
    case Transition::CrossFade: return QStringLiteral("crossfade");
    case Transition::FadeOut: return QStringLiteral("fadeout");
    }
    return QString();
}

QString AnimationEvent::mpePositionName(MpePosition position)
{
    switch (position) {
    case MpePosition::Default: return QStringLiteral("default");
    case MpePosition::FirstEvent: return QStringLiteral("firstEvent");
    case MpePosition::LastEvent: return QStringLiteral("lastEvent");
    }
    return QString();
}

QVariantMap AnimationEvent::toVariantMap(const PhotoFrame &photoFrame) const
{
    QVariantMap map;
    map.insert(EventKey::index, index);
    map.insert(EventKey::type, typeName(type));
    if (type == Type::FlyIn) {
        map.insert(EventKey::zoom, zoom);
        map.insert(EventKey::bearing, bearing);
        map.insert(EventKey::tilt, tilt);
        return map;
    }
    map.insert(EventKey::pathPosition, pathPosition);
    map.insert(EventKey::stepAnimatedPilot, stepAnimatedPilot);
    if (type != Type::MediaPoint) {
        map.insert(EventKey::cKpId, cKpId);
        return map;
    }
    map.insert(EventKey::transition, transitionName(transition));
    map.insert(EventKey::file, photoFrame.file);
    map.insert(EventKey::fileUrl, photoFrame.fileUrl);
    map.insert(EventKey::opacity, opacity);
    map.insert(EventKey::orientation, photoFrame.orientation);
    map.insert(EventKey::mpePosition, mpePositionName(mpePosition));
    map.insert(EventKey::width, photoFrame.width);
    map.insert(EventKey::height, photoFrame.height);
    return map;
}
