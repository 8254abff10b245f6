#include "mapview/BackgroundSelection.h"

#include "app/AppSettings.h"
#include "content/ContentItems.h"
#include "mapview/FileDialogs.h"
#include "mapview/QMainController.h"

#include <QFileInfo>
#include <QUrl>

namespace {
const QString osmPrefix = QStringLiteral("osm:");
const QString esriPrefix = QStringLiteral("esri:");
const QString cataloguePrefix = QStringLiteral("pseudeo:map:");
const QString browseWord = QStringLiteral("?browse");
const QString filePrefix = QStringLiteral("file:///");
}

const QString BackgroundSelection::defaultMap = QStringLiteral("osm:layer:0");

BackgroundSelection::Kind BackgroundSelection::kindOf(const QString &identifier)
{
    if (identifier.startsWith(osmPrefix))
        return Kind::LiveOsm;
    if (identifier.startsWith(esriPrefix))
        return Kind::LiveEsri;
    if (identifier.left(12) == cataloguePrefix)
        return Kind::CatalogueMap;
    if (identifier.startsWith(browseWord))
        return Kind::Browse;
    if (identifier.startsWith(filePrefix))
        return Kind::OwnPicture;
    return Kind::Invalid;
}

QString BackgroundSelection::trackingWord(const QString &identifier)
{
    static const QStringList known = {QStringLiteral("osm:standard"), QStringLiteral("esri:satellite"),
                                      QStringLiteral("esri:geographic"), QStringLiteral("esri:topo"),
                                      QStringLiteral("esri:standard")};
    return known.contains(identifier) ? identifier : QStringLiteral("custom");
}

bool BackgroundSelection::resolve(const QString &identifier, const std::vector<MapItem> &maps,
                                  QMainController &controller)
{
    switch (kindOf(identifier)) {
    case Kind::LiveOsm:
    case Kind::LiveEsri:
        m_background = identifier;
        m_picture.clear();
        return true;
    case Kind::CatalogueMap: {
        const QString id = identifier.mid(cataloguePrefix.size());
        for (const MapItem &map : maps) {
            if (map.elementId != id)
                continue;
            m_background = identifier;
            m_picture = map.sourceFile;
            m_colour = QColor(map.background);
            return true;
        }
        return false;
    }
    case Kind::Browse: {
        AppSettings &settings = controller.settings();
        const QString file = controller.fileDialogs().openFileName(
            controller.getString(QStringLiteral("strBrowseOwnContent")),
            settings.pathSetting(SettingsKey::BrowseContentPath), controller.fileFilter(QMainController::Images));
        if (file.isEmpty())
            return false;
        settings.setPathSetting(SettingsKey::BrowseContentPath, QFileInfo(file).absolutePath());
        m_picture = QFileInfo(file).absoluteFilePath();
        m_background = contentFileUrl(m_picture);
        return true;
    }
    case Kind::OwnPicture:
        m_background = identifier;
        m_picture = QUrl(identifier).toLocalFile();
        return true;
    case Kind::Invalid:
        break;
    }
    return false;
}
