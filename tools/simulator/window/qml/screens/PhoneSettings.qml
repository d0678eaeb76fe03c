import QtQuick 2.15
import ".."

// "PhoneSettings": the user's phone settings the bridge keeps, and the ways to the other pages.
Page {
    id: page
    readonly property var phone: _hmiphoneController.phoneSource

    title: qsTr("Phone settings")

    Column {
        width: parent.width
        SettingRow {
            width: parent.width
            text: qsTr("Manage contacts")
            slot: "requestPhoneManageContactsSettingsPage"
            onClicked: _hmiphoneController.requestPhoneManageContactsSettingsPage()
        }
        SettingRow {
            width: parent.width
            text: qsTr("Ringtone")
            slot: "requestPhoneRingtoneSettingsPage"
            onClicked: _hmiphoneController.requestPhoneRingtoneSettingsPage()
        }
        SettingRow {
            width: parent.width
            text: qsTr("Text message notification")
            slot: "requestPhoneTextMessageNotificationSettingsPage"
            onClicked: _hmiphoneController.requestPhoneTextMessageNotificationSettingsPage()
        }
        SettingRow {
            width: parent.width
            text: qsTr("Warn before calls while roaming")
            kind: "switch"
            on: page.phone.roamingWarning
            slot: "setRoamingWarningEnabled"
            onClicked: _hmiphoneController.setRoamingWarningEnabled(!on)
        }
        SettingRow {
            width: parent.width
            text: qsTr("Low battery notification")
            kind: "switch"
            on: page.phone.lowBatteryNotification
            slot: "setLowBatteryNotificationEnabled"
            onClicked: _hmiphoneController.setLowBatteryNotificationEnabled(!on)
        }
        SettingRow {
            width: parent.width
            text: qsTr("Mute audio on the handset")
            kind: "switch"
            on: page.phone.muteAudioInPrivacy
            slot: "setPhoneMuteAudioInPrivacyEnabled"
            onClicked: _hmiphoneController.setPhoneMuteAudioInPrivacyEnabled(!on)
        }
    }
}
