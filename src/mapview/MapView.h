#pragma once

#include "animation/AnimationEventList.h"
#include "animation/PlaybackCamera.h"
#include "animation/PlaybackLoop.h"
#include "animation/VisibleRegionProvider.h"
#include "mapview/QBackgroundChooser.h"
#include "mapview/QMainController.h"
#include "project/DocumentAnimationSource.h"
#include "models/QKeyPointImageItemsModel.h"
#include "models/QKeyPointItemsModel.h"
#include "models/QPilotItemsModel.h"

#include <QGeoCoordinate>
#include <QQuickView>
#include <QSize>
#include <QUrl>
#include <QVariantList>
#include <QVariantMap>

class PainterPathRenderer_Controller;
class QKeyEvent;
class QMouseEvent;
class QWidget;

// The map stage and the object the interface talks to: QML reaches it as the
// context property "host". It carries out the project commands, publishes the
// document as properties and forwards the interface's requests to the document.
class MapView : public QQuickView, private VisibleRegionProvider
{
    Q_OBJECT

    // Position on the map and view
    Q_PROPERTY(double centerPositionLongitude READ centerPositionLongitude NOTIFY centerPositionLongitudeChanged)
    Q_PROPERTY(double centerPositionLatitude READ centerPositionLatitude NOTIFY centerPositionLatitudeChanged)
    Q_PROPERTY(QGeoCoordinate centerPosition READ centerPosition NOTIFY centerPositionChanged)
    Q_PROPERTY(double currentZoomLevel READ currentZoomLevel NOTIFY currentZoomLevelChanged)
    Q_PROPERTY(double currentBearing READ currentBearing WRITE setCurrentBearing NOTIFY currentBearingChanged)
    Q_PROPERTY(double currentTilt READ currentTilt NOTIFY currentTiltChanged)
    // "centerLongitude", "centerLatitude", "zoomLevel", "bearing", "tilt"
    Q_PROPERTY(QVariantMap locationSettings READ locationSettings NOTIFY locationSettingsChanged)
    Q_PROPERTY(QSize windowSize READ windowSize NOTIFY windowSizeChanged)
    Q_PROPERTY(QSize scaledProjectSize READ scaledProjectSize NOTIFY scaledProjectSizeChanged)
    Q_PROPERTY(double scalingFactor READ scalingFactor CONSTANT)
    Q_PROPERTY(QString mapFrameSource READ mapFrameSource NOTIFY mapFrameSourceChanged)
    Q_PROPERTY(bool showOptions READ showOptions NOTIFY showOptionsChanged)
    // The style of the offline world map under the route; empty without one.
    Q_PROPERTY(QString offlineMapStyle READ offlineMapStyle CONSTANT)

    // Hover and marker
    Q_PROPERTY(bool mouseOverPath READ mouseOverPath NOTIFY mouseOverPathChanged)
    Q_PROPERTY(QGeoCoordinate mouseOverPathPosition READ mouseOverPathPosition NOTIFY mouseOverPathPositionChanged)
    Q_PROPERTY(double mouseOverPathPositionPercentage READ mouseOverPathPositionPercentage NOTIFY
                   mouseOverPathPositionPercentageChanged)
    Q_PROPERTY(int keypointHoveredID READ keypointHoveredID NOTIFY keypointHoveredIDChanged)
    Q_PROPERTY(bool markerLocked READ markerLocked NOTIFY markerLockedChanged)
    Q_PROPERTY(int markerMoveSID1 READ markerMoveSID1 NOTIFY markerMoveSID1Changed)
    Q_PROPERTY(int markerMoveSID2 READ markerMoveSID2 NOTIFY markerMoveSID2Changed)

    // Path
    // "color", "opacity", "width", "shadowEnabled", "shadowDistance", "shadowWidth", "shadowOpacity"
    Q_PROPERTY(QVariantMap pathSettings READ pathSettings WRITE writePathSettings NOTIFY pathSettingsChanged)
    // "line" 0, "curve" 1, "airplane" 2, "route" 3
    Q_PROPERTY(QVariantMap pathMode READ pathMode CONSTANT)
    Q_PROPERTY(int currentPathMode READ currentPathMode NOTIFY currentPathModeChanged)
    Q_PROPERTY(bool keyPointsLocked READ keyPointsLocked NOTIFY keyPointsLockedChanged)
    Q_PROPERTY(bool keyPointsFixed READ keyPointsFixed NOTIFY keyPointsFixedChanged)
    // One map per media point: "id", "indexPosition", "fileNameList", "fileOrientationList",
    // "title", "longitude", "latitude", "enabled", "mouseHovered"
    Q_PROPERTY(QVariantList mediaPoints READ mediaPoints NOTIFY mediaPointsChanged)
    Q_PROPERTY(QVariantList gpxArray READ gpxArray NOTIFY gpxArrayChanged)

