#pragma once

#include "models/FlatListModel.h"
#include "models/KeyPointItemsData.h"

#include <QColor>
#include <QGeoCoordinate>
#include <QGeoPath>

// The waypoint list of the interface, its settings page, and the markers and path
// segments that the map draws. The records and all edits are KeyPointItemsData's;
// this model forwards the interface's requests to it and tells the interface what
// changed. Durations are milliseconds throughout.
//
// Adding a point emits, in this order: rowsInserted, (when inserted on the route:
// dataChanged of animationDuration), activeItemChanged, activeKeyPointIdChanged,
// dataChanged, sizeChanged, addMarker, then addPathSegment (appended) or
// insertPathSegment and pathSegmentChanged of the new segment (inserted), then
// pathChanged and pathSegmentChanged of every other segment whose samples changed.
class QKeyPointItemsModel : public FlatListModel
{
    Q_OBJECT
    Q_PROPERTY(QVariantMap availableSettingsPages READ availableSettingsPages CONSTANT)
    Q_PROPERTY(int currentSettingsPage READ currentSettingsPage NOTIFY currentSettingsPageChanged)
    Q_PROPERTY(int activeKeyPointId READ activeKeyPointId NOTIFY activeKeyPointIdChanged)
    Q_PROPERTY(QVariantMap activeItem READ activeItem NOTIFY activeItemChanged)
    Q_PROPERTY(bool allKeyPointsEnabledState READ allKeyPointsEnabledState NOTIFY allKeyPointsEnabledStateChanged)
    Q_PROPERTY(int size READ size NOTIFY sizeChanged)

public:
    enum Role {
        TitleRole = Qt::UserRole + 1,
        ElementIdRole,
        AnimationDurationRole,
        PauseDurationRole,
        KeyPointFontRole,
        KeyPointFontFrameRole,
        KeyPointFontShadowRole,
        KeyPointFontColorRole,
        EnabledRole,
        SizeRole,
    };

    explicit QKeyPointItemsModel(QObject *parent = nullptr);

    using QAbstractItemModel::setData;
    void setData(KeyPointItemsData *data);
    // Connects the signals of the interface's "KeyPointItemsSignalList_Obj" under `root`
    // to the slots of the same names; without that object nothing is connected.
    void connectSignalList(QObject *root);

    // After a project or track is read: a row, a marker and the load progress
    // (triggerLoadState 3, 0 to 50) per key point, then every segment (addPathSegment,
    // triggerLoadState 5, 50 to 100).
    void loadKeyPoints();
    // Sends the segments' samples again (pathSegmentChanged). `aborted`: only those whose
    // samples changed since they were last sent; otherwise all. `progress`: with
    // triggerLoadState 5, 50 to 100.
    void updatePathSegments(bool aborted = false, bool progress = false);
    // The places of the key points along the route, after the curve was rebuilt.
    void refreshOrderIndices();
    // Playback: markers from `from` to `to` (curve sample indices) shown or hidden.
    void setVisibleForAnimation(int from, int to, bool flag);
    void setAllVisibleForAnimation(bool flag);
    // Emits altitudeDataChanged with the altitude and distance of every sample.
    void updateAltitudeData();
    // Empties the list (not the path) and tells the map to drop every object.
    void clear();

    QVariantMap availableSettingsPages() const;
    int currentSettingsPage() const;
    int activeKeyPointId() const;
    QVariantMap activeItem() const;
    bool allKeyPointsEnabledState() const;
    int size() const { return rowCount(); }

    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role) const override;
    QHash<int, QByteArray> roleNames() const override;

signals:
    void currentSettingsPageChanged();
    void activeKeyPointIdChanged();
    void activeItemChanged();
    void allKeyPointsEnabledStateChanged();
    void sizeChanged();
    void addMarker(QGeoCoordinate coord, QVariantMap keyPointInfo);
    void insertMarker(int lastMarkerId, QGeoCoordinate coord, QVariantMap keyPointInfo);
    void updateMarker(QVariantMap updateMarkerParam);
    void updateAllMarkersProperty(QVariantMap updateAllMarkersPropertyParam);
    void keyPointDeleted(int kpId);
    void clearAllObjects();
    void triggerLoadState(int, double);
    void addPathSegment(int sId, QGeoPath pathSegment);
    void insertPathSegment(int lastSegmentId, int sId, QGeoPath pathSegment);
    void pathSegmentChanged(int sId, QGeoPath pathSegment);
    void deletePathSegment(int sId);
    void updateEnableKeyPointsForAnimation();
    void pathChanged();
    void mediaPointDeleted(int mpId);
    void altitudeDataChanged(QVariantList altitudes, QVariantList distances);

public slots:
    void setCurrentSettingsPage(int page);
    // -1: every edit of the page applies to all points.
    void setActiveKeyPointId(int kpId);
    void enableKeyPoint(int kpId, bool state);
    void enableAllKeyPoints(bool state);
    void setKeyPointImage(int kpId, int imageId);
    void setKeyPointSize(double value);
    void setKeyPointPauseDuration(double value);
    void setKeyPointAnimationDuration(double value);
    void setKeyPointText(int kpId, QString text);
    void openFontDialog();
    void setKeyPointFontColor(QColor color);
    void setKeyPointFontFrame(bool state);
    void setKeyPointFontShadow(bool state);
    void setUserPhotoAsWaypoint(int dragElementId, int keypointID);
    // The map view places the photos; nothing to do here.
    void setUserPhotoAsBGAtWaypoint(int dragElementId, int keypointID);
    // Appends, or inserts on the route where the user marked it. Refused while a
    // track's key points are fixed, unless inserted on the route.
    void addKeyPoint(double longitude, double latitude, double altitude, QString title);
    // -1: all points. Photos on the point's sample go with it, and all photos with the
    // last point.
    void deleteKeyPoint(int kpId);
    void deleteMediaPoint(int mpId);

private:
    void editScope(int code, const QVariant &value);
    void emitMarkerChange(uint32_t scope, int code);
    void emitRowsChanged(uint32_t scope, const QVector<int> &roles = {});
    void deleteOneKeyPoint(uint32_t id, bool regenerate);

    KeyPointItemsData *m_data = nullptr;
};
