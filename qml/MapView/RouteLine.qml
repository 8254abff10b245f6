import QtQuick 2.15
import QtLocation 5.15

// One stretch of the route between two waypoints, or the shadow drawn under it.
MapPolyline {
    property int segmentId: 0
    // The shadow lies apart from the line by this many pixels, down and to the right.
    property real offset: 0

    transform: Translate {
        x: offset
        y: offset
    }
}
