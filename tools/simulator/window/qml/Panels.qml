import QtQuick 2.15

// Beside the display: the car's keys (a tap is a short press, the lower half of a key a long
// one), the host's menu bar, and the phone's side. Each press is played as a scenario step.
Rectangle {
    id: panels
    color: "#151a20"
    readonly property var phone: _hmiphoneController ? _hmiphoneController.phoneSource : null
    readonly property int battery: phone ? phone.deviceBatteryLevel : 0

    component Heading: Text {
        color: Theme.dim
        font.family: Theme.font
        font.pixelSize: 20
    }
    component Key: Column {
        property int code
        property alias text: shortPress.text
        spacing: 2
        Button {
            id: shortPress
            objectName: "key:" + parent.code
            width: 140
            height: 52
            fontSize: 20
            onClicked: _scenario.pressKey(parent.code, false)
        }
        Button {
            objectName: "longkey:" + parent.code
            width: 140
            height: 30
            fontSize: 14
            text: qsTr("long")
            onClicked: _scenario.pressKey(parent.code, true)
        }
    }
    component Action: Button {
        property string step
        width: 190
        height: 52
        fontSize: 20
        onClicked: _scenario.input(step)
    }

    Column {
        x: 20
        y: 16
        spacing: 10

        Heading { text: qsTr("Car keys") }
        Grid {
            columns: 4
            spacing: 10
            // The simulator's table of the car's keys.
            Repeater {
                model: _carKeys
                Key { code: modelData.code; text: qsTranslate("CarKeys", modelData.label) }
            }
        }

        Heading { text: qsTr("Menu bar") }
        Row {
            spacing: 10
            Action { width: 140; text: qsTr("Home"); step: '{"open": "home"}' }
            Action { width: 140; text: qsTr("Phone"); step: '{"open": "phone"}' }
            Action { width: 140; text: qsTr("Settings"); step: '{"open": "settings"}' }
            Action { width: 140; text: qsTr("Back"); step: '{"back": 1}' }
        }

        Heading { text: qsTr("The phone") }
        Grid {
            columns: 3
            spacing: 10
            Action {
                objectName: "phone:ring"
                text: qsTr("Ring")
                step: '{"set": "phone.incomingCall", "value": true}'
            }
            Action {
                objectName: "phone:hangUp"
                text: qsTr("Caller hangs up")
                step: '[{"set": "phone.incomingCall", "value": false},'
                      + '{"set": "phone.callConnected", "value": false},'
                      + '{"set": "phone.status", "value": 0}]'
            }
            Action {
                text: qsTr("Text message")
                step: '[{"set": "phone.textMessageSenderName", "value": "Anna Becker"},'
                      + '{"set": "phone.textMessageSenderNumber", "value": "+44 7700 900000"},'
                      + '{"set": "phone.textMessageBody", "value": "See you at eight?"},'
                      + '{"emit": "phone.newTextMessageAlert", "args": []}]'
            }
            Action { text: qsTr("Connect"); step: '{"set": "bluetooth.deviceConnected", "value": true}' }
            Action { text: qsTr("Disconnect"); step: '{"set": "bluetooth.deviceConnected", "value": false}' }
            Action { text: qsTr("Link loss"); step: '{"emit": "phone.nonUserDeviceDisconnectReceived", "args": []}' }
            Action {
                text: qsTr("Battery \u2212")
                step: '{"set": "phone.deviceBatteryLevel", "value": ' + Math.max(0, panels.battery - 1) + '}'
            }
            Action {
                text: qsTr("Battery +")
                step: '{"set": "phone.deviceBatteryLevel", "value": ' + Math.min(5, panels.battery + 1) + '}'
            }
        }
    }
}
