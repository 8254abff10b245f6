import QtQuick 2.15
import QtTest 1.15
import "Scene.js" as Scene

// The window's own logic: which action each answer of a box reports, the questions
// before leaving a modified project, the modal wait state and its replacement by an
// error, and the texts handed to the native side.
Item {
    id: stage
    width: 1280
    height: 800

    SignalSpy {
        id: actionSpy
        signalName: "triggerMessageBoxAction"
    }

    TestCase {
        name: "MapView"
        when: windowShown

        property var view: null

        function find(object, name) {
            return Scene.find(object, name)
        }

        function press(name) {
            var button = find(view, name)
            verify(button, name)
            tryCompare(button, "visible", true)
            mouseClick(button)
        }

        function init() {
            host.projectModified = false
            var component = Qt.createComponent("qrc:/Qml/MapView/MapView.qml")
            compare(component.status, Component.Ready, component.errorString())
            view = createTemporaryObject(component, stage)
            verify(view)
            actionSpy.target = find(view, "SignalList_Obj")
            actionSpy.clear()
        }

        function test_messageBoxAnswers_data() {
            return [
                { tag: "closing: don't save", ids: [1003, 1004, -1], press: "continueButton", buttons: 3, expected: 1003 },
                { tag: "closing: save", ids: [1003, 1004, -1], press: "abortButton", buttons: 3, expected: 1004 },
                { tag: "closing: cancel", ids: [1003, 1004, -1], press: "closeButton", buttons: 3, expected: -1 },
                { tag: "closing: escape", ids: [1003, 1004, -1], press: "", buttons: 3, expected: -1 },
                { tag: "one action: confirm", ids: [1013, -1, -1], press: "continueButton", buttons: 2, expected: 1013 },
                { tag: "one action: cancel", ids: [1013, -1, -1], press: "abortButton", buttons: 2, expected: -1 },
                { tag: "unknown id", ids: [77, 77, 77], press: "continueButton", buttons: 1, expected: 77 }
            ]
        }

        function test_messageBoxAnswers(data) {
            host.showMessageBox("Question", data.ids[0], data.ids[1], data.ids[2])
            var box = find(view, "messageBox")
            tryCompare(box, "opened", true)
            compare(box.buttons.length, data.buttons)
            if (data.press === "")
                keyClick(Qt.Key_Escape)
            else
                press(data.press)
            tryCompare(actionSpy, "count", 1)
            compare(actionSpy.signalArguments[0][0], data.expected)
            tryCompare(box, "visible", false)
        }

        function test_hintReportsItsAction() {
            host.showHint("Note", 1012)
            tryCompare(find(view, "hintBox"), "opened", true)
            press("confirmButton")
            tryCompare(actionSpy, "count", 1)
            compare(actionSpy.signalArguments[0][0], 1012)
        }

        function test_projectCommands_data() {
            return [
                { tag: "new", command: "newProjectButton", modified: false, answer: "", expected: 1000 },
                { tag: "open", command: "openProjectButton", modified: false, answer: "", expected: 1001 },
                { tag: "open track", command: "openTrackButton", modified: false, answer: "", expected: 1002 },
                { tag: "new, modified, save first", command: "newProjectButton", modified: true, answer: "abortButton", expected: 1007 },
                { tag: "open, modified, discard", command: "openProjectButton", modified: true, answer: "continueButton", expected: 1001 },
                { tag: "open, modified, cancel", command: "openProjectButton", modified: true, answer: "closeButton", expected: -1 },
                { tag: "open track, modified, save first", command: "openTrackButton", modified: true, answer: "abortButton", expected: 1009 }
            ]
        }

        function test_projectCommands(data) {
            host.projectModified = data.modified
            press(data.command)
            var box = find(view, "messageBox")
            if (data.answer !== "") {
                compare(actionSpy.count, 0, "nothing is reported before the answer")
                tryCompare(box, "opened", true)
                press(data.answer)
            } else {
                verify(!box.visible)
            }
            tryCompare(actionSpy, "count", 1)
            compare(actionSpy.signalArguments[0][0], data.expected)
        }

        function test_errorTakesWaitStatesPlace() {
            var waitBox = find(view, "waitState")
            var error = find(view, "errorBox")
            host.showWaitState("Loading 10%")
            tryCompare(waitBox, "opened", true)
            host.showWaitState("Loading 40%")
            compare(find(view, "waitText").text, "Loading 40%")

            // Modal: the commands below take no click and no shortcut.
            mouseClick(find(view, "newProjectButton"))
            keyClick(Qt.Key_N, Qt.ControlModifier)
            wait(50)
            compare(actionSpy.count, 0)

            host.showError("Broken file")
            compare(waitBox.visible, false)
            tryCompare(error, "opened", true)
            compare(find(view, "errorText").text, "Broken file")
            press("closeErrorButton")
            tryCompare(error, "visible", false)
            verify(find(view, "newProjectButton").enabled)
        }

        function test_hostStringsResentOnLanguageChange() {
            var written = host.stringWrites
            verify(written > 0, "the texts go to the native side at start")
            host.languageCBEntriesChanged()
            compare(host.stringWrites, written + 1)
            var keys = Object.keys(host.strHostStrings)
            verify(keys.length > 40)
            for (var i = 0; i < keys.length; ++i) {
                var text = host.strHostStrings[keys[i]]
                verify(text.length > 0 && text !== keys[i], keys[i])
            }
        }
    }
}