    // Animation
    Q_PROPERTY(double currentPosition READ currentPosition NOTIFY currentPositionChanged)
    Q_PROPERTY(double animationDuration READ animationDuration NOTIFY animationDurationChanged)
    Q_PROPERTY(QString animationDurationAsString READ animationDurationAsString NOTIFY animationDurationAsStringChanged)
    Q_PROPERTY(QString timeLinePositionAsString READ timeLinePositionAsString NOTIFY timeLinePositionAsStringChanged)
    Q_PROPERTY(double frameDuration READ frameDuration NOTIFY frameDurationChanged)
    Q_PROPERTY(QVariantList animationFrames READ animationFrames NOTIFY animationFramesChanged)
    // "staticMode" 0, "keepCentered" 1, "cropByCircle" 2, "cropByRectangle" 3
    Q_PROPERTY(QVariantMap animationMode READ animationMode CONSTANT)
    Q_PROPERTY(int currentAnimationMode READ currentAnimationMode NOTIFY currentAnimationModeChanged)
    Q_PROPERTY(int currentAnimationFrame READ currentAnimationFrame NOTIFY currentAnimationFrameChanged)
    Q_PROPERTY(bool ignorePauseOnKeyPoint READ ignorePauseOnKeyPoint NOTIFY ignorePauseOnKeyPointChanged)
    Q_PROPERTY(bool showKeyPointsOnAnimationPosition READ showKeyPointsOnAnimationPosition NOTIFY
                   showKeyPointsOnAnimationPositionChanged)
    Q_PROPERTY(bool animateKeyPoints READ animateKeyPoints NOTIFY animateKeyPointsChanged)
    Q_PROPERTY(bool animationRunning READ animationRunning NOTIFY animationRunningChanged)
    Q_PROPERTY(QVariantMap animationEvent READ animationEvent NOTIFY animationEventChanged)
    // Where the avatar of the current event stands: "valid", "longitude", "latitude",
    // "heading" (degrees clockwise from north)
    Q_PROPERTY(QVariantMap avatarPose READ avatarPose NOTIFY animationEventChanged)
    // The map's view for the current event, with the keys of locationSettings
    Q_PROPERTY(QVariantMap animationCamera READ animationCamera NOTIFY animationEventChanged)
    // The chosen share 0..1 of the longest film
    Q_PROPERTY(double animationDurationPerc READ animationDurationPerc NOTIFY animationDurationChanged)
    Q_PROPERTY(bool linearAnimationDuration READ linearAnimationDuration NOTIFY linearAnimationDurationChanged)
    Q_PROPERTY(bool flyInAnimation READ flyInAnimation NOTIFY flyInAnimationChanged)
    Q_PROPERTY(bool showOverlays READ showOverlays NOTIFY showOverlaysChanged)
    Q_PROPERTY(bool enableFlyInRotation READ enableFlyInRotation NOTIFY enableFlyInRotationChanged)
    Q_PROPERTY(bool enableFlyInTilt READ enableFlyInTilt NOTIFY enableFlyInTiltChanged)
    Q_PROPERTY(int flyInStartRotation READ flyInStartRotation NOTIFY flyInStartRotationChanged)
    Q_PROPERTY(int flyInEndTilt READ flyInEndTilt NOTIFY flyInEndTiltChanged)
    Q_PROPERTY(int flyInDuration READ flyInDuration NOTIFY flyInDurationChanged)
    Q_PROPERTY(int keyPointAnimationDuration READ keyPointAnimationDuration NOTIFY keyPointAnimationDurationChanged)
    Q_PROPERTY(int keyPointImageAnimationDuration READ keyPointImageAnimationDuration NOTIFY
                   keyPointImageAnimationDurationChanged)
    // name -> {"id": int, "title": translated text}; names "cut" 0, "fade" 1, "zoom" 2, "rotate" 3
    Q_PROPERTY(QVariantMap transitionModes READ transitionModes CONSTANT)
    Q_PROPERTY(int currentTransitionMode READ currentTransitionMode NOTIFY currentTransitionModeChanged)
    Q_PROPERTY(int fullFrameMediaDuration READ fullFrameMediaDuration WRITE setFullFrameMediaDuration NOTIFY
                   fullFrameMediaDurationChanged)
    Q_PROPERTY(double fullFrameFadeDuration READ fullFrameFadeDuration WRITE setFullFrameFadeDuration NOTIFY
                   fullFrameFadeDurationChanged)
    // Declared as a double; it holds a bool.
    Q_PROPERTY(double fullScreenDiashow READ fullScreenDiashow NOTIFY fullScreenDiashowChanged)

