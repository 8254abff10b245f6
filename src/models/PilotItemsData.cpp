#include "models/PilotItemsData.h"

#include "app/Trace.h"
#include "content/ContentCatalogue.h"
#include "content/IniAccess.h"
#include "content/UserAvatars.h"
#include "models/KeyPointItemsData.h"
#include "path/ContentPath.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QDir>
#include <QFileInfo>
#include <QImageReader>
#include <QUrl>

const QString PilotItemsData::defaultAvatarTitle = QStringLiteral("3d_cabrio");
const QString PilotItemsData::noAvatarTitle = QStringLiteral("01_no_avatar");

namespace {

const QString perspectiveFormat = QStringLiteral("perspective");
const QString flatFormat = QStringLiteral("2D");

PilotItem itemOfAvatar(const AvatarItem &avatar)
{
    PilotItem item;
    item.title = avatar.name;
    item.pilotId = avatar.id;
    item.isAnimated = avatar.animated != 0;
    item.pilotStyle = avatar.perspective != 0 ? perspectiveFormat : flatFormat;
    item.sourceFileName = contentFileUrl(avatar.sourceFile);
    item.thumbFileName = contentFileUrl(avatar.thumbFile);
    item.pilotWidth = avatar.defaultWidth;
    item.pilotRotation = avatar.allowRotation;
    item.pilotSymmetric = avatar.symmetric;
    item.pilotGroupId = avatar.groupIndex;
    item.pilotGroupName = avatar.groupName;
    item.isUserContent = avatar.isUserContent;
    item.contentPackageID = int32_t(avatar.packageIndex);
    return item;
}

PilotItem itemOfPilot(const PilotProperties &pilot)
{
    PilotItem item;
    item.isAnimated = pilot.hasFlag(PilotProperties::isAnimated);
    item.pilotStyle = pilot.displayFormat;
    item.sourceFileName = pilot.source;
    item.thumbFileName = pilot.thumb;
    item.pilotWidth = int32_t(pilot.width);
    item.pilotRotation = pilot.hasFlag(PilotProperties::rotation);
    item.pilotSymmetric = pilot.hasFlag(PilotProperties::symmetric);
    return item;
}

} // namespace

PilotProperties PilotItem::toPilot() const
{
    PilotProperties pilot;
    pilot.source = sourceFileName;
    pilot.thumb = thumbFileName;
    pilot.displayFormat = pilotStyle;
    pilot.width = double(pilotWidth);
    pilot.setFlag(PilotProperties::isAnimated, isAnimated);
    pilot.setFlag(PilotProperties::rotation, pilotRotation);
    pilot.setFlag(PilotProperties::symmetric, pilotSymmetric);
    return pilot;
}

PilotItemsData::PilotItemsData(PainterPathRenderer_Controller *document, const AppSettings &settings,
                               std::function<uint32_t()> activeKeyPointId)
    : m_document(document), m_settings(settings), m_activeKeyPointId(std::move(activeKeyPointId)),
      m_dialogs(std::make_unique<PilotDialogs>())
{
}

void PilotItemsData::setDialogs(std::unique_ptr<PilotDialogs> dialogs)
{
    m_dialogs = dialogs ? std::move(dialogs) : std::make_unique<PilotDialogs>();
}

void PilotItemsData::fillPilotItems(const ContentCatalogue &catalogue, const QString &browseTitle)
{
    const std::vector<AvatarItem> avatars = catalogue.avatars();
    m_browseTitle = browseTitle;
    m_items.clear();
    m_items.reserve(avatars.size() + 1);

    PilotItem browse;
    browse.title = browseTitle;
    browse.pilotId = nextContentItemId();
    browse.browseImage = true;
    if (!avatars.empty()) {
        browse.pilotGroupId = avatars.front().groupIndex;
        browse.pilotGroupName = avatars.front().groupName;
    }
    m_items.push_back(browse);
    for (const AvatarItem &avatar : avatars)
        m_items.push_back(itemOfAvatar(avatar));
    m_pilotGroups = catalogue.groups();

    const int row = rowOfTitle(defaultAvatarTitle);
    if (row >= 0) {
        PilotProperties pilot = m_items[size_t(row)].toPilot();
        pilot.width = 120.0;
        setDefaultPilot(pilot);
    } else {
        logTrace(1, QStringLiteral("PilotItemsData::fillPilotItems - no avatar %s"), defaultAvatarTitle);
    }
}

void PilotItemsData::refresh()
{
    if (!m_document)
        return;
    ContentCatalogue &catalogue = m_document->catalogue();
    catalogue.rescanAvatars();
    fillPilotItems(catalogue, m_browseTitle);
}

int PilotItemsData::rowOf(uint32_t pilotId) const
{
    for (size_t i = 0; i < m_items.size(); ++i) {
        if (m_items[i].pilotId == pilotId)
            return int(i);
    }
    return -1;
}

int PilotItemsData::rowOfTitle(const QString &title) const
{
    for (size_t i = 0; i < m_items.size(); ++i) {
        if (!m_items[i].browseImage && m_items[i].title == title)
            return int(i);
    }
    return -1;
}

