import QtQuick 2.15
import QtQuick.Controls 2.15
import QtQuick.Layouts 1.15
import "../Theme"

// Covers the window while the program works, with what it is doing. Nothing below
// takes input until it goes away.
Popup {
    id: wait

    property alias text: message.text

    function show(text) {
        message.text = text
        open()
    }

    anchors.centerIn: parent
    modal: true
    Overlay.modal: Rectangle {
        color: Theme.scrim
    }
    dim: true
    closePolicy: Popup.NoAutoClose
    // Gone at once when the work is done, or when an error box takes its place.
    exit: null
    padding: Theme.spaceXL

    background: Rectangle {
        radius: Theme.radius
        color: Theme.paper
        border.color: Theme.line
    }

    contentItem: RowLayout {
        spacing: Theme.spaceL

        BusyIndicator {
            Layout.preferredWidth: Theme.controlSize
            Layout.preferredHeight: Theme.controlSize
            running: wait.visible
        }
        Label {
            id: message
            objectName: "waitText"
            Layout.minimumWidth: 160
            Layout.maximumWidth: 360
            wrapMode: Text.Wrap
            color: Theme.ink
            font.pixelSize: Theme.textTitle
        }
    }
}
