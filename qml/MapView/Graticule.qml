import QtQuick 2.15
import QtPositioning 5.15
import "../Theme"

// Lines of latitude and longitude over the map, labelled at the window's edges, at a
// spacing that suits the zoom. Drawn flat on the screen, so only while the map is
// neither turned nor tilted.
Item {
    id: grid

    property var map: null

    property var parallels: []
    property var meridians: []

    // Spacings in degrees, whole degrees, minutes and seconds as on a chart; each
    // direction takes the finest that keeps its lines at least this far apart.
    readonly property var steps: [30, 20, 10, 5, 2, 1, 30 / 60, 20 / 60, 10 / 60, 5 / 60, 2 / 60, 1 / 60,
                                  30 / 3600, 20 / 3600, 10 / 3600, 5 / 3600]
    readonly property real minimumGap: 140

    function stepFor(pixelsPerDegree) {
        for (var i = steps.length - 1; i > 0; --i) {
            if (steps[i] * pixelsPerDegree >= minimumGap)
                return steps[i]
        }
        return steps[0]
    }

    // The angle as 51°, 51°12′ or 51°12′30″, as fine as the step needs; positive and
    // negative are the texts for either side, with %1 for the angle.
    function label(value, step, positive, negative) {
        var seconds = Math.round(Math.abs(value) * 3600)
        var text = Math.floor(seconds / 3600) + "°"
        if (step < 1)
            text += ("0" + Math.floor(seconds % 3600 / 60)).slice(-2) + "′"
        if (step < 1 / 60)
            text += ("0" + seconds % 60).slice(-2) + "″"
        return (value < 0 ? negative : positive).arg(text)
    }

    function update() {
        if (!map || !visible || width <= 0 || height <= 0)
            return
        var topLeft = map.toCoordinate(Qt.point(0, 0), false)
        var bottomRight = map.toCoordinate(Qt.point(width, height), false)
        var south = Math.max(bottomRight.latitude, -85), north = Math.min(topLeft.latitude, 85)
        var west = topLeft.longitude, east = bottomRight.longitude
        if (!isFinite(south) || !isFinite(north) || !isFinite(west) || !isFinite(east))
            return
        if (east <= west)
            east += 360
        var centre = map.center
        var lines = []
        var step = stepFor(height / (north - south))
        for (var lat = Math.ceil(south / step) * step; lat <= north; lat += step) {
            var y = map.fromCoordinate(QtPositioning.coordinate(lat, centre.longitude), false).y
            lines.push({ offset: y, label: label(lat, step,
                                                   //: Latitude north of the equator; %1 is the angle, such as 51°12′
                                                   qsTr("%1 N"),
                                                   //: Latitude south of the equator; %1 is the angle, such as 51°12′
                                                   qsTr("%1 S")) })
        }
        parallels = lines
        lines = []
        step = stepFor(width / (east - west))
        for (var lon = Math.ceil(west / step) * step; lon <= east; lon += step) {
            var x = map.fromCoordinate(QtPositioning.coordinate(centre.latitude, lon), false).x
            lines.push({ offset: x, label: label(((lon + 540) % 360) - 180, step,
                                                   //: Longitude east of Greenwich; %1 is the angle, such as 13°30′
                                                   qsTr("%1 E"),
                                                   //: Longitude west of Greenwich; %1 is the angle, such as 13°30′
                                                   qsTr("%1 W")) })
        }
        meridians = lines
    }

    onWidthChanged: update()
    onHeightChanged: update()
    onVisibleChanged: update()
    onMapChanged: update()

    Connections {
        target: grid.map
        function onCenterChanged() { grid.update() }
        function onZoomLevelChanged() { grid.update() }
    }

    Repeater {
        model: grid.parallels
        delegate: Item {
            y: modelData.offset
            width: grid.width
            Rectangle {
                width: parent.width
                height: 1
                color: Theme.gridLine
            }
            Text {
                x: Theme.spaceS
                y: -height - 2
                // Clear of the toolbar above and the other edge's labels below
                visible: parent.y > 100 && parent.y < grid.height - 3 * Theme.spaceL
                text: modelData.label
                color: Theme.inkMuted
                font.pixelSize: Theme.textCaption
            }
        }
    }
    Repeater {
        model: grid.meridians
        delegate: Item {
            x: modelData.offset
            height: grid.height
            Rectangle {
                width: 1
                height: parent.height
                color: Theme.gridLine
            }
            Text {
                x: Theme.spaceXS
                y: parent.height - height - Theme.spaceS
                visible: parent.x > 6 * Theme.spaceL && parent.x < grid.width - 6 * Theme.spaceL
                text: modelData.label
                color: Theme.inkMuted
                font.pixelSize: Theme.textCaption
            }
        }
    }
}
