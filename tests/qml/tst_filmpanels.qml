import QtQuick 2.15
import QtTest 1.15

// The film's settings and the avatar page: what each control asks for, in the units
// of the native side.
Item {
    id: stage
    width: 400
    height: 1400

    // The map view's slots that the film page calls directly
    QtObject {
        id: film
        property var animationMode: ({ "staticMode": 0, "keepCentered": 1, "cropByCircle": 2, "cropByRectangle": 3 })
        property int currentAnimationMode: 0
        property var animationFrames: [{ "title": "circle", "sourceFileName": "" }, { "title": "star", "sourceFileName": "" }]
        property int currentAnimationFrame: 0
        property bool flyInAnimation: true
        property var calls: []
        function setFlyInDuration(seconds) { calls.push(["setFlyInDuration", seconds]) }
        function setEnableFlyInRotation(on) { calls.push(["setEnableFlyInRotation", on]) }
        function slotLinearAnimationDuration(on) { calls.push(["slotLinearAnimationDuration", on]) }
        function setMaxAnimationDuration(index) { calls.push(["setMaxAnimationDuration", index]) }
    }
    Item {
        id: requests
        signal setAnimationMode(int mode)
        signal setAnimationFrame(int frame)
        signal setShowKeyPointsAtPosition(bool state)
        signal setAnimateKeyPoints(bool state)
        signal ignorePauseOnKeyPoint(bool state)
    }
    Item {
        id: avatarRequests
        signal changePilotItem(int pilotId)
        signal changeCurrentPilotItemWidth(double width)
        signal changeCurrentPilotItemRotation(bool state)
        signal updateGroupById(int groupId)
        signal updateGroupByIndex(int row)
    }
    MockAvatars {
        id: avatars
    }

    SignalSpy { id: spy }
    SignalSpy { id: deleteSpy; signalName: "deleteAvatarRequested" }

    property var filmComponent: Qt.createComponent("qrc:/Qml/MapView/FilmSettingsPage.qml")
    property var avatarComponent: Qt.createComponent("qrc:/Qml/MapView/AvatarSettingsPage.qml")

    TestCase {
        name: "FilmPanels"
        when: windowShown

        function filmPage() {
            film.calls = []
            film.currentAnimationMode = 0
            return createTemporaryObject(stage.filmComponent, stage, { width: 328, film: film, requests: requests })
        }

        function test_cameraAndFrames() {
            var page = filmPage()
            verify(!findChild(page, "masks").visible)
            spy.target = requests
            spy.signalName = "setAnimationMode"
            spy.clear()
            mouseClick(findChild(findChild(page, "cameraMode"), "choice_2"))
            compare(spy.signalArguments[0][0], 2)

            // The crop modes offer their frames; a frame is chosen by its place.
            film.currentAnimationMode = 2
            verify(findChild(page, "masks").visible)
            spy.signalName = "setAnimationFrame"
            spy.clear()
            mouseClick(findChild(page, "mask_1"))
            compare(spy.signalArguments[0][0], 1)
        }

        function test_switches_data() {
            return [
                { tag: "waypoints when reached", name: "waypointsWhenReached", signal: "setShowKeyPointsAtPosition", value: false },
                { tag: "pop up", name: "waypointsPopUp", signal: "setAnimateKeyPoints", value: false },
                { tag: "no stops", name: "noStops", signal: "ignorePauseOnKeyPoint", value: true },
                { tag: "even pace", name: "evenPace", call: "slotLinearAnimationDuration", value: true },
                { tag: "fly-in turns", name: "flyInRotation", call: "setEnableFlyInRotation", value: false },
            ]
        }

        function test_switches(data) {
            var page = filmPage()
            if (data.signal) {
                spy.target = requests
                spy.signalName = data.signal
                spy.clear()
            }
            mouseClick(findChild(page, data.name))
            if (data.signal)
                compare(spy.signalArguments[0][0], data.value)
            else
                compare(film.calls[0], [data.call, data.value])
        }

        function avatarPage() {
            return createTemporaryObject(stage.avatarComponent, stage,
                                         { width: 296, avatars: avatars, requests: avatarRequests })
        }

        function test_avatarChoiceAndGroups() {
            var page = avatarPage()
            var grid = findChild(page, "avatarGrid")
            tryVerify(function () { return grid.itemAtIndex(3) !== null })
            spy.target = avatarRequests
            spy.signalName = "changePilotItem"
            spy.clear()
            mouseClick(grid.itemAtIndex(3))
            compare(spy.signalArguments[0][0], 103)

            spy.signalName = "updateGroupById"
            spy.clear()
            mouseClick(findChild(page, "avatarGroup_1"))
            compare(spy.signalArguments[0][0], 1)
        }

        function test_onlyOwnAvatarsAreDeleted() {
            var page = avatarPage()
            var grid = findChild(page, "avatarGrid")
            tryVerify(function () { return grid.itemAtIndex(1) !== null })
            verify(!findChild(grid.itemAtIndex(1), "deleteAvatar_101").visible)
            deleteSpy.target = page
            deleteSpy.clear()
            grid.positionViewAtEnd()
            tryVerify(function () { return grid.itemAtIndex(4) !== null })
            var own = findChild(grid.itemAtIndex(4), "deleteAvatar_104")
            verify(own.visible)
            mouseClick(own)
            compare(deleteSpy.signalArguments[0][0], 104)
        }
    }
}