    // Program state
    Q_PROPERTY(QString versionInfo READ versionInfo CONSTANT)
    Q_PROPERTY(QString hostName READ hostName NOTIFY hostNameChanged)
    Q_PROPERTY(bool showCompass READ showCompass NOTIFY showCompassChanged)
    Q_PROPERTY(bool sendExportToHost READ sendExportToHost NOTIFY sendExportToHostChanged)
    Q_PROPERTY(bool projectModified READ projectModified NOTIFY projectModifiedChanged)
    Q_PROPERTY(bool isFirstStart READ isFirstStart CONSTANT)
    Q_PROPERTY(bool debug READ debug CONSTANT)
    Q_PROPERTY(bool enableBetaPatches READ enableBetaPatches NOTIFY enableBetaPatchesChanged)
    Q_PROPERTY(bool getStrings READ getStrings CONSTANT)
    // Written by QML with the key-to-text map of the current language.
    Q_PROPERTY(QVariantMap strHostStrings READ strHostStrings WRITE setStrings)
    Q_PROPERTY(QVariantMap messageBoxAction READ messageBoxAction CONSTANT)
    Q_PROPERTY(QString debugInfo READ debugInfo NOTIFY debugInfoChanged)
    Q_PROPERTY(bool debugInfoActive READ debugInfoActive WRITE setDebugInfoActive NOTIFY debugInfoActiveChanged)
    Q_PROPERTY(QVariantList debugInfoPages READ debugInfoPages NOTIFY debugInfoPagesChanged)
    // Lists of {"title": text, "selected": 0 or 1}, built on every read
    Q_PROPERTY(QVariantList hostCBEntries READ hostCBEntries NOTIFY hostCBEntriesChanged)
    Q_PROPERTY(QVariantList gpxAliasingCBEntries READ gpxAliasingCBEntries NOTIFY gpxAliasingCBEntriesChanged)
    Q_PROPERTY(QVariantList maxAnimationDurationCBEntries READ maxAnimationDurationCBEntries NOTIFY
                   maxAnimationDurationCBEntriesChanged)
    Q_PROPERTY(QVariantList languageCBEntries READ languageCBEntries NOTIFY languageCBEntriesChanged)

public:
    static const QString defaultSource; // "qrc:/Qml/MapView/MapView.qml"

    // The document must outlive the view. Settings default to the per-user store.
    explicit MapView(PainterPathRenderer_Controller *document, QWindow *parent = nullptr,
                     const AppSettings &settings = AppSettings());
    ~MapView() override;

    // Embeds the view in `window` (the top-level widget, whose title the view keeps),
    // loads the interface and starts an empty project.
    void init(QWidget *window, bool hide);
    // The same with another interface file, for tests.
    void init(QWidget *window, bool hide, const QUrl &source);

    QWidget *container() const { return m_container; }
    QMainController &mainController() { return m_mainController; }
    QKeyPointItemsModel &keyPointItemsModel() { return m_keyPointItemsModel; }
    QKeyPointImageItemsModel &keyPointImageItemsModel() { return m_keyPointImageItemsModel; }
    QPilotItemsModel &pilotItemsModel() { return m_pilotItemsModel; }
    QBackgroundChooser &backgroundChooser() { return m_backgroundChooser; }

    // The zoom level at which an extent of `current` degrees fills a view that showed
    // `target` degrees at `zoom`. The result lies in the map's range of zoom levels.
    static int fittedZoom(QSizeF target, QSizeF current, int zoom);

    // Property readers
    double centerPositionLongitude() const;
    double centerPositionLatitude() const;
    QGeoCoordinate centerPosition() const;
    double currentZoomLevel() const;
    double currentBearing() const;
    double currentTilt() const;
    QVariantMap locationSettings() const { return m_locationSettings; }
    QSize windowSize() const { return m_windowSize; }
    QSize scaledProjectSize() const;
    double scalingFactor() const;
    QString mapFrameSource() const;
    bool showOptions() const { return m_showOptions; }
    QString offlineMapStyle() const;

