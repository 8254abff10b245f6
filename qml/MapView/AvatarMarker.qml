import QtQuick 2.15
import QtLocation 5.15
import QtPositioning 5.15

// The avatar on its way along the route, centred on its place.
MapQuickItem {
    id: marker

    property var pilot: ({})
    // host.avatarPose: "valid", "longitude", "latitude", "heading"
    property var pose: ({})
    property real mapBearing: 0
    property int step: 0
    // Glides from place to place over the time of one film frame, so that the avatar
    // moves on smoothly where the preview drops frames.
    property bool glide: true

    readonly property var place: pose && pose.valid ? QtPositioning.coordinate(pose.latitude, pose.longitude)
                                                    : QtPositioning.coordinate()

    coordinate: place
    visible: place.isValid
    z: 6
    anchorPoint: Qt.point(picture.width / 2, picture.height / 2)
    Behavior on coordinate {
        enabled: marker.glide
        CoordinateAnimation { duration: 30 }
    }

    sourceItem: AvatarPicture {
        id: picture
        objectName: "avatarPicture"
        pilot: marker.pilot
        heading: (marker.pose && marker.pose.heading !== undefined ? marker.pose.heading : 0) - marker.mapBearing
        step: marker.step
    }
}
