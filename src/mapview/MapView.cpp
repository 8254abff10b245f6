#include "mapview/MapView.h"

#include "animation/AnimationEventList.h"
#include "animation/FrameRate.h"
#include "app/HostPrograms.h"
#include "app/Language.h"
#include "app/ProgramFolder.h"
#include "app/SplashText.h"
#include "app/Trace.h"
#include "app/Translators.h"
#include "app/gui/StartupSplash.h"
#include "mapview/QtKeyPointDialogs.h"
#include "mapview/QtPilotDialogs.h"
#include "mapview/ProgramResources.h"
#include "gpx/GpxWriter.h"
#include "path/PathMode.h"
#include "project/DocumentAnimationSource.h"
#include "project/PainterPathRenderer_Controller.h"
#include "platform/DesktopOpen.h"

#include <QCoreApplication>
#include <QCursor>
#include <QDir>
#include <QFileInfo>
#include <QGuiApplication>
#include <QQmlContext>
#include <QQmlEngine>
#include <QQuickItem>
#include <QTimer>
#include <QWidget>

#include <algorithm>
#include <cmath>

const QString MapView::defaultSource = QStringLiteral("qrc:/Qml/MapView/MapView.qml");

namespace {

// Zoom levels of the map item.
constexpr int minimumZoom = 0;
constexpr int maximumZoom = 20;

const QString modifiedMark = QStringLiteral(" *");

QVariantList comboEntries(const QMainController &controller, std::initializer_list<const char *> keys, int selected)
{
    QVariantList entries;
    for (const char *key : keys)
        entries.append(QVariantMap{{QStringLiteral("title"), controller.getString(QLatin1String(key))},
                                   {QStringLiteral("selected"), 0}});
    if (selected >= 0 && selected < entries.size()) {
        QVariantMap entry = entries[selected].toMap();
        entry[QStringLiteral("selected")] = 1;
        entries[selected] = entry;
    }
    return entries;
}

// "%1m%2s" of a share of the film.
QString filmTime(int32_t frames, double position)
{
    if (position == 0.0)
        return QStringLiteral("00m00s");
    const double rate = FrameRate::framesPerSecond;
    const double at = frames * position;
    const double minutes = std::trunc(at / (rate * 60));
    const double seconds = std::trunc((at - rate * 60 * minutes) / rate);
    return QStringLiteral("%1m%2s")
        .arg(qint64(minutes), 2, 10, QLatin1Char('0'))
        .arg(qint64(seconds), 2, 10, QLatin1Char('0'));
}

} // namespace

MapView::MapView(PainterPathRenderer_Controller *document, QWindow *parent, const AppSettings &settings)
    : QQuickView(parent), m_mainController(document, settings), m_document(document),
      m_animationSource(*document), m_eventList(m_animationSource), m_playback(m_eventList, m_animationSource)
{
    connect(&m_playback, &PlaybackLoop::animationEventChanged, this, &MapView::showPlaybackEvent);
    connect(&m_playback, &PlaybackLoop::activeKeyPointReached, this, &MapView::setActiveKeyPointId);
    connect(&m_playback, &PlaybackLoop::endShown, this, &MapView::playbackEndShown);
}

MapView::~MapView() = default;

// ---------------------------------------------------------------------------------------
// Set-up

void MapView::init(QWidget *window, bool hide)
{
    init(window, hide, QUrl(defaultSource));
}

void MapView::init(QWidget *window, bool hide, const QUrl &source)
{
    m_window = window;
    m_container = QWidget::createWindowContainer(this, window);
    if (window) {
        m_container->setMinimumSize(window->size());
        m_container->setMaximumSize(window->size());
        m_windowSize = window->size();
        if (auto *dialogs = dynamic_cast<QtFileDialogs *>(&m_mainController.fileDialogs()))
            dialogs->setParent(window);
    }
    m_container->setFocusPolicy(Qt::TabFocus);

    rootContext()->setContextProperty(QStringLiteral("host"), this);
    showSplashMessage(SplashMessage::SetSource);
    setSource(source);
    if (hide)
        m_container->hide();

    QQuickItem *root = rootObject();
    if (!root) {
        logTrace(3, QStringLiteral("MapView::init - no interface from %s"), source.toString());
        return;
    }
    if (QObject *signalList = root->findChild<QObject *>(QStringLiteral("SignalList_Obj")))
        connectSignalList(signalList);
    initLists();
    initKeyPointModels(root);
    initPilotModel(root);
    m_backgroundChooser.connectSignalList(root);
    rootContext()->setContextProperty(QStringLiteral("bgc_host"), &m_backgroundChooser);
    connect(&m_backgroundChooser, &QBackgroundChooser::projectIsModified, this, &MapView::projectIsModified);
    showSplashMessage(SplashMessage::InitTracking);
    showSplashMessage(SplashMessage::ConnectQml);

    PathSettings style = m_document->fields().pathSettings;
    style.color = QStringLiteral("#FF0000");
    style.width = 6;
    style.opacity = 0.8;
    m_document->fields().pathSettings = style;
    emit pathSettingsChanged();

    m_mainController.applyPathMode(PathMode::Curve);
    emit currentPathModeChanged();

    newProjectCommand();
    setProjectModified(false);
}

