import QtQuick 2.15
import QtLocation 5.15
import "../Theme"

// The place on the route next to the pointer, where a click inserts a waypoint.
MapQuickItem {
    anchorPoint: Qt.point(dot.width / 2, dot.height / 2)
    z: 2.5
    sourceItem: Rectangle {
        id: dot
        width: Theme.hoverDotSize
        height: width
        radius: width / 2
        color: Theme.accentInk
        border.color: Theme.accent
        border.width: Theme.highlightWidth
    }
}
