import QtQuick 2.15
import QtQuick.Controls 2.15
import QtQuick.Layouts 1.15
import QtLocation 5.15
import QtPositioning 5.15
import "../Theme"

// Looks a place up by name through the map's geocoding service and offers the
// places found; the one chosen becomes a waypoint. The service is on the internet:
// without a connection the field says so.
Control {
    id: search

    // Made on the first search, so that a session without one never loads it.
    property Component service: Component {
        Plugin {
            name: "osm"
        }
    }
    // How long a search may take before the field gives up on the service
    property int timeout: 15000

    // "", "searching", "offline", "none" or "failed"
    property string phase: ""
    property string lastQuery: ""

    signal placeChosen(var coordinate, string address)

    readonly property string statusText: {
        switch (phase) {
        case "searching": return qsTr("Searching…")
        case "offline": return qsTr("Place search needs an internet connection.")
        case "none": return qsTr("No place found for “%1”.").arg(lastQuery)
        case "failed": return qsTr("The place search did not work. Try again later.")
        }
        return ""
    }

    function find(text) {
        var query = text.trim()
        results.close()
        if (query === "")
            return
        if (!geocoder.plugin)
            geocoder.plugin = service.createObject(search)
        lastQuery = query
        phase = "searching"
        geocoder.query = query
        geocoder.update()
        deadline.restart()
    }

    function choose(index) {
        var location = geocoder.get(index)
        results.close()
        if (!location)
            return
        placeChosen(location.coordinate, location.address.text)
        field.text = ""
        phase = ""
    }

    function clear() {
        deadline.stop()
        geocoder.cancel()
        results.close()
        field.text = ""
        phase = ""
    }

    implicitWidth: Theme.searchWidth
    padding: Theme.spaceXS
    leftPadding: Theme.spaceS
    rightPadding: Theme.spaceXS

    background: Rectangle {
        radius: Theme.radius
        color: Theme.paper
        opacity: Theme.paperOpacity
        border.color: field.activeFocus ? Theme.accent : Theme.line
    }

    contentItem: ColumnLayout {
        spacing: 0

        RowLayout {
            Layout.fillWidth: true
            Layout.preferredHeight: Theme.controlSize
            spacing: Theme.spaceXS

            Image {
                Layout.preferredWidth: Theme.iconSize
                Layout.preferredHeight: Theme.iconSize
                source: "qrc:/Qml/images/search.svg"
                sourceSize: Qt.size(Theme.iconSize, Theme.iconSize)
                opacity: 0.7
            }
            TextField {
                id: field
                objectName: "placeSearchField"
                Layout.fillWidth: true
                placeholderText: qsTr("Search a place")
                selectByMouse: true
                background: null
                topPadding: 0
                bottomPadding: 0
                verticalAlignment: TextInput.AlignVCenter
                color: Theme.ink
                font.pixelSize: Theme.textBody
                onAccepted: search.find(text)
                Keys.onEscapePressed: search.clear()
            }
            ToolBarButton {
                objectName: "clearSearchButton"
                visible: field.text !== "" || search.phase !== ""
                text: qsTr("Clear the search")
                icon.source: "qrc:/Qml/images/close.svg"
                onClicked: search.clear()
            }
        }
        Label {
            objectName: "placeSearchStatus"
            Layout.fillWidth: true
            Layout.bottomMargin: Theme.spaceXS
            visible: text !== ""
            text: search.statusText
            wrapMode: Text.Wrap
            color: search.phase === "searching" ? Theme.inkMuted : Theme.danger
            font.pixelSize: Theme.textCaption
        }
    }

    GeocodeModel {
        id: geocoder
        autoUpdate: false
        limit: 8
        onStatusChanged: {
            if (status === GeocodeModel.Loading || search.phase !== "searching")
                return
            deadline.stop()
            if (status === GeocodeModel.Error)
                search.phase = error === GeocodeModel.CommunicationError ? "offline" : "failed"
            else if (count === 0)
                search.phase = "none"
            else {
                search.phase = ""
                results.open()
            }
        }
    }

    // A service that never answers counts as one that can't be reached.
    Timer {
        id: deadline
        interval: search.timeout
        onTriggered: {
            geocoder.cancel()
            search.phase = "offline"
        }
    }

    Popup {
        id: results
        objectName: "placeSearchResults"
        y: search.height + Theme.spaceXS
        width: search.width
        padding: Theme.spaceXS
        // The keys go to the places found: arrows choose, Enter takes one.
        focus: true
        onOpened: {
            list.currentIndex = 0
            list.forceActiveFocus()
        }
        background: Rectangle {
            radius: Theme.radius
            color: Theme.paper
            border.color: Theme.line
        }
        contentItem: ListView {
            id: list
            implicitHeight: contentHeight
            model: geocoder
            clip: true
            keyNavigationEnabled: true
            Keys.onReturnPressed: search.choose(currentIndex)
            Keys.onEnterPressed: search.choose(currentIndex)
            delegate: ItemDelegate {
                width: ListView.view.width
                text: locationData.address.text
                font.pixelSize: Theme.textBody
                highlighted: ListView.isCurrentItem
                onClicked: search.choose(index)
            }
        }
    }
}
