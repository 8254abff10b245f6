import QtQuick 2.15
import QtPositioning 5.15

// Stands in for the map view: the properties, slots and signals the interface uses,
// with counters where the tests need to see a call.
QtObject {
    property size windowSize: Qt.size(1280, 800)
    property string title: "Tourlet"
    property bool projectModified: false
    property bool getStrings: true
    property real exportPosition: 0.5
    property var locationSettings: ({ "centerLongitude": 11.58, "centerLatitude": 48.14,
                                      "zoomLevel": 6, "bearing": 0, "tilt": 0 })
    property var messageBoxAction: ({ "actionNone": -1, "actionNewProject": 1000,
                                      "actionLoadProject": 1001, "actionLoadGPX": 1002,
                                      "actionCloseApp": 1003, "actionSaveAndCloseProject": 1004,
                                      "actionSendVideo": 1006, "actionSaveAndNewProject": 1007,
                                      "actionSaveAndLoadProject": 1008, "actionSaveAndLoadGPX": 1009,
                                      "actionShowTutorial": 1012, "actionDeleteUserAvatar": 1013,
                                      "actionOpenWindowsSettings": 1014 })
    property var languageCBEntries: [{ "title": "strDEde", "selected": 0 },
                                     { "title": "strENen", "selected": 1 }]

    // Route and hover state
    property var pathSettings: ({ "color": "#FF0000", "opacity": 0.8, "width": 6, "shadowEnabled": false,
                                  "shadowDistance": 3, "shadowWidth": 6, "shadowOpacity": 0.8 })
    property var pathMode: ({ "line": 0, "curve": 1, "airplane": 2, "route": 3 })
    property int currentPathMode: 1
    property bool keyPointsFixed: false
    property bool markerLocked: false
    property bool mouseOverPath: false
    property var mouseOverPathPosition: QtPositioning.coordinate()
    property int keypointHoveredID: 0
    signal keyPointPositionChanged(int kpId, double longitude, double latitude)

    // The film
    property bool animationRunning: false
    property real currentPosition: 0
    property string timeLinePositionAsString: "00m00s"
    property string animationDurationAsString: "00m10s"
    property var animationEvent: ({})
    property var animationCamera: ({})
    property var avatarPose: ({})
    property int currentAnimationMode: 0
    property var animationFrames: []
    property int currentAnimationFrame: 0
    property bool animateKeyPoints: true
    property int keyPointAnimationDuration: 2

    property var strHostStrings: ({})
    property int stringWrites: 0
    onStrHostStringsChanged: ++stringWrites

    property int fullScreenToggles: 0
    property int gpxExports: 0
    property real zoomReported: -1
    function toggleFullScreen() { ++fullScreenToggles }
    function exportGPX() { ++gpxExports }
    function setZoom(level) { zoomReported = level }

    signal showMessageBox(string text, int actionContinue, int actionAbort, int actionClose)
    signal showHint(string text, int actionConfirmed)
    signal showError(string text)
    signal showWaitState(string text)
    signal hideWaitState()
}
