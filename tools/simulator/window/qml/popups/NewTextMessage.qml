import QtQuick 2.15
import ".."
import "../Format.js" as Format

// "NewTextMessageAlert1", "NewTextMessageAlert2": a text message came: who sent it and what it
// says. The second kind offers to hear, view, answer or call back.
PopupFrame {
    id: popup
    readonly property var phone: _hmiphoneController.phoneSource

    title: qsTr("New message from %1").arg(Format.who(phone.textMessageSenderName,
                                                     phone.textMessageSenderNumber))
    text: phone.textMessageBody
    actions: name === "NewTextMessageAlert2"
             ? [{ "text": qsTr("Hear"), "call": "hearNewTextMessage" },
                { "text": qsTr("View"), "call": "viewNewTextMessage" },
                { "text": qsTr("Reply"), "call": "replyNewTextMessage" },
                { "text": qsTr("Call"), "call": "callNewTextMessageNumber", "tint": "accept" },
                { "text": qsTr("Close"), "call": "hideNewTextMessageAlert" }]
             : [{ "text": qsTr("OK") }]
}
