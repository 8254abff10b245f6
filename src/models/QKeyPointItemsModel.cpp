#include "models/QKeyPointItemsModel.h"

#include <algorithm>

namespace {

constexpr uint32_t allPoints = KeyPointItemsData::allPoints;

// The role that shows a property in the list; 0 for those it doesn't show.
int roleOf(int code)
{
    switch (code) {
    case KeyPointItemsData::Size:
        return QKeyPointItemsModel::SizeRole;
    case KeyPointItemsData::AnimationDuration:
        return QKeyPointItemsModel::AnimationDurationRole;
    case KeyPointItemsData::PauseDuration:
        return QKeyPointItemsModel::PauseDurationRole;
    case KeyPointItemsData::FontFrame:
        return QKeyPointItemsModel::KeyPointFontFrameRole;
    case KeyPointItemsData::FontColor:
        return QKeyPointItemsModel::KeyPointFontColorRole;
    case KeyPointItemsData::FontShadow:
        return QKeyPointItemsModel::KeyPointFontShadowRole;
    case KeyPointItemsData::Font:
        return QKeyPointItemsModel::KeyPointFontRole;
    case KeyPointItemsData::Enabled:
        return QKeyPointItemsModel::EnabledRole;
    case KeyPointItemsData::Text:
        return QKeyPointItemsModel::TitleRole;
    default:
        return 0;
    }
}

} // namespace

QKeyPointItemsModel::QKeyPointItemsModel(QObject *parent) : FlatListModel(parent)
{
    qRegisterMetaType<QGeoPath>();
    qRegisterMetaType<QGeoCoordinate>();
}

void QKeyPointItemsModel::setData(KeyPointItemsData *data)
{
    beginResetModel();
    m_data = data;
    endResetModel();
}

void QKeyPointItemsModel::connectSignalList(QObject *root)
{
    connectSignalsByName(root, QStringLiteral("KeyPointItemsSignalList_Obj"),
                         {"setCurrentSettingsPage", "setActiveKeyPointId", "enableAllKeyPoints", "enableKeyPoint",
                          "setKeyPointImage", "setKeyPointSize", "setKeyPointPauseDuration",
                          "setKeyPointAnimationDuration", "setKeyPointText", "openFontDialog", "setKeyPointFontColor",
                          "setKeyPointFontFrame", "setKeyPointFontShadow", "setUserPhotoAsWaypoint", "addKeyPoint",
                          "deleteKeyPoint", "deleteMediaPoint"});
}

int QKeyPointItemsModel::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() || !m_data ? 0 : m_data->rowCount();
}

QVariant QKeyPointItemsModel::data(const QModelIndex &index, int role) const
{
    if (!index.isValid() || index.row() >= rowCount())
        return QVariant();
    const KeyPointItem &item = m_data->items()[size_t(index.row())];
    switch (role) {
    case Qt::DisplayRole:
    case TitleRole:
        return item.title;
    case ElementIdRole:
        return item.elementId;
    case AnimationDurationRole:
        return item.animationDuration;
    case PauseDurationRole:
        return item.pauseDuration;
    case KeyPointFontRole:
        return item.keyPointFont;
    case KeyPointFontFrameRole:
        return item.keyPointFontFrame;
    case KeyPointFontShadowRole:
        return item.keyPointFontShadow;
    case KeyPointFontColorRole:
        return item.keyPointFontColor;
    case EnabledRole:
        return item.enabled;
    case SizeRole:
        return item.size;
    default:
        return QVariant();
    }
}

QHash<int, QByteArray> QKeyPointItemsModel::roleNames() const
{
    return {{TitleRole, "title"},
            {ElementIdRole, "elementId"},
            {AnimationDurationRole, "animationDuration"},
            {PauseDurationRole, "pauseDuration"},
            {KeyPointFontRole, "keyPointFont"},
            {KeyPointFontFrameRole, "keyPointFontFrame"},
            {KeyPointFontShadowRole, "keyPointFontShadow"},
            {KeyPointFontColorRole, "keyPointFontColor"},
            {EnabledRole, "enabled"},
            {SizeRole, "size"}};
}

QVariantMap QKeyPointItemsModel::availableSettingsPages() const
{
    return m_data ? m_data->availableSettingsPages() : QVariantMap();
}

