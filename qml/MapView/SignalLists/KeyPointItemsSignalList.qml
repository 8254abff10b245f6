import QtQuick 2.15

// Requests to the waypoint model, connected by name on the native side.
Item {
    objectName: "KeyPointItemsSignalList_Obj"

    signal setCurrentSettingsPage(int page)
    signal setActiveKeyPointId(int kpId)
    signal enableAllKeyPoints(bool state)
    signal enableKeyPoint(int kpId, bool state)
    signal setKeyPointImage(int kpId, int imageId)
    signal setKeyPointSize(double value)
    signal setKeyPointPauseDuration(double value)
    signal setKeyPointAnimationDuration(double value)
    signal setKeyPointText(int kpId, string text)
    signal openFontDialog()
    signal setKeyPointFontColor(color fontColor)
    signal setKeyPointFontFrame(bool state)
    signal setKeyPointFontShadow(bool state)
    signal setUserPhotoAsWaypoint(int dragElementId, int keypointID)
    signal addKeyPoint(double longitude, double latitude, double altitude, string title)
    signal deleteKeyPoint(int kpId)
    signal deleteMediaPoint(int mpId)
}
