import QtQuick 2.15
import ".."
import "../Format.js" as Format

// "PhoneSmsList": the inbox the phone last sent, newest first: who, when, the first line;
// unread ones marked. A row opens the message, its speaker reads it out.
Page {
    id: page
    readonly property var phone: _hmiphoneController.phoneSource
    readonly property var messages: phone.textMessageList()

    title: qsTr("Messages")
    subtitle: phone.totalUnreadSmsCount > 0 ? qsTr("%n unread", "", phone.totalUnreadSmsCount) : ""

    Button {
        x: parent.width - width
        y: -84
        height: 64
        text: qsTr("Refresh")
        slot: "refreshMessages"
        onClicked: _hmiphoneController.refreshMessages()
    }
    ListView {
        objectName: "messages"
        width: parent.width
        height: parent.height
        clip: true
        model: page.messages
        delegate: Item {
            id: message
            required property int index
            required property string name
            required property string number
            required property string time
            required property string text
            required property bool read
            width: ListView.view.width
            height: 84
            MouseArea {
                anchors.fill: parent
                onClicked: _hmiphoneController.viewTextMessageOptions(message.index)
            }
            Rectangle {
                visible: !message.read
                x: 4
                y: 18
                width: 12
                height: 12
                radius: 6
                color: Theme.accent
            }
            Text {
                x: 28
                y: 8
                width: parent.width - 380
                elide: Text.ElideRight
                text: Format.who(message.name, message.number)
                color: Theme.text
                font { family: Theme.font; pixelSize: 28; bold: !message.read }
            }
            Text {
                x: 28
                y: 46
                width: parent.width - 380
                elide: Text.ElideRight
                text: message.text.split("\n")[0]
                color: Theme.dim
                font { family: Theme.font; pixelSize: 22 }
            }
            Text {
                anchors.right: hear.left
                anchors.rightMargin: 20
                anchors.verticalCenter: parent.verticalCenter
                text: message.time
                color: Theme.dim
                font { family: Theme.font; pixelSize: 20 }
            }
            Button {
                id: hear
                anchors.right: parent.right
                anchors.verticalCenter: parent.verticalCenter
                width: 120
                height: 60
                fontSize: 20
                text: qsTr("Hear")
                slot: "hearSelectedTextMessage"
                onClicked: _hmiphoneController.hearSelectedTextMessage(message.index)
            }
            Rectangle {
                anchors.bottom: parent.bottom
                width: parent.width
                height: 1
                color: "#2a333c"
            }
        }
    }
    Text {
        visible: page.messages.count === 0
        text: page.phone.messagesDownloadingStatus === 2 ? qsTr("Downloading messages")
                                                         : qsTr("No messages")
        color: Theme.dim
        font { family: Theme.font; pixelSize: 28 }
    }
}