int QKeyPointItemsModel::currentSettingsPage() const
{
    return m_data ? m_data->currentSettingsPage() : KeyPointItemsData::KeyPointPage;
}

int QKeyPointItemsModel::activeKeyPointId() const
{
    return m_data ? int(m_data->activeKeyPointId()) : 0;
}

QVariantMap QKeyPointItemsModel::activeItem() const
{
    return m_data ? m_data->activeItem() : QVariantMap();
}

bool QKeyPointItemsModel::allKeyPointsEnabledState() const
{
    return m_data && m_data->allEnabled();
}

void QKeyPointItemsModel::emitRowsChanged(uint32_t scope, const QVector<int> &roles)
{
    const int count = rowCount();
    if (scope == allPoints) {
        if (count > 0)
            emit dataChanged(index(0, 0), index(count - 1, 0), roles);
        return;
    }
    const int row = m_data->rowOf(scope);
    if (row >= 0)
        emit dataChanged(index(row, 0), index(row, 0), roles);
}

void QKeyPointItemsModel::emitMarkerChange(uint32_t scope, int code)
{
    if (scope == allPoints)
        emit updateAllMarkersProperty(m_data->propertyParam(code));
    else
        emit updateMarker(m_data->mapOf(scope));
}

void QKeyPointItemsModel::editScope(int code, const QVariant &value)
{
    if (!m_data)
        return;
    const uint32_t scope = m_data->activeKeyPointId();
    if (!m_data->editProperty(scope, code, value))
        return;
    emitMarkerChange(scope, code);
    if (const int role = roleOf(code))
        emitRowsChanged(scope, {role});
    emit activeItemChanged();
}

void QKeyPointItemsModel::setCurrentSettingsPage(int page)
{
    if (m_data && m_data->setCurrentSettingsPage(page))
        emit currentSettingsPageChanged();
}

void QKeyPointItemsModel::setActiveKeyPointId(int kpId)
{
    if (!m_data || !m_data->setActiveKeyPointId(uint32_t(kpId)))
        return;
    emit activeItemChanged();
    emit activeKeyPointIdChanged();
    emitRowsChanged(allPoints);
}

void QKeyPointItemsModel::enableKeyPoint(int kpId, bool state)
{
    if (!m_data)
        return;
    const bool allBefore = allKeyPointsEnabledState();
    if (!m_data->setEnabled(uint32_t(kpId), state))
        return;
    emitMarkerChange(uint32_t(kpId), KeyPointItemsData::Enabled);
    emitRowsChanged(uint32_t(kpId), {EnabledRole});
    if (allBefore != allKeyPointsEnabledState())
        emit allKeyPointsEnabledStateChanged();
    emit activeItemChanged();
}

void QKeyPointItemsModel::enableAllKeyPoints(bool state)
{
    if (!m_data || !m_data->setEnabled(allPoints, state))
        return;
    emitRowsChanged(allPoints, {EnabledRole});
    emit allKeyPointsEnabledStateChanged();
    emit updateAllMarkersProperty(m_data->propertyParam(KeyPointItemsData::Enabled));
    emit activeItemChanged();
}

void QKeyPointItemsModel::setKeyPointImage(int kpId, int imageId)
{
    if (!m_data || !m_data->setImage(uint32_t(kpId), uint32_t(imageId)))
        return;
    if (uint32_t(kpId) == allPoints) {
        // The symbol comes with its photo frame.
        QVariantMap param;
        const QVariantMap first = m_data->items().front().toMap();
        for (const char *key : {"keyPointImageSource", "isMediaTemplate", "mediaCenterPositionOffset", "mediaSourceSize"})
            param.insert(QString::fromLatin1(key), first.value(QString::fromLatin1(key)));
        emit updateAllMarkersProperty(param);
    } else {
        emit updateMarker(m_data->mapOf(uint32_t(kpId)));
    }
    emit activeItemChanged();
}

void QKeyPointItemsModel::setKeyPointSize(double value)
{
    editScope(KeyPointItemsData::Size, value);
}

void QKeyPointItemsModel::setKeyPointPauseDuration(double value)
{
    editScope(KeyPointItemsData::PauseDuration, value);
}

void QKeyPointItemsModel::setKeyPointAnimationDuration(double value)
{
    editScope(KeyPointItemsData::AnimationDuration, value);
}

