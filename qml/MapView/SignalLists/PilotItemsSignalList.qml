import QtQuick 2.15

// Requests to the avatar model, connected by name on the native side.
Item {
    objectName: "PilotItemsSignalList_Obj"

    signal changePilotItem(int pilotId)
    signal changeCurrentPilotItemWidth(double width)
    signal changeCurrentPilotItemRotation(bool state)
    signal setDeletePilotID(int pilotId)
    signal updateGroupByIndex(int index)
    signal updateGroupById(int groupId)
    signal refresh()
}
