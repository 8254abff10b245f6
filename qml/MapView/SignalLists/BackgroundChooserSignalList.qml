import QtQuick 2.15

// Requests to the base map chooser, connected by name on the native side.
Item {
    objectName: "BackgroundChooserSignalList"

    signal selectBackground(string identifier)
    signal openBackgroundChooser(bool state)
    signal closeBackgroundChooser()
}