void QKeyPointItemsModel::setKeyPointText(int kpId, QString text)
{
    if (!m_data || !m_data->editProperty(uint32_t(kpId), KeyPointItemsData::Text, text))
        return;
    emitMarkerChange(uint32_t(kpId), KeyPointItemsData::Text);
    emitRowsChanged(uint32_t(kpId), {TitleRole});
    emit activeItemChanged();
}

void QKeyPointItemsModel::openFontDialog()
{
    if (!m_data)
        return;
    QFont font = m_data->scopeFont();
    if (m_data->dialogs().chooseFont(font))
        editScope(KeyPointItemsData::Font, font);
}

void QKeyPointItemsModel::setKeyPointFontColor(QColor color)
{
    editScope(KeyPointItemsData::FontColor, color);
}

void QKeyPointItemsModel::setKeyPointFontFrame(bool state)
{
    editScope(KeyPointItemsData::FontFrame, state);
}

void QKeyPointItemsModel::setKeyPointFontShadow(bool state)
{
    editScope(KeyPointItemsData::FontShadow, state);
}

void QKeyPointItemsModel::setUserPhotoAsWaypoint(int dragElementId, int keypointID)
{
    if (!m_data || !m_data->setUserPhoto(dragElementId, uint32_t(keypointID)))
        return;
    emit updateMarker(m_data->mapOf(uint32_t(keypointID)));
    emit activeItemChanged();
}

void QKeyPointItemsModel::setUserPhotoAsBGAtWaypoint(int, int) {}

void QKeyPointItemsModel::addKeyPoint(double longitude, double latitude, double altitude, QString title)
{
    if (!m_data || m_data->containsPosition(longitude, latitude))
        return;
    const uint32_t afterId = m_data->takeDropTarget(longitude, latitude);
    const bool inserting = afterId != 0;
    // A mark on the very spot of a key point would make a second point there.
    if (inserting && m_data->containsPosition(longitude, latitude))
        return;
    const int row = inserting ? m_data->rowOf(afterId) + 1 : m_data->rowCount();
    if (inserting ? row <= 0 : !m_data->canAppend())
        return;

    const bool allBefore = allKeyPointsEnabledState();
    beginInsertRows(QModelIndex(), row, row);
    const uint32_t id = inserting ? m_data->insertKeyPoint(afterId, longitude, latitude, altitude, title)
                                  : m_data->appendKeyPoint(longitude, latitude, altitude, title);
    endInsertRows();
    if (id == 0)
        return;

    // The point before gives up part of its leg.
    if (inserting)
        emitRowsChanged(allPoints, {AnimationDurationRole});
    emit activeItemChanged();
    emit activeKeyPointIdChanged();
    emitRowsChanged(allPoints);
    emit sizeChanged();
    if (allBefore != allKeyPointsEnabledState())
        emit allKeyPointsEnabledStateChanged();
    emit addMarker(m_data->coordinateOf(id), m_data->mapOf(id));

    QGeoPath segment;
    const uint32_t sId = m_data->segmentPath(id, true, segment);
    if (sId != 0) {
        if (inserting) {
            emit insertPathSegment(int(m_data->previousSegmentId(id)), int(sId), segment);
            emit pathSegmentChanged(int(sId), segment);
        } else {
            emit addPathSegment(int(sId), segment);
        }
    }
    emit pathChanged();
    // The legs next to the new point have new shapes.
    updatePathSegments(true);
}

void QKeyPointItemsModel::deleteKeyPoint(int kpId)
{
    if (!m_data)
        return;
    if (uint32_t(kpId) != allPoints) {
        deleteOneKeyPoint(uint32_t(kpId), true);
        return;
    }
    std::vector<uint32_t> ids;
    for (const KeyPointItem &item : m_data->items())
        ids.push_back(item.elementId);
    // The curve is made once at the end, not once per point.
    std::for_each(ids.rbegin(), ids.rend(), [this](uint32_t id) { deleteOneKeyPoint(id, false); });
    m_data->regenerateCurve();
    emit pathChanged();
    updatePathSegments(true);
}

