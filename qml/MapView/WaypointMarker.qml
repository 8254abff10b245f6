import QtQuick 2.15
import QtLocation 5.15

// A waypoint on the map, kept by the waypoint layer under its key point id.
MapQuickItem {
    id: marker

    property int keyPointId: 0
    property var info: ({})
    property bool active: false
    property bool hovered: false
    property bool playing: false
    property int popDuration: 0
    readonly property alias symbolItem: symbol.symbolItem
    // In the film a disabled waypoint stays away, and the others wait for the avatar.
    readonly property bool shownInFilm: info.enabled !== false && info.enabledForAnimation !== false

    visible: !playing || shownInFilm
    onShownInFilmChanged: {
        if (playing && shownInFilm && popDuration > 0)
            pop.restart()
    }
    NumberAnimation {
        id: pop
        target: symbol
        property: "scale"
        from: 0
        to: 1
        duration: marker.popDuration
        easing.type: Easing.OutBack
    }

    anchorPoint: symbol.anchor
    z: active ? 4 : 3
    sourceItem: WaypointSymbol {
        id: symbol
        info: marker.info
        active: marker.active
        hovered: marker.hovered
    }
}
