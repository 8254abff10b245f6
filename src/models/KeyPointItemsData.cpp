#include "models/KeyPointItemsData.h"

#include "app/Trace.h"
#include "path/DefaultTitle.h"
#include "path/GeoDistance.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QSet>

#include <algorithm>
#include <cmath>
#include <unordered_map>

namespace {

const char *propertyKeyOf(int code)
{
    static const char *const keys[] = {"size", "animationDuration", "pauseDuration", "keyPointFontFrame",
                                       "keyPointFontColor", "keyPointFontShadow", "keyPointFont", "enabled",
                                       "enabledForAnimation", "title", "keyPointImageSource"};
    return code >= 0 && code < int(std::size(keys)) ? keys[code] : nullptr;
}

// Writes the value of a bulk-edit code into the properties; true when a field changed.
bool applyProperty(KeyPointProperties &p, int code, const QVariant &value)
{
    const auto assign = [](auto &field, auto v) {
        const bool changed = !(field == v);
        field = v;
        return changed;
    };
    switch (code) {
    case KeyPointItemsData::Size:
        return assign(p.size, value.toDouble());
    case KeyPointItemsData::AnimationDuration:
        return assign(p.durationToNextKP, int32_t(std::lround(value.toDouble())));
    case KeyPointItemsData::PauseDuration:
        return assign(p.durationPause, int32_t(std::lround(value.toDouble())));
    case KeyPointItemsData::FontFrame:
        return assign(p.font.hasFrame, value.toBool());
    case KeyPointItemsData::FontColor:
        return assign(p.font.color, value.value<QColor>().name());
    case KeyPointItemsData::FontShadow:
        return assign(p.font.hasShadow, value.toBool());
    case KeyPointItemsData::Font: {
        KeyPointFont font = p.font;
        setKeyPointFont(font, value.value<QFont>());
        const bool changed = font.family != p.font.family || font.pointSize != p.font.pointSize || font.style != p.font.style;
        p.font = font;
        return changed;
    }
    case KeyPointItemsData::Enabled:
        return assign(p.enabled, value.toBool());
    case KeyPointItemsData::Text:
        return assign(p.title, value.toString());
    default:
        return false;
    }
}

bool validValue(int code, const QVariant &value)
{
    switch (code) {
    case KeyPointItemsData::FontColor:
        return value.value<QColor>().isValid();
    case KeyPointItemsData::Font:
        return value.canConvert<QFont>();
    default:
        return propertyKeyOf(code) != nullptr;
    }
}

// What a new point takes over from the point before it.
void copyDisplaySettings(const KeyPointProperties &from, KeyPointProperties &to)
{
    to.font = from.font;
    to.size = from.size;
    to.durationToNextKP = from.durationToNextKP;
    to.durationPause = from.durationPause;
    to.imageSource = from.imageSource;
    to.isMediaTemplate = from.isMediaTemplate;
    to.mediaCenterOffsetX = from.mediaCenterOffsetX;
    to.mediaCenterOffsetY = from.mediaCenterOffsetY;
    to.mediaSizeW = from.mediaSizeW;
    to.mediaSizeH = from.mediaSizeH;
}

QGeoPath geoPathOf(const PathSegment &segment)
{
    QList<QGeoCoordinate> coordinates;
    coordinates.reserve(int(segment.curvePoints.size()));
    for (const CurvePoint &p : segment.curvePoints)
        coordinates.append(QGeoCoordinate(p.y, p.x));
    return QGeoPath(coordinates);
}

QString newKeyPointTitle(const QString &title)
{
    // Named points count too, so numbers never repeat within a run.
    const uint32_t number = defaultKeyPointTitleCounter();
    setDefaultKeyPointTitleCounter(number + 1);
    if (title.isEmpty())
        return QStringLiteral("%1 %2").arg(defaultPointTitle()).arg(number);
    // Search results come as place, region, country: the place is enough.
    return title.split(QLatin1Char(',')).first();
}

} // namespace

KeyPointItemsData::KeyPointItemsData(PainterPathRenderer_Controller *document)
    : m_document(document),
      m_dialogs(std::make_unique<KeyPointDialogs>()),
      m_activeItem{{QStringLiteral("elementId"), 0}},
      m_availableSettingsPages{{QStringLiteral("path"), PathPage},
                               {QStringLiteral("keyPoint"), KeyPointPage},
                               {QStringLiteral("avatar"), AvatarPage}},
      m_defaultFont(QStringLiteral("Arial"), 18, -1, false)
{
}

