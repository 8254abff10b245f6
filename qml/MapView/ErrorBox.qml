import QtQuick 2.15
import QtQuick.Controls 2.15
import QtQuick.Layouts 1.15
import "../Theme"

// Tells the user that something failed. It reports nothing back.
Dialog {
    id: box

    property alias text: message.text

    function show(text) {
        message.text = text
        open()
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

    contentItem: ColumnLayout {
        spacing: Theme.spaceM

        Label {
            Layout.fillWidth: true
            text: qsTr("Something went wrong")
            color: Theme.danger
            font.pixelSize: Theme.textTitle
            font.weight: Font.DemiBold
        }
        Label {
            id: message
            objectName: "errorText"
            Layout.fillWidth: true
            wrapMode: Text.Wrap
            color: Theme.ink
            font.pixelSize: Theme.textBody
            lineHeight: 1.2
        }
        Button {
            objectName: "closeErrorButton"
            Layout.alignment: Qt.AlignRight
            Layout.topMargin: Theme.spaceS
            text: qsTr("OK")
            highlighted: true
            font.capitalization: Font.MixedCase
            focus: true
            onClicked: box.close()
        }
    }
}