void MapView::initLists()
{
    AppSettings &settings = m_mainController.settings();
    const QString folder = programFolder().isEmpty() ? QDir::currentPath() : programFolder();
    const QString imageRoot = QDir::cleanPath(QDir(folder).absoluteFilePath(QStringLiteral("imgsrc"))) + QLatin1Char('/');
    ContentCatalogue &catalogue = m_document->catalogue();
    catalogue.load(imageRoot, settings.pathSetting(QStringLiteral("DynamicContentPath")), currentLanguage());
    logTrace(0, QStringLiteral("MapView::initLists - %d waypoint symbols from %s"), int(catalogue.waypoints().size()),
             imageRoot);
    m_keyPointImageItemsModel.setData(&m_mainController.keyPointData().imageItems());
    m_keyPointImageItemsModel.refill(catalogue.waypoints(), browseTitle());
    rebuildAnimationFrames();

    PilotItemsData &pilots = m_mainController.pilotData();
    pilots.setDialogs(std::make_unique<QtPilotDialogs>(m_mainController, m_window));
    m_pilotItemsModel.setData(&pilots);
    m_pilotItemsModel.fill(catalogue, browseTitle());
    // The live layers join the tree once the interface can name them.
    m_backgroundChooser.buildTree(catalogue.maps(), {}, {});
}

QString MapView::browseTitle() const
{
    return m_mainController.getString(QStringLiteral("strBrowseOwnContent"));
}

void MapView::initKeyPointModels(QObject *root)
{
    KeyPointItemsData &data = m_mainController.keyPointData();
    data.setChangedCallback([this] { setProjectModified(true); });
    data.setDialogs(std::make_unique<QtKeyPointDialogs>(m_mainController, m_window));
    m_keyPointItemsModel.setData(&data);
    m_keyPointItemsModel.connectSignalList(root);
    rootContext()->setContextProperty(QStringLiteral("keyPointItemsModel"), &m_keyPointItemsModel);
    connect(&m_keyPointItemsModel, &QKeyPointItemsModel::pathChanged, this, &MapView::pathChanged);
    connect(&m_keyPointItemsModel, &QKeyPointItemsModel::triggerLoadState, this, &MapView::triggerLoadState);
    connect(this, &MapView::setActiveKeyPointId, &m_keyPointItemsModel, &QKeyPointItemsModel::setActiveKeyPointId);
    rootContext()->setContextProperty(QStringLiteral("keyPointImageItemsModel"), &m_keyPointImageItemsModel);
}

QString MapView::offlineMapStyle() const
{
    return offlineWorldMapStyle();
}

void MapView::initPilotModel(QObject *root)
{
    m_pilotItemsModel.connectSignalList(root);
    rootContext()->setContextProperty(QStringLiteral("pilotItemsModel"), &m_pilotItemsModel);
    connect(&m_keyPointItemsModel, &QKeyPointItemsModel::activeKeyPointIdChanged, &m_pilotItemsModel,
            &QPilotItemsModel::activeKeyPointIdChanged);
    connect(&m_pilotItemsModel, &QPilotItemsModel::projectIsModified, this, &MapView::projectIsModified);
    // The model names its message by the key of the interface's text.
    connect(&m_pilotItemsModel, &QPilotItemsModel::showError, this,
            [this](const QString &key) { DoShowError(m_mainController.getString(key)); });
}

