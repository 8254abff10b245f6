import QtQuick 2.15
import QtQuick.Controls 2.15
import QtQuick.Controls.Material 2.15
import QtQuick.Layouts 1.15
import "../Theme"

// The settings of the waypoint being edited, or of all waypoints at once. It shows
// the waypoint model's active item and sends each change as a request; durations
// are seconds here and milliseconds in the model.
ColumnLayout {
    id: page

    // The waypoint model and its symbol list; both null until the map view has them.
    property var waypoints: null
    property var symbols: null
    // KeyPointItemsSignalList_Obj
    property var requests: null

    readonly property var item: waypoints && waypoints.activeItem ? waypoints.activeItem : ({})
    readonly property int activeId: waypoints ? waypoints.activeKeyPointId : 0
    readonly property bool allWaypoints: activeId === -1
    readonly property bool hasWaypoints: waypoints !== null && waypoints.size > 0
    readonly property bool editing: hasWaypoints && activeId !== 0
    // The single waypoint to go back to from "all waypoints"
    property int lastSingleId: 0
    onActiveIdChanged: if (activeId > 0) lastSingleId = activeId

    spacing: Theme.spaceXS

    Label {
        objectName: "waypointHint"
        Layout.fillWidth: true
        visible: !page.editing
        wrapMode: Text.Wrap
        color: Theme.inkMuted
        font.pixelSize: Theme.textBody
        lineHeight: 1.2
        text: page.hasWaypoints ? qsTr("Click a waypoint on the map to change it.")
                                : qsTr("No waypoints yet. Click on the map to set one, or search for a place.")
    }

    SegmentedChoice {
        objectName: "waypointScope"
        visible: page.hasWaypoints
        options: [{ text: qsTr("This waypoint"), value: "one" },
                  { text: qsTr("All waypoints"), value: "all" }]
        current: page.allWaypoints ? "all" : page.activeId > 0 ? "one" : ""
        onChosen: page.requests.setActiveKeyPointId(value === "all" ? -1 : page.lastSingleId)
    }

    ColumnLayout {
        Layout.fillWidth: true
        visible: page.editing
        spacing: Theme.spaceXS

        SettingLabel {
            text: qsTr("Title")
            visible: !page.allWaypoints
        }
        TextField {
            id: titleField
            objectName: "waypointTitle"
            Layout.fillWidth: true
            visible: !page.allWaypoints
            selectByMouse: true
            font.pixelSize: Theme.textBody
            text: page.item.title !== undefined ? page.item.title : ""
            onEditingFinished: {
                if (text !== page.item.title)
                    page.requests.setKeyPointText(page.activeId, text)
                text = Qt.binding(function () { return page.item.title !== undefined ? page.item.title : "" })
            }
        }

        SettingLabel {
            text: qsTr("Symbol")
        }
        SymbolGrid {
            objectName: "symbolGrid"
            symbols: page.symbols
            current: page.item.keyPointImageSource !== undefined ? page.item.keyPointImageSource : ""
            onPicked: page.requests.setKeyPointImage(page.activeId, symbolId)
        }

        SettingSlider {
            objectName: "waypointSize"
            text: qsTr("Size")
            from: 0.25
            to: 3
            stepSize: 0.05
            value: page.item.size !== undefined ? page.item.size : 1
            //: A size in percent of the normal size
            format: function (v) { return qsTr("%1 %").arg(Math.round(v * 100)) }
            onCommitted: page.requests.setKeyPointSize(value)
        }

        SettingLabel {
            text: qsTr("Timing")
        }
        DurationField {
            objectName: "pauseDuration"
            text: qsTr("Stop at the waypoint")
            milliseconds: page.item.pauseDuration !== undefined ? page.item.pauseDuration : 0
            onCommitted: page.requests.setKeyPointPauseDuration(milliseconds)
        }
        DurationField {
            objectName: "legDuration"
            text: qsTr("On the way to the next one")
            milliseconds: page.item.animationDuration !== undefined ? page.item.animationDuration : 0
            onCommitted: page.requests.setKeyPointAnimationDuration(milliseconds)
        }

        SettingLabel {
            text: qsTr("Caption")
        }
        Button {
            objectName: "fontButton"
            Layout.fillWidth: true
            Material.background: Theme.paper
            font.capitalization: Font.MixedCase
            font.pixelSize: Theme.textBody
            readonly property var captionFont: page.item.keyPointFont
            //: Opens the choice of a font; %1 is the font's name, %2 its size in points
            text: captionFont && captionFont.family ? qsTr("Font: %1, %2 pt…").arg(captionFont.family)
                                                                           .arg(Math.round(captionFont.pointSize))
                                                    : qsTr("Font…")
            onClicked: page.requests.openFontDialog()
        }
        ColorSwatches {
            objectName: "captionColors"
            Layout.fillWidth: true
            colors: Theme.captionColors
            current: page.item.keyPointFontColor !== undefined ? page.item.keyPointFontColor : "transparent"
            onPicked: page.requests.setKeyPointFontColor(colorName)
        }
        SettingSwitch {
            objectName: "captionFrame"
            text: qsTr("Frame behind the caption")
            on: page.item.keyPointFontFrame === true
            onSwitched: page.requests.setKeyPointFontFrame(value)
        }
        SettingSwitch {
            objectName: "captionShadow"
            text: qsTr("Shadow under the caption")
            on: page.item.keyPointFontShadow === true
            onSwitched: page.requests.setKeyPointFontShadow(value)
        }

        SettingSwitch {
            objectName: "waypointEnabled"
            Layout.topMargin: Theme.spaceS
            text: page.allWaypoints ? qsTr("Show all waypoints") : qsTr("Show this waypoint")
            on: page.allWaypoints ? page.waypoints.allKeyPointsEnabledState === true : page.item.enabled !== false
            onSwitched: {
                if (page.allWaypoints)
                    page.requests.enableAllKeyPoints(value)
                else
                    page.requests.enableKeyPoint(page.activeId, value)
            }
        }

        Button {
            objectName: "deleteWaypoint"
            Layout.alignment: Qt.AlignRight
            Layout.topMargin: Theme.spaceS
            visible: !page.allWaypoints
            flat: true
            text: qsTr("Delete waypoint")
            icon.source: "qrc:/Qml/images/delete.svg"
            icon.color: Theme.danger
            Material.foreground: Theme.danger
            font.capitalization: Font.MixedCase
            font.pixelSize: Theme.textBody
            onClicked: page.requests.deleteKeyPoint(page.activeId)
        }
    }
}
