#include "mapview/QMainController.h"

#include "app/Trace.h"
#include "path/DefaultTitle.h"
#include "path/PathMode.h"
#include "project/DocumentFile.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QDir>
#include <QFileInfo>

namespace {

const QString trackFilter = QStringLiteral(
    "TopoGrafix (*.gpx);;Google Earth (*.kml *.kmz);;Garmin Training Center (*.tcx);;CompeGPS (*.trk)");
const QString trackWildcards = QStringLiteral("*.gpx *.kml *.kmz *.tcx *.trk");
const QString imageWildcards = QStringLiteral("*.jpg *.png *.bmp *.tif *.tiff *.svg");
const QString projectExtension = QStringLiteral("zkgeo");

} // namespace

QMainController::QMainController(PainterPathRenderer_Controller *document, const AppSettings &settings)
    : m_document(document), m_settings(settings), m_fileDialogs(std::make_unique<QtFileDialogs>()),
      m_keyPointData(document),
      m_pilotData(document, m_settings, [this] { return m_keyPointData.activeKeyPointId(); })
{
    m_actions = {{QStringLiteral("actionNone"), -1},
                 {QStringLiteral("actionNewProject"), 1000},
                 {QStringLiteral("actionLoadProject"), 1001},
                 {QStringLiteral("actionLoadGPX"), 1002},
                 {QStringLiteral("actionCloseApp"), 1003},
                 {QStringLiteral("actionSaveAndCloseProject"), 1004},
                 {QStringLiteral("actionSendVideo"), 1006},
                 {QStringLiteral("actionSaveAndNewProject"), 1007},
                 {QStringLiteral("actionSaveAndLoadProject"), 1008},
                 {QStringLiteral("actionSaveAndLoadGPX"), 1009},
                 {QStringLiteral("actionShowTutorial"), 1012},
                 {QStringLiteral("actionDeleteUserAvatar"), 1013},
                 {QStringLiteral("actionOpenWindowsSettings"), 1014}};

    m_programVersion = m_document->programVersion();
    const QString lastVersion = m_settings.lastStartedVersion();
    if (lastVersion.isEmpty() || lastVersion != m_programVersion) {
        m_isFirstStart = true;
        m_settings.setLastStartedVersion(m_programVersion);
    }

    m_document->setGpxAliasing(uint32_t(m_settings.gpxAliasing()));
    m_document->setMaxAnimationDuration(uint32_t(m_settings.maxAnimationDuration()));
}

QString QMainController::getString(const QString &key) const
{
    const auto found = m_strings.constFind(key);
    if (found == m_strings.constEnd()) {
        logTrace(3, QStringLiteral("QMainController::getString: %s not found"), key);
        return key;
    }
    return found.value().toString();
}

void QMainController::setStrings(const QVariantMap &strings)
{
    m_strings = strings;
    const QString titleKey = QStringLiteral("strDefaultKeypointTitle");
    if (m_strings.contains(titleKey))
        setDefaultPointTitle(m_strings.value(titleKey).toString());
}

QVariantMap QMainController::pathModes() const
{
    return {{QStringLiteral("line"), PathMode::Line},
            {QStringLiteral("curve"), PathMode::Curve},
            {QStringLiteral("airplane"), PathMode::Airplane},
            {QStringLiteral("route"), PathMode::Route}};
}

bool QMainController::applyPathMode(int mode)
{
    const std::optional<PathMode::Mapping> mapping = PathMode::map(mode);
    if (!mapping)
        return false;
    ProjectFields &fields = m_document->fields();
    fields.pathMode = mode;
    fields.sceneMode = mapping->drawMode;
    if (Path *path = m_document->pathManager().active()) {
        // Straight first, so that even an unchanged mode regenerates the curve.
        path->setPathMode(CurveMode::Straight);
        if (mapping->curveMode != CurveMode::Straight)
            path->setPathMode(mapping->curveMode);
    }
    return true;
}

bool QMainController::updateMarkerLock(uint32_t keyPointId)
{
    bool locked = false;
    const Path *path = m_document->pathManager().active();
    if (path && path->isFixedTrack()) {
        const std::vector<KeyPoint> &keyPoints = path->keyPoints;
        locked = keyPoints.empty() || keyPoints.front().id == keyPointId || keyPoints.back().id == keyPointId;
    }
    if (locked == m_markerLocked)
        return false;
    m_markerLocked = locked;
    return true;
}