void MapView::connectSignalList(QObject *signalList)
{
    // Signal of the interface's object and the slot it reaches; same name unless given.
    struct Row
    {
        const char *signal;
        const char *slot;
    };
    static const Row rows[] = {
        {"saveProject()", nullptr},
        {"setPathMode(int)", nullptr},
        {"setAnimationMode(int)", nullptr},
        {"setAnimationFrame(int)", nullptr},
        {"ignorePauseOnKeyPoint(bool)", nullptr},
        {"setShowKeyPointsAtPosition(bool)", nullptr},
        {"setAnimateKeyPoints(bool)", nullptr},
        {"mouseMoved(double,double)", nullptr},
        {"markerMoved(double,double)", nullptr},
        {"setMoveDistance(double)", nullptr},
        {"setCenterPosition(double,double)", nullptr},
        {"saveBoundaries(double,double,double,double)", nullptr},
        {"setTimelinePosition(double)", nullptr},
        {"startAnimation()", nullptr},
        {"resetAnimationLoop()", nullptr},
        {"stopAnimation(bool)", nullptr},
        {"setCurrentAnimationPosition(int)", nullptr},
        {"changeKeyPointPosition(int,double,double)", nullptr},
        {"resetPhotoDrop()", nullptr},
        {"setShowCompass(bool)", nullptr},
        {"setSendExportToHost(bool)", nullptr},
        {"triggerMessageBoxAction(int)", nullptr},
        // There is no such slot: the interface writes the pathSettings property instead.
        // The connect stays, and Qt warns about it.
        {"setPathSettings(QVariant)", nullptr},
        {"setHost(int)", nullptr},
        {"setLanguage(int)", nullptr},
        {"openHelp()", nullptr},
        {"setEnableBetaPatches(bool)", nullptr},
        {"hideCursor()", nullptr},
        {"showCursor()", nullptr},
    };
    for (const Row &row : rows) {
        const QByteArray signal = QByteArray("2") + row.signal;
        const QByteArray slot = QByteArray("1") + (row.slot ? row.slot : row.signal);
        connect(signalList, signal.constData(), this, slot.constData());
    }
}

// ---------------------------------------------------------------------------------------
// Window

QString MapView::applicationTitle() const
{
    return QCoreApplication::applicationName();
}

void MapView::setWindowTitle(const QString &text)
{
    if (m_window)
        m_window->setWindowTitle(text);
    // The interface shows it too, as the view's own title.
    setTitle(text);
}

void MapView::updateSceneSize()
{
    ProjectFields &fields = m_document->fields();
    fields.hostWidth = m_windowSize.width();
    fields.hostHeight = m_windowSize.height();
    fields.sceneWidth = m_windowSize.width();
    fields.sceneHeight = m_windowSize.height();
}

void MapView::setMapVisible(bool visible, bool showOptions)
{
    logTrace(0, QStringLiteral("MapView::setMapVisible"));
    if (m_container)
        m_container->setVisible(visible);
    updateSceneSize();
    emit scaledProjectSizeChanged();
    m_showOptions = showOptions;
    emit showOptionsChanged();
}

void MapView::resizeHost(int width, int height)
{
    if (m_document->exportProperties().exportActive)
        return;
    m_windowSize = QSize(width, height);
    updateSceneSize();
    if (m_container) {
        m_container->setMinimumSize(m_windowSize);
        m_container->setMaximumSize(m_windowSize);
    }
    emit windowSizeChanged();
    emit scaledProjectSizeChanged();
    emit centerPositionChanged();
}

void MapView::handleCloseApp()
{
    if (m_projectModified) {
        emit showMessageBox(m_mainController.getString(QStringLiteral("strSaveOnCloseProjectHint")),
                            m_mainController.action(QStringLiteral("actionCloseApp")),
                            m_mainController.action(QStringLiteral("actionSaveAndCloseProject")),
                            m_mainController.action(QStringLiteral("actionNone")));
        return;
    }
    emit closeApp();
}

void MapView::leaveFullscreen()
{
    if (!m_fullScreen)
        return;
    m_fullScreen = false;
    emit setFullScreen(false);
}

void MapView::toggleFullScreen()
{
    m_fullScreen = !m_fullScreen;
    emit setFullScreen(m_fullScreen);
}

void MapView::hideCursor()
{
    // Pushed, never popped: each call stacks one more override cursor.
    QGuiApplication::setOverrideCursor(QCursor(Qt::BlankCursor));
}

void MapView::showCursor()
{
    QGuiApplication::setOverrideCursor(QCursor(Qt::ArrowCursor));
}

// ---------------------------------------------------------------------------------------
// Project commands

void MapView::triggerMessageBoxAction(int messageId)
{
    logTrace(0, QStringLiteral("MapView::triggerMessageBoxAction %d"), messageId);
    struct Row
    {
        const char *name;
        void (MapView::*run)();
    };
    static const Row rows[] = {
        {"actionNone", nullptr},
        {"actionNewProject", &MapView::newProjectCommand},
        {"actionLoadProject", &MapView::loadProjectFromDialog},
        {"actionLoadGPX", &MapView::loadTrackFromDialog},
        {"actionCloseApp", &MapView::emitCloseApp},
        {"actionSaveAndCloseProject", &MapView::saveThenClose},
        {"actionSendVideo", &MapView::sendVideo},
        {"actionSaveAndNewProject", &MapView::saveThenNewProject},
        {"actionSaveAndLoadProject", &MapView::saveThenLoadProject},
        // Looked up under a name the table lacks: it answers to id 0, and the id the
        // interface reads for "actionSaveAndLoadGPX" reaches nothing.
        {"actionSaveAndLoadGPXProject", &MapView::saveThenLoadTrack},
        {"actionShowTutorial", &MapView::showTutorial},
        {"actionDeleteUserAvatar", &MapView::deleteUserAvatar},
        // Opens a system settings page that this platform does not have.
        {"actionOpenWindowsSettings", nullptr},
    };
    for (const Row &row : rows) {
        if (m_mainController.action(QLatin1String(row.name)) != messageId)
            continue;
        if (row.run)
            (this->*row.run)();
        return;
    }
}

