import QtQuick 2.15
import ".."

// "MultipleTextMessagesReceived": more messages came while the alert was up.
PopupFrame {
    readonly property int received: _hmiphoneController.receivedTextMessageCount
    title: qsTr("New messages")
    text: qsTr("%n new messages", "", received)
    actions: [{ "text": qsTr("View"), "call": "viewTextMessages" },
              { "text": qsTr("Close"), "call": "hideNewTextMessageAlert" }]
}
