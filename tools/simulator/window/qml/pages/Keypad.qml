import QtQuick 2.15
import ".."

// The dial keypad ("DialKeypad") and the keypad during a call ("KeypadInCall", tones).
Page {
    id: page
    readonly property var phone: _hmiphoneController.phoneSource
    readonly property bool inCall: name === "KeypadInCall"
    title: inCall ? "Keypad" : "Dial"

    Text {
        objectName: "number"
        width: 560
        horizontalAlignment: Text.AlignHCenter
        text: page.inCall ? phone.dtmfNumberEntered : phone.callNumberEntered
        color: Theme.text
        font.family: Theme.font
        font.pixelSize: 48
    }
    Grid {
        y: 80
        columns: 3
        spacing: 16
        Repeater {
            model: ["1", "2", "3", "4", "5", "6", "7", "8", "9", "*", "0", "#"]
            Button {
                width: 176
                height: 88
                text: modelData
                fontSize: 36
                slot: page.inCall ? "dialPadTonePressed" : "dialPadButtonPressed"
                enabled: page.inCall || !_hmiphoneController.isMaximumSizeOfNumber
                onClicked: page.inCall ? _hmiphoneController.dialPadTonePressed(modelData, modelData)
                                       : _hmiphoneController.dialPadButtonPressed(modelData)
                onPressAndHold: if (!page.inCall && modelData === "0")
                                    _hmiphoneController.dialPadButtonPressed("+")
            }
        }
    }
    Column {
        x: 640
        y: 80
        spacing: 16
        Button {
            visible: !page.inCall
            width: 300
            text: "\u232B Delete"
            slot: "dialPadBackSpacePressed"
            enabled: !_hmiphoneController.isEmptyNumber
            onClicked: _hmiphoneController.dialPadBackSpacePressed()
            onPressAndHold: _hmiphoneController.dialPadBackSpaceLongPress()
        }
        Button {
            visible: !page.inCall
            width: 300
            text: "Call"
            slot: "makeCall"
            tint: Theme.accept
            onClicked: _hmiphoneController.makeCall()
        }
        Button {
            visible: !page.inCall
            width: 300
            text: "Speak it"
            slot: "dialPadSpeakItPressed"
            onClicked: _hmiphoneController.dialPadSpeakItPressed()
        }
        Button {
            visible: page.inCall
            width: 300
            text: "Hide keypad"
            slot: "hideCallKeyPad"
            onClicked: _hmiphoneController.hideCallKeyPad()
        }
        Button {
            visible: page.inCall
            width: 300
            text: "End call"
            slot: "endCall"
            tint: Theme.reject
            onClicked: _hmiphoneController.endCall()
        }
    }
}
