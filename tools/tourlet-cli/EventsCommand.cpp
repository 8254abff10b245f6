#include "Commands.h"
#include "JsonStream.h"

#include "animation/AnimationEventList.h"
#include "animation/FlyInCamera.h"
#include "app/AppSettings.h"
#include "project/DocumentAnimationSource.h"
#include "project/DocumentFile.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QFile>
#include <QJsonObject>

#include <map>

namespace {

// The keys in the order of the event table; each event carries the ones of its type.
const QString *const eventKeys[] = {&EventKey::index,       &EventKey::type,       &EventKey::cKpId,
                                    &EventKey::pathPosition, &EventKey::stepAnimatedPilot,
                                    &EventKey::zoom,        &EventKey::bearing,    &EventKey::tilt,
                                    &EventKey::transition,  &EventKey::file,       &EventKey::fileUrl,
                                    &EventKey::opacity,     &EventKey::orientation, &EventKey::mpePosition,
                                    &EventKey::width,       &EventKey::height};

void writeValue(JsonStream &json, const QVariant &value)
{
    switch (value.userType()) {
    case QMetaType::Bool: json.value(value.toBool()); break;
    case QMetaType::Int: json.value(int32_t(value.toInt())); break;
    case QMetaType::UInt: json.value(uint32_t(value.toUInt())); break;
    case QMetaType::Double: json.value(value.toDouble()); break;
    default: json.value(value.toString()); break;
    }
}

QByteArray eventLine(const QVariantMap &event)
{
    JsonStream json;
    json.beginObject();
    for (const QString *key : eventKeys) {
        const auto found = event.constFind(*key);
        if (found == event.constEnd())
            continue;
        json.key(key->toUtf8().constData());
        writeValue(json, found.value());
    }
    json.endObject();
    return json.bytes();
}

QJsonObject summary(const AnimationEventList &list, const AnimationTiming &timing)
{
    std::map<AnimationEvent::Type, int> counts;
    for (const AnimationEvent &e : list.events())
        ++counts[e.type];
    QJsonObject byType;
    using Type = AnimationEvent::Type;
    for (Type type : {Type::Start, Type::FlyIn, Type::Pause, Type::Step, Type::MediaPoint, Type::End})
        byType.insert(AnimationEvent::typeName(type), counts[type]);
    return {{QStringLiteral("counts"), byType},
            {QStringLiteral("totalFrames"), timing.totalFrames},
            {QStringLiteral("durationText"), timing.durationText},
            {QStringLiteral("stretch"), timing.stretch},
            {QStringLiteral("pilotSteps"), list.pilotSteps()},
            {QStringLiteral("events"), list.count()}};
}

// "--name 0|1": `given` tells whether the option was there at all.
bool takeSwitch(QStringList &args, const QString &name, bool &value, bool &given, QString &error)
{
    QString text;
    given = cli::takeOption(args, name, text, &error);
    if (!error.isEmpty())
        return false;
    if (given && text != QLatin1String("0") && text != QLatin1String("1")) {
        error = QStringLiteral("%1 takes 0 or 1, not '%2'").arg(name, text);
        return false;
    }
    value = text == QLatin1String("1");
    return true;
}

int runEvents(const QStringList &arguments)
{
    QStringList args = arguments;
    const bool wantSummary = cli::takeFlag(args, QStringLiteral("--summary"));
    bool linearGiven = false, flyInGiven = false, linear = false, flyIn = false;
    QString error;
    if (!takeSwitch(args, QStringLiteral("--linear"), linear, linearGiven, error) ||
        !takeSwitch(args, QStringLiteral("--flyin"), flyIn, flyInGiven, error))
        return cli::fail(error);
    // The longest film as the user chose it in the program, unless given here.
    uint32_t maxDuration = uint32_t(AppSettings().maxAnimationDuration());
    QString maxDurationText;
    if (cli::takeOption(args, QStringLiteral("--max-duration"), maxDurationText, &error)) {
        bool ok = false;
        maxDuration = maxDurationText.toUInt(&ok);
        if (!ok || maxDuration > 4)
            return cli::fail(QStringLiteral("--max-duration takes 0 (1 min), 1 (5 min), 2 (10 min), 3 (30 min) or 4 (60 min), "
                                            "not '%1'")
                                 .arg(maxDurationText));
    } else if (!error.isEmpty()) {
        return cli::fail(error);
    }
    if (args.size() != 1 || args.first().startsWith(QLatin1String("--")))
        return cli::fail(QStringLiteral("events needs exactly one FILE"));
    const QString fileName = args.first();

    PainterPathRenderer_Controller document;
    document.setMaxAnimationDuration(maxDuration);
    const DocumentOpenResult opened = openDocumentFile(document, fileName);
    if (!opened.ok())
        return cli::fail(QStringLiteral("%1: %2").arg(fileName, opened.reason));
    if (linearGiven)
        document.fields().linearAnimationDurations = linear;
    if (flyInGiven)
        document.fields().flyInEnabled = flyIn;

    // As a start of playback: the camera is saved and, with a fly-in, zoomed out to
    // the route; the fly-in ends at the user's zoom.
    DocumentAnimationSource source(document);
    const double startZoom = FlyInCamera(source).prepareFlyIn();
    AnimationEventList list(source);
    list.updateDuration();
    if (!list.build(source.linearAnimationDurations(), source.flyInSwitches().enabled, startZoom))
        return cli::fail(QStringLiteral("%1: the event list could not be built (a key point is not on the route, "
                                        "or the durations are damaged)")
                             .arg(fileName));

    if (wantSummary) {
        cli::printJson(summary(list, document.timing()));
        return 0;
    }
    QFile out;
    out.open(stdout, QIODevice::WriteOnly);
    QByteArray chunk;
    chunk.reserve(1 << 20);
    QVariantMap event;
    for (int32_t i = 0; i < list.count(); ++i) {
        list.event(uint32_t(i), event);
        chunk += eventLine(event);
        chunk += '\n';
        if (chunk.size() > (1 << 20) - 4096) {
            out.write(chunk);
            chunk.clear();
        }
    }
    out.write(chunk);
    return 0;
}

} // namespace

CliCommand eventsCommand()
{
    return {"events",
            "events FILE [--linear 0|1] [--flyin 0|1] [--max-duration 0..4] [--summary]   the per-frame events of a start\n"
            "      of playback; the longest film is the stored choice \"MaxAnimationDuration\" unless given",
            runEvents};
}
