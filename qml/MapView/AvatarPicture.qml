import QtQuick 2.15
import "Urls.js" as Urls
import "AvatarView.js" as AvatarView

// The avatar as the film shows it: a picture turned or mirrored to the direction of
// travel, an animated picture stepped by the film, or the view of a 3D avatar from
// the side it is seen from.
Item {
    id: avatar

    // The avatar model's currentPilot: "displayFormat", "pilotWidth",
    // "sourceFileName", "animated", "pilotRotation", "pilotSymmetric"
    property var pilot: ({})
    // Degrees clockwise from the top of the screen
    property real heading: 0
    // The number of steps the film has asked an animated picture for
    property int step: 0

    // Each picture reads the pilot itself: a binding that read another one of this
    // item could see it from before the change and load the wrong kind of file.
    function sourceOf(pilot, kind) {
        return AvatarView.kindOf(pilot) === kind ? Urls.fromPath(pilot.sourceFileName) : ""
    }
    readonly property var flat: AvatarView.flatPose(heading, pilot.pilotRotation === true,
                                                    pilot.pilotSymmetric === true)
    readonly property int seriesFrames: 72

    width: pilot.pilotWidth > 0 ? pilot.pilotWidth : 120
    height: width

    Image {
        objectName: "avatarStill"
        anchors.fill: parent
        source: avatar.sourceOf(avatar.pilot, "still")
        visible: source !== ""
        sourceSize: Qt.size(avatar.width * 2, avatar.height * 2)
        fillMode: Image.PreserveAspectFit
        mirror: avatar.flat.mirrored
        rotation: avatar.flat.rotation
        smooth: true
    }

    AnimatedImage {
        objectName: "avatarAnimated"
        anchors.fill: parent
        source: avatar.sourceOf(avatar.pilot, "animated")
        visible: source !== ""
        fillMode: Image.PreserveAspectFit
        playing: false
        currentFrame: frameCount > 0 ? avatar.step % frameCount : 0
        mirror: avatar.flat.mirrored
        rotation: avatar.flat.rotation
        smooth: true
    }

    // A series "<stem>_1.png" ... "<stem>_72.png"; the source names the stem.
    Image {
        objectName: "avatarSeries"
        anchors.fill: parent
        readonly property string stem: avatar.sourceOf(avatar.pilot, "series")
        source: stem !== "" ? stem + "_" + AvatarView.frameNumber(avatar.heading, avatar.seriesFrames) + ".png" : ""
        visible: source !== ""
        fillMode: Image.PreserveAspectFit
        smooth: true
    }
}
