import QtQuick 2.15
import QtQuick.Controls 2.15
import QtQuick.Layouts 1.15
import "../Theme"

// Covers the window while a film is exported: how far it has come, and the way to
// stop it or to let it run on out of sight.
Rectangle {
    id: root

    width: host.windowSize && host.windowSize.width > 0 ? host.windowSize.width : 300
    height: host.windowSize && host.windowSize.height > 0 ? host.windowSize.height : 100
    // A window of its own over the map, so it can't let the map shine through.
    color: Theme.mapBackground

    Item {
        objectName: "SignalList_Obj"
        id: signalList

        signal abortProgress()
        signal gotoBackground()
    }

    Pane {
        anchors.centerIn: parent
        width: Math.min(Theme.dialogWidth, root.width - 2 * Theme.spaceS)
        padding: root.height < 200 ? Theme.spaceS : Theme.spaceXL

        background: Rectangle {
            radius: Theme.radius
            color: Theme.paper
            border.color: Theme.line
        }

        ColumnLayout {
            anchors.fill: parent
            spacing: Theme.spaceM

            RowLayout {
                Layout.fillWidth: true
                Label {
                    Layout.fillWidth: true
                    text: qsTr("Exporting the film")
                    elide: Text.ElideRight
                    color: Theme.ink
                    font.pixelSize: Theme.textTitle
                    font.weight: Font.DemiBold
                }
                Label {
                    objectName: "percentText"
                    //: Share of the film exported so far
                    text: qsTr("%1 %").arg(Math.floor(bar.value * 100))
                    color: Theme.inkMuted
                    font.pixelSize: Theme.textBody
                }
            }
            ProgressBar {
                id: bar
                Layout.fillWidth: true
                from: 0
                to: 1
                value: host.exportPosition !== undefined ? host.exportPosition : 0
            }
            RowLayout {
                Layout.fillWidth: true
                spacing: Theme.spaceS
                Item {
                    Layout.fillWidth: true
                }
                Button {
                    objectName: "backgroundButton"
                    text: qsTr("Hide window")
                    flat: true
                    font.capitalization: Font.MixedCase
                    onClicked: signalList.gotoBackground()
                }
                Button {
                    objectName: "abortButton"
                    text: qsTr("Stop export")
                    flat: true
                    font.capitalization: Font.MixedCase
                    onClicked: signalList.abortProgress()
                }
            }
        }
    }
}
