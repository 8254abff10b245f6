#include "mapview/QBackgroundChooser.h"

#include "app/Trace.h"
#include "content/ContentItems.h"
#include "mapview/QMainController.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QImageReader>

namespace {

QVariantMap entry(std::initializer_list<std::pair<const char *, QVariant>> values)
{
    QVariantMap map;
    for (const auto &[key, value] : values)
        map.insert(QLatin1String(key), value);
    return map;
}

KeyPoint keyPointAt(const QGeoCoordinate &place)
{
    KeyPoint point(place.longitude(), place.latitude(), 0.0);
    return point;
}

QGeoCoordinate coordinateOf(const KeyPoint &point)
{
    return QGeoCoordinate(point.latitude, point.longitude);
}

} // namespace

QBackgroundChooser::QBackgroundChooser(QMainController &controller, PainterPathRenderer_Controller &document)
    : m_controller(controller), m_document(document)
{
}

void QBackgroundChooser::buildTree(const std::vector<MapItem> &maps, const QStringList &osmLayers,
                                   const QStringList &esriLayers)
{
    m_maps = maps;
    const auto text = [this](const char *key) { return m_controller.getString(QLatin1String(key)); };
    const auto mapsOf = [&maps](const QString &category) {
        return int(std::count_if(maps.begin(), maps.end(), [&](const MapItem &m) { return m.mainCategory == category; }));
    };
    const QString osmWord = QStringLiteral("osm");
    const QString esriWord = QStringLiteral("esri");
    const QString shopWord = QStringLiteral("europe_shop");
    const QString ownWord = QStringLiteral("ownContent");
    const QString baseWord = QStringLiteral("basemaps");

    m_items = {
        entry({{"main_category", "geoprovider"}, {"item_category", osmWord}, {"title", text("strBackgroundChooser_OSM")},
               {"elements", osmLayers.size()}, {"height", 20}}),
        entry({{"main_category", "geoprovider"}, {"item_category", esriWord}, {"title", text("strBackgroundChooser_ESRI")},
               {"elements", esriLayers.size()}, {"height", 20}}),
        entry({{"main_category", "shopcontent"}, {"item_category", shopWord},
               {"title", text("strBackgroundChooser_ShopContentHeadLine")}, {"elements", 1}, {"height", 20}}),
        entry({{"main_category", "pseudomaps"}, {"item_category", ownWord}, {"title", text("strBackgroundChooser_BrowseMap")},
               {"elements", 1}, {"height", 20}}),
        entry({{"main_category", "pseudomaps"}, {"item_category", baseWord}, {"title", text("strBackgroundChooser_BaseMaps")},
               {"elements", mapsOf(baseWord)}, {"height", 20}}),
    };
    const auto freeOf = [this](const char *category) {
        return int(std::count_if(m_items.begin(), m_items.end(), [category](const QVariant &item) {
            return item.toMap().value(QStringLiteral("main_category")).toString() == QLatin1String(category);
        }));
    };
    m_categories = {
        entry({{"category", "geoprovider"}, {"title", text("strBackgroundChooser_LiveMaps")}, {"elements", 2},
               {"free", freeOf("geoprovider")}}),
        entry({{"category", "shopcontent"}, {"title", text("strBackgroundChooser_ShopMaps")}, {"elements", 1},
               {"flickable", true}}),
        entry({{"category", "pseudomaps"}, {"title", text("strBackgroundChooser_PseudoMaps")}, {"elements", 4},
               {"flickable", true}, {"free", freeOf("pseudomaps")}}),
    };

    m_elements.clear();
    const auto addLayers = [this](const QString &word, const QStringList &names) {
        for (int i = 0; i < names.size(); ++i)
            m_elements.append(entry({{"element_id", QStringLiteral("%1:layer:%2").arg(word).arg(i)},
                                     {"item_main_category", word},
                                     {"title", names[i]},
                                     {"widthWeight", 1.0},
                                     {"thumbFileName", QString()}}));
    };
    addLayers(osmWord, osmLayers);
    addLayers(esriWord, esriLayers);
    m_elements.append(entry({{"element_id", "?browse"},
                             {"item_main_category", ownWord},
                             {"title", text("strBackgroundChooser_BrowseMap_Search")},
                             {"widthWeight", 1.0},
                             {"thumbFileName", "qrc:/Qml/images/dialogs_ic_import.svg"}}));
    for (const MapItem &map : maps) {
        QVariantMap element = contentItemMap(map, ItemMapField::MapList);
        element.insert(QStringLiteral("element_id"), QStringLiteral("pseudeo:map:") + map.elementId);
        element.insert(QStringLiteral("item_main_category"), map.mainCategory);
        element.insert(QStringLiteral("widthWeight"), map.widthWeight.toDouble());
        element.insert(QStringLiteral("backgroundColor"), map.background);
        m_elements.append(element);
    }
    emit backgroundCategoriesChanged();
    emit backgroundCategoryItemsChanged();
    emit backgroundCategoryItemElementsChanged();
}

void QBackgroundChooser::connectSignalList(QObject *root)
{
    QObject *list = root ? root->findChild<QObject *>(QStringLiteral("BackgroundChooserSignalList")) : nullptr;
    if (!list)
        return;
    connect(list, SIGNAL(selectBackground(QString)), this, SLOT(selectBackground(QString)));
    connect(list, SIGNAL(openBackgroundChooser(bool)), this, SLOT(openBackgroundChooser(bool)));
    connect(list, SIGNAL(closeBackgroundChooser()), this, SLOT(closeBackgroundChooser()));
}

