import QtQuick 2.15

// What the interface asks of the map view. Connected by name on the native side:
// names and argument types must stay as they are, misspellings included.
Item {
    objectName: "SignalList_Obj"

    signal saveProject()
    signal setPathMode(int mode)
    signal setAnimationMode(int mode)
    signal setAnimationFrame(int frame)
    signal ignorePauseOnKeyPoint(bool state)
    signal setShowKeyPointsAtPosition(bool state)
    signal setAnimateKeyPoints(bool state)
    signal mouseMoved(double longitude, double latitude)
    signal markerMoved(double longitude, double latitude)
    signal setMoveDistance(double distance)
    signal setTimelinePosition(double position)
    signal setCenterPosition(double latitude, double longitude)
    signal saveBoundaries(double longitudeTL, double latitudeTL, double longitudeBR, double latitudeBR)
    signal exportNextFrame(int frame)
    signal startAnimation()
    signal resetAnimationLoop()
    signal stopAnimation(bool state)
    signal setCurrentAnimationPosition(int position)
    signal changeKeyPointPosition(int kpId, double longitude, double latitude)
    signal setShowCompass(bool state)
    signal setSendExportToHost(bool state)
    signal grabNextFrame()
    signal triggerMessageBoxAction(int messageId)
    signal snapShot()
    signal setPathSettings(var settings)
    signal setUserPhotosAsBGAtWaypoint(int dragElementId, int keypointID)
    signal setUserPohotosAsBGAtRoute(int dragElementId, double longlitude, double latitude)
    signal moveMediaPoint(double longlitude, double latitude, int mediaPointId)
    signal resetPhotoDrop()
    signal setTransitionMode(int mode)
    signal setHost(int index)
    signal setLanguage(int index)
    signal openHelp()
    signal setEnableBetaPatches(bool state)
    signal hideCursor()
    signal showCursor()
}
