import QtQuick 2.15
import QtQuick.Controls 2.15
import QtQuick.Layouts 1.15
import "../Theme"

// A named slider with its value beside the name. It shows `value` and reports a
// new one when the user lets go, not on every step of a drag.
ColumnLayout {
    id: setting

    property alias text: name.text
    property real value: 0
    property alias from: slider.from
    property alias to: slider.to
    property alias stepSize: slider.stepSize
    // The value as the user reads it
    property var format: function (v) { return String(v) }

    signal committed(real value)

    Layout.fillWidth: true
    spacing: 0

    function commit() {
        if (slider.value !== setting.value)
            setting.committed(slider.value)
        slider.value = Qt.binding(function () { return setting.value })
    }

    RowLayout {
        Layout.fillWidth: true
        SettingLabel {
            id: name
        }
        Label {
            objectName: "sliderValue"
            Layout.topMargin: Theme.spaceS
            text: setting.format(slider.value)
            color: Theme.ink
            font.pixelSize: Theme.textCaption
        }
    }
    Slider {
        id: slider
        objectName: "slider"
        Layout.fillWidth: true
        snapMode: Slider.SnapAlways
        value: setting.value
        onPressedChanged: if (!pressed) setting.commit()
        // Keys move the handle without a press.
        onMoved: if (!pressed) setting.commit()
    }
}
