#include "Commands.h"
#include "JsonStream.h"

#include "gpx/GpxWriter.h"
#include "gpx/TrackFile.h"
#include "gpx/TrackImport.h"
#include "path/Path.h"

#include <QFileInfo>

#include <algorithm>
#include <unordered_map>

namespace {

void lonLat(JsonStream &json, const char *name, const KeyPoint &corner)
{
    json.key(name).beginArray().value(corner.longitude).value(corner.latitude).endArray();
}

// A long track has hundreds of thousands of samples: written straight into the text.
QByteArray describe(const TrackFile &file, const Path &path)
{
    JsonStream json;
    json.reserve(int(std::min<size_t>(path.curvePoints.size() * 80 + path.keyPoints.size() * 120, 1u << 30)));
    json.beginObject();
    json.key("creator").value(file.creator());
    json.key("items").beginArray();
    for (const TrackItem &item : file.items()) {
        const TrackBounds &b = item.bounds;
        json.beginObject();
        json.key("type").value(item.type);
        json.key("points").value(int32_t(item.points.size()));
        json.key("bounds").beginArray().value(b.left).value(b.top).value(b.right).value(b.bottom).endArray();
        json.endObject();
    }
    json.endArray();
    json.key("pathType").value(path.pathType);
    json.key("fixedCurve").value(path.fixedCurve);
    json.key("curveMode").value(path.curveMode);
    lonLat(json, "boundaryMin", path.boundaryMin);
    lonLat(json, "boundaryMax", path.boundaryMax);

    std::unordered_map<uint32_t, int32_t> keyIndex;
    json.key("keyPoints").beginArray();
    for (size_t i = 0; i < path.keyPoints.size(); ++i) {
        const KeyPoint &k = path.keyPoints[i];
        keyIndex[k.id] = int32_t(i);
        json.beginObject();
        json.key("x").value(k.x);
        json.key("y").value(k.y);
        json.key("z").value(k.z);
        json.key("title").value(k.title());
        json.key("durationToNextKP").value(k.properties.durationToNextKP);
        json.endObject();
    }
    json.endArray();
    json.key("curvePoints").beginArray();
    for (const CurvePoint &c : path.curvePoints) {
        const auto found = c.correspondingKeyPoint ? keyIndex.find(c.correspondingKeyPoint) : keyIndex.end();
        json.beginObject();
        json.key("x").value(c.x);
        json.key("y").value(c.y);
        json.key("z").value(c.z);
        json.key("kp").value(found == keyIndex.end() ? -1 : found->second);
        json.endObject();
    }
    json.endArray();
    json.endObject();
    return json.bytes();
}

int runTrack(const QStringList &arguments)
{
    QStringList args = arguments;
    QString aliasingText = QStringLiteral("1"), gpxOut, error;
    cli::takeOption(args, QStringLiteral("--aliasing"), aliasingText, &error);
    cli::takeOption(args, QStringLiteral("--write-gpx"), gpxOut, &error);
    if (!error.isEmpty())
        return cli::fail(error);
    bool ok = false;
    const uint aliasing = aliasingText.toUInt(&ok);
    if (!ok || aliasing > 3)
        return cli::fail(QStringLiteral("--aliasing takes 0, 1, 2 or 3, not '%1'").arg(aliasingText));
    if (args.size() != 1)
        return cli::fail(QStringLiteral("track needs exactly one FILE"));
    const QString fileName = args.first();
    if (!QFileInfo(fileName).isFile())
        return cli::fail(QStringLiteral("%1: no such file").arg(fileName));

    TrackFile file;
    Path path;
    if (!TrackImport::read(fileName, path, aliasing, TrackImport::fixedDuration, &file))
        return cli::fail(QStringLiteral("%1: not a readable track file (GPX, KML, KMZ, TCX or TRK)").arg(fileName));
    if (!gpxOut.isEmpty() && !GpxWriter::write(gpxOut, path.curvePoints, path, &error))
        return cli::fail(QStringLiteral("%1: can't write the GPX file, nothing was changed: %2").arg(gpxOut, error));
    cli::printJsonText(describe(file, path));
    return 0;
}

} // namespace

CliCommand trackCommand()
{
    return {"track", "track FILE [--aliasing 0|1|2|3] [--write-gpx OUT.gpx]   read a track as the program opens it",
            runTrack};
}
