#include "CliCommand.h"

#include "content/ContentCatalogue.h"

#include <QDir>
#include <QFileInfo>
#include <QJsonArray>
#include <QJsonObject>
#include <QJsonValue>

namespace {

QJsonObject commonFields(const ContentItem &item)
{
    return {{QStringLiteral("id"), qint64(item.id)},
            {QStringLiteral("groupIndex"), item.groupIndex},
            {QStringLiteral("groupName"), item.groupName},
            {QStringLiteral("packageIndex"), qint64(item.packageIndex)},
            {QStringLiteral("name"), item.name},
            {QStringLiteral("type"), item.type},
            {QStringLiteral("fileName"), item.fileName},
            {QStringLiteral("sourceFile"), item.sourceFile},
            {QStringLiteral("thumbFile"), item.thumbFile},
            {QStringLiteral("packType"), qint64(item.packType)}};
}

QJsonObject withItemMap(QJsonObject record, const ContentItem &item, uint32_t mask)
{
    record.insert(QStringLiteral("itemMap"), QJsonObject::fromVariantMap(contentItemMap(item, mask)));
    return record;
}

QJsonArray avatarRecords(const std::vector<AvatarItem> &items)
{
    QJsonArray out;
    for (const AvatarItem &a : items) {
        QJsonObject r = commonFields(a);
        r.insert(QStringLiteral("animated"), qint64(a.animated));
        r.insert(QStringLiteral("perspective"), qint64(a.perspective));
        r.insert(QStringLiteral("allowRotation"), a.allowRotation);
        r.insert(QStringLiteral("symmetric"), a.symmetric);
        r.insert(QStringLiteral("defaultWidth"), a.defaultWidth);
        r.insert(QStringLiteral("isUserContent"), a.isUserContent);
        out.append(r);
    }
    return out;
}

QJsonArray waypointRecords(const std::vector<WaypointItem> &items)
{
    QJsonArray out;
    for (const WaypointItem &w : items) {
        QJsonObject r = commonFields(w);
        r.insert(QStringLiteral("animated"), qint64(w.animated));
        r.insert(QStringLiteral("isMediaTemplate"), w.isMediaTemplate);
        r.insert(QStringLiteral("mediaCenterOffset"),
                 QJsonObject{{QStringLiteral("x"), w.mediaCenterOffset.x}, {QStringLiteral("y"), w.mediaCenterOffset.y}});
        r.insert(QStringLiteral("mediaSize"), QJsonObject{{QStringLiteral("width"), w.mediaSize.width},
                                                          {QStringLiteral("height"), w.mediaSize.height}});
        out.append(withItemMap(r, w, ItemMapField::WaypointList));
    }
    return out;
}

QJsonArray mapRecords(const std::vector<MapItem> &items)
{
    QJsonArray out;
    for (const MapItem &m : items) {
        QJsonObject r = commonFields(m);
        r.insert(QStringLiteral("elementId"), m.elementId);
        r.insert(QStringLiteral("mainCategory"), m.mainCategory);
        r.insert(QStringLiteral("widthWeight"), m.widthWeight);
        r.insert(QStringLiteral("background"), m.background);
        r.insert(QStringLiteral("origins"), m.origins);
        out.append(withItemMap(r, m, ItemMapField::MapList));
    }
    return out;
}

QJsonArray maskRecords(const std::vector<MaskItem> &items)
{
    QJsonArray out;
    for (const MaskItem &m : items) {
        QJsonObject r = commonFields(m);
        r.insert(QStringLiteral("guid"), m.guid);
        out.append(withItemMap(r, m, ItemMapField::MaskList));
    }
    return out;
}

int runContent(QStringList args)
{
    QString error;
    QString imageRoot;
    QString dataFolder;
    QString language = QStringLiteral("1");
    if (!cli::takeOption(args, QStringLiteral("--image-root"), imageRoot, &error))
        return cli::fail(error.isEmpty() ? QStringLiteral("content: --image-root DIR is required") : error);
    cli::takeOption(args, QStringLiteral("--data"), dataFolder, &error);
    cli::takeOption(args, QStringLiteral("--language"), language, &error);
    if (!error.isEmpty())
        return cli::fail(error);
    if (!args.isEmpty())
        return cli::fail(QStringLiteral("content: unexpected argument '%1'").arg(args.first()));
    if (!QFileInfo(imageRoot).isDir())
        return cli::fail(QStringLiteral("content: image root '%1' is not a folder").arg(imageRoot));
    if (!dataFolder.isEmpty() && !QFileInfo(dataFolder).isDir())
        return cli::fail(QStringLiteral("content: data folder '%1' is not a folder").arg(dataFolder));
    bool ok = false;
    const int languageIndex = language.toInt(&ok);
    if (!ok)
        return cli::fail(QStringLiteral("content: --language needs a number, not '%1'").arg(language));

    // The catalogue keeps paths as given, and item maps make file URLs of them.
    imageRoot = QDir::cleanPath(QFileInfo(imageRoot).absoluteFilePath()) + QLatin1Char('/');
    if (!dataFolder.isEmpty())
        dataFolder = QDir::cleanPath(QFileInfo(dataFolder).absoluteFilePath());
    ContentCatalogue catalogue;
    catalogue.load(imageRoot, dataFolder, languageIndex);
    cli::printJson({{QStringLiteral("imageRoot"), catalogue.imageRoot()},
                    {QStringLiteral("contentIniPath"), catalogue.contentIniPath()},
                    {QStringLiteral("utpRoot"), catalogue.utpRoot()},
                    {QStringLiteral("teeRoot"), catalogue.teeRoot()},
                    {QStringLiteral("groups"), QJsonArray::fromStringList(catalogue.groups())},
                    {QStringLiteral("avatars"), avatarRecords(catalogue.avatars())},
                    {QStringLiteral("waypoints"), waypointRecords(catalogue.waypoints())},
                    {QStringLiteral("maps"), mapRecords(catalogue.maps())},
                    {QStringLiteral("masks"), maskRecords(catalogue.masks())}});
    return 0;
}

} // namespace

CliCommand contentCommand()
{
    return {"content", "content --image-root DIR [--data DIR] [--language N]   list the content catalogue",
            [](const QStringList &args) { return runContent(args); }};
}
