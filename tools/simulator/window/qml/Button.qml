import QtQuick 2.15

// A touch button of the head unit. `slot` names the controller slot it calls, if any (its object
// name is then "action:<slot>").
Rectangle {
    id: button
    property alias text: label.text
    property string slot: ""
    property bool checked: false
    property color tint: Theme.raised
    property int fontSize: 26
    signal clicked()
    signal pressAndHold()

    objectName: slot.length > 0 ? "action:" + slot : ""
    implicitWidth: Math.max(160, label.implicitWidth + 48)
    implicitHeight: 72
    radius: 10
    opacity: enabled ? 1 : 0.4
    color: area.pressed ? Qt.lighter(tint, 1.4) : (checked ? Theme.accent : tint)
    border.color: "#3a4754"

    Text {
        id: label
        objectName: "buttonLabel"
        anchors.centerIn: parent
        width: parent.width - 16
        horizontalAlignment: Text.AlignHCenter
        elide: Text.ElideRight
        color: Theme.text
        font.family: Theme.font
        font.pixelSize: button.fontSize
    }
    MouseArea {
        id: area
        anchors.fill: parent
        onClicked: button.clicked()
        onPressAndHold: button.pressAndHold()
    }
}
