import QtQuick 2.15
import QtQuick.Controls 2.15
import QtQuick.Layouts 1.15
import "../Theme"

// A duration typed in seconds, held and reported in milliseconds.
RowLayout {
    id: field

    property alias text: name.text
    property real milliseconds: 0

    signal committed(real milliseconds)

    readonly property string decimalPoint: Qt.locale().decimalPoint

    function format(ms) {
        return String(Math.round(ms / 100) / 10).replace(".", decimalPoint)
    }

    function parse(text) {
        var seconds = parseFloat(text.replace(decimalPoint, ".").replace(",", "."))
        return isFinite(seconds) ? Math.round(seconds * 1000) : NaN
    }

    Layout.fillWidth: true
    spacing: Theme.spaceS

    Label {
        id: name
        Layout.fillWidth: true
        wrapMode: Text.Wrap
        color: Theme.ink
        font.pixelSize: Theme.textBody
    }
    TextField {
        id: input
        objectName: "secondsInput"
        Layout.preferredWidth: 64
        horizontalAlignment: Text.AlignRight
        selectByMouse: true
        font.pixelSize: Theme.textBody
        text: field.format(field.milliseconds)
        validator: RegularExpressionValidator {
            regularExpression: /\d{0,5}([.,]\d{0,3})?/
        }
        onEditingFinished: {
            var ms = field.parse(text)
            if (!isNaN(ms) && ms !== field.milliseconds)
                field.committed(ms)
            text = Qt.binding(function () { return field.format(field.milliseconds) })
        }
    }
    Label {
        //: Unit after a duration field: seconds
        text: qsTr("s")
        color: Theme.inkMuted
        font.pixelSize: Theme.textBody
    }
}
