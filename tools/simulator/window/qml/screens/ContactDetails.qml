import QtQuick 2.15
import ".."

// "ContactDetails": the contact the driver picked from the list (the list stores its row as the
// controller's last known phone book index), with a call and the name read out.
Page {
    id: page
    readonly property var book: _hmiphoneController.phoneSource.phoneBook()
    readonly property int row: _hmiphoneController.lastKnownPhonebookIndex
    readonly property string name: book.get(row, "name") || ""
    readonly property string number: book.get(row, "number") || ""

    title: page.name.length > 0 ? page.name : qsTr("Contact")

    Text {
        objectName: "number"
        text: page.number
        color: Theme.text
        font { family: Theme.font; pixelSize: 36 }
    }
    Row {
        y: 100
        spacing: 20
        Button {
            width: 260
            text: qsTr("Call")
            slot: "callNumber"
            tint: Theme.accept
            enabled: page.number.length > 0
            onClicked: _hmiphoneController.callNumber(page.number)
        }
        Button {
            width: 260
            text: qsTr("Read name")
            slot: "playContactName"
            enabled: page.name.length > 0
            onClicked: _hmiphoneController.playContactName(page.name)
        }
        Button {
            width: 260
            text: qsTr("All contacts")
            slot: "viewContacts"
            onClicked: _hmiphoneController.viewContacts()
        }
    }
}
