import QtQuick 2.15
import ".."

// "PhoneBookList": the phone book the phone sent, with its alphabet bar. The list shows the
// driver-restricted window the controller sets (the letter sections around the rows in view, at
// most five pages; a letter's first 20 contacts after a jump) and tells the controller which rows
// are in view whenever the list comes to rest.
Page {
    id: page
    readonly property var phone: _hmiphoneController.phoneSource
    readonly property var book: phone.phoneBook()
    readonly property int firstRow: Math.max(0, phone.driverRestrictedPhonebookModelMinRow)
    readonly property int lastRow: phone.driverRestrictedPhonebookModelMaxRow >= 0
                                   ? Math.min(phone.driverRestrictedPhonebookModelMaxRow,
                                              book.listLength - 1)
                                   : book.listLength - 1
    readonly property int rowHeight: 64
    // A driver-restricted window is set: only its rows are shown.
    readonly property bool restricted: phone.driverRestrictedPhonebookModelMinRow >= 0

    function reportVisibleRows() {
        var perPage = Math.max(1, Math.floor(contacts.height / page.rowHeight));
        var top = page.firstRow + Math.max(0, Math.floor(contacts.contentY / page.rowHeight));
        _hmiphoneController.calculateDriverRestrictedPhonebookMinMaxRows(
                    top, Math.min(page.lastRow, top + perPage - 1), perPage);
    }

    title: qsTr("Contacts")
    subtitle: restricted ? qsTr("%1 to %2 of %n", "", book.listLength).arg(firstRow + 1)
                                                                    .arg(lastRow + 1)
                         : qsTr("%n contacts", "", book.listLength)

    Button {
        x: parent.width - width - 100
        y: -84
        height: 64
        text: qsTr("Search")
        slot: "searchContacts"
        onClicked: _hmiphoneController.searchContacts()
    }
    ListView {
        id: contacts
        objectName: "contacts"
        width: parent.width - 100
        height: parent.height
        clip: true
        model: Math.max(0, page.lastRow - page.firstRow + 1)
        delegate: ListRow {
            required property int index
            readonly property int row: page.firstRow + index
            width: ListView.view.width
            height: page.rowHeight
            text: page.book.get(row, "name") || ""
            detail: page.book.get(row, "number") || ""
            onClicked: {
                _hmiphoneController.setLastKnownPhonebookIndex(row);
                _hmiphoneController.selectPhoneBookEntry(row);
            }
        }
        onMovementEnded: page.reportVisibleRows()
    }
    ListView {
        objectName: "alphabet"
        x: parent.width - 80
        width: 80
        height: parent.height
        clip: true
        model: page.phone.AlphabetIndexModel()
        delegate: Text {
            required property string alphabet
            required property int letterIndex
            width: 80
            height: 34
            horizontalAlignment: Text.AlignHCenter
            text: alphabet
            color: letterIndex < 0 ? Theme.dim : Theme.accent
            font { family: Theme.font; pixelSize: 24 }
            MouseArea {
                anchors.fill: parent
                enabled: parent.letterIndex >= 0
                onClicked: _hmiphoneController.driverRestrictedPhonebookFilterByAlpha(parent.alphabet)
            }
        }
    }
}
