import QtQuick 2.15
import QtQuick.Controls 2.15
import QtQuick.Layouts 1.15
import "../Theme"

// The floating panel of the film's settings, opened from the film's bar.
Control {
    id: panel

    property alias film: page.film
    property alias requests: page.requests
    property real maximumHeight: 600

    signal closeRequested()

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
            Label {
                Layout.fillWidth: true
                text: qsTr("Film")
                color: Theme.ink
                font.pixelSize: Theme.textTitle
                font.weight: Font.DemiBold
            }
            ToolBarButton {
                objectName: "closeFilmSettingsButton"
                text: qsTr("Close")
                icon.source: "qrc:/Qml/images/close.svg"
                onClicked: panel.closeRequested()
            }
        }
        Flickable {
            Layout.fillWidth: true
            Layout.preferredHeight: Math.min(contentHeight, panel.maximumHeight - header.height
                                             - panel.topPadding - panel.bottomPadding - Theme.spaceS)
            contentWidth: width
            contentHeight: page.height
            clip: true
            boundsBehavior: Flickable.StopAtBounds
            ScrollBar.vertical: ScrollBar {}

            FilmSettingsPage {
                id: page
                objectName: "filmSettingsPage"
                width: parent.width
            }
        }
    }
}
