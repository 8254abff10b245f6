import QtQuick 2.15
import QtTest 1.15
import "qrc:/Qml/MapView/AvatarView.js" as AvatarView

// How the avatar is drawn for a direction of travel: turned, mirrored, or the
// picture of a 3D series seen from that side.
Item {
    id: stage
    width: 400
    height: 400

    TestCase {
        name: "Avatar"
        when: windowShown

        function test_flatPose_data() {
            return [
                // seen from above: the nose turns with the road
                { tag: "top, east", heading: 90, rotates: true, symmetric: false, rotation: 90, mirrored: false },
                { tag: "top, heading -30", heading: -30, rotates: true, symmetric: false, rotation: 330, mirrored: false },
                { tag: "fixed picture", heading: 200, rotates: false, symmetric: false, rotation: 0, mirrored: false },
                // seen from the side: facing right, mirrored to the left
                { tag: "side, east", heading: 90, rotates: false, symmetric: true, rotation: 0, mirrored: false },
                { tag: "side, west", heading: 270, rotates: false, symmetric: true, rotation: 0, mirrored: true },
                { tag: "side, due south", heading: 180, rotates: false, symmetric: true, rotation: 0, mirrored: false },
                // both: turned, and mirrored rather than upside down
                { tag: "side turning, north-east", heading: 45, rotates: true, symmetric: true, rotation: -45, mirrored: false },
                { tag: "side turning, south-west", heading: 225, rotates: true, symmetric: true, rotation: -45, mirrored: true },
                { tag: "side turning, north-west", heading: 315, rotates: true, symmetric: true, rotation: 45, mirrored: true },
            ]
        }

        function test_flatPose(data) {
            var pose = AvatarView.flatPose(data.heading, data.rotates, data.symmetric)
            compare(pose.rotation, data.rotation)
            compare(pose.mirrored, data.mirrored)
        }

        function test_kindOf_data() {
            return [
                { tag: "3D series", pilot: { sourceFileName: "/a/ZK3D/car/car", displayFormat: "perspective" }, kind: "series" },
                { tag: "animated picture", pilot: { sourceFileName: "/a/b.gif", displayFormat: "2D", animated: true }, kind: "animated" },
                { tag: "picture", pilot: { sourceFileName: "/a/b.png", displayFormat: "2D", animated: false }, kind: "still" },
                { tag: "no picture", pilot: { sourceFileName: "", displayFormat: "perspective" }, kind: "" },
                { tag: "nothing chosen", pilot: ({}), kind: "" },
            ]
        }

        function test_kindOf(data) {
            compare(AvatarView.kindOf(data.pilot), data.kind)
        }

        function test_frameNumber_data() {
            return [
                { tag: "north", heading: 0, frame: 1 },
                { tag: "east", heading: 90, frame: 19 },
                { tag: "just short of north", heading: 358, frame: 1 },
                { tag: "rounded to the nearer view", heading: 12.6, frame: 4 },
                { tag: "negative", heading: -90, frame: 55 },
            ]
        }

        function test_frameNumber(data) {
            compare(AvatarView.frameNumber(data.heading, 72), data.frame)
        }
    }
}
