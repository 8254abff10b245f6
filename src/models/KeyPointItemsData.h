#pragma once

#include "models/KeyPointDialogs.h"
#include "models/KeyPointImageItems.h"
#include "models/KeyPointItem.h"

#include <QGeoCoordinate>
#include <QGeoPath>
#include <QVariantList>
#include <QVariantMap>

#include <functional>
#include <memory>
#include <vector>

class KeyPoint;
class Path;
class PainterPathRenderer_Controller;
struct KeyPointProperties;
struct PoolPhoto;

// The waypoints of the document's active path as the interface lists them: one record
// per key point, in path order, and every edit of them. Each edit goes to the path
// first and the records follow it. Held by value by its owner; QKeyPointItemsModel
// shows it and tells the interface what changed.
//
// Durations (records, activeItem, edit values) are milliseconds, as the key points
// keep them.
class KeyPointItemsData
{
public:
    // The key point id that stands for all points.
    static constexpr uint32_t allPoints = 0xFFFFFFFFu;

    // What the bulk edit changes; also the key of updateAllMarkersProperty.
    enum Property {
        Size = 0,
        AnimationDuration = 1,
        PauseDuration = 2,
        FontFrame = 3,
        FontColor = 4,
        FontShadow = 5,
        Font = 6,
        Enabled = 7,
        EnabledForAnimation = 8,
        Text = 9,
        ImageSource = 10,
    };
    enum Page { PathPage = 0, KeyPointPage = 1, AvatarPage = 2 };

    struct SegmentPath
    {
        uint32_t id = 0; // 0: not to be sent
        QGeoPath path;
    };

    explicit KeyPointItemsData(PainterPathRenderer_Controller *document = nullptr);

    void setDocument(PainterPathRenderer_Controller *document) { m_document = document; }
    // Called after every edit that changes the document.
    void setChangedCallback(std::function<void()> changed) { m_changed = std::move(changed); }
    void setDialogs(std::unique_ptr<KeyPointDialogs> dialogs);
    KeyPointDialogs &dialogs() { return *m_dialogs; }

    KeyPointImageItems &imageItems() { return m_imageItems; }
    const KeyPointImageItems &imageItems() const { return m_imageItems; }

    const std::vector<KeyPointItem> &items() const { return m_items; }
    int rowCount() const { return int(m_items.size()); }
    // -1 for an id without a record.
    int rowOf(uint32_t id) const;
    // Records and the active point go; the path stays as it is.
    void clearModel();
    // Key points of the path, and the record of the one at `index` appended (loading).
    int keyPointCount() const;
    void appendRecordOf(int index);

    int currentSettingsPage() const { return m_currentSettingsPage; }
    bool setCurrentSettingsPage(int page);
    QVariantMap availableSettingsPages() const { return m_availableSettingsPages; }
    uint32_t activeKeyPointId() const { return m_activeKeyPointId; }
    // allPoints keeps the page's values, with elementId -1. False when nothing changed
    // or the id is unknown.
    bool setActiveKeyPointId(uint32_t id);
    const QVariantMap &activeItem() const { return m_activeItem; }
    // The marker map of a point; empty for an unknown id.
    QVariantMap mapOf(uint32_t id) const;
    QGeoCoordinate coordinateOf(uint32_t id) const;

    // Sets a property on one point, or on all with allPoints; false when nothing changed.
    // A single point with the value it has already is no change; all points always are.
    bool editProperty(uint32_t scope, int code, const QVariant &value);
    // {key of the code: value of the first record}
    QVariantMap propertyParam(int code) const;
    // The font that the font dialog starts from.
    QFont scopeFont() const;
    bool setEnabled(uint32_t id, bool state);
    // True when every record is enabled; false for none or a mix.
    bool allEnabled() const;
    // Sets the playback flag on the records whose orderIndex lies in [from, to] and
    // returns the ids of those that changed.
    std::vector<uint32_t> setVisibleForAnimation(int from, int to, bool flag);
    void setAllVisibleForAnimation(bool flag);
    void refreshOrderIndices();

    // A symbol of the list for one point or for all; false when the point or the symbol
    // is unknown or the picture dialog was cancelled.
    bool setImage(uint32_t id, uint32_t imageId);
    // Photo `photoId` of the pool shown by the symbol of key point `id`.
    bool setUserPhoto(int32_t photoId, uint32_t id);
    bool deleteMediaPoint(uint32_t id);

    // A key point of the path at exactly this position.
    bool containsPosition(double longitude, double latitude) const;
    // The sample that the user marked on the route: its position goes to longitude and
    // latitude, the mark is cleared, and the result is the key point whose leg holds
    // it. 0 when no sample is marked.
    uint32_t takeDropTarget(double &longitude, double &latitude);
    // False while the document holds a track whose key points are fixed.
    bool canAppend() const;
    // Both make the new point active and return its id, or 0 when refused.
    uint32_t appendKeyPoint(double longitude, double latitude, double altitude, const QString &title);
    uint32_t insertKeyPoint(uint32_t afterId, double longitude, double latitude, double altitude,
                            const QString &title);
    // Deletes the key point from the path; its record stays until removeRecord. Without
    // `regenerate` the curve waits for regenerateCurve. The last key point takes the
    // path's media points with it.
    bool deleteFromPath(uint32_t id, bool regenerate = true);
    void regenerateCurve();
    void removeRecord(int row);
    std::vector<uint32_t> mediaPointIds() const;

    uint32_t segmentIdOf(uint32_t keyPointId) const;
    uint32_t previousSegmentId(uint32_t keyPointId) const;
    // The samples of the key point's segment; 0 when there is none, or when `force` is
    // off and its samples are unchanged since they were last taken.
    uint32_t segmentPath(uint32_t keyPointId, bool force, QGeoPath &out);
    // The same for all segments, in path order.
    std::vector<SegmentPath> segmentPaths(bool force);

    // Altitude of each sample and its distance along the route in metres.
    void altitudeProfile(QVariantList &altitudes, QVariantList &distances) const;

private:
    Path *path();
    const Path *path() const;
    KeyPoint *keyPoint(uint32_t id);
    void applyDefaultSymbol(KeyPointProperties &properties) const;
    const PoolPhoto *nextFreePhoto() const;
    void refreshRecord(int row);
    void makeActive(uint32_t id);
    void clearActive();
    // After an edit: the active point's map again, or, with all points in scope, the given keys.
    void refreshActiveItem(std::initializer_list<const char *> keys);
    void markChanged();

    PainterPathRenderer_Controller *m_document;
    std::function<void()> m_changed;
    std::unique_ptr<KeyPointDialogs> m_dialogs;
    int m_currentSettingsPage = KeyPointPage;
    uint32_t m_activeKeyPointId = 0;
    QVariantMap m_activeItem;
    QVariantMap m_availableSettingsPages;
    KeyPointImageItems m_imageItems;
    QFont m_defaultFont;
    std::vector<KeyPointItem> m_items;
};
