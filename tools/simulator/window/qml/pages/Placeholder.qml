import QtQuick 2.15
import ".."

// A view of another module of the head unit (the home screen, the settings menu, ...). The
// settings menu offers the phone's entry, as the host's menu lists it.
Page {
    id: page
    Text {
        anchors.centerIn: parent
        horizontalAlignment: Text.AlignHCenter
        text: "A view of another module"
        color: Theme.dim
        font.family: Theme.font
        font.pixelSize: 28
    }
    Button {
        objectName: "menu:settings/Phone"
        visible: page.viewId === "HOST.Settings"
        text: "Phone"
        onClicked: _scenario.input('{"open": "settings/Phone"}')
    }
}
