import QtQuick 2.15

// Stands in for the waypoint symbol list: the first row is the choice of a picture
// of one's own.
ListModel {
    ListElement { title: "Own picture"; imageSource: ""; keyPointImageItemId: 30; isAnimated: false }
    ListElement { title: "Tick"; imageSource: "qrc:/Qml/images/check.svg"; keyPointImageItemId: 21; isAnimated: false }
    ListElement { title: "Folder"; imageSource: "qrc:/Qml/images/open.svg"; keyPointImageItemId: 22; isAnimated: false }
}
