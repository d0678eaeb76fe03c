import QtQuick 2.15
import ".."

// "PhoneRingtoneAboutSettings": the ringtone the head unit plays for a call; a row plays it and
// makes it the ringtone (leaving the page stops the playing).
Page {
    id: page
    readonly property var phone: _hmiphoneController.phoneSource

    title: qsTr("Ringtone")

    Column {
        width: parent.width
        Repeater {
            model: [qsTr("The phone's own"), qsTr("Classic"), qsTr("Chimes"), qsTr("Marimba"),
                    qsTr("Pulse")]
            SettingRow {
                required property string modelData
                required property int index
                width: parent.width
                text: modelData
                kind: "choice"
                on: page.phone.phoneRingtone === index
                slot: "setRingtone"
                onClicked: {
                    _hmiphoneController.playRingtone(index);
                    _hmiphoneController.setRingtone(index);
                }
            }
        }
    }
}
