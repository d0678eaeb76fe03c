import QtQuick 2.15
import ".."

// "PhoneBookSearch": the driver types the beginning of a name; the phone searches its phone
// book, and the list comes back once the results are ready.
Page {
    id: page
    readonly property var book: _hmiphoneController.phoneSource.phoneBook()

    title: qsTr("Search contacts")
    subtitle: qsTr("%n contacts", "", book.listLength)

    Rectangle {
        width: 700
        height: 72
        radius: 8
        color: Theme.surface
        border.color: Theme.accent
        TextInput {
            id: searchText
            objectName: "searchText"
            anchors.fill: parent
            anchors.margins: 16
            color: Theme.text
            font { family: Theme.font; pixelSize: 30 }
            focus: true
        }
        Text {
            anchors.fill: searchText
            visible: searchText.text.length === 0
            text: qsTr("Name")
            color: Theme.dim
            font: searchText.font
        }
    }
    Button {
        x: 720
        text: qsTr("Search")
        slot: "searchPhoneBook"
        enabled: searchText.text.length > 0
        onClicked: _hmiphoneController.searchPhoneBook(searchText.text)
    }
    Grid {
        y: 110
        columns: 9
        spacing: 10
        Repeater {
            model: ["A", "B", "C", "D", "E", "F", "G", "H", "I", "J", "K", "L", "M", "N", "O", "P",
                    "Q", "R", "S", "T", "U", "V", "W", "X", "Y", "Z"]
            Button {
                required property string modelData
                width: 96
                height: 64
                text: modelData
                onClicked: searchText.text += modelData
            }
        }
    }
}
