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
    // The dark copy of the route under it, and the one under a caption
    readonly property color routeShadow: "#000000"
    readonly property color captionShadow: "#99000000"
    // Around the map in the two crop modes of the film
    readonly property color filmFrame: "#1F2A30"

    // Choices offered for the route and for captions
    readonly property var routeColors: ["#FF0000", "#E8710A", "#F2C200", "#2E9E44",
                                        "#1A73E8", "#7B3FB5", "#1F2A30", "#FFFFFF"]
    readonly property var captionColors: ["#000000", "#FFFFFF", "#C4553B", "#B3261E",
                                          "#2E9E44", "#1A73E8", "#7B3FB5", "#5E6A71"]

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
    readonly property int panelWidth: 328
    readonly property int searchWidth: 280
    readonly property int timelineWidth: 760
    readonly property int swatchSize: 28
    readonly property int symbolTileSize: 52

    // On the map: a waypoint symbol at size 1, the dot that follows the pointer on
    // the route, and the ring around the waypoint being edited
    readonly property int markerSize: 48
    readonly property int hoverDotSize: 14
    readonly property int highlightWidth: 3
    readonly property real disabledOpacity: 0.4
}
