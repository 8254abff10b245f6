import QtQuick 2.15
import QtQml 2.15
import QtQuick.Controls 2.15
import QtQuick.Layouts 1.15
import "../Theme"

// The film's bar at the bottom of the window: play and stop, where the film stands
// and how long it is, seeking, the film's settings and full screen.
Control {
    id: bar

    property bool playing: false
    // 0..1 of the film
    property real position: 0
    property string positionText: "00m00s"
    property string lengthText: "00m00s"
    property bool settingsOpen: false

    signal playRequested()
    signal stopRequested()
    signal seekRequested(real position)
    signal settingsToggled()
    signal fullScreenRequested()

    padding: Theme.spaceXS
    leftPadding: Theme.spaceS
    rightPadding: Theme.spaceS

    background: Rectangle {
        radius: Theme.radius
        color: Theme.paper
        opacity: Theme.paperOpacity
        border.color: Theme.line
    }

    contentItem: RowLayout {
        spacing: Theme.spaceS

        ToolBarButton {
            objectName: "playButton"
            text: bar.playing ? qsTr("Stop the preview") : qsTr("Play the preview")
            icon.source: bar.playing ? "qrc:/Qml/images/stop.svg" : "qrc:/Qml/images/play.svg"
            icon.color: Theme.accent
            onClicked: bar.playing ? bar.stopRequested() : bar.playRequested()
        }

        Label {
            objectName: "positionText"
            text: bar.positionText
            color: Theme.ink
            font.pixelSize: Theme.textBody
            font.family: "monospace"
        }

        Slider {
            id: seek
            objectName: "timelineSlider"
            Layout.fillWidth: true
            from: 0
            to: 1
            // Follows the film except while the user drags it.
            Binding on value {
                when: !seek.pressed
                value: bar.position
                restoreMode: Binding.RestoreNone
            }
            onMoved: bar.seekRequested(value)
            Accessible.name: qsTr("Position in the film")
        }

        Label {
            objectName: "lengthText"
            text: bar.lengthText
            color: Theme.inkMuted
            font.pixelSize: Theme.textBody
            font.family: "monospace"
        }

        ToolBarSeparator {}

        ToolBarButton {
            objectName: "filmSettingsButton"
            text: qsTr("Settings of the film")
            icon.source: "qrc:/Qml/images/film-settings.svg"
            checkable: true
            checked: bar.settingsOpen
            onClicked: bar.settingsToggled()
        }
        ToolBarButton {
            objectName: "timelineFullScreenButton"
            text: qsTr("Full screen")
            icon.source: "qrc:/Qml/images/fullscreen.svg"
            onClicked: bar.fullScreenRequested()
        }
    }
}
