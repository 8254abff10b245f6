import QtQuick 2.15
import QtQuick.Controls 2.15
import "../Theme"
import "SignalLists"

// The program's window: the map owns it, the project commands, the place search and
// the settings panel float over it, and the dialogs of the map view come up in front
// of all.
Item {
    id: root

    width: host.windowSize && host.windowSize.width > 0 ? host.windowSize.width : 1280
    height: host.windowSize && host.windowSize.height > 0 ? host.windowSize.height : 800

    // The item models come after the interface has loaded: null until then.
    property var waypoints: typeof keyPointItemsModel !== "undefined" ? keyPointItemsModel : null
    property var waypointSymbols: typeof keyPointImageItemsModel !== "undefined" ? keyPointImageItemsModel : null
    property var avatars: typeof pilotItemsModel !== "undefined" ? pilotItemsModel : null
    readonly property int activeWaypointId: waypoints ? waypoints.activeKeyPointId : 0
    property bool settingsOpen: false
    property bool filmSettingsOpen: false
    // The two panels share the right side: one at a time.
    onSettingsOpenChanged: if (settingsOpen) filmSettingsOpen = false
    onFilmSettingsOpenChanged: if (filmSettingsOpen) settingsOpen = false

    readonly property var actions: host.messageBoxAction
    readonly property bool modalOpen: messageBox.visible || hintBox.visible
                                      || errorBox.visible || waitState.visible

    readonly property bool playing: host.animationRunning === true
    readonly property int cameraMode: host.currentAnimationMode !== undefined ? host.currentAnimationMode : 0

    // The corners of the map's view, which the fly-in fits the route into.
    function visibleRegion() {
        return worldMap.visibleRegion()
    }

    // The id of a message-box action by name; "actionNone" for a name the table lacks.
    function action(name) {
        return actions[name] !== undefined ? actions[name] : actions["actionNone"]
    }

    // New, open and open track: a modified project is only left after asking.
    function runProjectCommand(plainAction, saveFirstAction) {
        if (host.projectModified)
            messageBox.ask(qsTr("This project has changes that are not saved yet. Save them first?"),
                           action(plainAction), action(saveFirstAction), action("actionNone"))
        else
            signalList.triggerMessageBoxAction(action(plainAction))
    }

    // The native side takes its texts from here, again after each change of language.
    function sendHostStrings() {
        host.strHostStrings = hostStrings.table()
        toolBar.languages = host.languageCBEntries
    }

    Component.onCompleted: {
        if (host.getStrings)
            sendHostStrings()
    }

    HostStrings {
        id: hostStrings
    }

    // Opens the panel on a waypoint, as a click on its marker does.
    function editWaypoint(keyPointId) {
        keyPointRequests.setActiveKeyPointId(keyPointId)
        settingsPanel.showPage("keyPoint")
        settingsOpen = true
    }

    SignalList {
        id: signalList
    }
    PhotoPoolSignalList {}
    AltitudePresetsSignalList {}
    KeyPointItemsSignalList {
        id: keyPointRequests
    }
    KeyPointImageItemsSignalList {}
    PilotItemsSignalList {
        id: pilotRequests
    }
    TrackingList {}
    BackgroundChooserSignalList {}
    ExportSignalList {}

    WorldMap {
        id: worldMap
        objectName: "mapStage"
        anchors.fill: parent
        locationSettings: host.locationSettings
        baseMapStyle: host.offlineMapStyle !== undefined ? host.offlineMapStyle : ""
        onViewMoved: {
            signalList.setCenterPosition(center.latitude, center.longitude)
            signalList.saveBoundaries(topLeft.longitude, topLeft.latitude,
                                      bottomRight.longitude, bottomRight.latitude)
            signalList.setMoveDistance(hitRadius)
            if (typeof host.setZoom === "function")
                host.setZoom(zoomLevel)
        }

        waypointModel: root.waypoints
        pathSettings: host.pathSettings
        activeWaypointId: root.activeWaypointId
        hoveredWaypointId: host.keypointHoveredID
        overRoute: host.mouseOverPath
        routePosition: host.mouseOverPathPosition
        keyPointsFixed: host.keyPointsFixed
        markerLocked: host.markerLocked
        onPointerMoved: signalList.mouseMoved(longitude, latitude)
        onMarkerMoved: signalList.markerMoved(longitude, latitude)
        onMarkerDropped: signalList.changeKeyPointPosition(keyPointId, longitude, latitude)
        onMapClicked: keyPointRequests.addKeyPoint(longitude, latitude, 0, "")
        onMarkerClicked: root.editWaypoint(keyPointId)

        playing: root.playing
        animationCamera: host.animationCamera
        avatarPose: host.avatarPose
        pilot: root.avatars ? root.avatars.currentPilot : ({})
        waypointPopDuration: host.animateKeyPoints ? host.keyPointAnimationDuration * 500 : 0
    }

    FilmFrame {
        id: filmFrame
        objectName: "filmFrame"
        anchors.fill: worldMap
        readonly property var frames: host.animationFrames || []
        readonly property var chosen: frames[host.currentAnimationFrame] || frames[0]
        visible: root.playing && (root.cameraMode === 2 || root.cameraMode === 3) && maskSource !== ""
        maskSource: chosen ? chosen.sourceFileName : ""
    }

    // What the film asks of the map at each event: the waypoints reached, and the
    // next picture of an animated avatar.
    Connections {
        target: host
        ignoreUnknownSignals: true
        property int lastPosition: -1
        function onAnimationEventChanged() {
            var event = host.animationEvent
            if (event.type === "start") {
                lastPosition = -1
                signalList.resetAnimationLoop()
            }
            if (event.stepAnimatedPilot === true)
                ++worldMap.pilotStep
            if (event.pathPosition !== undefined && event.pathPosition > lastPosition) {
                lastPosition = event.pathPosition
                signalList.setCurrentAnimationPosition(event.pathPosition)
            }
        }
    }

    PlaceSearch {
        id: placeSearch
        objectName: "placeSearch"
        anchors.left: toolBar.right
        anchors.top: toolBar.top
        anchors.leftMargin: Theme.spaceS
        width: Math.min(Theme.searchWidth, root.width - x - Theme.spaceL)
        enabled: !root.modalOpen
        onPlaceChosen: {
            keyPointRequests.addKeyPoint(coordinate.longitude, coordinate.latitude, 0, address)
            worldMap.centerOn(coordinate)
        }
    }

    SettingsPanel {
        id: settingsPanel
        objectName: "settingsPanel"
        anchors.right: parent.right
        anchors.top: toolBar.bottom
        anchors.margins: Theme.spaceL
        anchors.topMargin: Theme.spaceS
        maximumHeight: root.height - y - Theme.spaceL
        visible: root.settingsOpen
        enabled: !root.modalOpen
        waypoints: root.waypoints
        symbols: root.waypointSymbols
        requests: keyPointRequests
        pathSettings: host.pathSettings
        pathModes: host.pathMode
        currentPathMode: host.currentPathMode
        courseFixed: host.keyPointsFixed
        onPathSettingsEdited: host.pathSettings = settings
        onPathModeChosen: signalList.setPathMode(mode)
        onCloseRequested: root.settingsOpen = false
        avatars: root.avatars
        avatarRequests: pilotRequests
        // The model lets the pictures go before their files are deleted.
        onDeleteAvatarRequested: {
            pilotRequests.setDeletePilotID(pilotId)
            messageBox.ask(qsTr("Delete this avatar?"),
                           root.action("actionDeleteUserAvatar"), root.action("actionNone"), root.action("actionNone"))
        }
    }

    FilmSettingsPanel {
        objectName: "filmSettingsPanel"
        anchors.right: parent.right
        anchors.bottom: timeline.top
        anchors.margins: Theme.spaceL
        anchors.bottomMargin: Theme.spaceS
        maximumHeight: timeline.y - toolBar.y - toolBar.height - 2 * Theme.spaceL
        visible: root.filmSettingsOpen
        enabled: !root.modalOpen
        film: host
        requests: signalList
        onCloseRequested: root.filmSettingsOpen = false
    }

    TimelineBar {
        id: timeline
        objectName: "timelineBar"
        anchors.horizontalCenter: parent.horizontalCenter
        anchors.bottom: parent.bottom
        anchors.margins: Theme.spaceL
        width: Math.min(Theme.timelineWidth, root.width - 2 * Theme.spaceL)
        enabled: !root.modalOpen
        playing: root.playing
        position: host.currentPosition
        positionText: host.timeLinePositionAsString
        lengthText: host.animationDurationAsString
        settingsOpen: root.filmSettingsOpen
        onPlayRequested: signalList.startAnimation()
        onStopRequested: signalList.stopAnimation(true)
        onSeekRequested: signalList.setTimelinePosition(position)
        onSettingsToggled: root.filmSettingsOpen = !root.filmSettingsOpen
        onFullScreenRequested: host.toggleFullScreen()
    }

    // Deletes the waypoint being edited; a text field that has the keys keeps them.
    Shortcut {
        sequences: ["Delete", "Backspace"]
        enabled: !root.modalOpen && root.activeWaypointId > 0
        onActivated: keyPointRequests.deleteKeyPoint(root.activeWaypointId)
    }

    ProjectToolBar {
        id: toolBar
        anchors.left: parent.left
        anchors.top: parent.top
        anchors.margins: Theme.spaceL
        title: host.title !== undefined ? host.title : ""
        commandsEnabled: !root.modalOpen
        settingsPanelOpen: root.settingsOpen
        onSettingsPanelToggled: root.settingsOpen = !root.settingsOpen
        onNewProjectRequested: root.runProjectCommand("actionNewProject", "actionSaveAndNewProject")
        onOpenProjectRequested: root.runProjectCommand("actionLoadProject", "actionSaveAndLoadProject")
        onOpenTrackRequested: root.runProjectCommand("actionLoadGPX", "actionSaveAndLoadGPX")
        onSaveRequested: signalList.saveProject()
        onExportGpxRequested: host.exportGPX()
        onLanguageChosen: signalList.setLanguage(index)
        onFullScreenRequested: host.toggleFullScreen()
    }

    // Quitting asks about unsaved changes as closing the window does.
    Shortcut {
        sequence: StandardKey.Quit
        enabled: !root.modalOpen
        onActivated: host.handleCloseApp()
    }

    MessageBox {
        id: messageBox
        objectName: "messageBox"
        actions: root.actions
        onActionChosen: signalList.triggerMessageBoxAction(actionId)
    }

    HintBox {
        id: hintBox
        objectName: "hintBox"
        onActionChosen: signalList.triggerMessageBoxAction(actionId)
    }

    ErrorBox {
        id: errorBox
        objectName: "errorBox"
    }

    WaitState {
        id: waitState
        objectName: "waitState"
    }

    Connections {
        target: host
        function onShowMessageBox(text, actionContinue, actionAbort, actionClose) {
            messageBox.ask(text, actionContinue, actionAbort, actionClose)
        }
        function onShowHint(text, actionConfirmed) {
            hintBox.show(text, actionConfirmed)
        }
        // A load that fails leaves its wait state up: the error takes its place.
        function onShowError(text) {
            waitState.close()
            errorBox.show(text)
        }
        function onShowWaitState(text) {
            waitState.show(text)
        }
        function onHideWaitState() {
            waitState.close()
        }
        function onLanguageCBEntriesChanged() {
            root.sendHostStrings()
        }
    }

    // A waypoint that the map view has put elsewhere, such as onto a track.
    Connections {
        target: host
        ignoreUnknownSignals: true
        function onKeyPointPositionChanged(kpId, longitude, latitude) {
            worldMap.moveMarker(kpId, longitude, latitude)
        }
    }
}
