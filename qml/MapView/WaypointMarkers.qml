import QtQuick 2.15
import QtPositioning 5.15

// The waypoints on the map, one marker per key point, made and changed as the
// waypoint model reports them.
Item {
    id: markerSet

    property var map: null
    // The waypoint model: addMarker, insertMarker, updateMarker,
    // updateAllMarkersProperty, keyPointDeleted and clearAllObjects
    property var model: null
    property int activeId: 0
    property int hoveredId: 0
    // While the film plays a waypoint shows once the avatar has reached it, popping
    // up over popDuration milliseconds.
    property bool playing: false
    property int popDuration: 0

    // The markers in the order of the route
    property var markers: []

    function markerById(keyPointId) {
        for (var i = 0; i < markers.length; ++i) {
            if (markers[i].keyPointId === keyPointId)
                return markers[i]
        }
        return null
    }

    // The id of the topmost marker whose symbol covers a point of `item`, or 0.
    function markerAt(item, x, y) {
        var best = null
        for (var i = 0; i < markers.length; ++i) {
            var symbol = markers[i].symbolItem
            var p = symbol.mapFromItem(item, x, y)
            if (p.x >= 0 && p.y >= 0 && p.x <= symbol.width && p.y <= symbol.height
                    && (!best || markers[i].z >= best.z))
                best = markers[i]
        }
        return best ? best.keyPointId : 0
    }

    function make(coordinate, info) {
        var marker = markerComponent.createObject(map, { keyPointId: info.elementId, coordinate: coordinate, info: info })
        map.addMapItem(marker)
        return marker
    }

    function add(coordinate, info) {
        insert(-1, coordinate, info)
    }

    // After the marker of `lastId`; at the end when there is none.
    function insert(lastId, coordinate, info) {
        if (!map || !info)
            return
        var existing = markerById(info.elementId)
        if (existing) {
            existing.coordinate = coordinate
            existing.info = info
            return
        }
        var list = markers.slice()
        var at = -1
        for (var i = 0; i < list.length; ++i) {
            if (list[i].keyPointId === lastId)
                at = i + 1
        }
        list.splice(at < 0 ? list.length : at, 0, make(coordinate, info))
        markers = list
    }

    function update(info) {
        var marker = info ? markerById(info.elementId) : null
        if (marker)
            marker.info = info
    }

    // One key with its new value, for every marker.
    function updateAll(change) {
        for (var i = 0; i < markers.length; ++i) {
            var info = Object.assign({}, markers[i].info)
            for (var key in change)
                info[key] = change[key]
            markers[i].info = info
        }
    }

    function move(keyPointId, longitude, latitude) {
        var marker = markerById(keyPointId)
        if (marker)
            marker.coordinate = QtPositioning.coordinate(latitude, longitude)
    }

    function remove(keyPointId) {
        var marker = markerById(keyPointId)
        if (!marker)
            return
        markers = markers.filter(function (m) { return m !== marker })
        map.removeMapItem(marker)
        marker.destroy()
    }

    function clear() {
        for (var i = 0; i < markers.length; ++i) {
            map.removeMapItem(markers[i])
            markers[i].destroy()
        }
        markers = []
    }

    Connections {
        target: markerSet.model
        ignoreUnknownSignals: true
        function onAddMarker(coord, keyPointInfo) { markerSet.add(coord, keyPointInfo) }
        function onInsertMarker(lastMarkerId, coord, keyPointInfo) { markerSet.insert(lastMarkerId, coord, keyPointInfo) }
        function onUpdateMarker(updateMarkerParam) { markerSet.update(updateMarkerParam) }
        function onUpdateAllMarkersProperty(updateAllMarkersPropertyParam) { markerSet.updateAll(updateAllMarkersPropertyParam) }
        function onKeyPointDeleted(kpId) { markerSet.remove(kpId) }
        function onClearAllObjects() { markerSet.clear() }
    }

    Component {
        id: markerComponent
        WaypointMarker {
            objectName: "waypointMarker"
            // With all waypoints in the edit, all are marked.
            active: markerSet.activeId === -1 || keyPointId === markerSet.activeId
            hovered: !markerSet.playing && keyPointId === markerSet.hoveredId
            playing: markerSet.playing
            popDuration: markerSet.popDuration
        }
    }
}