bool PilotItemsData::updateGroupById(int groupId)
{
    const QString idKey = QStringLiteral("groupId");
    if (m_activeGroup.contains(idKey) && m_activeGroup.value(idKey).toInt() == groupId)
        return false;
    for (size_t row = 0; row < m_items.size(); ++row) {
        const PilotItem &item = m_items[row];
        if (item.pilotGroupId != groupId)
            continue;
        m_activeGroup = {{QStringLiteral("groupName"), item.pilotGroupName},
                         {idKey, item.pilotGroupId},
                         {QStringLiteral("groupIndex"), int(row)}};
        return true;
    }
    return false;
}

bool PilotItemsData::updateGroupByIndex(int row)
{
    if (row < 0 || row >= rowCount())
        return false;
    const QString nameKey = QStringLiteral("groupName");
    const PilotItem &item = m_items[size_t(row)];
    if (m_activeGroup.contains(nameKey) && m_activeGroup.value(nameKey).toString() == item.pilotGroupName)
        return false;
    int first = row;
    for (int r = 0; r < row; ++r) {
        if (m_items[size_t(r)].pilotGroupName == item.pilotGroupName) {
            first = r;
            break;
        }
    }
    m_activeGroup = {{nameKey, item.pilotGroupName},
                     {QStringLiteral("groupId"), item.pilotGroupId},
                     {QStringLiteral("groupIndex"), first}};
    return true;
}

bool PilotItemsData::isBrowseItem(uint32_t pilotId) const
{
    const int row = rowOf(pilotId);
    return row >= 0 && m_items[size_t(row)].browseImage;
}

std::vector<PathSegment *> PilotItemsData::activeSegments() const
{
    Path *path = m_document ? m_document->pathManager().active() : nullptr;
    if (!path || path->pathSegments.empty())
        return {};
    uint32_t id = m_activeKeyPointId ? m_activeKeyPointId() : 0;
    if (id == KeyPointItemsData::allPoints) {
        std::vector<PathSegment *> all;
        for (PathSegment &segment : path->pathSegments)
            all.push_back(&segment);
        return all;
    }
    const int index = path->keyPointIndex(id);
    if (index < 0)
        return {};
    // The last key point ends the route; the avatar that reaches it is the one before.
    if (index > 0 && size_t(index) + 1 == path->keyPoints.size())
        id = path->keyPoints[size_t(index) - 1].id;
    PathSegment *segment = path->segmentForKeyPoint(id);
    return segment ? std::vector<PathSegment *>{segment} : std::vector<PathSegment *>{};
}

bool PilotItemsData::applyPilot(const PilotProperties &pilot, const QString &trackingWord)
{
    logTrace(0, QStringLiteral("PilotItemsData::applyPilot - tracking avatar %s"), trackingWord);
    const std::vector<PathSegment *> segments = activeSegments();
    if (segments.empty()) {
        setDefaultPilot(pilot);
        return false;
    }
    for (PathSegment *segment : segments)
        segment->setPilot(pilot, true);
    return true;
}

bool PilotItemsData::changePilotItem(uint32_t pilotId)
{
    const int row = rowOf(pilotId);
    if (row < 0 || m_items[size_t(row)].browseImage)
        return false;
    const PilotItem &item = m_items[size_t(row)];
    applyPilot(item.toPilot(), item.isUserContent ? QStringLiteral("custom") : QFileInfo(item.sourceFileName).fileName());
    return true;
}

QString PilotItemsData::dataFolder() const
{
    return m_settings.pathSetting(SettingsKey::DynamicContentPath);
}

// The interface's text for the last failed import: an archive that can't be found or
// opened, or one that holds no usable picture series.
QString PilotItemsData::importErrorKey()
{
    switch (importErrorNumber()) {
    case 3:   // no such file
    case 110: // could not be opened
        return QStringLiteral("strErrorOpenFile");
    default:
        return QStringLiteral("strErrorWrongFileStructure");
    }
}

std::optional<PilotProperties> PilotItemsData::pilotOfUserFile(const QString &file)
{
    PilotProperties pilot;
    pilot.width = 120.0;
    pilot.flags = PilotProperties::rotation;
    if (isZipAvatar(file)) {
        QString picture;
        if (!importZipAvatar(dataFolder(), file, picture)) {
            logTrace(3, QStringLiteral("PilotItemsData::pilotOfUserFile - %s: %s"), file, importErrorText());
            m_browseError = importErrorKey();
            return std::nullopt;
        }
        pilot.thumb = contentFileUrl(picture);
        // The frames are "<name>_<n>.png"; the source names the series.
        pilot.source = contentFileUrl(picture.left(picture.lastIndexOf(QLatin1Char('_'))));
        pilot.displayFormat = perspectiveFormat;
        return pilot;
    }
    QImageReader reader(file);
    if (!reader.canRead()) {
        logTrace(3, QStringLiteral("PilotItemsData::pilotOfUserFile - no picture in %s: %s"), file, reader.errorString());
        m_browseError = QStringLiteral("strErrorWrongFileStructure");
        return std::nullopt;
    }
    pilot.setFlag(PilotProperties::isAnimated, reader.supportsAnimation() && reader.imageCount() > 1);
    pilot.thumb = QUrl::fromLocalFile(file).toString(QUrl::FullyEncoded);
    pilot.source = file;
    pilot.displayFormat = flatFormat;
    return pilot;
}

