import QtQuick 2.15

// A row of a list page: its text, an optional second line, and a tap.
Rectangle {
    id: row
    property alias text: label.text
    property alias detail: second.text
    signal clicked()

    height: 72
    color: area.pressed ? Theme.raised : "transparent"
    Text {
        id: label
        x: 20
        anchors.verticalCenter: parent.verticalCenter
        color: Theme.text
        font.family: Theme.font
        font.pixelSize: 28
    }
    Text {
        id: second
        anchors.right: parent.right
        anchors.rightMargin: 20
        anchors.verticalCenter: parent.verticalCenter
        color: Theme.dim
        font.family: Theme.font
        font.pixelSize: 22
    }
    Rectangle {
        anchors.bottom: parent.bottom
        width: parent.width
        height: 1
        color: "#2a333c"
    }
    MouseArea {
        id: area
        anchors.fill: parent
        onClicked: row.clicked()
    }
}
