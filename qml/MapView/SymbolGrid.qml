import QtQuick 2.15
import QtQuick.Controls 2.15
import QtQuick.Layouts 1.15
import "../Theme"
import "Urls.js" as Urls

// The waypoint symbols to choose from: the rows of the symbol model, with "title",
// "imageSource", "keyPointImageItemId" and "isAnimated". A row without a picture is
// the choice of a picture of one's own.
Grid {
    id: grid

    property var symbols: null
    // The symbol of the waypoint being edited, a file path or URL
    property string current: ""

    signal picked(int symbolId)

    function fileName(source) {
        var text = String(source || "")
        return text.substring(text.lastIndexOf("/") + 1).toLowerCase()
    }

    Layout.fillWidth: true
    columns: 5
    spacing: Theme.spaceXS

    Repeater {
        model: grid.symbols
        delegate: AbstractButton {
            id: tile
            objectName: "symbol_" + model.keyPointImageItemId
            readonly property bool own: !model.imageSource
            readonly property bool selected: !own && grid.current !== ""
                                             && grid.fileName(grid.current) === grid.fileName(model.imageSource)
            implicitWidth: Theme.symbolTileSize
            implicitHeight: Theme.symbolTileSize
            padding: Theme.spaceXS
            hoverEnabled: true
            Accessible.name: model.title
            ToolTip.visible: hovered && own
            ToolTip.delay: 500
            ToolTip.text: model.title

            background: Rectangle {
                radius: Theme.radius / 2
                color: tile.own ? Theme.paper : "transparent"
                border.color: tile.selected || tile.hovered ? Theme.accent : Theme.line
                border.width: tile.selected ? 2 : 1
            }
            contentItem: Item {
                Image {
                    anchors.centerIn: parent
                    width: Theme.iconSize
                    height: Theme.iconSize
                    visible: tile.own
                    source: tile.own ? "qrc:/Qml/images/own-picture.svg" : ""
                    sourceSize: Qt.size(Theme.iconSize, Theme.iconSize)
                }
                Loader {
                    anchors.fill: parent
                    active: !tile.own
                    sourceComponent: Urls.isAnimated(model.imageSource) ? animated : still
                }
                Component {
                    id: still
                    Image {
                        source: Urls.fromPath(model.imageSource)
                        fillMode: Image.PreserveAspectFit
                        asynchronous: true
                        mipmap: true
                    }
                }
                Component {
                    id: animated
                    AnimatedImage {
                        source: Urls.fromPath(model.imageSource)
                        fillMode: Image.PreserveAspectFit
                    }
                }
            }
            onClicked: grid.picked(model.keyPointImageItemId)
        }
    }
}
