import QtQuick 2.15
import QtQuick.Window 2.15
import QtLocation 5.15
import QtPositioning 5.15
import "../Theme"

// The map that fills the window, with the route and its waypoints. It takes its view
// from the map view's location settings, reports where the user has moved it and
// what the pointer does on it.
Item {
    id: stage

    // host.locationSettings: "centerLongitude", "centerLatitude", "zoomLevel",
    // "bearing", "tilt"
    property var locationSettings: ({})
    // The offline world map's style; without one the map shows its ground colour and grid.
    property string baseMapStyle: ""
    readonly property alias map: mapLoader.item

    // The waypoint model, null until the map view has set it
    property var waypointModel: null
    property var pathSettings: ({})
    property int activeWaypointId: 0
    // The map view's hover state (0 for no waypoint) and the place on the route
    // next to the pointer
    property int hoveredWaypointId: 0
    property bool overRoute: false
    property var routePosition: null
    property bool keyPointsFixed: false
    property bool markerLocked: false

    // The film: while it plays the camera follows host.animationCamera, the avatar
    // travels and the waypoints appear as it reaches them; editing rests.
    property bool playing: false
    property var animationCamera: ({})
    property var avatarPose: ({})
    property var pilot: ({})
    property int pilotStep: 0
    // Waypoints pop up over this many milliseconds as the avatar reaches them; 0: at once.
    property int waypointPopDuration: 0
    // Movement glides over one film frame; the export wants each frame exact.
    property bool glide: true

    readonly property var routeLayer: map ? map.routeLayer : null
    readonly property var markerLayer: map ? map.markerLayer : null
    readonly property var pointer: map ? map.pointer : null

    // Sent a moment after the user has stopped moving the map.
    signal viewMoved(var center, real zoomLevel, var topLeft, var bottomRight, real hitRadius)
    signal pointerMoved(double longitude, double latitude)
    signal markerMoved(double longitude, double latitude)
    signal markerDropped(int keyPointId, double longitude, double latitude)
    signal mapClicked(double longitude, double latitude)
    signal markerClicked(int keyPointId)

    function moveMarker(keyPointId, longitude, latitude) {
        if (markerLayer)
            markerLayer.move(keyPointId, longitude, latitude)
    }

    function centerOn(coordinate) {
        if (map)
            map.center = coordinate
    }

    // [longitude, latitude] of the top-left and bottom-right corner of the view
    function visibleRegion() {
        if (!map)
            return []
        var tl = map.toCoordinate(Qt.point(0, 0), false)
        var br = map.toCoordinate(Qt.point(map.width, map.height), false)
        if (!tl.isValid || !br.isValid)
            return []
        return [tl.longitude, tl.latitude, br.longitude, br.latitude]
    }

    function applyView(s) {
        var m = mapLoader.item
        if (!m || !s)
            return
        if (isFinite(s.centerLatitude) && isFinite(s.centerLongitude))
            m.center = QtPositioning.coordinate(s.centerLatitude, s.centerLongitude)
        if (isFinite(s.zoomLevel))
            m.zoomLevel = s.zoomLevel
        if (isFinite(s.bearing))
            m.bearing = s.bearing
        if (isFinite(s.tilt))
            m.tilt = s.tilt
    }

    function applyLocationSettings() {
        applyView(locationSettings)
    }

    onLocationSettingsChanged: applyLocationSettings()

    // No network: the offline world map drawn from the program's own vector tiles, or
    // only the ground colour and the grid. The route lies under the country names.
    // Only the plugin in use is made: one left unused complains as it goes.
    // Held in a plain object, so that making it is no change the map would react to.
    readonly property var made: ({})
    function pluginInUse() {
        if (!made.plugin)
            made.plugin = (baseMapStyle !== "" ? worldPlugin : overlayPlugin).createObject(stage)
        return made.plugin
    }
    Component {
        id: worldPlugin
        Plugin {
            name: "mapboxgl"
            PluginParameter {
                name: "mapboxgl.mapping.additional_style_urls"
                value: stage.baseMapStyle
            }
            PluginParameter {
                name: "mapboxgl.mapping.items.insert_before"
                value: "country-names-large"
            }
        }
    }
    Component {
        id: overlayPlugin
        Plugin {
            name: "itemsoverlay"
        }
    }
    onAnimationCameraChanged: {
        if (playing)
            applyView(animationCamera)
    }

    // The map item wants a window from its first moment on, so it is made once the
    // stage stands in one.
    Loader {
        id: mapLoader
        anchors.fill: parent
        active: stage.Window.window !== null
        onLoaded: stage.applyLocationSettings()

        sourceComponent: Map {
            id: geoMap
            objectName: "worldMap"
            color: Theme.mapBackground
            copyrightsVisible: false
            plugin: stage.pluginInUse()
            // The offline style is the first map type the plugin offers.
            Component.onCompleted: {
                if (stage.baseMapStyle !== "" && supportedMapTypes.length > 0)
                    activeMapType = supportedMapTypes[0]
            }

            property alias routeLayer: routeLayer
            property alias markerLayer: markerLayer
            property alias pointer: pointer

            // The pointer pans the map itself, so that a drag can move a waypoint
            // instead; the wheel still zooms.
            gesture.acceptedGestures: MapGestureArea.PinchGesture

            Behavior on center {
                enabled: stage.playing && stage.glide
                CoordinateAnimation { duration: 30 }
            }

            onCenterChanged: settle.restart()
            onZoomLevelChanged: settle.restart()
            onBearingChanged: settle.restart()
            onTiltChanged: settle.restart()
            // The map takes its new size only after its children have theirs.
            onWidthChanged: {
                settle.restart()
                Qt.callLater(grid.update)
            }
            onHeightChanged: {
                settle.restart()
                Qt.callLater(grid.update)
            }

            Timer {
                id: settle
                interval: 150
                onTriggered: {
                    // The hit radius for the pointer: what a finger's width on the
                    // screen measures on the ground.
                    var c = Qt.point(geoMap.width / 2, geoMap.height / 2)
                    var metres = geoMap.toCoordinate(c, false).distanceTo(
                                geoMap.toCoordinate(Qt.point(c.x + 12, c.y), false))
                    stage.viewMoved(geoMap.center, geoMap.zoomLevel,
                                    geoMap.toCoordinate(Qt.point(0, 0), false),
                                    geoMap.toCoordinate(Qt.point(geoMap.width, geoMap.height), false),
                                    metres)
                }
            }

            // Under the route and the waypoints
            Graticule {
                id: grid
                anchors.fill: parent
                z: 0.5
                map: geoMap
                visible: stage.baseMapStyle === "" && geoMap.bearing === 0 && geoMap.tilt === 0
            }

            RouteSegments {
                id: routeLayer
                map: geoMap
                model: stage.waypointModel
                pathSettings: stage.pathSettings
            }

            WaypointMarkers {
                id: markerLayer
                map: geoMap
                model: stage.waypointModel
                playing: stage.playing
                popDuration: stage.waypointPopDuration
                activeId: stage.playing ? 0 : stage.activeWaypointId
                hoveredId: stage.hoveredWaypointId > 0 ? stage.hoveredWaypointId : pointer.symbolUnderPointer
            }

            AvatarMarker {
                objectName: "avatarMarker"
                visible: stage.playing && place.isValid
                pilot: stage.pilot
                pose: stage.avatarPose
                mapBearing: geoMap.bearing
                step: stage.pilotStep
                glide: stage.glide
            }

            RouteHoverDot {
                objectName: "routeHoverDot"
                coordinate: stage.routePosition && stage.routePosition.isValid ? stage.routePosition
                                                                               : QtPositioning.coordinate()
                visible: stage.overRoute && stage.hoveredWaypointId <= 0 && !pointer.draggingMarker && !stage.playing
            }

            MapPointer {
                id: pointer
                map: geoMap
                enabled: !stage.playing
                markers: markerLayer
                hoveredId: stage.hoveredWaypointId
                keyPointsFixed: stage.keyPointsFixed
                markerLocked: stage.markerLocked
                routePosition: stage.routePosition
                onPointerMoved: stage.pointerMoved(longitude, latitude)
                onMarkerMoved: stage.markerMoved(longitude, latitude)
                onMarkerDropped: stage.markerDropped(keyPointId, longitude, latitude)
                onMapClicked: stage.mapClicked(longitude, latitude)
                onMarkerClicked: stage.markerClicked(keyPointId)
            }
        }
    }
}
