#include "content/ContentCatalogue.h"

#include "app/Trace.h"
#include "content/IniAccess.h"
#include "content/UserAvatars.h"

#include <QFileInfo>

#include <algorithm>

const QString ContentCatalogue::utpMarker = QStringLiteral("TourletUTP");
const QString ContentCatalogue::teeMarker = QStringLiteral("TourletTEE");

namespace {

const QString mainSection = QStringLiteral("main");
const QString contentIniName = QStringLiteral("tourletContent.ini");
const QString trueText = QStringLiteral("true");

QString withSlash(const QString &folder)
{
    return folder.endsWith(QLatin1Char('/')) ? folder : folder + QLatin1Char('/');
}

QString lastComponent(QString path)
{
    while (path.size() > 1 && path.endsWith(QLatin1Char('/')))
        path.chop(1);
    return QFileInfo(path).fileName();
}

bool isTrue(const QString &ini, const QString &key)
{
    return readIniValue(ini, mainSection, key, false) == trueText;
}

QStringList shopSubfolders(ContentCatalogue::Kind kind)
{
    switch (kind) {
    case ContentCatalogue::Avatars:
        return {QStringLiteral("Transport"), QStringLiteral("Vehicles"), QStringLiteral("VehiclesOther")};
    case ContentCatalogue::Waypoints:
        return {QStringLiteral("WayPoints")};
    case ContentCatalogue::Maps:
        return {QStringLiteral("Maps_Countries_Islands"), QStringLiteral("Maps_Continents"),
                QStringLiteral("Maps_Generic")};
    case ContentCatalogue::Masks:
        break;
    }
    return {};
}

// The leading decimal number of text, 0 if there is none; ignores what follows it.
double leadingNumber(const QString &text)
{
    const QString s = text.trimmed();
    int end = 0;
    auto digits = [&]() {
        const int from = end;
        while (end < s.size() && s.at(end).isDigit() && s.at(end).unicode() < 128)
            ++end;
        return end - from;
    };
    if (end < s.size() && (s.at(end) == QLatin1Char('+') || s.at(end) == QLatin1Char('-')))
        ++end;
    int mantissa = digits();
    if (end < s.size() && s.at(end) == QLatin1Char('.')) {
        ++end;
        mantissa += digits();
    }
    if (mantissa == 0)
        return 0.0;
    if (end < s.size() && (s.at(end) == QLatin1Char('e') || s.at(end) == QLatin1Char('E'))) {
        const int mark = end++;
        if (end < s.size() && (s.at(end) == QLatin1Char('+') || s.at(end) == QLatin1Char('-')))
            ++end;
        if (digits() == 0)
            end = mark;
    }
    bool ok = false;
    const double value = s.left(end).toDouble(&ok);
    return ok ? value : 0.0;
}

} // namespace

QString ContentCatalogue::kindName(Kind kind)
{
    switch (kind) {
    case Avatars:
        return QStringLiteral("avatars");
    case Waypoints:
        return QStringLiteral("waypoints");
    case Maps:
        return QStringLiteral("maps");
    case Masks:
        return QStringLiteral("masks");
    }
    return QString();
}

QString ContentCatalogue::languageSuffix(int languageIndex)
{
    static const char *const suffixes[] = {"_DE", "_EN", "_FR", "_IT", "_NL", "_ES", "_JA"};
    if (languageIndex < 0 || languageIndex > 6)
        languageIndex = 1;
    return QString::fromLatin1(suffixes[languageIndex]);
}

QString ContentCatalogue::translationIni(const QString &folder) const
{
    return folder + QStringLiteral("Translation") + m_languageSuffix + QStringLiteral(".ini");
}

QStringList ContentCatalogue::contentSetFolders() const
{
    QStringList sets;
    for (const QString &host : m_hostContentFolders)
        sets += listSubfolders(withSlash(host) + QStringLiteral("ShopManager"), false);
    return sets;
}

