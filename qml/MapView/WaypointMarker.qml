import QtQuick 2.15
import QtLocation 5.15

// A waypoint on the map, kept by the waypoint layer under its key point id.
MapQuickItem {
    id: marker

    property int keyPointId: 0
    property alias info: symbol.info
    property alias active: symbol.active
    property alias hovered: symbol.hovered
    readonly property alias symbolItem: symbol.symbolItem

    anchorPoint: symbol.anchor
    z: active ? 4 : 3
    sourceItem: WaypointSymbol {
        id: symbol
    }
}