QString QMainController::fileFilter(FilterKind kind) const
{
    const QString all = getString(QStringLiteral("strAllSupportedfiles"));
    const QString images = getString(QStringLiteral("strAllImagefiles"));
    switch (kind) {
    case ProjectFiles:
        return QStringLiteral("%1 (*.%2 %3);;").arg(all, projectExtension, trackWildcards) +
               QStringLiteral("%1 (*.%2);;").arg(getString(QStringLiteral("strProjectfiles")), projectExtension) +
               trackFilter;
    case TrackFiles:
        return QStringLiteral("%1 (%2);;").arg(all, trackWildcards) + trackFilter;
    case ContentWithArchives:
        return QStringLiteral("%1 (%2 | %3);;").arg(all, QStringLiteral("*.zip"), imageWildcards) +
               QStringLiteral("%1 (%2);;").arg(images, imageWildcards) +
               QStringLiteral("%1 (%2);;").arg(getString(QStringLiteral("strAllAnimationfiles")), QStringLiteral("*.gif")) +
               QStringLiteral("%1 (%2)").arg(getString(QStringLiteral("strAllCompressedfiles")), QStringLiteral("*.zip"));
    case Content:
        return QStringLiteral("%1 (%2 | %3);;").arg(all, QStringLiteral("*.zip"), imageWildcards) +
               QStringLiteral("%1 (%2);;").arg(images, imageWildcards) +
               QStringLiteral("%1 (%2)").arg(getString(QStringLiteral("strAllAnimationfiles")), QStringLiteral("*.gif"));
    case Images:
        return QStringLiteral("%1 (%2)").arg(images, imageWildcards);
    case Photos:
        return QStringLiteral("%1 (%2)").arg(images, QStringLiteral("*.jpg"));
    }
    return QString();
}

QString QMainController::proposedSaveName(const QString &folder, const std::vector<KeyPoint> &keyPoints,
                                          const QDateTime &now)
{
    const QString stamp = now.toString(QStringLiteral("yyyy-MM-dd_HH-mm-ss"));
    if (keyPoints.size() > 1)
        return QStringLiteral("%1/%2 - %3 (%4)").arg(folder, keyPoints.front().title(), keyPoints.back().title(), stamp);
    return QStringLiteral("%1/tourlet_project_%2").arg(folder, stamp);
}

bool QMainController::loadDialog(QString &fileName, bool track)
{
    const QString filter = fileFilter(track ? TrackFiles : ProjectFiles);
    const QString folder = m_settings.pathSetting(SettingsKey::ProjectPath);
    const QString chosen = m_fileDialogs->openFileName(getString(QStringLiteral("strLoadProject")), folder, filter);
    if (chosen.isEmpty())
        return false;
    const QFileInfo info(chosen);
    if (info.exists())
        m_settings.setPathSetting(SettingsKey::ProjectPath, info.absolutePath());
    fileName = chosen;
    return true;
}

bool QMainController::saveNameDialog(QString &fileName, const QString &filter)
{
    const QString folder = m_settings.pathSetting(SettingsKey::ProjectPath);
    const std::vector<KeyPoint> keyPoints = m_document->pathManager().keyPoints();
    const QString proposed = proposedSaveName(folder, keyPoints, QDateTime::currentDateTime());
    const QString chosen = m_fileDialogs->saveFileName(getString(QStringLiteral("strSaveProject")), proposed, filter);
    if (chosen.isEmpty())
        return false;
    m_settings.setPathSetting(SettingsKey::ProjectPath, QFileInfo(chosen).absolutePath());
    fileName = chosen;
    return true;
}

bool QMainController::saveProject(QString &fileName)
{
    if (!saveNameDialog(fileName, QStringLiteral("*.%1").arg(projectExtension)))
        return false;
    if (!saveDocumentFile(*m_document, fileName)) {
        logTrace(3, QStringLiteral("QMainController::saveProject[%s] - not written: %s"), fileName,
                 m_document->projectController().lastWriteError());
        return false;
    }
    return true;
}

void QMainController::newProject()
{
    m_document->newProject();
}

bool QMainController::loadFile(const QString &fileName, bool &isProject)
{
    const DocumentOpenResult result = openDocumentFile(*m_document, fileName);
    isProject = result.status == DocumentOpenResult::Status::Project;
    if (!result.ok())
        logTrace(3, QStringLiteral("QMainController::loadFile[%s] - %s"), fileName, result.reason);
    return result.ok();
}
