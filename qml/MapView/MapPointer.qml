import QtQuick 2.15

// The pointer on the map. It reports every move, turns a click into a new waypoint
// or the choice of one, drags waypoints, and pans the map when a press on it becomes
// a drag. Wheel events go on to the map, which zooms.
MouseArea {
    id: pointer

    property var map: null
    property var markers: null
    // From the map view: the waypoint under the pointer (0 for none), whether the
    // waypoints lie on a recorded track and where the pointer meets the route.
    property int hoveredId: 0
    property bool keyPointsFixed: false
    property bool markerLocked: false
    property var routePosition: null

    // The waypoint whose symbol is under the pointer, where the map view knows none
    property int symbolUnderPointer: 0
    // "", "pan" or "marker" while the left button is down
    property string dragMode: ""
    readonly property bool draggingMarker: dragMode === "marker"

    signal pointerMoved(double longitude, double latitude)
    signal markerMoved(double longitude, double latitude)
    signal markerDropped(int keyPointId, double longitude, double latitude)
    signal mapClicked(double longitude, double latitude)
    signal markerClicked(int keyPointId)

    property int pressedId: 0
    property point pressPoint
    property point lastPoint
    property var pressCoordinate: null

    function coordinateAt(x, y) {
        return map.toCoordinate(Qt.point(x, y), false)
    }

    function waypointAt(x, y) {
        if (hoveredId > 0)
            return hoveredId
        return markers ? markers.markerAt(pointer, x, y) : 0
    }

    // On a track a waypoint slides along the route, its two ends stay put.
    function startMarkerDrag() {
        if (pressedId <= 0 || (keyPointsFixed && markerLocked))
            return false
        var marker = markers ? markers.markerById(pressedId) : null
        if (!marker)
            return false
        pressCoordinate = marker.coordinate
        dragMode = "marker"
        return true
    }

    function followPointer(x, y) {
        var coordinate = coordinateAt(x, y)
        if (keyPointsFixed)
            markerMoved(coordinate.longitude, coordinate.latitude)
        else
            markers.move(pressedId, coordinate.longitude, coordinate.latitude)
    }

    // The map view answers each move of a waypoint on a track with the place on the
    // route it snaps to.
    onRoutePositionChanged: {
        if (draggingMarker && keyPointsFixed && routePosition && routePosition.isValid)
            markers.move(pressedId, routePosition.longitude, routePosition.latitude)
    }

    anchors.fill: parent
    hoverEnabled: true
    preventStealing: true
    acceptedButtons: Qt.LeftButton
    cursorShape: dragMode === "pan" ? Qt.ClosedHandCursor
               : dragMode === "marker" || hoveredId > 0 || symbolUnderPointer > 0 ? Qt.PointingHandCursor
               : Qt.ArrowCursor

    onPressed: {
        // A text being edited in a panel is done when the map is clicked.
        forceActiveFocus()
        pressedId = waypointAt(mouse.x, mouse.y)
        pressPoint = Qt.point(mouse.x, mouse.y)
        lastPoint = pressPoint
        dragMode = ""
    }

    function hover(x, y) {
        symbolUnderPointer = markers ? markers.markerAt(pointer, x, y) : 0
        var coordinate = coordinateAt(x, y)
        pointerMoved(coordinate.longitude, coordinate.latitude)
    }

    onEntered: hover(mouseX, mouseY)

    onPositionChanged: {
        if (!pressed) {
            hover(mouse.x, mouse.y)
            return
        }
        if (dragMode === "") {
            if (Math.abs(mouse.x - pressPoint.x) < Qt.styleHints.startDragDistance
                    && Math.abs(mouse.y - pressPoint.y) < Qt.styleHints.startDragDistance)
                return
            if (!startMarkerDrag())
                dragMode = "pan"
        }
        if (dragMode === "pan")
            map.pan(Math.round(lastPoint.x - mouse.x), Math.round(lastPoint.y - mouse.y))
        else
            followPointer(mouse.x, mouse.y)
        lastPoint = Qt.point(mouse.x, mouse.y)
    }

    onReleased: {
        var coordinate = coordinateAt(mouse.x, mouse.y)
        if (dragMode === "marker") {
            // On a track the marker stands where the map view snapped it.
            var target = keyPointsFixed && routePosition && routePosition.isValid ? routePosition : coordinate
            markers.move(pressedId, target.longitude, target.latitude)
            markerDropped(pressedId, target.longitude, target.latitude)
        } else if (dragMode === "") {
            if (pressedId > 0)
                markerClicked(pressedId)
            else
                mapClicked(coordinate.longitude, coordinate.latitude)
        }
        dragMode = ""
        pressedId = 0
    }

    onCanceled: {
        if (dragMode === "marker" && pressCoordinate)
            markers.move(pressedId, pressCoordinate.longitude, pressCoordinate.latitude)
        dragMode = ""
        pressedId = 0
    }
}
