import QtQuick 2.15
import ".."

// The text messages: the list ("PhoneSmsList"), one message ("PhoneSmsView") and the reply
// texts ("PhoneSmsReplyView").
Page {
    id: page
    readonly property var phone: _hmiphoneController.phoneSource
    title: name === "PhoneSmsView" ? "Message" : name === "PhoneSmsReplyView" ? "Reply" : "Messages"

    Button {
        visible: page.name === "PhoneSmsList"
        text: "Refresh"
        slot: "refreshMessages"
        onClicked: _hmiphoneController.refreshMessages()
    }
    ListView {
        objectName: "messages"
        visible: page.name === "PhoneSmsList"
        y: 96
        width: parent.width
        height: parent.height - 96
        clip: true
        model: phone.textMessageList()
        delegate: ListRow {
            width: ListView.view.width
            text: (model.read ? "" : "\u2022 ") + (model.name || model.number) + ": " + model.text
            detail: "hear"
            onClicked: _hmiphoneController.viewTextMessageOptions(index)
            MouseArea {
                anchors.right: parent.right
                width: 160
                height: parent.height
                onClicked: _hmiphoneController.hearSelectedTextMessage(index)
            }
        }
    }

    Text {
        visible: page.name === "PhoneSmsView"
        width: parent.width
        wrapMode: Text.Wrap
        text: phone.textMessageBody
        color: Theme.text
        font.family: Theme.font
        font.pixelSize: 30
    }
    Row {
        visible: page.name === "PhoneSmsView"
        y: 300
        spacing: 20
        Repeater {
            model: [["Hear", "hearTextMessage"], ["Reply", "replyTextMessage"],
                    ["Call", "callNewTextMessageNumber"]]
            Button {
                text: modelData[0]
                slot: modelData[1]
                onClicked: _hmiphoneController[modelData[1]]()
            }
        }
    }

    ListView {
        objectName: "replies"
        visible: page.name === "PhoneSmsReplyView"
        width: parent.width - 260
        height: parent.height
        clip: true
        model: phone.smsReplyMessages
        // A reply text is a string or a row with its "text".
        delegate: ListRow {
            readonly property string reply: typeof modelData === "string" ? modelData
                                                                          : modelData.text || ""
            width: ListView.view.width
            text: reply
            detail: reply === phone.replyTextSelected ? "selected" : ""
            onClicked: _hmiphoneController.hearSelectedReplyMessage()
        }
    }
    Button {
        visible: page.name === "PhoneSmsReplyView"
        x: parent.width - 220
        width: 220
        text: "Send"
        slot: "sendTextMessage"
        tint: Theme.accept
        onClicked: _hmiphoneController.sendTextMessage()
    }
}
