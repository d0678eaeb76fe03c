import QtQuick 2.15
import ".."

// "PhoneDeleteAllContactsPopup": deleting the head unit's copy of the contacts.
PopupFrame {
    readonly property int contacts: _hmiphoneController.phoneSource.phoneBook().listLength
    title: qsTr("Delete all contacts?")
    text: qsTr("%n contacts will be deleted from the car. The phone keeps its own.", "", contacts)
    actions: [{ "text": qsTr("Delete"), "call": "requestDeleteAllContacts", "tint": "reject" },
              { "text": qsTr("Cancel") }]
}