void MapView::deleteUserAvatar()
{
    m_pilotItemsModel.deleteUserPilot();
}

void MapView::saveThenClose()
{
    if (saveProject())
        emit closeApp();
}

void MapView::saveThenNewProject()
{
    if (saveProject())
        newProjectCommand();
}

void MapView::saveThenLoadProject()
{
    if (saveProject())
        loadProjectCommand(false);
}

void MapView::saveThenLoadTrack()
{
    if (saveProject())
        loadProjectCommand(true);
}

void MapView::sendVideo()
{
    if (m_lastExportFile.isEmpty()) {
        logTrace(1, QStringLiteral("MapView::sendVideo - no film exported yet"));
        return;
    }
    if (!hostPrograms().sendVideoToHost(m_lastExportFile))
        logTrace(3, QStringLiteral("MapView::sendVideo - the host did not take %s"), m_lastExportFile);
}

void MapView::showTutorial()
{
    // The tutorial is the opening chapter of the user guide that comes with the program.
    openHelp();
}

void MapView::newProjectCommand()
{
    if (m_animationRunning)
        stopAnimation(false);
    m_mainController.newProject();
    resetViews();
}

void MapView::resetViews()
{
    m_keyPointItemsModel.clear();
    emit mediaPointsClear();
    setProjectModified(false);

    emit currentPathModeChanged();
    emit keyPointsLockedChanged();
    emit pathSettingsChanged();
    emit currentAnimationModeChanged();
    emit currentAnimationFrameChanged();
    emit mapFrameSourceChanged();
    emit keyPointImageAnimationDurationChanged();
    emit currentZoomLevelChanged();
    rebuildLocationSettings();

    m_mainController.applyPathMode(m_mainController.pathModes().value(QStringLiteral("curve")).toInt());
    m_document->setKeyPointsFixed(false);
    emit currentPathModeChanged();

    updateSceneSize();
    emit keyPointsFixedChanged();
    m_markerMoveSID1 = 0;
    m_pilotItemsModel.activeKeyPointIdChanged();
    setWindowTitle(applicationTitle());
}

void MapView::rebuildLocationSettings()
{
    const ProjectFields &fields = m_document->fields();
    m_locationSettings = {{QStringLiteral("centerLongitude"), fields.centerPosition.longitude},
                          {QStringLiteral("centerLatitude"), fields.centerPosition.latitude},
                          {QStringLiteral("zoomLevel"), fields.currentZoomLevel},
                          {QStringLiteral("bearing"), fields.currentBearing},
                          {QStringLiteral("tilt"), fields.currentTilt}};
    emit locationSettingsChanged();
}

void MapView::loadProjectCommand(bool track)
{
    QString fileName;
    if (!m_mainController.loadDialog(fileName, track))
        return;
    startLoad(fileName);
}

void MapView::openFile(const QString &fileName)
{
    startLoad(fileName);
}

void MapView::startLoad(const QString &fileName)
{
    if (m_animationRunning)
        stopAnimation(false);
    m_loading = true;
    m_projectFileName = fileName;
    m_mainController.newProject();
    resetViews();
    emit showWaitState(m_mainController.getString(QStringLiteral("strLoadProjectHint")));
    // Back to the event loop once, so that the wait state paints before the load.
    QTimer::singleShot(100, this, &MapView::delayedLoadProjectFinish);
}

