import QtQuick 2.15
import QtQuick.Controls 2.15
import QtQuick.Layouts 1.15
import "../Theme"

// The slim bar of project commands that floats over the map's top left corner,
// with the title of the project.
Control {
    id: bar

    property string title
    property var languages: []
    property bool commandsEnabled: true
    property bool settingsPanelOpen: false

    signal newProjectRequested()
    signal openProjectRequested()
    signal openTrackRequested()
    signal saveRequested()
    signal exportGpxRequested()
    signal languageChosen(int index)
    signal fullScreenRequested()
    signal settingsPanelToggled()

    padding: Theme.spaceXS
    leftPadding: Theme.spaceS
    rightPadding: Theme.spaceS

    background: Rectangle {
        radius: Theme.radius
        color: Theme.paper
        opacity: Theme.paperOpacity
        border.color: Theme.line
    }

    contentItem: RowLayout {
        spacing: Theme.spaceXS

        ToolBarButton {
            objectName: "newProjectButton"
            text: qsTr("New project")
            icon.source: "qrc:/Qml/images/new.svg"
            shortcut: "Ctrl+N"
            enabled: bar.commandsEnabled
            onClicked: bar.newProjectRequested()
        }
        ToolBarButton {
            objectName: "openProjectButton"
            text: qsTr("Open project")
            icon.source: "qrc:/Qml/images/open.svg"
            shortcut: "Ctrl+O"
            enabled: bar.commandsEnabled
            onClicked: bar.openProjectRequested()
        }
        ToolBarButton {
            objectName: "openTrackButton"
            text: qsTr("Open track")
            icon.source: "qrc:/Qml/images/open-track.svg"
            shortcut: "Ctrl+Shift+O"
            enabled: bar.commandsEnabled
            onClicked: bar.openTrackRequested()
        }
        ToolBarSeparator {}
        ToolBarButton {
            objectName: "saveButton"
            text: qsTr("Save project")
            icon.source: "qrc:/Qml/images/save.svg"
            shortcut: "Ctrl+S"
            enabled: bar.commandsEnabled
            onClicked: bar.saveRequested()
        }
        ToolBarButton {
            objectName: "exportGpxButton"
            text: qsTr("Export route as GPX")
            icon.source: "qrc:/Qml/images/export-gpx.svg"
            shortcut: "Ctrl+E"
            enabled: bar.commandsEnabled
            onClicked: bar.exportGpxRequested()
        }
        ToolBarSeparator {}
        ToolBarButton {
            objectName: "settingsPanelButton"
            text: qsTr("Route and waypoints")
            icon.source: "qrc:/Qml/images/route-settings.svg"
            enabled: bar.commandsEnabled
            icon.color: !enabled ? Theme.inkMuted : bar.settingsPanelOpen ? Theme.accent : Theme.ink
            onClicked: bar.settingsPanelToggled()
        }
        ToolBarSeparator {}
        Label {
            objectName: "projectTitle"
            Layout.leftMargin: Theme.spaceS
            Layout.rightMargin: Theme.spaceS
            Layout.maximumWidth: 360
            text: bar.title
            visible: text.length > 0
            elide: Text.ElideMiddle
            color: Theme.ink
            font.pixelSize: Theme.textBody
        }
        ToolBarSeparator { visible: bar.title.length > 0 }
        ToolBarButton {
            id: languageButton
            objectName: "languageButton"
            text: qsTr("Language")
            icon.source: "qrc:/Qml/images/language.svg"
            enabled: bar.commandsEnabled
            toolTipAllowed: !languageMenu.visible
            onClicked: languageMenu.open()

            LanguageMenu {
                id: languageMenu
                y: languageButton.height + Theme.spaceS
                entries: bar.languages
                onLanguageChosen: bar.languageChosen(index)
            }
        }
        ToolBarButton {
            objectName: "fullScreenButton"
            text: qsTr("Full screen")
            icon.source: "qrc:/Qml/images/fullscreen.svg"
            shortcut: "F11"
            enabled: bar.commandsEnabled
            onClicked: bar.fullScreenRequested()
        }
    }
}