void KeyPointItemsData::setDialogs(std::unique_ptr<KeyPointDialogs> dialogs)
{
    m_dialogs = dialogs ? std::move(dialogs) : std::make_unique<KeyPointDialogs>();
}

Path *KeyPointItemsData::path()
{
    return m_document ? m_document->pathManager().active() : nullptr;
}

const Path *KeyPointItemsData::path() const
{
    return m_document ? m_document->pathManager().active() : nullptr;
}

KeyPoint *KeyPointItemsData::keyPoint(uint32_t id)
{
    Path *p = path();
    const int index = p ? p->keyPointIndex(id) : -1;
    return index < 0 ? nullptr : &p->keyPoints[size_t(index)];
}

void KeyPointItemsData::markChanged()
{
    if (m_changed)
        m_changed();
}

int KeyPointItemsData::rowOf(uint32_t id) const
{
    for (size_t i = 0; i < m_items.size(); ++i) {
        if (m_items[i].elementId == id)
            return int(i);
    }
    return -1;
}

void KeyPointItemsData::clearModel()
{
    m_items.clear();
    clearActive();
}

void KeyPointItemsData::clearActive()
{
    m_activeKeyPointId = 0;
    m_activeItem = {{QStringLiteral("elementId"), 0}};
}

int KeyPointItemsData::keyPointCount() const
{
    const Path *p = path();
    return p ? int(p->keyPoints.size()) : 0;
}

void KeyPointItemsData::appendRecordOf(int index)
{
    KeyPointItem item;
    item.assignFrom(path()->keyPoints.at(size_t(index)));
    m_items.push_back(item);
}

void KeyPointItemsData::refreshRecord(int row)
{
    KeyPointItem &item = m_items.at(size_t(row));
    if (const KeyPoint *point = keyPoint(item.elementId))
        item.assignFrom(*point);
}

bool KeyPointItemsData::setCurrentSettingsPage(int page)
{
    if (page == m_currentSettingsPage)
        return false;
    m_currentSettingsPage = page;
    return true;
}

bool KeyPointItemsData::setActiveKeyPointId(uint32_t id)
{
    if (id == m_activeKeyPointId)
        return false;
    if (id == allPoints) {
        // The page goes on showing the values it shows, now for all points.
        m_activeKeyPointId = id;
        m_activeItem.insert(QStringLiteral("elementId"), -1);
        return true;
    }
    if (rowOf(id) < 0)
        return false;
    makeActive(id);
    return true;
}

void KeyPointItemsData::makeActive(uint32_t id)
{
    m_activeKeyPointId = id;
    m_activeItem = mapOf(id);
}

QVariantMap KeyPointItemsData::mapOf(uint32_t id) const
{
    const int row = rowOf(id);
    return row < 0 ? QVariantMap() : m_items[size_t(row)].toMap();
}

QGeoCoordinate KeyPointItemsData::coordinateOf(uint32_t id) const
{
    const Path *p = path();
    const int index = p ? p->keyPointIndex(id) : -1;
    if (index < 0)
        return QGeoCoordinate();
    const KeyPoint &point = p->keyPoints[size_t(index)];
    return QGeoCoordinate(point.y, point.x, point.z);
}

void KeyPointItemsData::refreshActiveItem(std::initializer_list<const char *> keys)
{
    if (m_activeKeyPointId != allPoints) {
        if (rowOf(m_activeKeyPointId) >= 0)
            m_activeItem = mapOf(m_activeKeyPointId);
        return;
    }
    if (m_items.empty())
        return;
    const QVariantMap first = m_items.front().toMap();
    for (const char *key : keys)
        m_activeItem.insert(QString::fromLatin1(key), first.value(QString::fromLatin1(key)));
}

bool KeyPointItemsData::editProperty(uint32_t scope, int code, const QVariant &value)
{
    if (!validValue(code, value))
        return false;
    const bool all = scope == allPoints;
    bool changed = false;
    for (size_t row = 0; row < m_items.size(); ++row) {
        KeyPointItem &item = m_items[row];
        if (!all && item.elementId != scope)
            continue;
        // Two codes change only what the interface shows.
        if (code == EnabledForAnimation || code == ImageSource) {
            const bool differs = code == EnabledForAnimation ? item.enabledForAnimation != value.toBool()
                                                             : item.keyPointImageSource != value.toString();
            if (!all && !differs)
                return false;
            if (code == EnabledForAnimation)
                item.enabledForAnimation = value.toBool();
            else
                item.keyPointImageSource = value.toString();
            changed = true;
            continue;
        }
        KeyPoint *point = keyPoint(item.elementId);
        if (!point)
            continue;
        KeyPointProperties edited = point->properties;
        if (!applyProperty(edited, code, value) && !all)
            return false;
        point->properties = edited;
        item.assignFrom(*point);
        changed = true;
    }
    if (!changed)
        return false;
    refreshActiveItem({propertyKeyOf(code)});
    if (code != EnabledForAnimation)
        markChanged();
    return true;
}

