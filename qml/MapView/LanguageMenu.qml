import QtQuick 2.15
import QtQml.Models 2.15
import QtQuick.Controls 2.15
import "../Theme"

// The interface languages, as the map view lists them, the current one checked.
Menu {
    id: menu

    // Entries of host.languageCBEntries: "title" and "selected".
    property var entries: []

    signal languageChosen(int index)

    Instantiator {
        model: menu.entries
        // One language is always the current one: a check mark, not a box.
        delegate: MenuItem {
            id: item
            text: modelData.title
            checkable: true
            checked: modelData.selected === 1
            font.pixelSize: Theme.textBody
            implicitHeight: Theme.controlSize
            indicator: Image {
                x: item.leftPadding
                anchors.verticalCenter: parent.verticalCenter
                width: Theme.iconSize
                height: Theme.iconSize
                sourceSize: Qt.size(Theme.iconSize, Theme.iconSize)
                source: "qrc:/Qml/images/check.svg"
                visible: item.checked
            }
            onTriggered: menu.languageChosen(index)
        }
        onObjectAdded: menu.insertItem(index, object)
        onObjectRemoved: menu.removeItem(object)
    }
}
