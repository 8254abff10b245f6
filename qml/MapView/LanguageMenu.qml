import QtQuick 2.15
import QtQml.Models 2.15
import QtQuick.Controls 2.15

// The interface languages, as the map view lists them, the current one checked.
Menu {
    id: menu

    // Entries of host.languageCBEntries: "title" and "selected".
    property var entries: []

    signal languageChosen(int index)

    Instantiator {
        model: menu.entries
        delegate: MenuItem {
            text: modelData.title
            checkable: true
            checked: modelData.selected === 1
            onTriggered: menu.languageChosen(index)
        }
        onObjectAdded: menu.insertItem(index, object)
        onObjectRemoved: menu.removeItem(object)
    }
}
