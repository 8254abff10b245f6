import QtQuick 2.15

// The smallest interface the map view wires itself to: its signal object only.
Item {
    Item {
        objectName: "SignalList_Obj"
        signal saveProject()
        signal setPathMode(int mode)
        signal ignorePauseOnKeyPoint(bool state)
        signal setShowKeyPointsAtPosition(bool state)
        signal setAnimateKeyPoints(bool state)
        signal setShowCompass(bool state)
        signal setSendExportToHost(bool state)
        signal triggerMessageBoxAction(int messageId)
        signal setPathSettings(var settings)
        signal setHost(int index)
        signal setLanguage(int index)
        signal openHelp()
        signal setEnableBetaPatches(bool state)
        signal hideCursor()
        signal showCursor()
    }
}
