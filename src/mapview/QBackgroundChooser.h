#pragma once

#include "mapview/BackgroundSelection.h"

#include <QColor>
#include <QGeoCoordinate>
#include <QGeoRectangle>
#include <QObject>
#include <QStringList>
#include <QVariantList>

class PainterPathRenderer_Controller;
class QMainController;
struct MapItem;

// The base map of a project and the chooser the user picks it in: live map layers,
// the catalogue's maps and pictures of the user's own, as a tree of three levels;
// the current background with the colour around it; and for a picture, the rectangle
// on the globe it covers and its crop mode. The interface reaches it as "bgc_host".
class QBackgroundChooser : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QVariantList backgroundCategories READ backgroundCategories NOTIFY backgroundCategoriesChanged)
    Q_PROPERTY(QVariantList backgroundCategoryItems READ backgroundCategoryItems NOTIFY backgroundCategoryItemsChanged)
    Q_PROPERTY(QVariantList backgroundCategoryItemElements READ backgroundCategoryItemElements NOTIFY
                   backgroundCategoryItemElementsChanged)
    Q_PROPERTY(bool showBackgroundChooser READ showBackgroundChooser NOTIFY showBackgroundChooserChanged)
    Q_PROPERTY(bool showBackButton READ showBackButton NOTIFY showBackButtonChanged)
    Q_PROPERTY(QString backgroundMap READ backgroundMap NOTIFY backgroundMapChanged)
    Q_PROPERTY(QColor backgroundMapColor READ backgroundMapColor NOTIFY backgroundMapColorChanged)
    Q_PROPERTY(QGeoCoordinate centerPositionAfterLoad READ centerPositionAfterLoad NOTIFY centerPositionAfterLoadChanged)
    Q_PROPERTY(QGeoRectangle pseudoBoundaries READ pseudoBoundaries NOTIFY pseudoBoundariesChanged)
    Q_PROPERTY(bool cropMode READ cropMode NOTIFY cropModeChanged)
    Q_PROPERTY(double zoomAfterLoad READ zoomAfterLoad NOTIFY zoomAfterLoadChanged)

public:
    QBackgroundChooser(QMainController &controller, PainterPathRenderer_Controller &document);

    // The tree from the catalogue's maps and the names of the live layers the map
    // plugins offer.
    void buildTree(const std::vector<MapItem> &maps, const QStringList &osmLayers, const QStringList &esriLayers);
    // Connects "BackgroundChooserSignalList" under root, when there is one.
    void connectSignalList(QObject *root);
    // The document's background after a load, chosen as the user would, unreported.
    void refresh();

    QVariantList backgroundCategories() const { return m_categories; }
    QVariantList backgroundCategoryItems() const { return m_items; }
    QVariantList backgroundCategoryItemElements() const { return m_elements; }
    bool showBackgroundChooser() const { return m_showChooser; }
    bool showBackButton() const { return m_showBackButton; }
    QString backgroundMap() const;
    QColor backgroundMapColor() const;
    QGeoCoordinate centerPositionAfterLoad() const;
    QGeoRectangle pseudoBoundaries() const;
    bool cropMode() const;
    double zoomAfterLoad() const;

public slots:
    void selectBackground(QString backgroundIdentifier);
    void openBackgroundChooser(bool showBackButton);
    void closeBackgroundChooser();
    void setCropMode(bool state);
    void savePseudoBoundaries(double longitudeTL, double latitudeTL, double longitudeBR, double latitudeBR);

signals:
    void backgroundCategoriesChanged();
    void backgroundCategoryItemsChanged();
    void backgroundCategoryItemElementsChanged();
    void showBackgroundChooserChanged();
    void showBackButtonChanged();
    void backgroundMapChanged();
    void backgroundMapColorChanged();
    void centerPositionAfterLoadChanged();
    void pseudoBoundariesChanged();
    void cropModeChanged();
    void zoomAfterLoadChanged();
    // The map is to load the current picture as its image layer.
    void initPseudoBackground();
    void projectIsModified();

private:
    bool choose(const QString &identifier);

    QMainController &m_controller;
    PainterPathRenderer_Controller &m_document;
    std::vector<MapItem> m_maps;
    QVariantList m_categories;
    QVariantList m_items;
    QVariantList m_elements;
    bool m_showChooser = false;
    bool m_showBackButton = false;
};
