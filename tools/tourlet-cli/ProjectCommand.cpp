#include "Commands.h"

#include "gpx/GpxWriter.h"
#include "project/DocumentFile.h"
#include "project/PainterPathRenderer_Controller.h"
#include "project/ProjectFieldSink.h"
#include "project/ProjectSaver.h"

#include <QJsonArray>
#include <QJsonObject>

namespace {

// Collects the document's fields under "section/key", with their types.
class JsonFieldSink : public ProjectFieldSink
{
public:
    void put(const QString &section, const QString &key, int32_t value) override { m_object.insert(name(section, key), value); }
    void put(const QString &section, const QString &key, double value) override { m_object.insert(name(section, key), value); }
    void put(const QString &section, const QString &key, bool value) override { m_object.insert(name(section, key), value); }
    void put(const QString &section, const QString &key, const QString &value) override
    {
        m_object.insert(name(section, key), value);
    }
    void putPoint(const QString &section, const KeyPoint &point) override
    {
        m_object.insert(name(section, QStringLiteral("longitude")), point.longitude);
        m_object.insert(name(section, QStringLiteral("latitude")), point.latitude);
        m_object.insert(name(section, QStringLiteral("x")), point.x);
        m_object.insert(name(section, QStringLiteral("y")), point.y);
    }
    QJsonObject object() const { return m_object; }

private:
    static QString name(const QString &section, const QString &key) { return section + QLatin1Char('/') + key; }
    QJsonObject m_object;
};

QJsonObject describePilot(const PilotProperties &pilot)
{
    return {{QStringLiteral("pilot_isAnimated"), pilot.hasFlag(PilotProperties::isAnimated)},
            {QStringLiteral("pilot_rotation"), pilot.hasFlag(PilotProperties::rotation)},
            {QStringLiteral("pilot_symmetric"), pilot.hasFlag(PilotProperties::symmetric)},
            {QStringLiteral("pilot_source"), pilot.source},
            {QStringLiteral("pilot_thumb"), pilot.thumb},
            {QStringLiteral("pilot_displayFormat"), pilot.displayFormat},
            {QStringLiteral("pilot_width"), pilot.width}};
}

QJsonObject describePath(const Path *path)
{
    if (!path)
        return {};
    QJsonArray keys;
    for (const KeyPoint &k : path->keyPoints) {
        const KeyPointFont &font = k.properties.font;
        keys.append(QJsonObject{{QStringLiteral("longitude"), k.longitude},
                                {QStringLiteral("latitude"), k.latitude},
                                {QStringLiteral("altitude"), k.altitude},
                                {QStringLiteral("x"), k.x},
                                {QStringLiteral("y"), k.y},
                                {QStringLiteral("title"), k.properties.title},
                                {QStringLiteral("durationToNextKP"), k.properties.durationToNextKP},
                                {QStringLiteral("durationPause"), k.properties.durationPause},
                                {QStringLiteral("size"), k.properties.size},
                                {QStringLiteral("imageSource"), k.properties.imageSource},
                                {QStringLiteral("font"), QJsonObject{{QStringLiteral("family"), font.family},
                                                                     {QStringLiteral("pointSize"), font.pointSize},
                                                                     {QStringLiteral("style"), qint64(font.style)},
                                                                     {QStringLiteral("color"), font.color},
                                                                     {QStringLiteral("hasFrame"), font.hasFrame},
                                                                     {QStringLiteral("hasShadow"), font.hasShadow}}}});
    }
    QJsonArray segments;
    for (const PathSegment &s : path->pathSegments) {
        QJsonObject segment = describePilot(s.pilot);
        segment.insert(QStringLiteral("samples"), int(s.curvePoints.size()));
        segments.append(segment);
    }
    return {{QStringLiteral("name"), path->name},
            {QStringLiteral("pathType"), path->pathType},
            {QStringLiteral("curveMode"), path->curveMode},
            {QStringLiteral("keyPointCount"), int(path->keyPoints.size())},
            {QStringLiteral("curvePointCount"), int(path->curvePoints.size())},
            {QStringLiteral("mediaPointCount"), int(path->mediaPoints.size())},
            {QStringLiteral("segmentCount"), int(path->pathSegments.size())},
            {QStringLiteral("keyPoints"), keys},
            {QStringLiteral("segments"), segments}};
}

QJsonArray describePhotos(const PhotoPool &pool)
{
    QJsonArray photos;
    for (const PoolPhoto &p : pool.photos) {
        photos.append(QJsonObject{{QStringLiteral("id"), p.id},
                                  {QStringLiteral("flags"), qint64(p.flags)},
                                  {QStringLiteral("orderId"), p.orderId},
                                  {QStringLiteral("sizeW"), p.sizeW},
                                  {QStringLiteral("sizeH"), p.sizeH},
                                  {QStringLiteral("path"), p.path},
                                  {QStringLiteral("time"), p.time},
                                  {QStringLiteral("captureDate"), p.captureDate},
                                  {QStringLiteral("orientation"), p.orientation}});
    }
    return photos;
}

QJsonObject describePreset(const AltitudePreset &preset)
{
    QJsonObject object = QJsonObject::fromVariantMap(preset.toMap());
    object.insert(QStringLiteral("version"), preset.version);
    object.insert(QStringLiteral("preset_version"), qint64(preset.presetVersion));
    return object;
}

QJsonObject describe(const PainterPathRenderer_Controller &document, const QString &file, DocumentOpenResult::Status kind)
{
    JsonFieldSink fields;
    ProjectSaver::writeLeadingFields(document, fields);
    ProjectSaver::writeTrailingFields(document, fields);
    fields.put(QStringLiteral("fullframe"), QStringLiteral("borderEffect"), document.photoPool().fullFrameBorderEffect);
    fields.put(QStringLiteral("fullframe"), QStringLiteral("cropping"), document.photoPool().fullFrameCropping);
    const AnimationTiming &timing = document.timing();
    return {{QStringLiteral("file"), file},
            {QStringLiteral("kind"), kind == DocumentOpenResult::Status::Track ? QStringLiteral("track") : QStringLiteral("project")},
            {QStringLiteral("fields"), fields.object()},
            {QStringLiteral("durationText"), timing.durationText},
            {QStringLiteral("naturalFrames"), document.naturalFrames()},
            {QStringLiteral("path"), describePath(document.pathManager().active())},
            {QStringLiteral("photoPool"), describePhotos(document.photoPool())},
            {QStringLiteral("altitudePreset"), describePreset(document.altitudePreset())}};
}

// Exit 1 for a file that is neither project nor track, 2 for a damaged project.
int openFailure(const QString &file, const DocumentOpenResult &result)
{
    const int code = result.status == DocumentOpenResult::Status::DamagedProject ? 2 : 1;
    return cli::fail(QStringLiteral("%1: %2").arg(file, result.reason), code);
}

int runProject(const QStringList &args)
{
    if (args.size() != 1)
        return cli::fail(QStringLiteral("project needs exactly one FILE"));
    PainterPathRenderer_Controller document;
    const DocumentOpenResult result = openDocumentFile(document, args.first());
    if (!result.ok())
        return openFailure(args.first(), result);
    cli::printJson(describe(document, args.first(), result.status));
    return 0;
}

int runConvert(const QStringList &arguments)
{
    QStringList args = arguments;
    QString output, aliasingText, error;
    if (!cli::takeOption(args, QStringLiteral("-o"), output, &error))
        return cli::fail(error.isEmpty() ? QStringLiteral("convert needs -o OUTPUT.zkgeo") : error);
    PainterPathRenderer_Controller document;
    if (cli::takeOption(args, QStringLiteral("--aliasing"), aliasingText, &error)) {
        bool ok = false;
        const uint aliasing = aliasingText.toUInt(&ok);
        if (!ok || aliasing > 3)
            return cli::fail(QStringLiteral("--aliasing wants 0 (off), 1 (auto), 2 (default) or 3 (max), not '%1'").arg(aliasingText));
        document.setGpxAliasing(aliasing);
    } else if (!error.isEmpty()) {
        return cli::fail(error);
    }
    if (args.size() != 1)
        return cli::fail(QStringLiteral("convert needs exactly one INPUT"));
    const QString input = args.first();

    const DocumentOpenResult result = openDocumentFile(document, input);
    if (!result.ok())
        return openFailure(input, result);
    if (!saveDocumentFile(document, output))
        return cli::fail(QStringLiteral("%1: can't be written, nothing was changed: %2")
                             .arg(output, document.projectController().lastWriteError()));
    const Path *path = document.pathManager().active();
    cli::printJson({{QStringLiteral("input"), input},
                    {QStringLiteral("output"), output},
                    {QStringLiteral("kind"), result.status == DocumentOpenResult::Status::Track ? QStringLiteral("track")
                                                                                              : QStringLiteral("project")},
                    {QStringLiteral("keyPointCount"), path ? int(path->keyPoints.size()) : 0},
                    {QStringLiteral("curvePointCount"), path ? int(path->curvePoints.size()) : 0}});
    return 0;
}

// The route of a project or track, written as the window's "export GPX" writes it.
int runGpx(const QStringList &arguments)
{
    QStringList args = arguments;
    QString output, error;
    if (!cli::takeOption(args, QStringLiteral("-o"), output, &error))
        return cli::fail(error.isEmpty() ? QStringLiteral("gpx needs -o OUT.gpx") : error);
    if (args.size() != 1)
        return cli::fail(QStringLiteral("gpx needs exactly one INPUT"));
    const QString input = args.first();

    PainterPathRenderer_Controller document;
    const DocumentOpenResult result = openDocumentFile(document, input);
    if (!result.ok())
        return openFailure(input, result);
    const std::vector<CurvePoint> samples = document.pathManager().routeSamples();
    const Path *path = document.pathManager().active();
    if (!GpxWriter::write(output, samples, path ? *path : Path(), &error))
        return cli::fail(QStringLiteral("%1: can't be written, nothing was changed: %2").arg(output, error));
    cli::printJson({{QStringLiteral("input"), input},
                    {QStringLiteral("output"), output},
                    {QStringLiteral("kind"), result.status == DocumentOpenResult::Status::Track ? QStringLiteral("track")
                                                                                              : QStringLiteral("project")},
                    {QStringLiteral("samples"), int(samples.size())}});
    return 0;
}

} // namespace

CliCommand projectCommand()
{
    return {"project", "project FILE   the document a project or track file opens into", runProject};
}

CliCommand convertCommand()
{
    return {"convert", "convert INPUT -o OUTPUT.zkgeo [--aliasing N]   open a project or track and save it as a project",
            runConvert};
}

CliCommand gpxCommand()
{
    return {"gpx", "gpx INPUT -o OUT.gpx   open a project or track and write its route as the GPX export does", runGpx};
}
