import QtQuick 2.15
import QtQuick.Controls 2.15
import QtQuick.Layouts 1.15
import "../Theme"

// A question with up to three answers. Each button stands for a message-box action
// id, and the id of the button pressed is what the box reports; closing the box with
// Escape reports the close action.
Dialog {
    id: box

    // Action names to ids, host.messageBoxAction.
    property var actions: ({})
    property alias text: message.text
    property var buttons: []
    property int closeActionId: -1
    property bool answered: false

    signal actionChosen(int actionId)

    function ask(text, actionContinue, actionAbort, actionClose) {
        message.text = text
        buttons = buttonsFor(actionContinue, actionAbort, actionClose)
        closeActionId = actionClose
        answered = false
        open()
    }

    // The buttons for the three ids, the same id given once, in the order they
    // stand. The save-and-then action, when there is one, is the default and stands
    // last; a discarding answer beside it stands apart on the left.
    function buttonsFor(actionContinue, actionAbort, actionClose) {
        var list = [{ role: "continue", actionId: actionContinue }]
        if (actionAbort !== actionContinue)
            list.push({ role: "abort", actionId: actionAbort })
        if (actionClose !== actionContinue && actionClose !== actionAbort)
            list.push({ role: "close", actionId: actionClose })
        var primary = list.length > 1 && list[1].role === "abort" && actionName(actionAbort) !== "actionNone" ? 1 : 0
        for (var i = 0; i < list.length; ++i) {
            list[i].text = buttonText(list[i].actionId)
            list[i].primary = i === primary
            list[i].leading = primary !== 0 && i === 0
        }
        var ordered = list.filter(function (b) { return b.leading })
        ordered = ordered.concat(list.filter(function (b) { return !b.leading && !b.primary }))
        return ordered.concat(list.filter(function (b) { return b.primary }))
    }

    function actionName(actionId) {
        for (var name in actions) {
            if (actions[name] === actionId)
                return name
        }
        return ""
    }

    function buttonText(actionId) {
        var name = actionName(actionId)
        if (name.indexOf("actionSaveAnd") === 0)
            return qsTr("Save")
        switch (name) {
        case "actionNone": return qsTr("Cancel")
        case "actionCloseApp":
        case "actionNewProject":
        case "actionLoadProject":
        case "actionLoadGPX": return qsTr("Don't save")
        case "actionSendVideo": return qsTr("Send the film")
        case "actionShowTutorial": return qsTr("Show the tutorial")
        case "actionDeleteUserAvatar": return qsTr("Delete")
        case "actionOpenWindowsSettings": return qsTr("Open the system settings")
        }
        return qsTr("OK")
    }

    Component {
        id: answerButton
        Button {
            objectName: modelData.role + "Button"
            text: modelData.text
            highlighted: modelData.primary
            flat: !modelData.primary
            focus: modelData.primary
            font.capitalization: Font.MixedCase
            onClicked: box.answer(modelData.actionId)
        }
    }

    function answer(actionId) {
        answered = true
        close()
        actionChosen(actionId)
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
    onClosed: if (!answered) answer(closeActionId)

    contentItem: ColumnLayout {
        spacing: Theme.spaceXL

        Label {
            id: message
            objectName: "messageText"
            Layout.fillWidth: true
            wrapMode: Text.Wrap
            color: Theme.ink
            font.pixelSize: Theme.textBody
            lineHeight: 1.2
        }
        RowLayout {
            Layout.fillWidth: true
            spacing: Theme.spaceS

            Repeater {
                model: box.buttons.filter(function (b) { return b.leading })
                delegate: answerButton
            }
            Item {
                Layout.fillWidth: true
            }
            Repeater {
                model: box.buttons.filter(function (b) { return !b.leading })
                delegate: answerButton
            }
        }
    }
}
