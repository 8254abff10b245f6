import QtQuick 2.15
import QtQuick.Window 2.15
import QtLocation 5.15
import QtPositioning 5.15
import "../Theme"

// The map that fills the window. It takes its view from the map view's location
// settings and reports where the user has moved it.
Item {
    id: stage

    // host.locationSettings: "centerLongitude", "centerLatitude", "zoomLevel",
    // "bearing", "tilt"
    property var locationSettings: ({})
    readonly property alias map: mapLoader.item

    // Sent a moment after the user has stopped moving the map.
    signal viewMoved(var center, real zoomLevel, var topLeft, var bottomRight, real hitRadius)

    function applyLocationSettings() {
        var m = mapLoader.item
        var s = locationSettings
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

    onLocationSettingsChanged: applyLocationSettings()

    // The map item wants a window from its first moment on, so it is made once the
    // stage stands in one.
    Loader {
        id: mapLoader
        anchors.fill: parent
        active: stage.Window.window !== null
        onLoaded: stage.applyLocationSettings()

        sourceComponent: Map {
            id: map
            objectName: "worldMap"
            color: Theme.mapBackground
            copyrightsVisible: false
            // Tiles come from the program alone, never from the network: the only map
            // type used is the custom one, whose tiles are looked up in the resource.
            // Where none is found the map shows its ground colour.
            plugin: Plugin {
                name: "osm"
                PluginParameter {
                    name: "osm.mapping.providersrepository.disabled"
                    value: true
                }
                PluginParameter {
                    name: "osm.mapping.custom.host"
                    value: "qrc:/Qml/maptiles/"
                }
            }
            activeMapType: {
                for (var i = 0; i < supportedMapTypes.length; ++i) {
                    if (supportedMapTypes[i].style === MapType.CustomMap)
                        return supportedMapTypes[i]
                }
                return supportedMapTypes[0]
            }

            onCenterChanged: settle.restart()
            onZoomLevelChanged: settle.restart()
            onBearingChanged: settle.restart()
            onTiltChanged: settle.restart()
            onWidthChanged: settle.restart()
            onHeightChanged: settle.restart()

            Timer {
                id: settle
                interval: 150
                onTriggered: {
                    // The hit radius for the pointer: what a finger's width on the
                    // screen measures on the ground.
                    var c = Qt.point(map.width / 2, map.height / 2)
                    var metres = map.toCoordinate(c, false).distanceTo(
                                map.toCoordinate(Qt.point(c.x + 12, c.y), false))
                    stage.viewMoved(map.center, map.zoomLevel,
                                    map.toCoordinate(Qt.point(0, 0), false),
                                    map.toCoordinate(Qt.point(map.width, map.height), false),
                                    metres)
                }
            }
        }
    }

    Graticule {
        anchors.fill: parent
        map: mapLoader.item
        visible: map !== null && map.bearing === 0 && map.tilt === 0
    }
}