QString ContentCatalogue::findSetRoot(const QString &marker) const
{
    for (const QString &folder : contentSetFolders())
        if (fileExists(folder + QLatin1Char('/') + marker))
            return folder;
    return QString();
}

bool ContentCatalogue::load(const QString &imageRoot, const QString &dataFolder, int languageIndex,
                            const QString &userAvatarFolder)
{
    m_languageSuffix = languageSuffix(languageIndex);
    m_dataFolder = dataFolder;

    QString avatarFolder = userAvatarFolder;
    if (avatarFolder.isEmpty() && !dataFolder.isEmpty())
        avatarFolder = dataFolder + QLatin1Char('/') + QStringLiteral("userAvatars");
    if (!avatarFolder.isEmpty())
        migrateUserAvatars(avatarFolder);

    m_utpRoot = findSetRoot(utpMarker);
    m_teeRoot = findSetRoot(teeMarker);

    m_imageRoot = imageRoot.isEmpty() ? imageRoot : withSlash(imageRoot);
    const QString contentIni = dataFolder + QLatin1Char('/') + contentIniName;
    m_contentIniPath = !dataFolder.isEmpty() && fileExists(contentIni) ? contentIni : QString();

    IniReadCache cache;
    m_avatars.clear();
    scanAvatars(scanList(Avatars));
    m_waypoints.clear();
    scanWaypoints(scanList(Waypoints));
    m_maps.clear();
    scanMaps(scanList(Maps));
    m_masks.clear();
    scanMasks(scanList(Masks));
    logTrace(0, QStringLiteral("ContentCatalogue::load: %d avatars, %d waypoints, %d maps, %d masks"),
             int(m_avatars.size()), int(m_waypoints.size()), int(m_maps.size()), int(m_masks.size()));
    return true;
}

QStringList ContentCatalogue::scanList(Kind kind, const QStringList &headFolders) const
{
    QStringList folders;
    for (const QString &head : headFolders)
        folders << withSlash(head);
    auto add = [&](const QString &folder) {
        for (const QString &head : headFolders)
            if (samePath(withSlash(head), folder))
                return;
        folders << folder;
    };
    if (!m_contentIniPath.isEmpty())
        for (const QString &entry : readIniList(m_contentIniPath, kindName(kind), QStringLiteral("paths"),
                                                QStringLiteral(","), true))
            add(withSlash(entry));
    const QString name = kindName(kind);
    add(m_imageRoot + name + QLatin1Char('/'));
    const QString setRoot = m_utpRoot.isEmpty() ? m_imageRoot + QStringLiteral("_shop") : m_utpRoot;
    for (const QString &sub : shopSubfolders(kind))
        add(setRoot + QLatin1Char('/') + sub + QLatin1Char('/'));
    if (kind == Avatars)
        add(m_teeRoot.isEmpty() ? m_imageRoot + QStringLiteral("_shop/tee") + QLatin1Char('/')
                                : m_teeRoot + QLatin1Char('/'));
    return folders;
}

ContentItem ContentCatalogue::scanItem(const QString &folder, const QString &stem, const QString &ini,
                                       uint32_t packageIndex) const
{
    ContentItem item;
    item.id = nextContentItemId();
    item.packageIndex = packageIndex;
    item.name = stem;
    item.type = readIniValue(ini, mainSection, QStringLiteral("type"), false);
    item.sourceFile = folder + stem + QLatin1Char('.') + item.type;
    item.thumbFile = folder + QStringLiteral("Icons/") + stem + QLatin1Char('.') + item.type;
    const QString pack = readIniValue(ini, mainSection, QStringLiteral("cPack"), false);
    if (pack == QLatin1String("UTP") || ini.contains(utpMarker))
        item.packType = 1;
    else if (pack == QLatin1String("TEE") || ini.contains(teeMarker))
        item.packType = 2;
    return item;
}

