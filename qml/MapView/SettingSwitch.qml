import QtQuick 2.15
import QtQuick.Controls 2.15
import QtQuick.Layouts 1.15
import "../Theme"

// An on/off setting that shows `on` and reports the user's choice.
Switch {
    id: control

    property bool on: false

    signal switched(bool value)

    Layout.fillWidth: true
    checked: on
    font.pixelSize: Theme.textBody
    onToggled: {
        switched(checked)
        checked = Qt.binding(function () { return control.on })
    }
}