void MapView::delayedLoadProjectFinish()
{
    ProjectFields &fields = m_document->fields();
    const auto extent = [&fields] {
        return QSizeF(std::abs(fields.visibleBoundariesBR.longitude - fields.visibleBoundariesTL.longitude),
                      std::abs(fields.visibleBoundariesTL.latitude - fields.visibleBoundariesBR.latitude));
    };
    const QSizeF oldExtent = extent();

    bool isProject = false;
    if (!m_mainController.loadFile(m_projectFileName, isProject)) {
        // The wait state stays up until the next load or new project replaces it.
        emit showError(m_mainController.getString(QStringLiteral("strErrorCantLoadProject")));
        m_loading = false;
        update();
        return;
    }

    const Path *path = m_document->pathManager().active();
    const int32_t pathType = path ? path->pathType : PathType::Ordinary;
    // A track goes onto the default map; a map that this installation lacks ("???...")
    // stays named, so that a project keeps it for where it is found.
    const QString background = fields.backgroundMap;
    if (pathType == PathType::GPX && background.size() > 3 && !background.startsWith(QLatin1String("???")))
        m_backgroundChooser.selectBackground(BackgroundSelection::defaultMap);

    m_keyPointItemsModel.loadKeyPoints();
    // The avatar page shows the avatar of the loaded project.
    m_pilotItemsModel.activeKeyPointIdChanged();

    setProjectModified(false);
    m_backgroundChooser.refresh();
    emit mapFrameSourceChanged();
    emit showCompassChanged();
    emit animationDurationChanged();
    rebuildLocationSettings();
    if (path) {
        for (const MediaPoint &media : path->mediaPoints)
            emit mediaPointAdded(int(media.id));
    }
    pathChanged();

    if (pathType == PathType::GPX) {
        if (Path *active = m_document->pathManager().active())
            active->update();
        m_keyPointItemsModel.updatePathSegments(true, true);
    }

    if (pathType == PathType::GPX || !isProject) {
        if (!isProject) {
            fields.currentZoomLevel = fittedZoom(oldExtent, extent(), int(fields.currentZoomLevel));
            rebuildLocationSettings();
            m_eventList.updateDuration();
            emit animationDurationChanged();
            emit animationDurationAsStringChanged();
            emit timeLinePositionAsStringChanged();
        }
        emit currentZoomLevelChanged();
        emit centerPositionChanged();
    }

    updateSceneSize();
    emit keyPointsFixedChanged();
    m_loading = false;
    emit hideWaitState();

    const QFileInfo file(m_projectFileName);
    setWindowTitle(QStringLiteral("%1 - %2").arg(applicationTitle(), isProject ? file.completeBaseName() : file.fileName()));
    update();
}

int MapView::fittedZoom(QSizeF target, QSizeF current, int zoom)
{
    double targetWidth = target.width();
    double targetHeight = target.height();
    const double width = current.width();
    const double height = current.height();

    if (targetWidth != 0.0 && targetHeight != 0.0 && (width > targetWidth || height > targetHeight)) {
        while ((width > targetWidth || height > targetHeight) && zoom > minimumZoom) {
            targetWidth *= 2.0;
            targetHeight *= 2.0;
            --zoom;
        }
        --zoom;
    }
    targetWidth *= 0.85;
    targetHeight *= 0.85;
    // A single point has no extent: the zoom stops at the map's closest level.
    while (targetWidth * 0.5 > width && targetHeight * 0.5 > height && zoom < maximumZoom) {
        targetWidth *= 0.5;
        targetHeight *= 0.5;
        ++zoom;
    }
    return std::clamp(zoom, minimumZoom, maximumZoom);
}

void MapView::triggerLoadState(int step, double perc)
{
    QString text = m_mainController.getString(QStringLiteral("strLoadProjectHint"));
    if (perc >= 0.0) {
        if (m_lastLoadPercent >= 0.0 && perc - m_lastLoadPercent < 1.0)
            return;
        text += QStringLiteral(" %1%").arg(int(perc));
    } else {
        text += QStringLiteral(" %1").arg(step);
    }
    emit showWaitState(text);
    m_lastLoadPercent = perc;
    QCoreApplication::processEvents();
}

bool MapView::saveProject()
{
    QString fileName;
    if (!m_mainController.saveProject(fileName))
        return false;
    setWindowTitle(QStringLiteral("%1 - %2").arg(applicationTitle(), QFileInfo(fileName).completeBaseName()) +
                   modifiedMark);
    setProjectModified(false);
    return true;
}

void MapView::setProjectModified(bool modified)
{
    QString text = title();
    if (modified && !text.endsWith(modifiedMark))
        text += modifiedMark;
    else if (!modified && text.endsWith(modifiedMark))
        text.chop(modifiedMark.size());
    setWindowTitle(text);
    m_projectModified = modified;
    emit projectModifiedChanged();
}

void MapView::projectIsModified()
{
    setProjectModified(true);
}

void MapView::exportGPX()
{
    QString fileName;
    if (!m_mainController.saveNameDialog(fileName, QStringLiteral("*.gpx")))
        return;
    const std::vector<CurvePoint> samples = m_document->pathManager().routeSamples();
    const Path *path = m_document->pathManager().active();
    QString error;
    if (!GpxWriter::write(fileName, samples, path ? *path : Path(), &error)) {
        logTrace(3, QStringLiteral("MapView::exportGPX[%s] - %s"), fileName, error);
        emit showError(m_mainController.getString(QStringLiteral("strErrorCantExportGPX")));
    }
}