void ContentCatalogue::readGroups(const QStringList &folders)
{
    for (const QString &folder : folders) {
        const QStringList sections = readIniList(folder + QStringLiteral("categories.ini"), mainSection,
                                                 QStringLiteral("sections"), QStringLiteral(";"), true);
        for (const QString &section : sections) {
            const QString name = readIniValue(translationIni(folder), section, QStringLiteral("name"), true);
            if (!m_groups.contains(name))
                m_groups << name;
        }
    }
}

void ContentCatalogue::fillAvatar(AvatarItem &item, const QString &pkg, const QString &ini) const
{
    item.allowRotation = isTrue(ini, QStringLiteral("allowRotation"));
    item.symmetric = isTrue(ini, QStringLiteral("symmetric"));
    item.animated = isTrue(ini, QStringLiteral("animated")) ? 1 : 0;
    const bool perspective =
        readIniValue(ini, mainSection, QStringLiteral("displayFormat"), false) == QLatin1String("perspective");
    item.defaultWidth = 120;
    if (perspective) {
        item.perspective = 1;
        const QString frames = pkg + QStringLiteral("ZK3D/") + item.name + QLatin1Char('/') + item.name;
        item.sourceFile = frames;
        item.thumbFile = frames + QStringLiteral("_1.") + item.type;
    }
    item.isUserContent = isTrue(ini, QStringLiteral("isUserContent"));

    const QString groupKey = readIniValue(ini, mainSection, QStringLiteral("gName"), true);
    if (!groupKey.isEmpty())
        item.groupName = readIniValue(translationIni(pkg), groupKey, QStringLiteral("name"), true);
    if (item.groupName.isEmpty()) {
        const QString section = item.packType == 2   ? QStringLiteral("TEE")
                                : item.packType == 1 ? QStringLiteral("UTP")
                                                     : QStringLiteral("noCat");
        item.groupName = readIniValue(translationIni(m_imageRoot + QStringLiteral("avatars/")), section,
                                      QStringLiteral("name"), true);
    }
    const int at = m_groups.indexOf(item.groupName);
    item.groupIndex = at >= 0 ? at : m_groups.size();
}

void ContentCatalogue::scanAvatars(const QStringList &folders)
{
    readGroups(folders);
    for (int index = 0; index < folders.size(); ++index) {
        const QString &folder = folders.at(index);
        for (const QString &file : listInformationFiles(folder)) {
            const QString ini = folder + QStringLiteral("informations/") + file;
            const QString stem = QFileInfo(file).completeBaseName();
            AvatarItem item;
            static_cast<ContentItem &>(item) = scanItem(folder, stem, ini, uint32_t(index));
            fillAvatar(item, folder, ini);
            m_avatars.push_back(item);
        }
    }
    // Only the group order is promised; within a group the order may change.
    std::sort(m_avatars.begin(), m_avatars.end(),
              [](const AvatarItem &a, const AvatarItem &b) { return a.groupIndex < b.groupIndex; });
}

void ContentCatalogue::scanWaypoints(const QStringList &folders)
{
    for (int index = 0; index < folders.size(); ++index) {
        const QString &folder = folders.at(index);
        for (const QString &file : listInformationFiles(folder)) {
            const QString ini = folder + QStringLiteral("informations/") + file;
            const QString stem = QFileInfo(file).completeBaseName();
            WaypointItem item;
            static_cast<ContentItem &>(item) = scanItem(folder, stem, ini, uint32_t(index));
            item.animated = isTrue(ini, QStringLiteral("animated")) ? 1 : 0;
            item.isMediaTemplate = isTrue(ini, QStringLiteral("media"));
            if (item.isMediaTemplate) {
                const QString x = readIniValue(ini, mainSection, QStringLiteral("mediaCPOx"), false);
                const QString y = readIniValue(ini, mainSection, QStringLiteral("mediaCPOy"), false);
                if (!x.isEmpty() && !y.isEmpty())
                    item.mediaCenterOffset = {leadingNumber(x), leadingNumber(y)};
                const QString w = readIniValue(ini, mainSection, QStringLiteral("mediaW"), false);
                const QString h = readIniValue(ini, mainSection, QStringLiteral("mediaH"), false);
                if (!w.isEmpty() && !h.isEmpty())
                    item.mediaSize = {leadingNumber(w), leadingNumber(h)};
            }
            m_waypoints.push_back(item);
        }
    }
}