QString QBackgroundChooser::backgroundMap() const
{
    return m_document.fields().backgroundMap;
}

QColor QBackgroundChooser::backgroundMapColor() const
{
    return QColor(m_document.fields().backgroundMapColor);
}

QGeoCoordinate QBackgroundChooser::centerPositionAfterLoad() const
{
    return coordinateOf(m_document.fields().pseudoMapCenter);
}

QGeoRectangle QBackgroundChooser::pseudoBoundaries() const
{
    const ProjectFields &f = m_document.fields();
    return QGeoRectangle(coordinateOf(f.pseudoBoundariesTL), coordinateOf(f.pseudoBoundariesBR));
}

bool QBackgroundChooser::cropMode() const
{
    return m_document.fields().pseudoMapCropMode;
}

double QBackgroundChooser::zoomAfterLoad() const
{
    return m_document.fields().pseudoMapInitialZoom;
}

bool QBackgroundChooser::choose(const QString &identifier)
{
    BackgroundSelection selection;
    if (!selection.resolve(identifier, m_maps, m_controller))
        return false;
    ProjectFields &fields = m_document.fields();
    fields.backgroundMap = selection.background();
    if (selection.colour().isValid())
        fields.backgroundMapColor = selection.colour().name();
    return true;
}

void QBackgroundChooser::selectBackground(QString backgroundIdentifier)
{
    if (choose(backgroundIdentifier)) {
        emit projectIsModified();
        logTrace(0, QStringLiteral("tracking: background %s"), BackgroundSelection::trackingWord(backgroundMap()));
    }
    emit backgroundMapChanged();
    emit backgroundMapColorChanged();
    emit showBackgroundChooserChanged();
    emit pseudoBoundariesChanged();
    emit centerPositionAfterLoadChanged();
    emit zoomAfterLoadChanged();
}

void QBackgroundChooser::refresh()
{
    emit backgroundMapChanged();
    emit backgroundMapColorChanged();
    emit pseudoBoundariesChanged();
    emit centerPositionAfterLoadChanged();
    emit zoomAfterLoadChanged();
    emit cropModeChanged();
}

void QBackgroundChooser::openBackgroundChooser(bool showBackButton)
{
    logTrace(0, QStringLiteral("tracking: background chooser opened"));
    m_showBackButton = showBackButton;
    emit showBackButtonChanged();
    m_showChooser = true;
    emit showBackgroundChooserChanged();
}

void QBackgroundChooser::closeBackgroundChooser()
{
    m_showChooser = false;
    emit showBackgroundChooserChanged();
}

void QBackgroundChooser::setCropMode(bool state)
{
    if (m_document.fields().pseudoMapCropMode == state)
        return;
    m_document.fields().pseudoMapCropMode = state;
    emit cropModeChanged();
    emit projectIsModified();
}

void QBackgroundChooser::savePseudoBoundaries(double longitudeTL, double latitudeTL, double longitudeBR,
                                              double latitudeBR)
{
    BackgroundSelection selection;
    const QSize picture = selection.resolve(backgroundMap(), m_maps, m_controller)
                              ? QImageReader(selection.picture()).size()
                              : QSize();
    if (!picture.isValid() || picture.isEmpty())
        return;
    const double ar = double(picture.width()) / picture.height();
    QGeoCoordinate tl(latitudeTL, longitudeTL), br(latitudeBR, longitudeBR);
    const QGeoCoordinate tr(latitudeTL, longitudeBR), bl(latitudeBR, longitudeTL);
    const double width = tl.distanceTo(tr);
    const double height = tl.distanceTo(bl);
    if (width <= 0.0 || height <= 0.0)
        return;
    const double ar2 = width / height;
    if (ar2 > ar) {
        // Too wide for the picture: taller by the same amount above and below.
        const double grow = (width / ar - height) / 2;
        logTrace(0, QStringLiteral("height = %f, tempHeight1 = %f, tempHeight2 = %f\n"), height, grow, grow);
        tl = tl.atDistanceAndAzimuth(grow, bl.azimuthTo(tl));
        br = br.atDistanceAndAzimuth(grow, tr.azimuthTo(br));
    } else {
        // Too tall: wider by the same amount left and right.
        const double grow = (height * ar - width) / 2;
        logTrace(0, QStringLiteral("width = %f, tempWidth1 = %f, tempWidth2 = %f\n"), width, grow, grow);
        tl = tl.atDistanceAndAzimuth(grow, tr.azimuthTo(tl));
        br = br.atDistanceAndAzimuth(grow, bl.azimuthTo(br));
    }
    logTrace(0, QStringLiteral("ar = %f, ar2 = %f\n"), ar, ar2);
    ProjectFields &fields = m_document.fields();
    fields.pseudoBoundariesTL = keyPointAt(tl);
    fields.pseudoBoundariesBR = keyPointAt(br);
    fields.pseudoMapCenter = keyPointAt(QGeoRectangle(tl, br).center());
    emit pseudoBoundariesChanged();
    emit centerPositionAfterLoadChanged();
    emit initPseudoBackground();
    emit projectIsModified();
}
