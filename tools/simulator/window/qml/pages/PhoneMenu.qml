import QtQuick 2.15
import ".."

// The phone menu: the ways into the phone's screens.
Page {
    title: "Phone"
    readonly property var phone: _hmiphoneController.phoneSource
    Grid {
        columns: 4
        spacing: 24
        Repeater {
            model: [["Dial pad", "showDialPad"], ["Contacts", "viewContacts"],
                    ["Recent calls", "viewRecentCalls"], ["Messages", "viewTextMessages"],
                    ["Voice", "toggleSiri"], ["Alerts", "viewStatusBarAlerts"],
                    ["Settings", "gotoPhoneSettings"], ["Add phone", "addPhonePressed"]]
            Button {
                width: 280
                height: 160
                text: modelData[0]
                slot: modelData[1]
                onClicked: _hmiphoneController[modelData[1]]()
            }
        }
        Button {
            width: 280
            height: 160
            text: "Do not disturb"
            slot: "toggleDoNotDisturb"
            checked: phone.doNotDisturb
            onClicked: _hmiphoneController.toggleDoNotDisturb()
        }
    }
}
