import QtQuick 2.15
import QtQuick.Layouts 1.15
import "../Theme"

// A thin upright line between groups of toolbar buttons.
Rectangle {
    Layout.preferredWidth: 1
    Layout.preferredHeight: Theme.iconSize
    Layout.leftMargin: Theme.spaceXS
    Layout.rightMargin: Theme.spaceXS
    color: Theme.line
}
