import QtQuick 2.15

// Requests to the photo pool model, connected by name on the native side.
Item {
    objectName: "PhotoPoolSignalList_Obj"

    signal importUserPhotos()
    signal removeUserPhoto(string fileName)
    signal selectUserPhoto(string fileName)
    signal unSelectAllUserPhotos()
    signal dragUserPhoto(string fileName)
    signal changePhotoDate(int mode)
    signal setTransitionMode(int mode)
    signal changePhotoOrder(int mode)
    signal clearModel()
}