    bool mouseOverPath() const { return m_mouseOverPath; }
    QGeoCoordinate mouseOverPathPosition() const { return m_mouseOverPathPosition; }
    double mouseOverPathPositionPercentage() const { return m_mouseOverPathPositionPercentage; }
    int keypointHoveredID() const { return m_keypointHoveredID; }
    bool markerLocked() const { return m_mainController.markerLocked(); }
    int markerMoveSID1() const { return m_markerMoveSID1; }
    int markerMoveSID2() const { return m_markerMoveSID2; }

    QVariantMap pathSettings() const;
    void writePathSettings(const QVariantMap &settings);
    QVariantMap pathMode() const { return m_mainController.pathModes(); }
    int currentPathMode() const;
    bool keyPointsLocked() const;
    bool keyPointsFixed() const;
    QVariantList mediaPoints() const;
    QVariantList gpxArray() const { return {}; }

    double currentPosition() const { return m_timelinePosition; }
    double animationDuration() const;
    QString animationDurationAsString() const;
    QString timeLinePositionAsString() const;
    double frameDuration() const;
    QVariantList animationFrames() const { return m_animationFrames; }
    QVariantMap animationMode() const;
    int currentAnimationMode() const;
    int currentAnimationFrame() const;
    bool ignorePauseOnKeyPoint() const;
    bool showKeyPointsOnAnimationPosition() const;
    bool animateKeyPoints() const;
    bool animationRunning() const { return m_animationRunning; }
    QVariantMap animationEvent() const { return m_animationEvent; }
    QVariantMap avatarPose() const { return m_avatarPose; }
    QVariantMap animationCamera() const { return m_animationCamera; }
    double animationDurationPerc() const;
    // Set by the exporter while it runs: a click or Control+Space leave the film alone.
    void setExportRunning(bool running) { m_exportRunning = running; }
    bool linearAnimationDuration() const;
    bool flyInAnimation() const;
    bool showOverlays() const { return m_showOverlays; }
    bool enableFlyInRotation() const;
    bool enableFlyInTilt() const;
    int flyInStartRotation() const;
    int flyInEndTilt() const;
    int flyInDuration() const;
    int keyPointAnimationDuration() const;
    int keyPointImageAnimationDuration() const;
    QVariantMap transitionModes() const;
    int currentTransitionMode() const;
    int fullFrameMediaDuration() const;
    void setFullFrameMediaDuration(int seconds);
    double fullFrameFadeDuration() const;
    void setFullFrameFadeDuration(double seconds);
    double fullScreenDiashow() const;

    QString hostName() const;
    bool showCompass() const;
    bool sendExportToHost() const;
    bool projectModified() const { return m_projectModified; }
    bool isFirstStart() const { return m_mainController.isFirstStart(); }
    // The document carries no debug switch: the overlay is reached by debugInfoActive.
    bool debug() const { return false; }
    bool enableBetaPatches() const;
    bool getStrings() const { return true; }
    QVariantMap strHostStrings() const { return m_mainController.strings(); }
    QVariantMap messageBoxAction() const { return m_mainController.actions(); }
    QString debugInfo() const { return m_debugText; }
    bool debugInfoActive() const { return m_debugInfoActive; }
    void setDebugInfoActive(bool active);
    QVariantList debugInfoPages() const { return m_debugInfoPages; }
    QVariantList hostCBEntries() const;
    QVariantList gpxAliasingCBEntries() const;
    QVariantList maxAnimationDurationCBEntries() const;
    QVariantList languageCBEntries() const;

public slots:
    // Window
    void setMapVisible(bool visible, bool showOptions);
    void resizeHost(int width, int height);
    void handleCloseApp();
    void leaveFullscreen();
    void toggleFullScreen();
    // Loads a project or track by name the way the load command does, for the
    // command line.
    void openFile(const QString &fileName);

    // Project commands
    void triggerMessageBoxAction(int messageId);
    bool saveProject();
    void delayedLoadProjectFinish();
    void triggerLoadState(int step, double perc);
    void projectIsModified();
    void exportGPX();
    void DoShowError(QString text);