std::optional<PilotItem> PilotItemsData::browseUserPilot()
{
    clearImportError();
    m_browseError.clear();
    const QString file = m_dialogs->chooseAvatarFile(m_settings.pathSetting(SettingsKey::BrowseContentPath));
    if (file.isEmpty())
        return std::nullopt;
    m_settings.setPathSetting(SettingsKey::BrowseContentPath, QFileInfo(file).absolutePath());
    const std::optional<PilotProperties> pilot = pilotOfUserFile(file);
    if (!pilot)
        return std::nullopt;
    applyPilot(*pilot, QStringLiteral("custom"));

    PilotItem item = itemOfPilot(*pilot);
    item.pilotId = nextContentItemId();
    item.title = QFileInfo(file).baseName();
    item.isUserContent = true;
    return item;
}

int PilotItemsData::insertUserItem(const PilotItem &item)
{
    const int row = std::min(userItemRow, rowCount());
    m_items.insert(m_items.begin() + row, item);
    return row;
}

bool PilotItemsData::setCurrentPilotWidth(double width)
{
    const std::vector<PathSegment *> segments = activeSegments();
    if (segments.empty()) {
        PilotProperties pilot = defaultPilot();
        const bool changed = pilot.width != width;
        pilot.width = width;
        setDefaultPilot(pilot);
        return changed;
    }
    bool changed = false;
    for (PathSegment *segment : segments) {
        changed |= segment->pilot.width != width;
        segment->setPilotWidth(width);
    }
    return changed;
}

bool PilotItemsData::setCurrentPilotRotation(bool on)
{
    const std::vector<PathSegment *> segments = activeSegments();
    if (segments.empty()) {
        PilotProperties pilot = defaultPilot();
        const bool changed = pilot.hasFlag(PilotProperties::rotation) != on;
        pilot.setFlag(PilotProperties::rotation, on);
        setDefaultPilot(pilot);
        return changed;
    }
    bool changed = false;
    for (PathSegment *segment : segments) {
        changed |= segment->pilot.hasFlag(PilotProperties::rotation) != on;
        segment->setPilotRotation(on);
    }
    return changed;
}

QVariantMap PilotItemsData::currentPilot() const
{
    const std::vector<PathSegment *> segments = activeSegments();
    const PilotProperties &pilot = segments.empty() ? defaultPilot() : segments.front()->pilot;
    return {{QStringLiteral("displayFormat"), pilot.displayFormat},
            {QStringLiteral("pilotWidth"), pilot.width},
            {QStringLiteral("sourceFileName"), pilot.source},
            {QStringLiteral("thumbFileName"), pilot.thumb},
            {QStringLiteral("animated"), pilot.hasFlag(PilotProperties::isAnimated)},
            {QStringLiteral("pilotRotation"), pilot.hasFlag(PilotProperties::rotation)},
            {QStringLiteral("pilotSymmetric"), pilot.hasFlag(PilotProperties::symmetric)}};
}

int PilotItemsData::takeDeletion()
{
    const int row = rowOf(m_deletePilotId);
    if (row >= 0)
        m_deletePath = m_items[size_t(row)].sourceFileName;
    return row;
}

bool PilotItemsData::deletionIsCurrent() const
{
    return !m_deletePath.isEmpty()
           && currentPilot().value(QStringLiteral("sourceFileName")).toString() == m_deletePath;
}

void PilotItemsData::removeRow(int row)
{
    if (row >= 0 && row < rowCount())
        m_items.erase(m_items.begin() + row);
}

bool PilotItemsData::removeDeletedAvatarFiles()
{
    const QString stem = QFileInfo(m_deletePath).baseName();
    const QString data = dataFolder();
    if (stem.isEmpty() || data.isEmpty())
        return false;
    const QString folder = data + QStringLiteral("/userAvatars/") + stem;
    // Only what an import made: a picture of the user's own stays where it is.
    if (!QDir::cleanPath(localFilePath(m_deletePath)).startsWith(QDir::cleanPath(folder) + QLatin1Char('/'))) {
        logTrace(1, QStringLiteral("PilotItemsData::removeDeletedAvatarFiles - %s lies outside %s"), m_deletePath, folder);
        return false;
    }
    const bool removed = QDir(folder).removeRecursively();
    if (!removed)
        logTrace(3, QStringLiteral("PilotItemsData::removeDeletedAvatarFiles - can't remove %s"), folder);
    removeIniListValue(data + QStringLiteral("/tourletContent.ini"), stem, QStringLiteral("avatars"),
                       QStringLiteral("paths"));
    return removed;
}
