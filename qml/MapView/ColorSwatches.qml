import QtQuick 2.15
import QtQuick.Controls 2.15
import "../Theme"

// A row of colours to choose from; the current one is ringed.
Grid {
    id: swatches

    property var colors: []
    property color current: "transparent"

    signal picked(string colorName)

    columns: 8
    spacing: Theme.spaceS

    Repeater {
        model: swatches.colors
        delegate: AbstractButton {
            id: swatch
            objectName: "swatch_" + modelData
            readonly property bool selected: Qt.colorEqual(swatches.current, modelData)
            implicitWidth: Theme.swatchSize
            implicitHeight: Theme.swatchSize
            Accessible.name: modelData
            background: Rectangle {
                radius: width / 2
                color: modelData
                border.color: swatch.selected ? Theme.accent : Theme.line
                border.width: swatch.selected ? Theme.highlightWidth : 1
                Rectangle {
                    anchors.centerIn: parent
                    width: parent.width - 2 * Theme.highlightWidth - 2
                    height: width
                    radius: width / 2
                    color: "transparent"
                    visible: swatch.selected
                    border.color: Theme.paper
                    border.width: 1
                }
            }
            onClicked: swatches.picked(modelData)
        }
    }
}
