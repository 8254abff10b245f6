import QtQuick 2.15
import "../Theme"
import "Urls.js" as Urls

// What a waypoint looks like on the map: its symbol, standing on the waypoint with
// its bottom centre, and its caption above it. `info` is the waypoint model's map
// of the point: "title", "enabled", "size", "keyPointImageSource", "keyPointFont",
// "keyPointFontColor", "keyPointFontFrame", "keyPointFontShadow", and for a photo
// template "isMediaTemplate", "mediaFileName", "mediaCenterPositionOffset",
// "mediaSourceSize".
Item {
    id: waypoint

    property var info: ({})
    property bool active: false
    property bool hovered: false

    // Where the waypoint lies inside this item: the bottom centre of the symbol.
    // The plain dot is centred on the waypoint instead.
    readonly property point anchor: Qt.point(symbol.x + symbol.width / 2,
                                             symbol.y + symbol.height - (source === "" ? symbol.height / 2 : 0))
    readonly property alias symbolItem: symbol

    readonly property real scaleFactor: info.size > 0 ? info.size : 1
    readonly property string source: Urls.fromPath(info.keyPointImageSource)
    readonly property string title: info.title !== undefined ? String(info.title) : ""
    readonly property var captionFont: info.keyPointFont !== undefined ? info.keyPointFont : ({})

    width: Math.max(symbol.width, caption.width)
    height: caption.height + symbol.height
    opacity: info.enabled === false ? Theme.disabledOpacity : 1

    // The ring on the ground that marks the waypoint being edited or pointed at
    Rectangle {
        width: symbol.width * 0.6
        height: width * 0.4
        radius: height / 2
        x: waypoint.anchor.x - width / 2
        y: waypoint.anchor.y - height / 2
        visible: waypoint.active || waypoint.hovered
        color: "transparent"
        border.color: Theme.accent
        border.width: Theme.highlightWidth
        opacity: waypoint.active ? 1 : 0.6
    }

    Item {
        id: symbol
        objectName: "waypointSymbol"
        width: Math.round(Theme.markerSize * waypoint.scaleFactor * (waypoint.hovered ? 1.1 : 1))
        // The plain marker is a dot: the caption stands right above it.
        height: waypoint.source === "" ? Math.round(width / 3) : width
        x: (waypoint.width - width) / 2
        y: caption.height

        // The plain marker while the waypoint has no symbol of its own
        Rectangle {
            anchors.horizontalCenter: parent.horizontalCenter
            anchors.bottom: parent.bottom
            width: parent.width / 3
            height: width
            radius: width / 2
            visible: waypoint.source === ""
            color: Theme.accent
            border.color: Theme.accentInk
            border.width: 2
        }
        Loader {
            anchors.fill: parent
            active: waypoint.source !== ""
            sourceComponent: Urls.isAnimated(waypoint.source) ? animatedPicture : stillPicture
        }
        // A photo in a template: the template's window, sized and placed in the
        // units of the template's picture, whose centre is the origin.
        Image {
            readonly property var offset: waypoint.info.mediaCenterPositionOffset
            readonly property var size: waypoint.info.mediaSourceSize
            readonly property real unit: symbol.width / 256
            readonly property bool shown: waypoint.info.isMediaTemplate === true && !!waypoint.info.mediaFileName
            visible: shown
            source: shown ? Urls.fromPath(waypoint.info.mediaFileName) : ""
            width: size ? size.width * unit : 0
            height: size ? size.height * unit : 0
            x: symbol.width / 2 + (offset ? offset.x * unit : 0) - width / 2
            y: symbol.height / 2 + (offset ? offset.y * unit : 0) - height / 2
            fillMode: Image.PreserveAspectCrop
            asynchronous: true
            clip: true
        }
    }

    Component {
        id: stillPicture
        Image {
            source: waypoint.source
            fillMode: Image.PreserveAspectFit
            asynchronous: true
            smooth: true
            mipmap: true
        }
    }
    Component {
        id: animatedPicture
        AnimatedImage {
            source: waypoint.source
            fillMode: Image.PreserveAspectFit
            smooth: true
        }
    }

    Item {
        id: caption
        objectName: "waypointCaption"
        visible: waypoint.title.length > 0
        width: visible ? label.width + 2 * padding : 0
        height: visible ? label.height + 2 * padding + Theme.spaceXS : 0
        x: (waypoint.width - width) / 2

        readonly property bool framed: waypoint.info.keyPointFontFrame === true
        readonly property int padding: framed ? Theme.spaceXS + 2 : 0

        Rectangle {
            anchors.fill: label
            anchors.margins: -caption.padding
            visible: caption.framed
            radius: Theme.radius / 2
            color: Theme.paper
            opacity: Theme.paperOpacity
            border.color: waypoint.active ? Theme.accent : Theme.line
            border.width: waypoint.active ? 2 : 1
        }
        Text {
            x: label.x + 1.5
            y: label.y + 1.5
            visible: waypoint.info.keyPointFontShadow === true
            text: label.text
            font: label.font
            color: Theme.captionShadow
        }
        Text {
            id: label
            x: caption.padding
            y: caption.padding
            text: waypoint.title
            font.family: waypoint.captionFont.family || "sans-serif"
            font.pointSize: waypoint.captionFont.pointSize > 0 ? waypoint.captionFont.pointSize : 12
            font.bold: waypoint.captionFont.bold === true
            font.italic: waypoint.captionFont.italic === true
            font.underline: waypoint.captionFont.underline === true
            font.strikeout: waypoint.captionFont.strikeout === true
            color: waypoint.info.keyPointFontColor !== undefined ? waypoint.info.keyPointFontColor : Theme.ink
        }
    }
}