QVariantMap KeyPointItemsData::propertyParam(int code) const
{
    const char *key = propertyKeyOf(code);
    if (!key || m_items.empty())
        return QVariantMap();
    const QString name = QString::fromLatin1(key);
    return {{name, m_items.front().toMap().value(name)}};
}

QFont KeyPointItemsData::scopeFont() const
{
    const int row = rowOf(m_activeKeyPointId);
    if (row >= 0)
        return m_items[size_t(row)].keyPointFont;
    const QVariant shown = m_activeItem.value(QStringLiteral("keyPointFont"));
    return shown.canConvert<QFont>() ? shown.value<QFont>() : m_defaultFont;
}

bool KeyPointItemsData::setEnabled(uint32_t id, bool state)
{
    bool changed = false;
    for (KeyPointItem &item : m_items) {
        if (id != allPoints && item.elementId != id)
            continue;
        KeyPoint *point = keyPoint(item.elementId);
        if (!point || point->properties.enabled == state)
            continue;
        point->properties.enabled = state;
        item.assignFrom(*point);
        changed = true;
    }
    if (!changed)
        return false;
    refreshActiveItem({"enabled"});
    markChanged();
    return true;
}

bool KeyPointItemsData::allEnabled() const
{
    return !m_items.empty()
           && std::all_of(m_items.begin(), m_items.end(), [](const KeyPointItem &item) { return item.enabled; });
}

std::vector<uint32_t> KeyPointItemsData::setVisibleForAnimation(int from, int to, bool flag)
{
    std::vector<uint32_t> changed;
    for (KeyPointItem &item : m_items) {
        if (item.orderIndex < from || item.orderIndex > to || item.enabledForAnimation == flag)
            continue;
        item.enabledForAnimation = flag;
        changed.push_back(item.elementId);
        if (item.elementId == m_activeKeyPointId)
            m_activeItem.insert(QStringLiteral("enabledForAnimation"), flag);
    }
    return changed;
}

void KeyPointItemsData::setAllVisibleForAnimation(bool flag)
{
    for (KeyPointItem &item : m_items)
        item.enabledForAnimation = flag;
    if (!m_items.empty())
        m_activeItem.insert(QStringLiteral("enabledForAnimation"), flag);
}

void KeyPointItemsData::refreshOrderIndices()
{
    const Path *p = path();
    if (!p)
        return;
    std::unordered_map<uint32_t, int32_t> sampleOf;
    sampleOf.reserve(p->keyPoints.size());
    for (size_t i = 0; i < p->curvePoints.size(); ++i) {
        const uint32_t named = p->curvePoints[i].correspondingKeyPoint;
        if (named != 0)
            sampleOf.emplace(named, int32_t(i));
    }
    for (KeyPointItem &item : m_items) {
        const auto found = sampleOf.find(item.elementId);
        item.orderIndex = found == sampleOf.end() ? 0 : found->second;
    }
}

const PoolPhoto *KeyPointItemsData::nextFreePhoto() const
{
    const Path *p = path();
    QSet<QString> shown;
    for (const KeyPoint &point : p->keyPoints)
        shown.insert(point.properties.mediaSource);
    for (const PoolPhoto &photo : m_document->photoPool().photos) {
        if (!shown.contains(photo.path))
            return &photo;
    }
    return nullptr;
}

