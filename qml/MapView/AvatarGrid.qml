import QtQuick 2.15
import QtQuick.Controls 2.15
import "../Theme"
import "Urls.js" as Urls

// The avatars to choose from, group after group. The first tile is the choice of an
// avatar of one's own; own avatars carry a button that deletes them.
GridView {
    id: grid

    // The avatar list: "title", "imageSource", "pilotId", "isUserContent", ...
    property var avatars: null
    // The thumbnail of the avatar of the waypoint's leg
    property string current: ""

    signal picked(int pilotId)
    signal deleteRequested(int pilotId)
    // The first row in sight, as the list scrolls.
    signal firstVisibleRowChanged(int row)

    function fileName(source) {
        var text = String(source || "")
        return text.substring(text.lastIndexOf("/") + 1).toLowerCase()
    }

    model: avatars
    cellWidth: Math.floor(width / 4)
    cellHeight: cellWidth
    clip: true
    boundsBehavior: Flickable.StopAtBounds
    ScrollBar.vertical: ScrollBar {}
    onContentYChanged: firstVisibleRowChanged(indexAt(width / 8, contentY + cellHeight / 2))
    // The group tabs start at the group of the first row.
    onCountChanged: if (count > 0 && contentY <= 0) firstVisibleRowChanged(0)

    delegate: AbstractButton {
        id: tile
        objectName: "avatar_" + model.pilotId
        readonly property bool browse: index === 0
        readonly property bool selected: !browse && grid.current !== ""
                                         && grid.fileName(grid.current) === grid.fileName(model.imageSource)
        width: grid.cellWidth
        height: grid.cellHeight
        padding: Theme.spaceXS
        hoverEnabled: true
        Accessible.name: model.title
        ToolTip.visible: hovered
        ToolTip.delay: 500
        ToolTip.text: model.title

        background: Rectangle {
            anchors.fill: parent
            anchors.margins: 2
            radius: Theme.radius / 2
            color: tile.browse ? Theme.paper : "transparent"
            border.color: tile.selected || tile.hovered ? Theme.accent : Theme.line
            border.width: tile.selected ? 2 : 1
        }
        contentItem: Item {
            Image {
                anchors.centerIn: parent
                width: Theme.iconSize
                height: Theme.iconSize
                visible: tile.browse
                source: tile.browse ? "qrc:/Qml/images/own-picture.svg" : ""
                sourceSize: Qt.size(Theme.iconSize, Theme.iconSize)
            }
            Image {
                anchors.fill: parent
                visible: !tile.browse
                source: tile.browse ? "" : Urls.fromPath(model.imageSource)
                sourceSize: Qt.size(2 * grid.cellWidth, 2 * grid.cellHeight)
                fillMode: Image.PreserveAspectFit
                asynchronous: true
                // An own avatar's files may be deleted: nothing of them stays cached.
                cache: !model.isUserContent
            }
        }
        onClicked: grid.picked(model.pilotId)

        ToolButton {
            objectName: "deleteAvatar_" + model.pilotId
            visible: model.isUserContent === true && !tile.browse
            anchors.top: parent.top
            anchors.right: parent.right
            width: Theme.iconSize + 4
            height: width
            padding: 2
            icon.source: "qrc:/Qml/images/delete.svg"
            icon.width: Theme.iconSize - 6
            icon.height: Theme.iconSize - 6
            icon.color: Theme.danger
            Accessible.name: qsTr("Delete this avatar")
            onClicked: grid.deleteRequested(model.pilotId)
        }
    }
}
