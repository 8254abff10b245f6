import QtQuick 2.15
import QtTest 1.15

// The film's bar: play and stop, and a slider that follows the film but not while
// the user holds it, and seeks to where it is let go.
Item {
    id: stage
    width: 900
    height: 200

    property var timelineComponent: Qt.createComponent("qrc:/Qml/MapView/TimelineBar.qml")

    SignalSpy { id: seekSpy; signalName: "seekRequested" }
    SignalSpy { id: playSpy; signalName: "playRequested" }
    SignalSpy { id: stopSpy; signalName: "stopRequested" }

    TestCase {
        name: "Timeline"
        when: windowShown

        property var bar: null

        function init() {
            bar = createTemporaryObject(stage.timelineComponent, stage, { width: 760 })
            verify(bar)
            for (const spy of [seekSpy, playSpy, stopSpy]) {
                spy.clear()
                spy.target = bar
            }
        }

        function child(name) {
            return findChild(bar, name)
        }

        function test_playToggles() {
            mouseClick(child("playButton"))
            compare(playSpy.count, 1)
            bar.playing = true
            mouseClick(child("playButton"))
            compare(stopSpy.count, 1)
            compare(playSpy.count, 1)
        }

        function test_sliderFollowsTheFilmUnlessHeld() {
            var slider = child("timelineSlider")
            bar.position = 0.25
            compare(slider.value, 0.25)

            // Held at three quarters, it stays there while the film moves on...
            var track = slider.width - slider.leftPadding - slider.rightPadding
            var x = slider.leftPadding + track * 0.75
            mousePress(slider, x, slider.height / 2)
            bar.position = 0.3
            verify(Math.abs(slider.value - 0.75) < 0.02, slider.value)
            // ...and seeks there when let go; then it follows the film again.
            mouseRelease(slider, x, slider.height / 2)
            verify(seekSpy.count >= 1)
            verify(Math.abs(seekSpy.signalArguments[seekSpy.count - 1][0] - 0.75) < 0.02)
            bar.position = 0.8
            compare(slider.value, 0.8)
        }
    }
}
