import QtQuick 2.15
import ".."

// "WaitingCall": a second call while one is connected: who waits, and the call it would join.
PopupFrame {
    id: popup
    title: qsTr("Call waiting")
    actions: [{ "text": qsTr("Accept"), "call": "acceptWaitingCall", "tint": "accept" },
              { "text": qsTr("Reject"), "call": "rejectWaitingCall", "tint": "reject" }]

    Column {
        width: parent.width
        spacing: 12
        Repeater {
            model: _hmiphoneController.phoneSource.callList()
            CallerLine {
                visible: callState === "waiting" || callState === "incoming"
                width: parent.width
            }
        }
        Repeater {
            model: _hmiphoneController.phoneSource.callList()
            CallerLine {
                visible: callState === "active"
                width: parent.width
                fontSize: 26
                opacity: 0.7
            }
        }
    }
}
