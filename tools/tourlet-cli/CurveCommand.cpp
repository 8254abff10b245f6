#include "Commands.h"

#include "path/Path.h"
#include "path/PathMode.h"

#include <QJsonArray>
#include <QJsonObject>

#include <unordered_map>

namespace {

bool parsePoint(const QString &text, double &lon, double &lat)
{
    const QStringList parts = text.split(QLatin1Char(','));
    if (parts.size() != 2)
        return false;
    bool okLon = false, okLat = false;
    lon = parts[0].toDouble(&okLon);
    lat = parts[1].toDouble(&okLat);
    return okLon && okLat && lon >= -180 && lon <= 180 && lat >= -90 && lat <= 90;
}

QJsonObject describe(const Path &path)
{
    std::unordered_map<uint32_t, int> keyIndex;
    QJsonArray keys;
    for (size_t i = 0; i < path.keyPoints.size(); ++i) {
        const KeyPoint &k = path.keyPoints[i];
        keyIndex[k.id] = int(i);
        keys.append(QJsonObject{{QStringLiteral("id"), qint64(k.id)}, {QStringLiteral("x"), k.x}, {QStringLiteral("y"), k.y}});
    }
    QJsonArray segments;
    for (const PathSegment &s : path.pathSegments) {
        segments.append(QJsonObject{{QStringLiteral("id"), qint64(s.id)},
                                    {QStringLiteral("keyPointId"), qint64(s.keyPointId)},
                                    {QStringLiteral("samples"), int(s.curvePoints.size())}});
    }
    QJsonArray samples;
    for (const CurvePoint &c : path.curvePoints) {
        const auto found = keyIndex.find(c.correspondingKeyPoint);
        samples.append(QJsonObject{{QStringLiteral("x"), c.x},
                                   {QStringLiteral("y"), c.y},
                                   {QStringLiteral("kp"), found == keyIndex.end() ? -1 : found->second}});
    }
    return {{QStringLiteral("curveMode"), path.curveMode},
            {QStringLiteral("keyPoints"), keys},
            {QStringLiteral("segments"), segments},
            {QStringLiteral("curvePoints"), samples}};
}

int runCurve(const QStringList &arguments)
{
    QStringList args = arguments;
    QString modeName, error;
    if (!cli::takeOption(args, QStringLiteral("--mode"), modeName, &error))
        return cli::fail(error.isEmpty() ? QStringLiteral("curve needs --mode line|curve|airplane|route") : error);
    const auto mapping = PathMode::map(PathMode::fromName(modeName));
    if (!mapping)
        return cli::fail(QStringLiteral("unknown mode '%1'; use line, curve, airplane or route").arg(modeName));

    Path path;
    // The generator runs once for the mode change, as in the document, then once for all points.
    path.setPathMode(CurveMode::Straight);
    path.setPathMode(mapping->curveMode);
    for (int i = 0; i < args.size(); ++i) {
        double lon = 0, lat = 0;
        if (!parsePoint(args[i], lon, lat))
            return cli::fail(QStringLiteral("'%1' is no LON,LAT pair in degrees").arg(args[i]));
        path.addKeyPoint(lon, lat, 0.0, QString(), i + 1 == args.size());
    }
    cli::printJson(describe(path));
    return 0;
}

} // namespace

CliCommand curveCommand()
{
    return {"curve", "curve --mode line|curve|airplane|route LON,LAT [LON,LAT ...]   the generated route", runCurve};
}
