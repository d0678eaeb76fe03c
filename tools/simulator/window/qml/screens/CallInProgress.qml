import QtQuick 2.15
import ".."

// "CallInProgress": the calls the phone has (two while one waits or is held), how long each has
// been connected, and the call's switches: mute, handset (privacy), the keypad, swap and join
// with two calls, and hanging up.
Page {
    id: page
    readonly property var phone: _hmiphoneController.phoneSource

    //: The title of the screen of a call in progress.
    title: qsTr("Call", "screen")
    subtitle: page.phone.multipleCallsConnected ? qsTr("Two calls") : ""

    Column {
        id: calls
        objectName: "calls"
        width: parent.width
        spacing: 24
        Repeater {
            model: page.phone.callList()
            // The calls in progress; one that rings has its popup.
            CallerLine {
                visible: callState !== "incoming" && callState !== "waiting"
                width: parent.width
                fontSize: callState === "held" ? 30 : 44
                opacity: callState === "held" ? 0.7 : 1
            }
        }
    }
    // A call the phone says nothing about.
    Text {
        visible: calls.height === 0
        text: qsTr("Unknown")
        color: Theme.text
        font { family: Theme.font; pixelSize: 44 }
    }
    Row {
        y: 250
        spacing: 20
        Button {
            width: 200
            height: 100
            text: page.phone.muted ? qsTr("Muted") : qsTr("Mute")
            slot: "requestMute"
            checked: page.phone.muted
            onClicked: _hmiphoneController.requestMute()
        }
        Button {
            width: 200
            height: 100
            text: qsTr("Handset")
            slot: "requestPrivacy"
            checked: page.phone.privateMode
            onClicked: _hmiphoneController.requestPrivacy()
        }
        Button {
            width: 200
            height: 100
            text: qsTr("Keypad")
            slot: "showCallKeyPad"
            onClicked: _hmiphoneController.showCallKeyPad()
        }
        Button {
            visible: page.phone.multipleCallsConnected
            width: 200
            height: 100
            text: qsTr("Swap")
            slot: "swapCall"
            onClicked: _hmiphoneController.swapCall()
        }
        Button {
            visible: page.phone.multipleCallsConnected
            width: 200
            height: 100
            text: qsTr("Join")
            slot: "joinCalls"
            onClicked: _hmiphoneController.joinCalls()
        }
    }
    Button {
        y: 390
        width: 440
        height: 96
        text: qsTr("End call")
        slot: "endCall"
        tint: Theme.reject
        onClicked: _hmiphoneController.endCall()
    }
}
