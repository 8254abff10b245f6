import QtQuick 2.15
import QtQuick.Controls 2.15
import "../Theme"

// An icon button of the toolbar. The text is its tooltip and accessible name; the
// shortcut works wherever the window has focus, while the button is enabled.
ToolButton {
    id: button

    property alias shortcut: keys.sequence
    // Off while a menu of the button is open, which the tooltip would cover.
    property bool toolTipAllowed: true

    display: AbstractButton.IconOnly
    implicitWidth: Theme.controlSize
    implicitHeight: Theme.controlSize
    padding: (Theme.controlSize - Theme.iconSize) / 2
    icon.width: Theme.iconSize
    icon.height: Theme.iconSize
    icon.color: enabled ? Theme.ink : Theme.inkMuted

    Accessible.name: text
    ToolTip.visible: (hovered || visualFocus) && toolTipAllowed
    ToolTip.delay: 500
    ToolTip.text: keys.nativeText.length > 0 ? qsTr("%1 (%2)").arg(text).arg(keys.nativeText) : text

    Shortcut {
        id: keys
        enabled: button.enabled && sequence !== ""
        onActivated: button.clicked()
    }
}