void ContentCatalogue::scanMaps(const QStringList &folders)
{
    for (int index = 0; index < folders.size(); ++index) {
        const QString &folder = folders.at(index);
        for (const QString &file : listInformationFiles(folder)) {
            const QString ini = folder + QStringLiteral("informations/") + file;
            const QString stem = QFileInfo(file).completeBaseName();
            MapItem item;
            static_cast<ContentItem &>(item) = scanItem(folder, stem, ini, uint32_t(index));
            item.mainCategory = readIniValue(ini, mainSection, QStringLiteral("item_main_category"), false,
                                             QStringLiteral("europe_shop"));
            item.elementId = readIniValue(ini, mainSection, QStringLiteral("origins"), false);
            item.origins = readIniValue(ini, mainSection, QStringLiteral("origins"), false);
            // The display name comes from the translation only, and stays empty without one.
            item.name = readIniValue(translationIni(folder), stem, QStringLiteral("name"), true);
            item.background = readIniValue(ini, mainSection, QStringLiteral("background"), false);
            item.widthWeight = readIniValue(ini, mainSection, QStringLiteral("widthWeight"), false);
            m_maps.push_back(item);
        }
    }
}

void ContentCatalogue::scanMasks(const QStringList &folders)
{
    for (int index = 0; index < folders.size(); ++index) {
        const QString &folder = folders.at(index);
        for (const QString &file : listInformationFiles(folder)) {
            const QString ini = folder + QStringLiteral("informations/") + file;
            const QString stem = QFileInfo(file).completeBaseName();
            MaskItem item;
            static_cast<ContentItem &>(item) = scanItem(folder, stem, ini, uint32_t(index));
            item.guid = readIniValue(ini, mainSection, QStringLiteral("guid"), false,
                                     QStringLiteral("{00000000-0000-0000-0000-000000000000}"));
            item.fileName = QFileInfo(item.sourceFile).fileName();
            m_masks.push_back(item);
        }
    }
}

void ContentCatalogue::rescanAvatars()
{
    QStringList avatarSets;
    for (const QString &set : contentSetFolders()) {
        bool ok = false;
        const int cat = readIniValue(set + QStringLiteral("/Tourlet.ini"), mainSection, QStringLiteral("cat"), true)
                            .toInt(&ok, 10);
        if (ok && cat == 0)
            avatarSets << set;
    }

    QString contentIni = m_contentIniPath;
    if (contentIni.isEmpty() && !m_dataFolder.isEmpty())
        contentIni = m_dataFolder + QLatin1Char('/') + contentIniName;
    const QStringList known =
        readIniList(contentIni, kindName(Avatars), QStringLiteral("paths"), QStringLiteral(","), true);

    QStringList added;
    for (const QString &set : avatarSets) {
        const QString name = lastComponent(set);
        const bool isKnown = std::any_of(known.begin(), known.end(),
                                         [&](const QString &entry) { return lastComponent(entry) == name; });
        if (isKnown)
            continue;
        if (!contentIni.isEmpty() && prependIniListValue(contentIni, set, kindName(Avatars), QStringLiteral("paths")))
            m_contentIniPath = contentIni;
        added << set;
    }
    if (added.isEmpty())
        return;
    logTrace(0, QStringLiteral("ContentCatalogue::rescanAvatars: %d new content sets"), int(added.size()));
    IniReadCache cache;
    m_avatars.clear();
    scanAvatars(scanList(Avatars, added));
}
