import QtQuick 2.15
import ".."

// A view of another module of the head unit (the home screen, the settings menu, ...). The
// settings menu offers the phone's entry, as the host's menu lists it.
Page {
    id: page
    readonly property bool settingsMenu: viewId === "HOST.Settings"
    title: settingsMenu ? qsTr("Settings") : viewId === "HOST.Home" ? qsTr("Home") : ""

    Text {
        anchors.centerIn: parent
        visible: !page.settingsMenu
        text: qsTr("Another part of the head unit")
        color: Theme.dim
        font { family: Theme.font; pixelSize: 28 }
    }
    Button {
        objectName: "menu:settings/Phone"
        visible: page.settingsMenu
        width: 400
        text: qsTr("Phone")
        onClicked: _scenario.input('{"open": "settings/Phone"}')
    }
}
