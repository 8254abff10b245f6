import QtQuick 2.15
import QtQuick.Controls 2.15
import QtQuick.Layouts 1.15
import "../Theme"

// The avatar that travels the leg of the chosen waypoint (or every leg): the
// avatars by group, its width and whether it turns with the road.
ColumnLayout {
    id: page

    // The avatar list model and its signal object "PilotItemsSignalList_Obj"
    property var avatars: null
    property var requests: null

    signal deleteAvatarRequested(int pilotId)

    readonly property var pilot: avatars && avatars.currentPilot ? avatars.currentPilot : ({})
    readonly property var groups: avatars && avatars.pilotGroups ? avatars.pilotGroups : []
    readonly property var activeGroup: avatars && avatars.activeGroup ? avatars.activeGroup : ({})

    spacing: Theme.spaceXS

    Flow {
        objectName: "avatarGroups"
        Layout.fillWidth: true
        spacing: Theme.spaceXS
        Repeater {
            model: page.groups
            delegate: Button {
                objectName: "avatarGroup_" + index
                text: modelData
                flat: page.activeGroup.groupName !== modelData
                highlighted: !flat
                font.capitalization: Font.MixedCase
                font.pixelSize: Theme.textCaption
                leftPadding: Theme.spaceS
                rightPadding: Theme.spaceS
                topInset: 2
                bottomInset: 2
                implicitHeight: 32
                onClicked: {
                    if (!page.requests)
                        return
                    page.requests.updateGroupById(index)
                    grid.positionViewAtIndex(page.activeGroup.groupIndex || 0, GridView.Beginning)
                }
            }
        }
    }

    AvatarGrid {
        id: grid
        objectName: "avatarGrid"
        Layout.fillWidth: true
        Layout.preferredHeight: Math.round(width / 4) * 3
        avatars: page.avatars
        current: page.pilot.thumbFileName || ""
        onPicked: if (page.requests) page.requests.changePilotItem(pilotId)
        onDeleteRequested: page.deleteAvatarRequested(pilotId)
        onFirstVisibleRowChanged: if (page.requests && row >= 0) page.requests.updateGroupByIndex(row)
    }

    SettingSlider {
        objectName: "avatarWidth"
        text: qsTr("Size")
        from: 20
        to: 400
        stepSize: 10
        value: page.pilot.pilotWidth > 0 ? page.pilot.pilotWidth : 120
        format: function (v) { return qsTr("%1 px").arg(Math.round(v)) }
        onCommitted: if (page.requests) page.requests.changeCurrentPilotItemWidth(value)
    }
    SettingSwitch {
        objectName: "avatarRotation"
        Layout.topMargin: Theme.spaceS
        text: qsTr("Turn with the road")
        on: page.pilot.pilotRotation === true
        onSwitched: if (page.requests) page.requests.changeCurrentPilotItemRotation(value)
    }
}
