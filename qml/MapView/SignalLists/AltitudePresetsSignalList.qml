import QtQuick 2.15

// Requests to the altitude theme model, connected by name on the native side.
Item {
    objectName: "AltitudePresetsSignalList_Obj"

    signal setCurrentThemeIndex(int index)
    signal enableHeightScale(bool state)
    signal enableDistanceScale(bool state)
    signal setBoardColor(string color)
    signal updateActiveAltitudeTheme(var theme)
    signal loadPreset()
    signal savePreset()
}
