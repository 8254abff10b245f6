import QtQuick 2.15

// Stands in for the avatar list: the browse row, two groups, an own avatar.
ListModel {
    property var currentPilot: ({ "pilotWidth": 120, "pilotRotation": true, "thumbFileName": "qrc:/Qml/images/new.svg" })
    property var pilotGroups: ["Road", "Air"]
    property var activeGroup: ({ "groupId": 0, "groupName": "Road", "groupIndex": 0 })

    ListElement { title: "Your own"; imageSource: ""; pilotId: 100; pilotGroupId: 0; isUserContent: false }
    ListElement { title: "car"; imageSource: "qrc:/Qml/images/new.svg"; pilotId: 101; pilotGroupId: 0; isUserContent: false }
    ListElement { title: "bus"; imageSource: "qrc:/Qml/images/open.svg"; pilotId: 102; pilotGroupId: 0; isUserContent: false }
    ListElement { title: "plane"; imageSource: "qrc:/Qml/images/save.svg"; pilotId: 103; pilotGroupId: 1; isUserContent: false }
    ListElement { title: "mine"; imageSource: "qrc:/Qml/images/search.svg"; pilotId: 104; pilotGroupId: 0; isUserContent: true }
}
