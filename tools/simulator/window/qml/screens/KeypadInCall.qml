import QtQuick 2.15
import ".."

// "KeypadInCall": touch tones during a call: the call, the tones sent so far, the keys.
Page {
    id: page
    readonly property var phone: _hmiphoneController.phoneSource

    title: qsTr("Tones")

    Column {
        width: 540
        spacing: 8
        Repeater {
            model: page.phone.callList()
            CallerLine {
                visible: callState === "active"
                width: 540
                fontSize: 30
            }
        }
        Text {
            objectName: "tones"
            width: 540
            elide: Text.ElideLeft
            text: page.phone.dtmfNumberEntered
            color: Theme.text
            font { family: Theme.font; pixelSize: 40 }
        }
    }
    Keypad {
        x: 0
        y: 150
        onPressed: _hmiphoneController.dialPadTonePressed(key, key)
    }
    Column {
        x: 620
        y: 150
        spacing: 14
        Button {
            width: 300
            text: qsTr("Hide keypad")
            slot: "hideCallKeyPad"
            onClicked: _hmiphoneController.hideCallKeyPad()
        }
        Button {
            width: 300
            text: qsTr("End call")
            slot: "endCall"
            tint: Theme.reject
            onClicked: _hmiphoneController.endCall()
        }
    }
}
