import QtQuick 2.15
import ".."

// "CallEnded": the call is over.
PopupFrame {
    title: qsTr("Call ended")
    actions: [{ "text": qsTr("OK"), "call": "callEndConfirmed" }]
}
