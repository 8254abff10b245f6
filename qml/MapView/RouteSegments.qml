import QtQuick 2.15
import "../Theme"

// The drawn route: for each path segment of the waypoint model one line, and under
// it a shadow when the route has one. Lines are made and dropped as the model
// reports its segments; a track's segment can hold 100,000 samples, so paths stay
// QGeoPath values handed to the lines whole and are never turned into JS lists.
Item {
    id: route

    property var map: null
    // The waypoint model: its addPathSegment, insertPathSegment, pathSegmentChanged,
    // deletePathSegment and clearAllObjects signals
    property var model: null
    // host.pathSettings: "color", "opacity", "width", "shadowEnabled",
    // "shadowDistance", "shadowWidth", "shadowOpacity"
    property var pathSettings: ({})

    // Segment ids in the order of the route
    property var segmentIds: []
    // Segment id to its {line, shadow}
    property var segments: ({})

    readonly property color lineColor: setting("color", "#FF0000")
    readonly property real lineOpacity: setting("opacity", 0.8)
    readonly property real lineWidth: setting("width", 6)
    readonly property bool shadowEnabled: setting("shadowEnabled", false)
    readonly property real shadowDistance: setting("shadowDistance", 3)
    readonly property real shadowWidth: setting("shadowWidth", 6)
    readonly property real shadowOpacity: setting("shadowOpacity", 0.8)

    function setting(key, fallback) {
        return pathSettings && pathSettings[key] !== undefined ? pathSettings[key] : fallback
    }

    function lineOf(segmentId) {
        var entry = segments[segmentId]
        return entry ? entry.line : null
    }

    // The shadow exists only while the route has one: an idle line of a long track
    // would cost as much as the route itself on every move of the map.
    function makeShadow(entry) {
        entry.shadow = shadowComponent.createObject(map, { segmentId: entry.line.segmentId })
        map.addMapItem(entry.shadow)
        if (entry.path)
            entry.shadow.setPath(entry.path)
    }

    function dropShadow(entry) {
        if (!entry.shadow)
            return
        map.removeMapItem(entry.shadow)
        entry.shadow.destroy()
        entry.shadow = null
    }

    function make(segmentId, path) {
        var entry = { line: lineComponent.createObject(map, { segmentId: segmentId }), shadow: null, path: null }
        map.addMapItem(entry.line)
        segments[segmentId] = entry
        if (shadowEnabled)
            makeShadow(entry)
        setPath(entry, path)
        return entry
    }

    function setPath(entry, path) {
        if (!path)
            return
        entry.path = path
        entry.line.setPath(path)
        if (entry.shadow)
            entry.shadow.setPath(path)
    }

    onShadowEnabledChanged: {
        for (var id in segments) {
            if (shadowEnabled)
                makeShadow(segments[id])
            else
                dropShadow(segments[id])
        }
    }

    function add(segmentId, path) {
        if (!map)
            return
        if (segments[segmentId]) {
            change(segmentId, path)
            return
        }
        make(segmentId, path)
        segmentIds = segmentIds.concat([segmentId])
    }

    function insert(lastSegmentId, segmentId, path) {
        if (!map)
            return
        if (segments[segmentId]) {
            change(segmentId, path)
            return
        }
        make(segmentId, path)
        var ids = segmentIds.slice()
        var at = ids.indexOf(lastSegmentId)
        ids.splice(at < 0 ? ids.length : at + 1, 0, segmentId)
        segmentIds = ids
    }

    // A project that loads reports its segments only as changed ones: an unknown id
    // is a new segment at the end.
    function change(segmentId, path) {
        var entry = segments[segmentId]
        if (entry)
            setPath(entry, path)
        else
            add(segmentId, path)
    }

    function drop(entry) {
        dropShadow(entry)
        map.removeMapItem(entry.line)
        entry.line.destroy()
    }

    function remove(segmentId) {
        var entry = segments[segmentId]
        if (!entry)
            return
        drop(entry)
        delete segments[segmentId]
        segmentIds = segmentIds.filter(function (id) { return id !== segmentId })
    }

    function clear() {
        for (var id in segments)
            drop(segments[id])
        segments = {}
        segmentIds = []
    }

    Connections {
        target: route.model
        ignoreUnknownSignals: true
        function onAddPathSegment(sId, pathSegment) { route.add(sId, pathSegment) }
        function onInsertPathSegment(lastSegmentId, sId, pathSegment) { route.insert(lastSegmentId, sId, pathSegment) }
        function onPathSegmentChanged(sId, pathSegment) { route.change(sId, pathSegment) }
        function onDeletePathSegment(sId) { route.remove(sId) }
        function onClearAllObjects() { route.clear() }
    }

    Component {
        id: lineComponent
        RouteLine {
            // Names are unique: the vector map makes a layer of each line by its name.
            objectName: "routeSegment_" + segmentId
            z: 2
            line.color: route.lineColor
            line.width: route.lineWidth
            opacity: route.lineOpacity
        }
    }

    Component {
        id: shadowComponent
        RouteLine {
            objectName: "routeSegmentShadow_" + segmentId
            z: 1
            line.color: Theme.routeShadow
            line.width: route.lineWidth + route.shadowWidth
            opacity: route.shadowOpacity
            offset: route.shadowDistance
        }
    }
}
