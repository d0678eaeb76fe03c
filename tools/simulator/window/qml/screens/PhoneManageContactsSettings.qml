import QtQuick 2.15
import ".."

// "PhoneManageContactsSettings": how the contacts come from the phone, sorted, downloaded again
// or deleted.
Page {
    id: page
    readonly property var phone: _hmiphoneController.phoneSource

    title: qsTr("Manage contacts")
    subtitle: qsTr("%n contacts", "", phone.phoneBook().listLength)

    Column {
        width: parent.width
        SettingRow {
            width: parent.width
            text: qsTr("Download contacts automatically")
            kind: "switch"
            on: page.phone.automaticContactDownload
            slot: "setAutomaticContactDownloadEnabled"
            onClicked: _hmiphoneController.setAutomaticContactDownloadEnabled(!on)
        }
        SettingRow {
            width: parent.width
            text: qsTr("Sort by first name")
            kind: "choice"
            on: page.phone.contactSortOrder === 0
            slot: "setContactSortOrder"
            onClicked: _hmiphoneController.setContactSortOrder(0)
        }
        SettingRow {
            width: parent.width
            text: qsTr("Sort by last name")
            kind: "choice"
            on: page.phone.contactSortOrder === 1
            onClicked: _hmiphoneController.setContactSortOrder(1)
        }
        SettingRow {
            width: parent.width
            text: qsTr("Download contacts again")
            slot: "requestReDownloadContacts"
            onClicked: _hmiphoneController.requestReDownloadContacts()
        }
        SettingRow {
            width: parent.width
            text: qsTr("Delete all contacts")
            slot: "requestPhoneDeleteAllContactsPopup"
            onClicked: _hmiphoneController.requestPhoneDeleteAllContactsPopup()
        }
    }
}
