import QtQuick 2.15
import QtQuick.Controls 2.15
import QtQuick.Layouts 1.15
import "../Theme"

// The floating panel of route and waypoint settings, one page each. The page shown
// is the waypoint model's current settings page.
Control {
    id: panel

    property var waypoints: null
    property var symbols: null
    // The avatar list and "PilotItemsSignalList_Obj"
    property var avatars: null
    property var avatarRequests: null
    // KeyPointItemsSignalList_Obj
    property var requests: null
    property alias pathSettings: routePage.pathSettings
    property alias pathModes: routePage.pathModes
    property alias currentPathMode: routePage.currentPathMode
    property alias courseFixed: routePage.courseFixed
    property real maximumHeight: 600

    signal pathSettingsEdited(var settings)
    signal pathModeChosen(int mode)
    signal closeRequested()
    signal deleteAvatarRequested(int pilotId)

    // Page names to ids, the model's availableSettingsPages: "path", "keyPoint" and
    // "avatar", which are also the tabs' indices.
    readonly property var pageIds: waypoints && waypoints.availableSettingsPages ? waypoints.availableSettingsPages
                                                                                 : ({ "path": 0, "keyPoint": 1, "avatar": 2 })
    // Until the model is there the panel keeps its page itself.
    property int localPage: pageIds["keyPoint"]
    readonly property int currentPage: waypoints ? waypoints.currentSettingsPage : localPage

    function showPage(name) {
        var id = pageIds[name]
        if (id === undefined)
            return
        localPage = id
        if (requests && waypoints)
            requests.setCurrentSettingsPage(id)
        // A tab shows the page the model has, whatever was clicked.
        tabs.currentIndex = Qt.binding(function () { return panel.currentPage })
    }

    implicitWidth: Theme.panelWidth
    padding: Theme.spaceL
    topPadding: Theme.spaceS

    background: Rectangle {
        radius: Theme.radius
        color: Theme.paper
        opacity: Theme.paperOpacity
        border.color: Theme.line
    }

    contentItem: ColumnLayout {
        spacing: Theme.spaceS

        RowLayout {
            id: header
            Layout.fillWidth: true
            spacing: Theme.spaceXS

            TabBar {
                id: tabs
                Layout.fillWidth: true
                background: null
                currentIndex: panel.currentPage
                TabButton {
                    objectName: "routePageTab"
                    text: qsTr("Route")
                    font.capitalization: Font.MixedCase
                    font.pixelSize: Theme.textBody
                    leftPadding: Theme.spaceS
                    rightPadding: Theme.spaceS
                    onClicked: panel.showPage("path")
                }
                TabButton {
                    objectName: "waypointPageTab"
                    text: qsTr("Waypoint")
                    font.capitalization: Font.MixedCase
                    font.pixelSize: Theme.textBody
                    leftPadding: Theme.spaceS
                    rightPadding: Theme.spaceS
                    onClicked: panel.showPage("keyPoint")
                }
                TabButton {
                    objectName: "avatarPageTab"
                    text: qsTr("Avatar")
                    font.capitalization: Font.MixedCase
                    font.pixelSize: Theme.textBody
                    leftPadding: Theme.spaceS
                    rightPadding: Theme.spaceS
                    onClicked: panel.showPage("avatar")
                }
            }
            ToolBarButton {
                objectName: "closeSettingsButton"
                text: qsTr("Close")
                icon.source: "qrc:/Qml/images/close.svg"
                onClicked: panel.closeRequested()
            }
        }

        Flickable {
            id: scroll
            readonly property Item page: [routePage, waypointPage, avatarPage][tabs.currentIndex] || waypointPage
            Layout.fillWidth: true
            Layout.preferredHeight: Math.min(contentHeight, panel.maximumHeight - header.height
                                             - panel.topPadding - panel.bottomPadding - Theme.spaceS)
            contentWidth: width
            contentHeight: page.height
            clip: true
            boundsBehavior: Flickable.StopAtBounds
            ScrollBar.vertical: ScrollBar {}

            RouteSettingsPage {
                id: routePage
                objectName: "routeSettingsPage"
                width: scroll.width
                visible: scroll.page === routePage
                onPathSettingsEdited: panel.pathSettingsEdited(settings)
                onPathModeChosen: panel.pathModeChosen(mode)
            }
            WaypointSettingsPage {
                id: waypointPage
                objectName: "waypointSettingsPage"
                width: scroll.width
                visible: scroll.page === waypointPage
                waypoints: panel.waypoints
                symbols: panel.symbols
                requests: panel.requests
            }
            AvatarSettingsPage {
                id: avatarPage
                objectName: "avatarSettingsPage"
                width: scroll.width
                visible: scroll.page === avatarPage
                avatars: panel.avatars
                requests: panel.avatarRequests
                onDeleteAvatarRequested: panel.deleteAvatarRequested(pilotId)
            }
        }
    }
}
