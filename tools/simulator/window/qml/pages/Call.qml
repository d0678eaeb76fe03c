import QtQuick 2.15
import ".."

// The call in progress: the number, the call's status, mute, privacy, the keypad, swap and join
// with two calls, and hanging up.
Page {
    id: page
    readonly property var phone: _hmiphoneController.phoneSource
    readonly property var statusNames: ({0: "No call", 1: "Dialling", 2: "Ended", 3: "Dialling",
                                         4: "Dialling", 5: "Dialling", 6: "Dialling", 7: "Connected",
                                         9: "Two calls", 10: "Conference", 11: "Busy", 12: "Stand-by"})
    title: phone.callNumberEntered.length > 0 ? phone.callNumberEntered : "Call"

    Text {
        objectName: "callStatus"
        text: (statusNames[phone.status] || "Status " + phone.status)
              + (phone.privateMode ? " \u2013 on the phone" : "")
        color: Theme.dim
        font.family: Theme.font
        font.pixelSize: 30
    }
    Row {
        y: 120
        spacing: 24
        Button {
            width: 220
            height: 120
            text: "Mute"
            slot: "requestMute"
            onClicked: _hmiphoneController.requestMute()
        }
        Button {
            width: 220
            height: 120
            text: "Privacy"
            slot: "requestPrivacy"
            checked: phone.privateMode
            onClicked: _hmiphoneController.requestPrivacy()
        }
        Button {
            width: 220
            height: 120
            text: "Keypad"
            slot: "showCallKeyPad"
            onClicked: _hmiphoneController.showCallKeyPad()
        }
        Button {
            visible: phone.multipleCallsConnected
            width: 220
            height: 120
            text: "Swap"
            slot: "swapCall"
            onClicked: _hmiphoneController.swapCall()
        }
        Button {
            visible: phone.multipleCallsConnected
            width: 220
            height: 120
            text: "Join"
            slot: "joinCalls"
            onClicked: _hmiphoneController.joinCalls()
        }
    }
    Button {
        y: 300
        width: 480
        height: 100
        text: "End call"
        slot: "endCall"
        tint: Theme.reject
        onClicked: _hmiphoneController.endCall()
    }
}
