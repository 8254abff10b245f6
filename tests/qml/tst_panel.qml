import QtQuick 2.15
import QtTest 1.15
import QtPositioning 5.15
import QtLocation 5.15
import "Scene.js" as Scene

// The settings panel and the place search: what each control asks of the waypoint
// model and the map view, in the model's units.
Item {
    id: stage
    width: 1280
    height: 800

    MockWaypoints {
        id: waypoints
    }
    MockSymbols {
        id: symbols
    }

    SignalSpy { id: requestSpy }
    SignalSpy { id: pathModeSpy; signalName: "setPathMode" }

    // The geocoder of the search, asking a canned answer or a port where nothing
    // listens instead of the internet.
    property string geocoder
    Component {
        id: testService
        Plugin {
            name: "osm"
            PluginParameter { name: "osm.geocoding.host"; value: stage.geocoder }
        }
    }

    TestCase {
        name: "Panel"
        when: windowShown

        property var view: null

        readonly property var pathDefaults: ({ "color": "#FF0000", "opacity": 0.8, "width": 6, "shadowEnabled": false,
                                               "shadowDistance": 3, "shadowWidth": 6, "shadowOpacity": 0.8 })

        function item(id) {
            return { "elementId": id, "title": "Harbour", "enabled": true, "size": 1, "pauseDuration": 3000,
                     "animationDuration": 5000, "keyPointImageSource": "/content/waypoints/check.svg",
                     "keyPointFontFrame": true, "keyPointFontShadow": false, "keyPointFontColor": "#000000",
                     "keyPointFont": { "family": "DejaVu Sans", "pointSize": 12 } }
        }

        function init() {
            host.pathSettings = pathDefaults
            host.keyPointsFixed = false
            waypoints.size = 2
            waypoints.currentSettingsPage = 1
            waypoints.activeKeyPointId = 4
            waypoints.activeItem = item(4)
            waypoints.allKeyPointsEnabledState = true
            var component = Qt.createComponent("qrc:/Qml/MapView/MapView.qml")
            compare(component.status, Component.Ready, component.errorString())
            view = createTemporaryObject(component, stage, { waypoints: waypoints, waypointSymbols: symbols })
            view.settingsOpen = true
            requestSpy.target = find("KeyPointItemsSignalList_Obj")
            requestSpy.clear()
            pathModeSpy.target = find("SignalList_Obj")
            pathModeSpy.clear()
        }

        function find(name, within) {
            var found = Scene.find(within || view, name)
            verify(found, name)
            return found
        }

        // Scrolls the panel to a control below its fold.
        function reveal(control) {
            var flickable = control.parent
            while (flickable && flickable.contentY === undefined)
                flickable = flickable.parent
            if (!flickable)
                return
            var top = control.mapToItem(flickable.contentItem, 0, 0).y
            flickable.contentY = Math.max(0, Math.min(top, flickable.contentHeight - flickable.height))
        }

        function type(field, text) {
            field.forceActiveFocus()
            field.selectAll()
            for (var i = 0; i < text.length; ++i)
                keyClick(text[i])
            keyClick(Qt.Key_Return)
        }

        function test_durations_data() {
            return [
                { tag: "pause in seconds", field: "pauseDuration", text: "2.5", request: "setKeyPointPauseDuration", ms: 2500 },
                { tag: "decimal comma", field: "pauseDuration", text: "0,5", request: "setKeyPointPauseDuration", ms: 500 },
                { tag: "leg in seconds", field: "legDuration", text: "12", request: "setKeyPointAnimationDuration", ms: 12000 },
                { tag: "unchanged", field: "legDuration", text: "5", request: "setKeyPointAnimationDuration", ms: -1 },
                { tag: "emptied", field: "pauseDuration", text: "", request: "setKeyPointPauseDuration", ms: -1 }
            ]
        }

        function test_durations(data) {
            var field = find(data.field)
            var input = find("secondsInput", field)
            tryCompare(input, "visible", true)
            compare(input.text, String(waypoints.activeItem[data.field === "legDuration" ? "animationDuration" : "pauseDuration"] / 1000))
            requestSpy.signalName = data.request
            type(input, data.text)
            compare(requestSpy.count, data.ms < 0 ? 0 : 1)
            if (data.ms >= 0)
                compare(requestSpy.signalArguments[0][0], data.ms)
            compare(input.text, field.format(field.milliseconds), "the field shows the model again")
        }

        function test_scope_data() {
            return [
                { tag: "one: hide", active: 4, control: "waypointEnabled", request: "enableKeyPoint", args: [4, false] },
                { tag: "all: hide", active: -1, control: "waypointEnabled", request: "enableAllKeyPoints", args: [false] },
                { tag: "one: symbol", active: 4, control: "symbol_22", request: "setKeyPointImage", args: [4, 22] },
                { tag: "all: symbol", active: -1, control: "symbol_22", request: "setKeyPointImage", args: [-1, 22] },
                { tag: "one: own picture", active: 4, control: "symbol_30", request: "setKeyPointImage", args: [4, 30] },
                { tag: "one: caption colour", active: 4, control: "swatch_#1A73E8", request: "setKeyPointFontColor",
                  args: ["#1a73e8"] },
                { tag: "one: frame", active: 4, control: "captionFrame", request: "setKeyPointFontFrame", args: [false] },
                { tag: "one: font", active: 4, control: "fontButton", request: "openFontDialog", args: [] },
                { tag: "one: delete", active: 4, control: "deleteWaypoint", request: "deleteKeyPoint", args: [4] },
                { tag: "one to all", active: 4, control: "choice_all", request: "setActiveKeyPointId", args: [-1] },
                { tag: "back to the last one", active: -1, control: "choice_one", request: "setActiveKeyPointId", args: [4] }
            ]
        }

        function test_scope(data) {
            waypoints.activeKeyPointId = data.active
            compare(find("waypointTitle").visible, data.active > 0, "a title belongs to one waypoint")
            compare(find("deleteWaypoint").visible, data.active > 0)
            requestSpy.signalName = data.request
            var control = find(data.control, data.control.indexOf("swatch") === 0 ? find("captionColors") : view)
            tryCompare(control, "visible", true)
            reveal(control)
            mouseClick(control)
            compare(requestSpy.count, 1)
            var args = requestSpy.signalArguments[0]
            for (var i = 0; i < data.args.length; ++i)
                compare(String(args[i]), String(data.args[i]))
        }

        function test_hints_data() {
            return [
                { tag: "no waypoints", size: 0, active: 0, hint: "No waypoints yet", editor: false },
                { tag: "none chosen", size: 3, active: 0, hint: "Click a waypoint", editor: false },
                { tag: "one chosen", size: 3, active: 4, hint: "", editor: true }
            ]
        }

        function test_hints(data) {
            waypoints.size = data.size
            waypoints.activeKeyPointId = data.active
            var hint = find("waypointHint")
            compare(hint.visible, data.hint !== "")
            verify(hint.text.indexOf(data.hint) === 0, hint.text)
            compare(find("waypointTitle").visible, data.editor)
            compare(find("waypointScope").visible, data.size > 0)
        }

        function test_routePage_data() {
            return [
                { tag: "colour", control: "swatch_#1A73E8", key: "color", value: "#1A73E8" },
                { tag: "shadow", control: "routeShadow", key: "shadowEnabled", value: true },
                { tag: "width by key", control: "routeWidth", key: "width", value: 7 },
                { tag: "course", control: "choice_0", mode: 0 },
                { tag: "course of a track", control: "choice_0", fixed: true, mode: -1 }
            ]
        }

        function test_routePage(data) {
            host.keyPointsFixed = data.fixed === true
            waypoints.currentSettingsPage = 0
            var page = find("routeSettingsPage")
            tryCompare(page, "visible", true)
            var control = find(data.control, page)
            if (data.key === "width") {
                var slider = find("slider", control)
                slider.forceActiveFocus()
                keyClick(Qt.Key_Right)
            } else {
                mouseClick(control)
            }
            if (data.mode !== undefined) {
                compare(pathModeSpy.count, data.mode < 0 ? 0 : 1)
                if (data.mode >= 0)
                    compare(pathModeSpy.signalArguments[0][0], data.mode)
                return
            }
            var expected = Object.assign({}, pathDefaults)
            expected[data.key] = data.value
            compare(host.pathSettings, expected)
        }

        function test_pageFollowsTheModel() {
            var button = find("settingsPanelButton")
            var panel = find("settingsPanel")
            mouseClick(button)
            verify(!panel.visible)
            mouseClick(button)
            verify(panel.visible)

            requestSpy.signalName = "setCurrentSettingsPage"
            mouseClick(find("routePageTab"))
            compare(requestSpy.count, 1)
            compare(requestSpy.signalArguments[0][0], 0)
            verify(find("waypointSettingsPage").visible, "the page is the model's")
            waypoints.currentSettingsPage = 0
            verify(find("routeSettingsPage").visible)
        }

        function test_search_data() {
            return [
                { tag: "offline", geocoder: "http://127.0.0.1:9", query: "Berlin",
                  status: "Place search needs an internet connection." },
                { tag: "nothing found", geocoder: Qt.resolvedUrl("data/nowhere"), query: "Nowhere",
                  status: "No place found for “Nowhere”." },
                { tag: "second place taken", geocoder: Qt.resolvedUrl("data/places"), query: "Paris", status: "",
                  keys: [Qt.Key_Down, Qt.Key_Return], added: [-95.5555, 33.6609, 0, "Paris, Lamar County, Texas, United States"] }
            ]
        }

        function test_search(data) {
            stage.geocoder = data.geocoder
            find("placeSearch").service = testService
            requestSpy.signalName = "addKeyPoint"
            type(find("placeSearchField"), data.query)
            var status = find("placeSearchStatus")
            var results = find("placeSearchResults")
            if (data.added) {
                tryCompare(results, "opened", true, 5000)
                for (var key of data.keys)
                    keyClick(key)
                compare(requestSpy.count, 1)
                for (var i = 0; i < data.added.length; ++i)
                    compare(requestSpy.signalArguments[0][i], data.added[i])
                var map = find("worldMap")
                fuzzyCompare(map.center.longitude, data.added[0], 1e-6)
                tryCompare(results, "visible", false)
            } else {
                tryCompare(status, "text", data.status, 5000)
                verify(!results.visible)
                compare(requestSpy.count, 0)
            }
        }
    }
}
