import QtQuick 2.15
import ".."

// "PhoneTextMessageNotificationSettings": whether new text messages are announced, and with
// which alert tone.
Page {
    id: page
    readonly property var phone: _hmiphoneController.phoneSource

    title: qsTr("Text message notification")

    Column {
        width: parent.width
        SettingRow {
            width: parent.width
            text: qsTr("Announce new messages")
            kind: "switch"
            on: page.phone.messageNotificationEnabled
            slot: "sendMessageNotificationEnabled"
            onClicked: _hmiphoneController.sendMessageNotificationEnabled(!on)
        }
        Repeater {
            model: [qsTr("No tone"), qsTr("Ding"), qsTr("Chirp"), qsTr("Bell")]
            SettingRow {
                required property string modelData
                required property int index
                width: parent.width
                enabled: page.phone.messageNotificationEnabled
                opacity: enabled ? 1 : 0.5
                text: modelData
                kind: "choice"
                on: page.phone.messageNotification === index
                slot: "setAlert"
                onClicked: {
                    _hmiphoneController.playAlert(index);
                    _hmiphoneController.setAlert(index);
                }
            }
        }
    }
}
