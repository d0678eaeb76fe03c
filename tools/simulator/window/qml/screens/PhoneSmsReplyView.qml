import QtQuick 2.15
import ".."
import "../Format.js" as Format

// "PhoneSmsReplyView": the canned replies the phone offers; the one chosen is the phone's
// selected reply, heard with its speaker and sent with "Send".
Page {
    id: page
    readonly property var phone: _hmiphoneController.phoneSource

    //: The title of the screen of the replies to choose from.
    title: qsTr("Reply", "screen")
    subtitle: qsTr("to %1").arg(Format.who(phone.textMessageSenderName,
                                          phone.textMessageSenderNumber))

    ListView {
        objectName: "replies"
        width: parent.width - 280
        height: parent.height
        clip: true
        model: page.phone.smsReplyMessages
        delegate: ListRow {
            required property var modelData
            // A reply is a map with its "text".
            readonly property string reply: modelData.text || ""
            width: ListView.view.width
            text: reply
            detail: reply === page.phone.replyTextSelected ? "\u2713" : ""
            onClicked: page.phone.replyTextSelected = reply
        }
    }
    Column {
        x: parent.width - 240
        spacing: 16
        Button {
            width: 240
            text: qsTr("Hear")
            slot: "hearSelectedReplyMessage"
            enabled: page.phone.replyTextSelected.length > 0
            onClicked: _hmiphoneController.hearSelectedReplyMessage()
        }
        Button {
            width: 240
            text: qsTr("Send")
            slot: "sendTextMessage"
            tint: Theme.accept
            enabled: page.phone.replyTextSelected.length > 0
            onClicked: _hmiphoneController.sendTextMessage()
        }
    }
}