bool KeyPointItemsData::setImage(uint32_t id, uint32_t imageId)
{
    const int row = id == allPoints ? -1 : rowOf(id);
    if (!path() || m_items.empty() || (id != allPoints && row < 0))
        return false;
    QVariantMap map;
    if (!m_imageItems.itemById(imageId, map))
        return false;
    KeyPointImageItem symbol = KeyPointImageItem::fromMap(map);
    if (symbol.browseImage) {
        const QString current = row >= 0 ? m_items[size_t(row)].keyPointImageSource
                                         : m_activeItem.value(QStringLiteral("keyPointImageSource")).toString();
        QString file;
        if (!m_dialogs->choosePicture(file, current) || file.isEmpty())
            return false;
        symbol = KeyPointImageItem();
        symbol.sourceFileName = interfaceFileUrl(file);
    }

    bool changed = false;
    for (size_t r = 0; r < m_items.size(); ++r) {
        if (row >= 0 && int(r) != row)
            continue;
        KeyPoint *point = keyPoint(m_items[r].elementId);
        if (!point)
            continue;
        changed = true;
        KeyPointProperties &p = point->properties;
        p.imageSource = symbol.sourceFileName;
        p.isMediaTemplate = symbol.isMediaTemplate;
        p.mediaCenterOffsetX = symbol.mediaCenterOffset.x();
        p.mediaCenterOffsetY = symbol.mediaCenterOffset.y();
        p.mediaSizeW = symbol.mediaSize.width();
        p.mediaSizeH = symbol.mediaSize.height();
        // A frame for a photo shows the next one that no waypoint shows yet.
        if (symbol.isMediaTemplate && row >= 0 && p.mediaSource.isEmpty()) {
            if (const PoolPhoto *photo = nextFreePhoto()) {
                p.mediaSource = photo->path;
                p.mediaRotation = photo->orientation;
            }
        }
        m_items[r].assignFrom(*point);
    }
    if (!changed)
        return false;
    refreshActiveItem({"keyPointImageSource", "isMediaTemplate", "mediaCenterPositionOffset", "mediaSourceSize"});
    markChanged();
    return true;
}

bool KeyPointItemsData::setUserPhoto(int32_t photoId, uint32_t id)
{
    const int row = rowOf(id);
    KeyPoint *point = row < 0 ? nullptr : keyPoint(id);
    const PoolPhoto *photo = point ? m_document->photoPool().find(photoId) : nullptr;
    if (!photo)
        return false;
    point->properties.mediaSource = photo->path;
    point->properties.mediaRotation = photo->orientation;
    refreshRecord(row);
    refreshActiveItem({});
    markChanged();
    return true;
}

bool KeyPointItemsData::deleteMediaPoint(uint32_t id)
{
    Path *p = path();
    if (!p || p->mediaPointIndex(id) < 0)
        return false;
    p->deleteMediaPointAndSample(id);
    markChanged();
    return true;
}

bool KeyPointItemsData::containsPosition(double longitude, double latitude) const
{
    const Path *p = path();
    return p && std::any_of(p->keyPoints.begin(), p->keyPoints.end(), [&](const KeyPoint &k) {
               return k.longitude == longitude && k.latitude == latitude;
           });
}

uint32_t KeyPointItemsData::takeDropTarget(double &longitude, double &latitude)
{
    Path *p = path();
    if (!p)
        return 0;
    uint32_t legStart = 0;
    for (CurvePoint &sample : p->curvePoints) {
        if (sample.correspondingKeyPoint != 0)
            legStart = sample.correspondingKeyPoint;
        if (sample.tt == 0)
            continue;
        sample.tt = 0;
        longitude = sample.x;
        latitude = sample.y;
        return legStart;
    }
    return 0;
}

bool KeyPointItemsData::canAppend() const
{
    return path() && !m_document->keyPointsFixed();
}


void KeyPointItemsData::applyDefaultSymbol(KeyPointProperties &properties) const
{
    QVariantMap map;
    if (!m_imageItems.itemById(KeyPointImageItems::defaultSymbolId, map))
        return;
    const KeyPointImageItem symbol = KeyPointImageItem::fromMap(map);
    properties.imageSource = symbol.sourceFileName;
    properties.isMediaTemplate = symbol.isMediaTemplate;
    properties.mediaCenterOffsetX = symbol.mediaCenterOffset.x();
    properties.mediaCenterOffsetY = symbol.mediaCenterOffset.y();
    properties.mediaSizeW = symbol.mediaSize.width();
    properties.mediaSizeH = symbol.mediaSize.height();
}

uint32_t KeyPointItemsData::appendKeyPoint(double longitude, double latitude, double altitude, const QString &title)
{
    if (!canAppend())
        return 0;
    logTrace(0, QStringLiteral("MapView::addKeyPoint <- %f, %f"), longitude, latitude);
    Path &p = *path();
    KeyPoint point(longitude, latitude, altitude);
    point.properties.title = newKeyPointTitle(title);
    if (!p.keyPoints.empty())
        copyDisplaySettings(p.keyPoints.back().properties, point.properties);
    if (point.properties.imageSource.isEmpty())
        applyDefaultSymbol(point.properties);
    const uint32_t id = point.id;
    p.addKeyPoint(point, true);

    appendRecordOf(int(p.keyPoints.size()) - 1);
    refreshOrderIndices();
    makeActive(id);
    markChanged();
    logTrace(0, QStringLiteral("MapView::addKeyPoint -> %d"), id);
    return id;
}

