import QtQuick 2.15
import ".."

// "PhoneBookEmpty": no contacts to show, and why, from the phone book's status (1 downloaded,
// 2 downloading, 3 empty, 4 no access, 5 failed).
Page {
    id: page
    readonly property var phone: _hmiphoneController.phoneSource
    readonly property int status: phone.phoneBookStatus

    title: qsTr("Contacts")

    Text {
        objectName: "reason"
        width: parent.width
        wrapMode: Text.Wrap
        text: page.status === 2 ? qsTr("The contacts are being downloaded from the phone.")
              : page.status === 3 ? qsTr("The phone has no contacts.")
              : page.status === 4 ? qsTr("The phone did not allow access to its contacts.")
              : page.status === 5 ? qsTr("The contacts could not be downloaded.")
              : page.phone.automaticContactDownload ? qsTr("No contacts yet.")
              : qsTr("Contacts are not downloaded automatically.")
        color: Theme.text
        font { family: Theme.font; pixelSize: 32 }
    }
    Button {
        y: 120
        visible: page.status !== 2
        text: qsTr("Download contacts")
        slot: "retryAutomaticContactDownload"
        onClicked: _hmiphoneController.retryAutomaticContactDownload()
    }
}
