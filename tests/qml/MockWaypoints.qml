import QtQuick 2.15

// Stands in for the waypoint model: its properties, and its signals for the tests
// to emit.
QtObject {
    property var availableSettingsPages: ({ "path": 0, "keyPoint": 1, "avatar": 2 })
    property int currentSettingsPage: 1
    property int activeKeyPointId: 0
    property var activeItem: ({ "elementId": 0 })
    property bool allKeyPointsEnabledState: true
    property int size: 0

    signal addMarker(var coord, var keyPointInfo)
    signal insertMarker(int lastMarkerId, var coord, var keyPointInfo)
    signal updateMarker(var updateMarkerParam)
    signal updateAllMarkersProperty(var updateAllMarkersPropertyParam)
    signal keyPointDeleted(int kpId)
    signal clearAllObjects()
    signal addPathSegment(int sId, var pathSegment)
    signal insertPathSegment(int lastSegmentId, int sId, var pathSegment)
    signal pathSegmentChanged(int sId, var pathSegment)
    signal deletePathSegment(int sId)
}
