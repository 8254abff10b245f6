import QtQuick 2.15
import QtQuick.Controls 2.15
import QtQuick.Layouts 1.15
import "../Theme"

// How the route runs between the waypoints and how it is drawn. Each change of the
// drawing goes out as the whole map of path settings with the one value changed.
ColumnLayout {
    id: page

    // host.pathSettings, host.pathMode ("line", "curve", "airplane", "route" to ids)
    // and host.currentPathMode
    property var pathSettings: ({})
    property var pathModes: ({})
    property int currentPathMode: -1
    // A recorded track keeps its course.
    property bool courseFixed: false

    signal pathSettingsEdited(var settings)
    signal pathModeChosen(int mode)

    function setting(key, fallback) {
        return pathSettings && pathSettings[key] !== undefined ? pathSettings[key] : fallback
    }

    function edit(key, value) {
        var settings = Object.assign({}, pathSettings)
        settings[key] = value
        pathSettingsEdited(settings)
    }

    readonly property var modeTitles: ({
        //: How the route runs between waypoints: straight lines
        "line": qsTr("Straight"),
        //: How the route runs between waypoints: a smooth curve
        "curve": qsTr("Curved"),
        //: How the route runs between waypoints: arcs like a flight
        "airplane": qsTr("Flight"),
        //: How the route runs between waypoints: as a route of straight legs, not drawn as a curve
        "route": qsTr("Route")
    })

    function modeOptions() {
        var options = []
        for (var name in pathModes) {
            if (modeTitles[name] !== undefined)
                options.push({ text: modeTitles[name], value: pathModes[name] })
        }
        return options.sort(function (a, b) { return a.value - b.value })
    }

    spacing: Theme.spaceXS

    SettingLabel {
        text: qsTr("Course")
    }
    SegmentedChoice {
        objectName: "pathMode"
        enabled: !page.courseFixed
        options: page.modeOptions()
        current: page.currentPathMode
        onChosen: page.pathModeChosen(value)
    }
    Label {
        Layout.fillWidth: true
        visible: page.courseFixed
        wrapMode: Text.Wrap
        color: Theme.inkMuted
        font.pixelSize: Theme.textCaption
        text: qsTr("A recorded track keeps its course.")
    }

    SettingLabel {
        text: qsTr("Colour")
    }
    ColorSwatches {
        objectName: "routeColors"
        Layout.fillWidth: true
        colors: Theme.routeColors
        current: page.setting("color", "transparent")
        onPicked: page.edit("color", colorName)
    }

    SettingSlider {
        objectName: "routeWidth"
        text: qsTr("Width")
        from: 1
        to: 20
        stepSize: 1
        value: page.setting("width", 6)
        //: A width in pixels on the screen
        format: function (v) { return qsTr("%1 px").arg(Math.round(v)) }
        onCommitted: page.edit("width", value)
    }
    SettingSlider {
        objectName: "routeOpacity"
        text: qsTr("Opacity")
        from: 0.1
        to: 1
        stepSize: 0.05
        value: page.setting("opacity", 0.8)
        format: function (v) { return qsTr("%1 %").arg(Math.round(v * 100)) }
        onCommitted: page.edit("opacity", value)
    }

    SettingSwitch {
        objectName: "routeShadow"
        Layout.topMargin: Theme.spaceS
        text: qsTr("Shadow under the route")
        on: page.setting("shadowEnabled", false) == true
        onSwitched: page.edit("shadowEnabled", value)
    }
    ColumnLayout {
        Layout.fillWidth: true
        visible: page.setting("shadowEnabled", false) == true
        spacing: Theme.spaceXS

        SettingSlider {
            objectName: "shadowDistance"
            text: qsTr("Shadow distance")
            from: 0
            to: 10
            stepSize: 0.5
            value: page.setting("shadowDistance", 3)
            format: function (v) { return qsTr("%1 px").arg(v) }
            onCommitted: page.edit("shadowDistance", value)
        }
        SettingSlider {
            objectName: "shadowWidth"
            text: qsTr("Shadow width")
            from: 0
            to: 20
            stepSize: 1
            value: page.setting("shadowWidth", 6)
            format: function (v) { return qsTr("%1 px").arg(Math.round(v)) }
            onCommitted: page.edit("shadowWidth", Math.round(value))
        }
        SettingSlider {
            objectName: "shadowOpacity"
            text: qsTr("Shadow opacity")
            from: 0.1
            to: 1
            stepSize: 0.05
            value: page.setting("shadowOpacity", 0.8)
            format: function (v) { return qsTr("%1 %").arg(Math.round(v * 100)) }
            onCommitted: page.edit("shadowOpacity", value)
        }
    }
}
