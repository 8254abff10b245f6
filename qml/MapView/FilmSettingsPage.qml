import QtQuick 2.15
import QtQuick.Controls 2.15
import QtQuick.Layouts 1.15
import "../Theme"
import "Urls.js" as Urls

// The film: its length, its pace, the waypoints on the way, the camera and the
// fly-in at the start.
ColumnLayout {
    id: page

    // The map view ("host") and its signal object "SignalList_Obj"
    property var film: null
    property var requests: null

    function value(name, fallback) {
        return film && film[name] !== undefined ? film[name] : fallback
    }

    readonly property var modes: value("animationMode", ({}))
    readonly property int mode: value("currentAnimationMode", 0)
    readonly property bool cropping: mode === modes["cropByCircle"] || mode === modes["cropByRectangle"]

    spacing: Theme.spaceXS

    SettingSlider {
        objectName: "filmLength"
        text: qsTr("Length, of the longest film")
        from: 0.02
        to: 1
        stepSize: 0.01
        value: page.value("animationDurationPerc", 0.07)
        format: function (v) { return qsTr("%1 %").arg(Math.round(v * 100)) }
        onCommitted: page.film.setAnimationDurationPerc(value)
    }
    SettingLabel {
        text: qsTr("Longest film")
    }
    ComboBox {
        objectName: "longestFilm"
        Layout.fillWidth: true
        readonly property var entries: page.value("maxAnimationDurationCBEntries", [])
        model: entries.map(function (e) { return e.title })
        currentIndex: entries.findIndex(function (e) { return e.selected === 1 })
        font.pixelSize: Theme.textBody
        onActivated: page.film.setMaxAnimationDuration(index)
    }
    SettingSwitch {
        objectName: "evenPace"
        text: qsTr("Even pace over the whole route")
        on: page.value("linearAnimationDuration", false) === true
        onSwitched: page.film.slotLinearAnimationDuration(value)
    }

    SettingLabel {
        text: qsTr("Waypoints")
    }
    SettingSwitch {
        objectName: "waypointsWhenReached"
        text: qsTr("Appear when reached")
        on: page.value("showKeyPointsOnAnimationPosition", true) === true
        onSwitched: page.requests.setShowKeyPointsAtPosition(value)
    }
    SettingSwitch {
        objectName: "waypointsPopUp"
        text: qsTr("Pop up")
        on: page.value("animateKeyPoints", true) === true
        onSwitched: page.requests.setAnimateKeyPoints(value)
    }
    SettingSlider {
        objectName: "popUpDuration"
        visible: page.value("animateKeyPoints", true) === true
        text: qsTr("Pop-up time")
        from: 1
        to: 6
        stepSize: 1
        value: page.value("keyPointAnimationDuration", 2)
        format: function (v) { return qsTr("%1 s").arg(Math.round(v)) }
        onCommitted: page.film.setKeyPointAnimationDuration(Math.round(value))
    }
    SettingSwitch {
        objectName: "noStops"
        text: qsTr("No stops at waypoints")
        on: page.value("ignorePauseOnKeyPoint", false) === true
        onSwitched: page.requests.ignorePauseOnKeyPoint(value)
    }

    SettingLabel {
        text: qsTr("Camera")
    }
    SegmentedChoice {
        objectName: "cameraMode"
        options: [
            //: The camera stays where the user left the map
            { text: qsTr("Still"), value: page.modes["staticMode"] },
            //: The camera keeps the avatar in the middle
            { text: qsTr("Follow"), value: page.modes["keepCentered"] },
            //: The camera follows, the map seen through a round frame
            { text: qsTr("Circle"), value: page.modes["cropByCircle"] },
            //: The camera follows, the map seen through a frame of a chosen shape
            { text: qsTr("Frame"), value: page.modes["cropByRectangle"] }
        ]
        current: page.mode
        onChosen: page.requests.setAnimationMode(value)
    }
    Flow {
        objectName: "masks"
        Layout.fillWidth: true
        visible: page.cropping
        spacing: Theme.spaceXS
        Repeater {
            model: page.value("animationFrames", [])
            delegate: AbstractButton {
                objectName: "mask_" + index
                readonly property bool selected: index === page.value("currentAnimationFrame", 0)
                width: 64
                height: 36 + 2 * Theme.spaceXS
                padding: Theme.spaceXS
                Accessible.name: modelData.title
                background: Rectangle {
                    radius: Theme.radius / 2
                    color: Theme.ink
                    border.color: parent.selected || parent.hovered ? Theme.accent : Theme.line
                    border.width: parent.selected ? 2 : 1
                }
                contentItem: Image {
                    source: Urls.fromPath(modelData.thumbFileName || modelData.sourceFileName)
                    sourceSize: Qt.size(128, 72)
                    fillMode: Image.PreserveAspectFit
                    asynchronous: true
                }
                onClicked: page.requests.setAnimationFrame(index)
            }
        }
    }

    SettingSwitch {
        objectName: "flyIn"
        Layout.topMargin: Theme.spaceS
        text: qsTr("Fly in at the start")
        on: page.value("flyInAnimation", false) === true
        onSwitched: page.film.slotFlyInAnimation(value)
    }
    ColumnLayout {
        Layout.fillWidth: true
        visible: page.value("flyInAnimation", false) === true
        spacing: Theme.spaceXS

        SettingSlider {
            objectName: "flyInDuration"
            text: qsTr("Fly-in")
            from: 1
            to: 15
            stepSize: 1
            value: page.value("flyInDuration", 5)
            format: function (v) { return qsTr("%1 s").arg(Math.round(v)) }
            onCommitted: page.film.setFlyInDuration(Math.round(value))
        }
        SettingSwitch {
            objectName: "flyInRotation"
            text: qsTr("Turn on the way")
            on: page.value("enableFlyInRotation", true) === true
            onSwitched: page.film.setEnableFlyInRotation(value)
        }
        SettingSlider {
            objectName: "flyInStartRotation"
            visible: page.value("enableFlyInRotation", true) === true
            text: qsTr("Turn by")
            from: -180
            to: 180
            stepSize: 5
            value: page.value("flyInStartRotation", 60)
            format: function (v) { return qsTr("%1°").arg(Math.round(v)) }
            onCommitted: page.film.setFlyInStartRotation(Math.round(value))
        }
        SettingSwitch {
            objectName: "flyInTilt"
            text: qsTr("Tilt on the way")
            on: page.value("enableFlyInTilt", true) === true
            onSwitched: page.film.setEnableFlyInTilt(value)
        }
        SettingSlider {
            objectName: "flyInEndTilt"
            visible: page.value("enableFlyInTilt", true) === true
            text: qsTr("Tilt to")
            from: 0
            to: 60
            stepSize: 1
            value: page.value("flyInEndTilt", 54)
            format: function (v) { return qsTr("%1°").arg(Math.round(v)) }
            onCommitted: page.film.setFlyInEndTilt(Math.round(value))
        }
    }
}
