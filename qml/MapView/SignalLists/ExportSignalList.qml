import QtQuick 2.15

// Requests to the video exporter, connected by name on the native side.
Item {
    objectName: "ExportSignalList"

    signal openSettings()
    signal startVideoExport()
    signal chooseExportFileName()
    signal exportFinished()
}
