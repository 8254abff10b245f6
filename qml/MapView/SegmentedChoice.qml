import QtQuick 2.15
import QtQuick.Controls 2.15
import QtQuick.Layouts 1.15
import "../Theme"

// A choice of one among a few, side by side. `options` are {text, value}.
RowLayout {
    id: choice

    property var options: []
    property var current

    signal chosen(var value)

    Layout.fillWidth: true
    spacing: Theme.spaceXS

    Repeater {
        model: choice.options
        delegate: Button {
            objectName: "choice_" + modelData.value
            Layout.fillWidth: true
            Layout.preferredWidth: 1
            text: modelData.text
            // Not "checked": a button once checked turns checkable and grows a bar.
            readonly property bool selected: modelData.value === choice.current
            highlighted: selected
            flat: !selected
            leftPadding: Theme.spaceXS
            rightPadding: Theme.spaceXS
            font.capitalization: Font.MixedCase
            font.pixelSize: Theme.textBody
            onClicked: if (modelData.value !== choice.current) choice.chosen(modelData.value)
        }
    }
}
