import QtQuick 2.15
import "Views.js" as Views

// The frame of a page of the screen area: its title and its content below.
Item {
    id: page
    property string viewId: ""
    readonly property string name: Views.nameOf(viewId)
    property string title: Views.title(name)
    default property alias content: body.data

    Text {
        x: 40
        y: 24
        text: page.title
        color: Theme.text
        font.family: Theme.font
        font.pixelSize: 36
    }
    Item {
        id: body
        anchors.fill: parent
        anchors.topMargin: 96
        anchors.leftMargin: 40
        anchors.rightMargin: 40
        anchors.bottomMargin: 40
    }
}