void MapView::DoShowError(QString text)
{
    emit showError(text);
}

// ---------------------------------------------------------------------------------------
// Property surface: position and view

double MapView::centerPositionLongitude() const
{
    return m_document->fields().centerPosition.longitude;
}

double MapView::centerPositionLatitude() const
{
    return m_document->fields().centerPosition.latitude;
}

QGeoCoordinate MapView::centerPosition() const
{
    const KeyPoint &center = m_document->fields().centerPosition;
    logTrace(0, QStringLiteral("centerPosition: %f, %f"), center.latitude, center.longitude);
    return QGeoCoordinate(center.latitude, center.longitude);
}

double MapView::currentZoomLevel() const
{
    const double zoom = m_document->fields().currentZoomLevel;
    logTrace(0, QStringLiteral("currentZoomLevel = %f"), zoom);
    return zoom;
}

double MapView::currentBearing() const
{
    return m_document->fields().currentBearing;
}

void MapView::setCurrentBearing(double current)
{
    logTrace(0, QStringLiteral("setCurrentBearing %f"), current);
    if (m_document->fields().currentBearing != current) {
        m_document->fields().currentBearing = current;
        emit currentBearingChanged();
    }
    if (m_mouseOverPath) {
        m_mouseOverPath = false;
        emit mouseOverPathChanged();
    }
}

double MapView::currentTilt() const
{
    return m_document->fields().currentTilt;
}

QSize MapView::scaledProjectSize() const
{
    return QSize(m_document->fields().sceneWidth, m_document->fields().sceneHeight);
}

double MapView::scalingFactor() const
{
    return m_document->scale();
}

QString MapView::mapFrameSource() const
{
    return m_document->fields().animationFrameSource;
}

// ---------------------------------------------------------------------------------------
// Property surface: path

QVariantMap MapView::pathSettings() const
{
    return m_document->fields().pathSettings.toMap();
}

void MapView::writePathSettings(const QVariantMap &settings)
{
    m_document->fields().pathSettings.fromMap(settings);
    setProjectModified(true);
    emit pathSettingsChanged();
}

int MapView::currentPathMode() const
{
    return m_document->fields().pathMode;
}

void MapView::setPathMode(int mode)
{
    if (!m_mainController.applyPathMode(mode))
        return;
    setProjectModified(true);
    emit currentPathModeChanged();
    m_keyPointItemsModel.updatePathSegments();
    pathChanged();
}

bool MapView::keyPointsLocked() const
{
    return m_document->fields().keyPointsLocked;
}

bool MapView::keyPointsFixed() const
{
    return m_document->keyPointsFixed();
}

QVariantList MapView::mediaPoints() const
{
    QVariantList list;
    const Path *path = m_document->pathManager().active();
    if (!path)
        return list;
    for (const MediaPoint &media : path->mediaPoints) {
        QStringList files;
        QVariantList orientations;
        for (const MediaFile &file : media.properties.imageSources) {
            files.append(QUrl::fromLocalFile(file.path).toString());
            orientations.append(file.orientation);
        }
        list.append(QVariantMap{{QStringLiteral("id"), media.id},
                                {QStringLiteral("indexPosition"), media.properties.indexPosition},
                                {QStringLiteral("fileNameList"), files},
                                {QStringLiteral("fileOrientationList"), orientations},
                                {QStringLiteral("title"), media.properties.title},
                                {QStringLiteral("longitude"), media.longitude},
                                {QStringLiteral("latitude"), media.latitude},
                                {QStringLiteral("enabled"), media.properties.enabled},
                                {QStringLiteral("mouseHovered"), int(media.id) == m_keypointHoveredID}});
    }
    return list;
}

void MapView::pathChanged()
{
    emit mediaPointsChanged();
    m_mouseOverPath = false;
    emit mouseOverPathChanged();
    rebuildDebugPages();
    emit debugInfoPagesChanged();
    m_eventList.updateDuration();
    emit animationDurationChanged();
    emit animationDurationAsStringChanged();
    emit timeLinePositionAsStringChanged();
}

void MapView::rebuildDebugPages()
{
    m_debugInfoPages = {QVariantMap{{QStringLiteral("title"), QStringLiteral("Page1")},
                                    {QStringLiteral("content"), QStringLiteral("QVariantMap page1")}},
                        QVariantMap{{QStringLiteral("title"), QStringLiteral("Page2")},
                                    {QStringLiteral("content"), QStringLiteral("QVariantMap page2")}}};
}

// ---------------------------------------------------------------------------------------
// Property surface: animation

int32_t MapView::chosenFrames() const
{
    const AnimationTiming &timing = m_document->timing();
    if (timing.durationFactor < 0.0)
        return 0;
    return int32_t(std::trunc(timing.totalFrames * timing.durationFactor));
}

