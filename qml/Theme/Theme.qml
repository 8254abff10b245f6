pragma Singleton
import QtQuick 2.15

// Colours, spacing and type of the whole interface. The map is the stage: panels
// float over it in a light, warm paper tone and stay small.
QtObject {
    // Palette; accent, ink and paper are also the Material colours of
    // qtquickcontrols2.conf.
    readonly property color ink: "#1F2A30"
    readonly property color inkMuted: "#5E6A71"
    readonly property color paper: "#FBFAF7"
    readonly property real paperOpacity: 0.94
    readonly property color line: "#DDD8CF"
    readonly property color accent: "#C4553B"
    readonly property color accentInk: "#FFFFFF"
    readonly property color danger: "#B3261E"
    readonly property color scrim: "#401F2A30"
    readonly property color mapBackground: "#DCE6E8"
    readonly property color gridLine: "#C2D1D5"

    // Spacing scale, in pixels
    readonly property int spaceXS: 4
    readonly property int spaceS: 8
    readonly property int spaceM: 12
    readonly property int spaceL: 16
    readonly property int spaceXL: 24

    // Type scale, in pixels
    readonly property int textCaption: 12
    readonly property int textBody: 14
    readonly property int textTitle: 16
    readonly property int textHeadline: 20

    // Shapes
    readonly property int radius: 10
    readonly property int iconSize: 24
    readonly property int controlSize: 40
    readonly property int dialogWidth: 440
}