    // Property surface
    void setStrings(QVariantMap stringMap);
    QString versionInfo() const;
    void setPathMode(int mode);
    void ignorePauseOnKeyPoint(bool state);
    void setShowKeyPointsAtPosition(bool state);
    void setAnimateKeyPoints(bool state);
    void setShowCompass(bool state);
    void setSendExportToHost(bool state);
    void setCurrentBearing(double current);
    void slotShowOverlays(bool state);
    void setFullScreenDiashow(bool state);
    void setGpxAliasing(int index);
    void setMaxAnimationDuration(int index);
    void setHost(int index);
    void setLanguage(int index);
    void openHelp();
    void setEnableBetaPatches(bool state);
    void hideCursor();
    void showCursor();
    void pathChanged();

    // Map interaction: the pointer, the marker of a key point and the view
    bool mouseMoved(double longitude, double latitude);
    void markerMoved(double longitude, double latitude);
    void setMoveDistance(double distance);
    void changeKeyPointPosition(int kpId, double longitude, double latitude);
    void setCenterPosition(double latitude, double longitude);
    void saveBoundaries(double longitudeTL, double latitudeTL, double longitudeBR, double latitudeBR);
    void setZoom(double current);
    void setCurrentTilt(double current);
    void resetPhotoDrop();

    // Playback
    void startAnimation();
    void stopAnimation(bool clicked);
    void killAnimation();
    void resetAnimationLoop();
    void setCurrentAnimationPosition(int nArrayIndex);
    void setTimelinePosition(double position);
    void setAnimationDurationPerc(double perc);
    void setAnimationMode(int mode);
    void setAnimationFrame(int index);
    void setKeyPointAnimationDuration(int value);
    void slotLinearAnimationDuration(bool state);
    void slotFlyInAnimation(bool state);
    void setEnableFlyInRotation(bool state);
    void setEnableFlyInTilt(bool state);
    void setFlyInDuration(int seconds);
    void setFlyInEndTilt(int degrees);
    void setFlyInStartRotation(int degrees);
    // The frame-accurate step of the export.
    void stepAnimation();

signals:
    // Towards the top-level window
    void closeApp();
    void requestUpdate();
    void setFullScreen(bool state);

    // Dialogs of the interface
    void showMessageBox(QString text, int actionContinue, int actionAbort, int actionClose);
    void showHint(QString text, int actionConfirmed);
    void showError(QString text);
    void showWaitState(QString text);
    void hideWaitState();

    void keyPointPositionChanged(int kpId, double longitude, double latitude);
    // Makes the key point the one the settings edit.
    void setActiveKeyPointId(int kpId);
    void mediaPointsClear();
    void mediaPointAdded(int id);

    void centerPositionLongitudeChanged();
    void centerPositionLatitudeChanged();
    void centerPositionChanged();
    void currentZoomLevelChanged();
    void currentBearingChanged();
    void currentTiltChanged();
    void locationSettingsChanged();
    void windowSizeChanged();
    void scaledProjectSizeChanged();
    void mapFrameSourceChanged();
    void showOptionsChanged();
    void mouseOverPathChanged();
    void mouseOverPathPositionChanged();
    void mouseOverPathPositionPercentageChanged();
    void keypointHoveredIDChanged();
    void markerLockedChanged();
    void markerMoveSID1Changed();
    void markerMoveSID2Changed();
    void pathSettingsChanged();
    void currentPathModeChanged();
    void keyPointsLockedChanged();
    void keyPointsFixedChanged();
    void mediaPointsChanged();
    void gpxArrayChanged();
    void currentPositionChanged();
    void animationDurationChanged();
    void animationDurationAsStringChanged();
    void timeLinePositionAsStringChanged();
    void frameDurationChanged();
    void animationFramesChanged();
    void currentAnimationModeChanged();
    void currentAnimationFrameChanged();
    void ignorePauseOnKeyPointChanged();
    void showKeyPointsOnAnimationPositionChanged();
    void animateKeyPointsChanged();
    void animationRunningChanged();
    void animationEventChanged();
    void linearAnimationDurationChanged();
    void flyInAnimationChanged();
    void showOverlaysChanged();
    void enableFlyInRotationChanged();
    void enableFlyInTiltChanged();
    void flyInStartRotationChanged();
    void flyInEndTiltChanged();
    void flyInDurationChanged();
    void keyPointAnimationDurationChanged();
    void keyPointImageAnimationDurationChanged();
    void currentTransitionModeChanged();
    void fullFrameMediaDurationChanged();
    void fullFrameFadeDurationChanged();
    void fullScreenDiashowChanged();
    void hostNameChanged();
    void showCompassChanged();
    void sendExportToHostChanged();
    void projectModifiedChanged();
    void enableBetaPatchesChanged();
    void debugInfoChanged();
    void debugInfoActiveChanged();
    void debugInfoPagesChanged();
    void hostCBEntriesChanged();
    void gpxAliasingCBEntriesChanged();
    void maxAnimationDurationCBEntriesChanged();
    void languageCBEntriesChanged();