double MapView::animationDuration() const
{
    return chosenFrames() / FrameRate::framesPerSecond;
}

QString MapView::animationDurationAsString() const
{
    return AnimationTiming::formatDuration(chosenFrames());
}

QString MapView::timeLinePositionAsString() const
{
    return filmTime(chosenFrames(), m_timelinePosition);
}

double MapView::frameDuration() const
{
    return m_document->timing().frameDuration;
}

QVariantMap MapView::animationMode() const
{
    return {{QStringLiteral("staticMode"), 0},
            {QStringLiteral("keepCentered"), 1},
            {QStringLiteral("cropByCircle"), 2},
            {QStringLiteral("cropByRectangle"), 3}};
}

int MapView::currentAnimationMode() const
{
    return m_document->fields().animationMode;
}

int MapView::currentAnimationFrame() const
{
    return m_document->fields().animationFrame;
}

bool MapView::ignorePauseOnKeyPoint() const
{
    return m_document->fields().ignorePauseOnKeyPoint;
}

void MapView::ignorePauseOnKeyPoint(bool state)
{
    if (m_document->fields().ignorePauseOnKeyPoint == state)
        return;
    m_document->fields().ignorePauseOnKeyPoint = state;
    setProjectModified(true);
    emit ignorePauseOnKeyPointChanged();
}

bool MapView::showKeyPointsOnAnimationPosition() const
{
    return m_document->fields().showKeyPointsOnAnimationPosition;
}

void MapView::setShowKeyPointsAtPosition(bool state)
{
    if (m_document->fields().showKeyPointsOnAnimationPosition == state)
        return;
    m_document->fields().showKeyPointsOnAnimationPosition = state;
    setProjectModified(true);
    emit showKeyPointsOnAnimationPositionChanged();
}

bool MapView::animateKeyPoints() const
{
    return m_document->fields().animateKeyPoints;
}

void MapView::setAnimateKeyPoints(bool state)
{
    if (m_document->fields().animateKeyPoints == state)
        return;
    m_document->fields().animateKeyPoints = state;
    setProjectModified(true);
    emit animateKeyPointsChanged();
}

bool MapView::linearAnimationDuration() const
{
    return m_document->fields().linearAnimationDurations;
}

bool MapView::flyInAnimation() const
{
    return m_document->fields().flyInEnabled;
}

void MapView::slotShowOverlays(bool state)
{
    if (m_showOverlays == state)
        return;
    m_showOverlays = state;
    emit showOverlaysChanged();
}

bool MapView::enableFlyInRotation() const
{
    return m_document->fields().flyInRotation;
}

bool MapView::enableFlyInTilt() const
{
    return m_document->fields().flyInTilt;
}

int MapView::flyInStartRotation() const
{
    return int(m_document->timing().flyInRotation);
}

int MapView::flyInEndTilt() const
{
    return int(m_document->timing().flyInTilt);
}

int MapView::flyInDuration() const
{
    return m_document->timing().flyInDuration;
}

int MapView::keyPointAnimationDuration() const
{
    return m_document->timing().keyPointAnimationDuration;
}

int MapView::keyPointImageAnimationDuration() const
{
    return m_document->timing().keyPointAnimationDuration;
}

QVariantMap MapView::transitionModes() const
{
    static const std::pair<const char *, const char *> titles[] = {{"cut", "strTransitionCut"},
                                                                   {"fade", "strTransitionFade"},
                                                                   {"zoom", "strTransitionZoom"},
                                                                   {"rotate", "strTransitionRotation"}};
    const QMap<QString, int> &kinds = AnimationEventList::transitionKinds();
    QVariantMap modes;
    for (const auto &[name, titleKey] : titles)
        modes.insert(QLatin1String(name),
                     QVariantMap{{QStringLiteral("id"), kinds.value(QLatin1String(name))},
                                 {QStringLiteral("title"), m_mainController.getString(QLatin1String(titleKey))}});
    return modes;
}

int MapView::currentTransitionMode() const
{
    return m_document->fields().fullFrameTransitionMode;
}

int MapView::fullFrameMediaDuration() const
{
    return m_document->fields().fullFrameDuration / 1000;
}

void MapView::setFullFrameMediaDuration(int seconds)
{
    m_document->fields().fullFrameDuration = seconds * 1000;
    setProjectModified(true);
    emit fullFrameMediaDurationChanged();
}

double MapView::fullFrameFadeDuration() const
{
    return m_document->fields().fullFrameFadeDuration / 1000.0;
}

void MapView::setFullFrameFadeDuration(double seconds)
{
    m_document->fields().fullFrameFadeDuration = int32_t(std::trunc(seconds * 1000.0));
    setProjectModified(true);
    emit fullFrameFadeDurationChanged();
}

