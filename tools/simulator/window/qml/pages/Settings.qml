import QtQuick 2.15
import ".."

// The phone's settings pages: switches on the user's settings the bridge keeps, and the ways to
// the other pages.
Page {
    id: page
    readonly property var phone: _hmiphoneController.phoneSource
    // [label, kind, slot, setting]: "switch" rows show the setting and call the slot with its
    // opposite, "page" rows call the slot.
    readonly property var rows: ({
        "PhoneSettingsRoot": [["Phone settings", "page", "gotoPhoneSettings"],
                              ["Bluetooth devices", "page", "viewBluetoothDevices"]],
        "PhoneSettings": [["Manage contacts", "page", "requestPhoneManageContactsSettingsPage"],
                          ["Ringtones", "page", "requestPhoneRingtoneSettingsPage"],
                          ["Text message notification", "page",
                           "requestPhoneTextMessageNotificationSettingsPage"],
                          ["Roaming warning", "switch", "setRoamingWarningEnabled", "roamingWarning"],
                          ["Low battery notification", "switch", "setLowBatteryNotificationEnabled",
                           "lowBatteryNotification"],
                          ["Mute audio in privacy", "switch", "setPhoneMuteAudioInPrivacyEnabled",
                           "muteAudioInPrivacy"]],
        "PhoneManageContactsSettings": [["Automatic download", "switch",
                                         "setAutomaticContactDownloadEnabled", "automaticContactDownload"],
                                        ["Download contacts again", "page", "requestReDownloadContacts"],
                                        ["Delete all contacts", "page", "requestPhoneDeleteAllContactsPopup"]],
        "PhoneRingtoneAboutSettings": [["Ringtone 1", "choice", "setRingtone", "phoneRingtone", 1],
                                       ["Ringtone 2", "choice", "setRingtone", "phoneRingtone", 2],
                                       ["Ringtone 3", "choice", "setRingtone", "phoneRingtone", 3]],
        "PhoneTextMessageNotificationSettings": [["Notify new messages", "switch",
                                                  "sendMessageNotificationEnabled",
                                                  "messageNotificationEnabled"],
                                                 ["Alert tone 1", "choice", "setAlert",
                                                  "messageNotification", 1],
                                                 ["Alert tone 2", "choice", "setAlert",
                                                  "messageNotification", 2]]
    })

    Column {
        width: parent.width
        Repeater {
            model: page.rows[page.name] || []
            ListRow {
                readonly property var value: modelData[3] ? page.phone[modelData[3]] : undefined
                objectName: "action:" + modelData[2]
                width: parent.width
                text: modelData[0]
                detail: modelData[1] === "switch" ? (value ? "on" : "off")
                        : modelData[1] === "choice" ? (value === modelData[4] ? "\u2713" : "") : "\u203A"
                onClicked: {
                    if (modelData[1] === "switch")
                        _hmiphoneController[modelData[2]](!value);
                    else if (modelData[1] === "choice")
                        _hmiphoneController[modelData[2]](modelData[4]);
                    else
                        _hmiphoneController[modelData[2]]();
                }
            }
        }
    }
}
