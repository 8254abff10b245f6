import QtQuick 2.15
import QtQuick.Controls 2.15
import QtQuick.Layouts 1.15
import "../Theme"

// The name of a setting in the panel, above its control.
Label {
    Layout.fillWidth: true
    Layout.topMargin: Theme.spaceS
    color: Theme.inkMuted
    font.pixelSize: Theme.textCaption
    font.weight: Font.DemiBold
    elide: Text.ElideRight
}