double MapView::fullScreenDiashow() const
{
    return m_document->fields().fullFrameFullscreen ? 1.0 : 0.0;
}

void MapView::setFullScreenDiashow(bool state)
{
    m_document->fields().fullFrameFullscreen = state;
    setProjectModified(true);
    emit fullScreenDiashowChanged();
}

// ---------------------------------------------------------------------------------------
// Property surface: program state and lists

void MapView::setStrings(QVariantMap stringMap)
{
    m_mainController.setStrings(stringMap);
    // The browse item of the symbol list carries a translated title.
    if (m_keyPointImageItemsModel.rowCount() > 0)
        m_keyPointImageItemsModel.refill(m_document->catalogue().waypoints(), browseTitle());
    // Not the language list: the interface answers its change by sending the strings.
    emit gpxAliasingCBEntriesChanged();
    emit maxAnimationDurationCBEntriesChanged();
}

QString MapView::versionInfo() const
{
    return m_mainController.programVersion();
}

QString MapView::hostName() const
{
    return hostPrograms().hostName();
}

bool MapView::showCompass() const
{
    return m_document->fields().showCompass;
}

void MapView::setShowCompass(bool state)
{
    m_document->fields().showCompass = state;
    setProjectModified(true);
    emit showCompassChanged();
}

bool MapView::sendExportToHost() const
{
    return m_document->fields().sendExportToHost;
}

void MapView::setSendExportToHost(bool state)
{
    m_document->fields().sendExportToHost = state;
    setProjectModified(true);
    emit sendExportToHostChanged();
}

bool MapView::enableBetaPatches() const
{
    return m_mainController.settings().enableBetaPatches();
}

void MapView::setEnableBetaPatches(bool state)
{
    if (m_mainController.settings().setEnableBetaPatches(state))
        emit enableBetaPatchesChanged();
}

void MapView::setDebugInfoActive(bool active)
{
    if (m_debugInfoActive == active)
        return;
    m_debugInfoActive = active;
    emit debugInfoActiveChanged();
}

QVariantList MapView::hostCBEntries() const
{
    return hostPrograms().hostComboEntries(m_mainController.settings());
}

QVariantList MapView::gpxAliasingCBEntries() const
{
    return comboEntries(m_mainController,
                        {"strGPXAliasingOff", "strGPXAliasingAuto", "strGPXAliasingDefault", "strGPXAliasingMax"},
                        m_mainController.settings().gpxAliasing());
}

QVariantList MapView::maxAnimationDurationCBEntries() const
{
    return comboEntries(m_mainController,
                        {"strMaxAnimationDuration1Min", "strMaxAnimationDuration5Min", "strMaxAnimationDuration10Min",
                         "strMaxAnimationDuration30Min", "strMaxAnimationDuration60Min"},
                        m_mainController.settings().maxAnimationDuration());
}

QVariantList MapView::languageCBEntries() const
{
    return comboEntries(m_mainController, {"strDEde", "strENen", "strFRfr", "strITit", "strNLnl", "strESes", "strJPja"},
                        currentLanguage());
}

void MapView::setGpxAliasing(int index)
{
    m_mainController.settings().setGpxAliasing(index);
    m_document->setGpxAliasing(uint32_t(index));
    emit gpxAliasingCBEntriesChanged();
}

void MapView::setMaxAnimationDuration(int index)
{
    m_mainController.settings().setMaxAnimationDuration(index);
    m_document->setMaxAnimationDuration(uint32_t(index));
    emit maxAnimationDurationCBEntriesChanged();
}

void MapView::setHost(int index)
{
    if (hostPrograms().selectHost(index, m_mainController.settings()))
        m_document->fields().hostName = hostPrograms().hostName();
    emit hostCBEntriesChanged();
    emit hostNameChanged();
}

void MapView::setLanguage(int index)
{
    if (Translators *translators = Translators::instance())
        translators->setLanguage(index);
    engine()->retranslate();
    emit languageCBEntriesChanged();
}

void MapView::openHelp()
{
    const QString folder = programFolder().isEmpty() ? QDir::currentPath() : programFolder();
    const QString guide = LanguageTable::helpFilePath(currentLanguage(), folder);
    logTrace(0, QStringLiteral("MapView::openHelp %s"), guide);
    if (!openWithDesktop(QUrl::fromLocalFile(guide)))
        logTrace(3, QStringLiteral("MapView::openHelp - nothing opened %s"), guide);
}

int MapView::currentLanguage() const
{
    const Translators *translators = Translators::instance();
    if (translators && translators->current() >= 0)
        return translators->current();
    return language(m_mainController.settings());
}
