import QtQuick 2.15
import ".."
import "../Format.js" as Format

// "PhoneSmsView": the message the phone last detailed: who sent it and its text, to hear, answer
// with a reply or call back.
Page {
    id: page
    readonly property var phone: _hmiphoneController.phoneSource

    title: Format.who(phone.textMessageSenderName, phone.textMessageSenderNumber)
    subtitle: phone.textMessageSenderName.length > 0 ? phone.textMessageSenderNumber : ""

    Text {
        objectName: "body"
        width: parent.width
        height: 260
        wrapMode: Text.Wrap
        elide: Text.ElideRight
        text: page.phone.textMessageBody
        color: Theme.text
        font { family: Theme.font; pixelSize: 32 }
    }
    Row {
        y: 300
        spacing: 20
        Button {
            width: 220
            text: qsTr("Hear")
            slot: "hearTextMessage"
            onClicked: _hmiphoneController.hearTextMessage()
        }
        Button {
            width: 220
            text: qsTr("Reply")
            slot: "replyTextMessage"
            onClicked: _hmiphoneController.replyTextMessage()
        }
        Button {
            width: 220
            text: qsTr("Call")
            slot: "callNewTextMessageNumber"
            tint: Theme.accept
            onClicked: _hmiphoneController.callNewTextMessageNumber()
        }
    }
}
