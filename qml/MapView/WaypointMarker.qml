import QtQuick 2.15
import QtLocation 5.15

// A waypoint on the map, kept by the waypoint layer under its key point id.
MapQuickItem {
    id: marker

    property int keyPointId: 0
    property var info: ({})
    property bool active: false
    property bool hovered: false
    readonly property alias symbolItem: symbol.symbolItem

    anchorPoint: symbol.anchor
    z: active ? 4 : 3
    sourceItem: WaypointSymbol {
        id: symbol
        info: marker.info
        active: marker.active
        hovered: marker.hovered
    }
}