uint32_t KeyPointItemsData::insertKeyPoint(uint32_t afterId, double longitude, double latitude, double altitude,
                                           const QString &title)
{
    Path *p = path();
    const int afterRow = rowOf(afterId);
    if (!p || afterRow < 0 || p->keyPointIndex(afterId) < 0)
        return 0;
    logTrace(0, QStringLiteral("MapView::addKeyPoint <- %f, %f after %d"), longitude, latitude, afterId);
    KeyPoint point(longitude, latitude, altitude);
    point.properties.title = newKeyPointTitle(title);
    copyDisplaySettings(p->keyPoints[size_t(p->keyPointIndex(afterId))].properties, point.properties);
    if (point.properties.imageSource.isEmpty())
        applyDefaultSymbol(point.properties);
    const uint32_t id = point.id;
    p->insertKeyPoint(afterId, point, true);

    PathSegment *before = p->segmentForKeyPoint(afterId);
    if (PathSegment *added = p->segmentForKeyPoint(id); added && before)
        added->setPilot(before->pilot, true);
    // The leg before ends at the new point now, also on a track, whose curve stays.
    if (before)
        before->changed = true;
    KeyPointItem item;
    item.assignFrom(p->keyPoints.at(size_t(p->keyPointIndex(id))));
    m_items.insert(m_items.begin() + afterRow + 1, item);
    refreshRecord(afterRow);
    refreshOrderIndices();
    makeActive(id);
    markChanged();
    return id;
}

bool KeyPointItemsData::deleteFromPath(uint32_t id, bool regenerate)
{
    Path *p = path();
    if (!p || p->keyPointIndex(id) < 0 || !p->deleteKeyPoint(id, regenerate))
        return false;
    // Without a route there is no place to show photos at.
    if (p->keyPoints.empty())
        p->mediaPoints.clear();
    markChanged();
    return true;
}

void KeyPointItemsData::regenerateCurve()
{
    if (Path *p = path())
        p->update();
}

void KeyPointItemsData::removeRecord(int row)
{
    const uint32_t id = m_items.at(size_t(row)).elementId;
    m_items.erase(m_items.begin() + row);
    if (id == m_activeKeyPointId)
        clearActive();
}

std::vector<uint32_t> KeyPointItemsData::mediaPointIds() const
{
    std::vector<uint32_t> ids;
    if (const Path *p = path()) {
        for (const MediaPoint &m : p->mediaPoints)
            ids.push_back(m.id);
    }
    return ids;
}

uint32_t KeyPointItemsData::segmentIdOf(uint32_t keyPointId) const
{
    const Path *p = path();
    if (!p)
        return 0;
    const auto found = std::find_if(p->pathSegments.begin(), p->pathSegments.end(),
                                    [&](const PathSegment &s) { return s.keyPointId == keyPointId; });
    return found == p->pathSegments.end() ? 0 : found->id;
}

uint32_t KeyPointItemsData::previousSegmentId(uint32_t keyPointId) const
{
    const Path *p = path();
    if (!p)
        return 0;
    for (size_t i = 1; i < p->pathSegments.size(); ++i) {
        if (p->pathSegments[i].keyPointId == keyPointId)
            return p->pathSegments[i - 1].id;
    }
    return 0;
}

uint32_t KeyPointItemsData::segmentPath(uint32_t keyPointId, bool force, QGeoPath &out)
{
    Path *p = path();
    PathSegment *segment = p ? p->segmentForKeyPoint(keyPointId) : nullptr;
    if (!segment || (!force && !segment->changed))
        return 0;
    out = geoPathOf(*segment);
    segment->changed = false;
    return segment->id;
}

std::vector<KeyPointItemsData::SegmentPath> KeyPointItemsData::segmentPaths(bool force)
{
    std::vector<SegmentPath> out;
    Path *p = path();
    if (!p)
        return out;
    out.resize(p->pathSegments.size());
    for (size_t i = 0; i < p->pathSegments.size(); ++i) {
        PathSegment &segment = p->pathSegments[i];
        if (!force && !segment.changed)
            continue;
        out[i] = {segment.id, geoPathOf(segment)};
        segment.changed = false;
    }
    return out;
}

void KeyPointItemsData::altitudeProfile(QVariantList &altitudes, QVariantList &distances) const
{
    altitudes.clear();
    distances.clear();
    const Path *p = path();
    if (!p)
        return;
    double along = 0.0;
    const CurvePoint *previous = nullptr;
    for (const CurvePoint &sample : p->curvePoints) {
        if (previous)
            along += geoDistance(previous->y, previous->x, sample.y, sample.x);
        altitudes.append(sample.z);
        distances.append(along);
        previous = &sample;
    }
}
