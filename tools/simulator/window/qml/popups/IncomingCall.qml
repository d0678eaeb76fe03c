import QtQuick 2.15
import ".."

// "IncomingCall": who is calling, from the phone's call list; accept or reject.
PopupFrame {
    id: popup
    title: qsTr("Incoming call")
    actions: [{ "text": qsTr("Accept"), "call": "acceptIncomingCall", "tint": "accept" },
              { "text": qsTr("Reject"), "call": "rejectIncomingCall", "tint": "reject" }]

    Column {
        id: callers
        width: parent.width
        Repeater {
            model: _hmiphoneController.phoneSource.callList()
            CallerLine {
                visible: callState === "incoming"
                width: parent.width
            }
        }
    }
    // A ringing call the phone says nothing about.
    Text {
        visible: callers.height === 0
        text: qsTr("Unknown caller")
        color: Theme.text
        font { family: Theme.font; pixelSize: 40 }
    }
}
