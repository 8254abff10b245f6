import QtQuick 2.15

// The waypoint symbol list looks for this object; it carries no requests yet.
Item {
    objectName: "KeyPointImageItemsSignalList_Obj"
}