    // Declared for the interface; nothing emits them.
    void createLandscape(QString name, int width, int height);
    void routePointsChanged();
    void changeImage(QImage image);

protected:
    void keyPressEvent(QKeyEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;

private:
    bool visibleRegion(GeoRect &region) const override;
    bool releaseIsOnTheMap() const;
    void seekToEnd();
    // The event that playback has reached: pose, camera and timeline follow it.
    void showPlaybackEvent();
    void playbackEndShown();
    void rebuildAnimationFrames();
    void connectSignalList(QObject *signalList);
    // The content catalogue and the lists made from it, then the waypoint models.
    void initLists();
    void initKeyPointModels(QObject *root);
    void initPilotModel(QObject *root);
    QString browseTitle() const;
    // The lock rule for the hovered key point and the signals that follow a change.
    void applyMarkerLock(uint32_t keyPointId);
    bool hoverKeyPoint(double longitude, double latitude);
    bool hoverPath(double longitude, double latitude);
    void setMouseOverPath(bool over);
    void setDebugText(const QString &text);
    // Key points have moved: the drawn route follows.
    void keyPointsMoved();
    void advanceDebugKeys(const QKeyEvent *event);
    void setProjectModified(bool modified);
    void setWindowTitle(const QString &title);
    void newProjectCommand();
    void resetViews();
    void loadProjectCommand(bool track);
    void loadProjectFromDialog() { loadProjectCommand(false); }
    void loadTrackFromDialog() { loadProjectCommand(true); }
    void startLoad(const QString &fileName);
    void emitCloseApp() { emit closeApp(); }
    void saveThenClose();
    void saveThenNewProject();
    void saveThenLoadProject();
    void saveThenLoadTrack();
    void sendVideo();
    void deleteUserAvatar();
    void showTutorial();
    void rebuildLocationSettings();
    void rebuildDebugPages();
    void updateSceneSize();
    QString applicationTitle() const;
    int currentLanguage() const;
    // Frames of the chosen film length.
    int32_t chosenFrames() const;

    // Members are made in the order of ownership and go in reverse. The item models,
    // the background chooser and the playback, which use the main controller and the
    // document, come at the end; the exporter and the usage tracking will join them.
    QWidget *m_container = nullptr; // the embedding widget, a child of the window
    QMainController m_mainController;
    PainterPathRenderer_Controller *m_document;
    QSize m_windowSize;
    QString m_debugText;
    QGeoCoordinate m_mouseOverPathPosition;
    QWidget *m_window = nullptr;
    QString m_projectFileName;
    // The film of the last finished export, which "actionSendVideo" hands to the host.
    QString m_lastExportFile;
    QVariantMap m_locationSettings;
    QVariantList m_debugInfoPages;
    QVariantList m_animationFrames;
    QVariantMap m_animationEvent;
    double m_lastLoadPercent = -1.0;
    double m_timelinePosition = 0.0;
    double m_mouseOverPathPositionPercentage = 0.0;
    double m_moveDistance = 0.0; // the hit radius in metres
    int m_debugKeyState = 0;      // progress through the key sequence of the debug overlay
    int m_keypointHoveredID = 0;
    int m_markerMoveSID1 = 0;
    int m_markerMoveSID2 = 0;
    bool m_mouseOverPath = false;
    bool m_showOptions = false;
    bool m_projectModified = false;
    bool m_fullScreen = false;
    bool m_animationRunning = false;
    bool m_showOverlays = true;
    bool m_debugInfoActive = false;
    // From the start of a load to its end the map still shows the old view; what it
    // reports of it then would overwrite the view of the loaded file.
    bool m_loading = false;

    QKeyPointItemsModel m_keyPointItemsModel;
    QKeyPointImageItemsModel m_keyPointImageItemsModel;
    QPilotItemsModel m_pilotItemsModel;
    QBackgroundChooser m_backgroundChooser{m_mainController, *m_document};

    DocumentAnimationSource m_animationSource;
    AnimationEventList m_eventList;
    PlaybackLoop m_playback;
    PlaybackCamera m_playbackCamera;
    QVariantMap m_avatarPose;
    QVariantMap m_animationCamera;
    // The heading of the avatar looks this many metres along the route.
    double m_headingSpan = 50.0;
    bool m_exportRunning = false;
};
