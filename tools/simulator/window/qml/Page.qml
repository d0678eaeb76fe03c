import QtQuick 2.15

// The frame of a screen: its title, a line under it, and its content below. Each screen file
// names its own title.
Item {
    id: page
    property string viewId: ""
    property string title: ""
    property string subtitle: ""
    default property alias content: body.data

    Text {
        id: heading
        objectName: "title"
        x: 40
        y: 20
        text: page.title
        color: Theme.text
        font { family: Theme.font; pixelSize: 36 }
    }
    Text {
        objectName: "subtitle"
        anchors.left: heading.right
        anchors.leftMargin: 24
        anchors.baseline: heading.baseline
        text: page.subtitle
        color: Theme.dim
        font { family: Theme.font; pixelSize: 24 }
    }
    Item {
        id: body
        anchors.fill: parent
        anchors.topMargin: 88
        anchors.leftMargin: 40
        anchors.rightMargin: 40
        anchors.bottomMargin: 32
    }
}