void QKeyPointItemsModel::deleteOneKeyPoint(uint32_t id, bool regenerate)
{
    const int row = m_data->rowOf(id);
    if (row < 0)
        return;
    const uint32_t sId = m_data->segmentIdOf(id);
    const bool wasActive = m_data->activeKeyPointId() == id;
    const std::vector<uint32_t> mediaBefore = m_data->mediaPointIds();
    if (!m_data->deleteFromPath(id, regenerate))
        return;
    beginRemoveRows(QModelIndex(), row, row);
    m_data->removeRecord(row);
    endRemoveRows();

    const std::vector<uint32_t> mediaAfter = m_data->mediaPointIds();
    for (const uint32_t media : mediaBefore) {
        if (std::find(mediaAfter.begin(), mediaAfter.end(), media) == mediaAfter.end())
            emit mediaPointDeleted(int(media));
    }
    emit keyPointDeleted(int(id));
    emit deletePathSegment(int(sId));
    emit sizeChanged();
    emit allKeyPointsEnabledStateChanged();
    if (regenerate) {
        emit pathChanged();
        updatePathSegments(true);
    }
    if (wasActive) {
        emit activeKeyPointIdChanged();
        emit activeItemChanged();
    }
}

void QKeyPointItemsModel::deleteMediaPoint(int mpId)
{
    if (m_data && m_data->deleteMediaPoint(uint32_t(mpId)))
        emit mediaPointDeleted(mpId);
}

void QKeyPointItemsModel::updatePathSegments(bool aborted, bool progress)
{
    if (!m_data)
        return;
    m_data->refreshOrderIndices();
    const std::vector<KeyPointItemsData::SegmentPath> segments = m_data->segmentPaths(!aborted);
    const double count = double(segments.size());
    for (size_t i = 0; i < segments.size(); ++i) {
        if (segments[i].id != 0)
            emit pathSegmentChanged(int(segments[i].id), segments[i].path);
        if (progress)
            emit triggerLoadState(5, 100.0 / count * double(i) * 0.5 + 50.0);
    }
}

void QKeyPointItemsModel::loadKeyPoints()
{
    if (!m_data)
        return;
    if (rowCount() > 0)
        clear();
    const int count = m_data->keyPointCount();
    for (int i = 0; i < count; ++i) {
        beginInsertRows(QModelIndex(), i, i);
        m_data->appendRecordOf(i);
        endInsertRows();
        const uint32_t id = m_data->items().back().elementId;
        emit addMarker(m_data->coordinateOf(id), m_data->mapOf(id));
        emit triggerLoadState(3, 100.0 / count * i * 0.5);
    }
    m_data->refreshOrderIndices();
    emit sizeChanged();
    emit allKeyPointsEnabledStateChanged();

    const std::vector<KeyPointItemsData::SegmentPath> segments = m_data->segmentPaths(true);
    for (size_t i = 0; i < segments.size(); ++i) {
        emit addPathSegment(int(segments[i].id), segments[i].path);
        emit triggerLoadState(5, 100.0 / double(segments.size()) * double(i) * 0.5 + 50.0);
    }
}

void QKeyPointItemsModel::refreshOrderIndices()
{
    if (m_data)
        m_data->refreshOrderIndices();
}

void QKeyPointItemsModel::setVisibleForAnimation(int from, int to, bool flag)
{
    if (!m_data)
        return;
    for (const uint32_t id : m_data->setVisibleForAnimation(from, to, flag))
        emit updateMarker(m_data->mapOf(id));
}

void QKeyPointItemsModel::setAllVisibleForAnimation(bool flag)
{
    if (!m_data)
        return;
    m_data->setAllVisibleForAnimation(flag);
    emit updateAllMarkersProperty({{QStringLiteral("enabledForAnimation"), flag}});
}

void QKeyPointItemsModel::updateAltitudeData()
{
    if (!m_data)
        return;
    QVariantList altitudes, distances;
    m_data->altitudeProfile(altitudes, distances);
    emit altitudeDataChanged(altitudes, distances);
}

void QKeyPointItemsModel::clear()
{
    if (!m_data)
        return;
    const bool hadActive = m_data->activeKeyPointId() != 0;
    beginResetModel();
    m_data->clearModel();
    endResetModel();
    emit clearAllObjects();
    emit sizeChanged();
    emit allKeyPointsEnabledStateChanged();
    if (hadActive) {
        emit activeKeyPointIdChanged();
        emit activeItemChanged();
    }
}
