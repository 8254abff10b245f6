import QtQuick 2.15
import QtTest 1.15
import QtPositioning 5.15
import "Scene.js" as Scene

// The route and its waypoints on the map, as the waypoint model reports them, and
// what the pointer does on the map: hover, clicks, dragging waypoints and panning.
Item {
    id: stage
    width: 1280
    height: 800

    MockWaypoints {
        id: waypoints
    }

    SignalSpy { id: addSpy; signalName: "addKeyPoint" }
    SignalSpy { id: activeSpy; signalName: "setActiveKeyPointId" }
    SignalSpy { id: deleteSpy; signalName: "deleteKeyPoint" }
    SignalSpy { id: dropSpy; signalName: "changeKeyPointPosition" }
    SignalSpy { id: markerMovedSpy; signalName: "markerMoved" }
    SignalSpy { id: mouseMovedSpy; signalName: "mouseMoved" }

    // The map view's answer to a waypoint dragged on a track: the place on the
    // route, here always on the parallel 48°.
    Connections {
        id: trackAnswer
        target: null
        function onMarkerMoved(longitude, latitude) {
            host.mouseOverPathPosition = QtPositioning.coordinate(48, longitude)
        }
    }

    TestCase {
        name: "Route"
        when: windowShown

        property var view: null
        property var world: null
        property var map: null

        function init() {
            host.keypointHoveredID = 0
            host.keyPointsFixed = false
            host.markerLocked = false
            host.mouseOverPath = false
            host.mouseOverPathPosition = QtPositioning.coordinate()
            host.pathSettings = Object.assign({}, host.pathSettings, { "shadowEnabled": false })
            waypoints.activeKeyPointId = 0
            waypoints.size = 0
            var component = Qt.createComponent("qrc:/Qml/MapView/MapView.qml")
            compare(component.status, Component.Ready, component.errorString())
            view = createTemporaryObject(component, stage, { waypoints: waypoints })
            world = Scene.find(view, "mapStage")
            tryVerify(function () { return world.map && world.map.width > 0 })
            map = world.map
            var signals = Scene.find(view, "SignalList_Obj")
            var requests = Scene.find(view, "KeyPointItemsSignalList_Obj")
            for (var spy of [addSpy, activeSpy, deleteSpy])
                spy.target = requests
            for (spy of [dropSpy, markerMovedSpy, mouseMovedSpy])
                spy.target = signals
            for (spy of [addSpy, activeSpy, deleteSpy, dropSpy, markerMovedSpy, mouseMovedSpy])
                spy.clear()
            trackAnswer.target = null
        }

        function path(points) {
            return QtPositioning.path(points.map(function (p) { return QtPositioning.coordinate(p[1], p[0]) }))
        }

        function info(id, title) {
            return { "elementId": id, "title": title, "enabled": true, "size": 1, "keyPointImageSource": "",
                     "keyPointFontFrame": true, "keyPointFontShadow": false, "keyPointFontColor": "#000000",
                     "keyPointFont": { "family": "DejaVu Sans", "pointSize": 12 } }
        }

        // Map centre and zoom as the mock host has them: 11.58° E, 48.14° N.
        function addMarker(id, title, longitude, latitude) {
            waypoints.addMarker(QtPositioning.coordinate(latitude, longitude), info(id, title))
        }

        function pointOf(longitude, latitude) {
            return map.fromCoordinate(QtPositioning.coordinate(latitude, longitude), false)
        }

        function test_segments_data() {
            var a = [[10, 48], [11, 48.5]], b = [[11, 48.5], [12, 48], [13, 48.2]], c = [[8, 47], [9, 47.5]]
            return [
                { tag: "appended empty, then drawn", steps: [["add", 1, []], ["change", 1, a]],
                  ids: [1], lengths: [2], first: [10] },
                { tag: "inserted after its predecessor", steps: [["add", 1, a], ["add", 2, b], ["insert", 1, 3, c]],
                  ids: [1, 3, 2], lengths: [2, 2, 3], first: [10, 8, 11] },
                { tag: "reported by a load as changed", steps: [["change", 7, b], ["change", 8, a]],
                  ids: [7, 8], lengths: [3, 2], first: [11, 10] },
                { tag: "deleted", steps: [["add", 1, a], ["add", 2, b], ["delete", 1], ["delete", 9]],
                  ids: [2], lengths: [3], first: [11] },
                { tag: "cleared", steps: [["add", 1, a], ["add", 2, b], ["clear"]], ids: [], lengths: [], first: [] },
                { tag: "with shadow", shadow: true, steps: [["add", 1, a], ["add", 2, b]],
                  ids: [1, 2], lengths: [2, 3], first: [10, 11] },
                { tag: "shadow switched on later", steps: [["add", 1, a], ["shadow", true], ["add", 2, b], ["delete", 1]],
                  ids: [2], lengths: [3], first: [11], shadows: 1 },
                { tag: "shadow switched off", shadow: true, steps: [["add", 1, a], ["shadow", false]],
                  ids: [1], lengths: [2], first: [10], shadows: 0 }
            ]
        }

        function test_segments(data) {
            if (data.shadow)
                host.pathSettings = Object.assign({}, host.pathSettings, { "shadowEnabled": true })
            for (var step of data.steps) {
                switch (step[0]) {
                case "add": waypoints.addPathSegment(step[1], path(step[2])); break
                case "insert": waypoints.insertPathSegment(step[1], step[2], path(step[3])); break
                case "change": waypoints.pathSegmentChanged(step[1], path(step[2])); break
                case "delete": waypoints.deletePathSegment(step[1]); break
                case "clear": waypoints.clearAllObjects(); break
                case "shadow": host.pathSettings = Object.assign({}, host.pathSettings, { "shadowEnabled": step[1] }); break
                }
            }
            var route = world.routeLayer
            compare(route.segmentIds, data.ids)
            // Removed lines leave the map at once; destroy() frees them later.
            var lines = Scene.findAll(map, "routeSegment_").filter(function (l) { return map.mapItems.indexOf(l) >= 0 })
            compare(lines.length, data.ids.length)
            var shadows = Scene.findAll(map, "routeSegmentShadow_").filter(function (l) { return map.mapItems.indexOf(l) >= 0 })
            compare(shadows.length, data.shadows !== undefined ? data.shadows : data.shadow ? data.ids.length : 0)
            for (var i = 0; i < data.ids.length; ++i) {
                var line = route.lineOf(data.ids[i])
                compare(line.pathLength(), data.lengths[i], "segment " + data.ids[i])
                fuzzyCompare(line.coordinateAt(0).longitude, data.first[i], 1e-9)
            }
        }

        function test_markers_data() {
            return [
                { tag: "added in order", steps: [["add", 1, "A"], ["add", 2, "B"]], titles: ["A", "B"] },
                { tag: "inserted after its predecessor", steps: [["add", 1, "A"], ["add", 2, "B"], ["insert", 1, 3, "C"]],
                  titles: ["A", "C", "B"] },
                { tag: "inserted after an unknown one goes last", steps: [["add", 1, "A"], ["insert", 9, 3, "C"]],
                  titles: ["A", "C"] },
                { tag: "updated", steps: [["add", 1, "A"], ["add", 2, "B"], ["update", 2, "Bee"]], titles: ["A", "Bee"] },
                { tag: "one property for all", steps: [["add", 1, "A"], ["add", 2, "B"], ["all", { "size": 2 }]],
                  titles: ["A", "B"], sizes: [2, 2] },
                { tag: "all hidden", steps: [["add", 1, "A"], ["all", { "enabled": false }]], titles: ["A"], faded: true },
                { tag: "deleted", steps: [["add", 1, "A"], ["add", 2, "B"], ["delete", 1], ["delete", 7]], titles: ["B"] },
                { tag: "cleared", steps: [["add", 1, "A"], ["add", 2, "B"], ["clear"]], titles: [] },
                { tag: "moved by the map view", steps: [["add", 1, "A"], ["moved", 1, 12.5, 47.5]], titles: ["A"],
                  longitudes: [12.5] },
                { tag: "the one edited is marked", steps: [["add", 1, "A"], ["add", 2, "B"], ["active", 2]],
                  titles: ["A", "B"], marked: [false, true] },
                { tag: "all in the edit are marked", steps: [["add", 1, "A"], ["add", 2, "B"], ["active", -1]],
                  titles: ["A", "B"], marked: [true, true] }
            ]
        }

        function test_markers(data) {
            for (var step of data.steps) {
                switch (step[0]) {
                case "add": addMarker(step[1], step[2], 11, 48); break
                case "insert": waypoints.insertMarker(step[1], QtPositioning.coordinate(48, 11), info(step[2], step[3])); break
                case "update": waypoints.updateMarker(info(step[1], step[2])); break
                case "all": waypoints.updateAllMarkersProperty(step[1]); break
                case "delete": waypoints.keyPointDeleted(step[1]); break
                case "clear": waypoints.clearAllObjects(); break
                case "moved": host.keyPointPositionChanged(step[1], step[2], step[3]); break
                case "active": waypoints.activeKeyPointId = step[1]; break
                }
            }
            var markers = world.markerLayer.markers
            compare(markers.map(function (m) { return m.info.title }), data.titles)
            var onMap = Scene.findAll(map, "waypointMarker").filter(function (m) { return map.mapItems.indexOf(m) >= 0 })
            compare(onMap.length, data.titles.length)
            compare(markers.map(function (m) { return m.active }), data.marked || markers.map(function () { return false }))
            for (var i = 0; i < markers.length; ++i) {
                var caption = Scene.find(markers[i], "waypointCaption")
                verify(caption.visible)
                if (data.sizes)
                    compare(markers[i].symbolItem.width, Math.round(48 * data.sizes[i]))
                if (data.longitudes)
                    fuzzyCompare(markers[i].coordinate.longitude, data.longitudes[i], 1e-9)
                verify((markers[i].sourceItem.opacity < 1) === (data.faded === true))
            }
        }

        function test_click_data() {
            return [
                { tag: "empty map adds a waypoint", hovered: 0, at: "empty" },
                { tag: "hovered waypoint is chosen", hovered: 5, at: "empty" },
                { tag: "symbol under the pointer is chosen", hovered: 0, at: "symbol" }
            ]
        }

        function test_click(data) {
            addMarker(5, "Five", 11.58, 48.14)
            var marker = world.markerLayer.markerById(5)
            var symbol = marker.symbolItem
            // The map places its items when it next lays them out.
            tryVerify(function () {
                var at = map.fromCoordinate(QtPositioning.coordinate(48.14, 11.58), false)
                return Math.abs(marker.x + marker.anchorPoint.x - at.x) < 1
                        && Math.abs(marker.y + marker.anchorPoint.y - at.y) < 1
            })
            var point = data.at === "symbol" ? symbol.mapToItem(map, symbol.width / 2, symbol.height / 2)
                                             : Qt.point(200, 600)
            host.keypointHoveredID = data.hovered
            mouseClick(world.pointer, point.x, point.y)
            if (data.hovered === 0 && data.at === "empty") {
                compare(addSpy.count, 1)
                var coordinate = map.toCoordinate(point, false)
                fuzzyCompare(addSpy.signalArguments[0][0], coordinate.longitude, 1e-6)
                fuzzyCompare(addSpy.signalArguments[0][1], coordinate.latitude, 1e-6)
                compare(addSpy.signalArguments[0][3], "")
                compare(activeSpy.count, 0)
            } else {
                compare(addSpy.count, 0)
                compare(activeSpy.count, 1)
                compare(activeSpy.signalArguments[0][0], 5)
            }
        }

        function test_drag_data() {
            return [
                { tag: "waypoint on a route", hovered: 4, fixed: false, locked: false, result: "dropped" },
                { tag: "waypoint on a track snaps", hovered: 4, fixed: true, locked: false, result: "snapped" },
                { tag: "end of a track stays", hovered: 4, fixed: true, locked: true, result: "panned" },
                { tag: "empty map pans", hovered: 0, fixed: false, locked: false, result: "panned" }
            ]
        }

        function test_drag(data) {
            addMarker(4, "Four", 11.58, 48.14)
            host.keypointHoveredID = data.hovered
            host.keyPointsFixed = data.fixed
            host.markerLocked = data.locked
            trackAnswer.target = Scene.find(view, "SignalList_Obj")
            var start = pointOf(11.58, 48.14)
            var centre = map.center.longitude
            var end = Qt.point(start.x + 80, start.y + 40)
            var target = map.toCoordinate(end, false)
            mouseMove(world.pointer, start.x, start.y)
            mouseMovedSpy.clear()
            mouseDrag(world.pointer, start.x, start.y, 80, 40)

            var marker = world.markerLayer.markerById(4)
            if (data.result === "panned") {
                compare(dropSpy.count, 0)
                verify(map.center.longitude < centre, "the map follows the pointer")
                fuzzyCompare(marker.coordinate.longitude, 11.58, 1e-9)
            } else {
                fuzzyCompare(map.center.longitude, centre, 1e-9)
                compare(dropSpy.count, 1)
                compare(dropSpy.signalArguments[0][0], 4)
                var latitude = data.result === "snapped" ? 48 : target.latitude
                fuzzyCompare(dropSpy.signalArguments[0][1], target.longitude, 1e-6)
                fuzzyCompare(dropSpy.signalArguments[0][2], latitude, 1e-6)
                fuzzyCompare(marker.coordinate.latitude, latitude, 1e-6)
                compare(markerMovedSpy.count > 0, data.result === "snapped")
            }
            compare(addSpy.count, 0)
            compare(mouseMovedSpy.count, 0, "a drag is no hover")
        }

        function test_hover() {
            mouseMove(world.pointer, 300, 300)
            compare(mouseMovedSpy.count, 1)
            var coordinate = map.toCoordinate(Qt.point(300, 300), false)
            fuzzyCompare(mouseMovedSpy.signalArguments[0][0], coordinate.longitude, 1e-6)
            fuzzyCompare(mouseMovedSpy.signalArguments[0][1], coordinate.latitude, 1e-6)

            var dot = Scene.find(map, "routeHoverDot")
            verify(!dot.visible)
            host.mouseOverPathPosition = QtPositioning.coordinate(48.2, 11.7)
            host.mouseOverPath = true
            verify(dot.visible)
            compare(dot.coordinate, QtPositioning.coordinate(48.2, 11.7))
            compare(world.pointer.cursorShape, Qt.ArrowCursor)
            host.keypointHoveredID = 3
            verify(!dot.visible, "a waypoint under the pointer wins over the route")
            compare(world.pointer.cursorShape, Qt.PointingHandCursor)
        }

        function test_deleteKey_data() {
            return [
                { tag: "map has the keys", key: Qt.Key_Delete, editing: false, deleted: 1 },
                { tag: "backspace", key: Qt.Key_Backspace, editing: false, deleted: 1 },
                { tag: "title being edited", key: Qt.Key_Delete, editing: true, deleted: 0 }
            ]
        }

        function test_deleteKey(data) {
            waypoints.size = 1
            waypoints.activeItem = info(6, "Six")
            waypoints.activeKeyPointId = 6
            view.settingsOpen = true
            var title = Scene.find(view, "waypointTitle")
            tryCompare(title, "visible", true)
            if (data.editing)
                title.forceActiveFocus()
            else
                world.pointer.forceActiveFocus()
            keyClick(data.key)
            compare(deleteSpy.count, data.deleted)
            if (data.deleted)
                compare(deleteSpy.signalArguments[0][0], 6)
        }
    }
}
