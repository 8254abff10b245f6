import QtQuick 2.15
import QtQuick.Controls 2.15
import QtQuick.Layouts 1.15
import "../Theme"

// A note for the user with a single answer, which reports its action id; closing the
// note with Escape counts as that answer.
Dialog {
    id: box

    property alias text: message.text
    property int confirmedActionId: -1
    property bool answered: false

    signal actionChosen(int actionId)

    function show(text, actionConfirmed) {
        message.text = text
        confirmedActionId = actionConfirmed
        answered = false
        open()
    }

    function answer() {
        answered = true
        close()
        actionChosen(confirmedActionId)
    }

    anchors.centerIn: parent
    width: Math.min(Theme.dialogWidth, parent ? parent.width - 2 * Theme.spaceXL : Theme.dialogWidth)
    modal: true
    Overlay.modal: Rectangle {
        color: Theme.scrim
    }
    closePolicy: Popup.CloseOnEscape
    padding: Theme.spaceXL
    bottomPadding: Theme.spaceL
    onClosed: if (!answered) answer()

    contentItem: ColumnLayout {
        spacing: Theme.spaceXL

        Label {
            id: message
            objectName: "hintText"
            Layout.fillWidth: true
            wrapMode: Text.Wrap
            color: Theme.ink
            font.pixelSize: Theme.textBody
            lineHeight: 1.2
        }
        Button {
            objectName: "confirmButton"
            Layout.alignment: Qt.AlignRight
            text: qsTr("OK")
            highlighted: true
            font.capitalization: Font.MixedCase
            focus: true
            onClicked: box.answer()
        }
    }
}
