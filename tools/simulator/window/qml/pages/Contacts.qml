import QtQuick 2.15
import ".."

// The contact list ("PhoneBookList") and the contact search ("PhoneBookSearch"): the bridge's
// alphabet bar and contact list.
Page {
    id: page
    readonly property var phone: _hmiphoneController.phoneSource
    readonly property var book: phone.phoneBook()
    readonly property bool search: name === "PhoneBookSearch"

    Rectangle {
        visible: page.search
        width: 700
        height: 64
        color: Theme.surface
        border.color: Theme.accent
        TextInput {
            id: searchText
            anchors.fill: parent
            anchors.margins: 14
            color: Theme.text
            font.family: Theme.font
            font.pixelSize: 28
        }
    }
    Button {
        x: page.search ? 720 : 0
        text: page.search ? "Search" : "Search contacts"
        slot: page.search ? "searchPhoneBook" : "searchContacts"
        onClicked: page.search ? _hmiphoneController.searchPhoneBook(searchText.text)
                               : _hmiphoneController.searchContacts()
    }
    ListView {
        objectName: "contacts"
        y: 88
        width: parent.width - 120
        height: parent.height - 88
        clip: true
        model: page.book.listLength
        delegate: ListRow {
            width: ListView.view.width
            text: page.book.get(index, "name") || "Contact " + (index + 1)
            detail: page.book.get(index, "number") || ""
            onClicked: _hmiphoneController.selectPhoneBookEntry(index)
        }
    }
    ListView {
        objectName: "alphabet"
        x: parent.width - 80
        y: 88
        width: 80
        height: parent.height - 88
        clip: true
        model: phone.AlphabetIndexModel()
        delegate: Text {
            width: 80
            height: 36
            horizontalAlignment: Text.AlignHCenter
            text: alphabet
            color: letterIndex < 0 ? Theme.dim : Theme.accent
            font.family: Theme.font
            font.pixelSize: 26
            MouseArea {
                anchors.fill: parent
                onClicked: _hmiphoneController.driverRestrictedPhonebookFilterByAlpha(alphabet)
            }
        }
    }
}
