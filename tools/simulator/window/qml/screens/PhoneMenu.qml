import QtQuick 2.15
import ".."

// "PhoneMenu": the ways into the phone's screens, with what waits behind them (unread messages,
// status alerts) and the phone's own switches (do not disturb, the voice assistant).
Page {
    id: page
    readonly property var phone: _hmiphoneController.phoneSource
    readonly property var alerts: phone.statusAlertList()

    title: qsTr("Phone")
    subtitle: phone.roaming ? qsTr("Roaming") : ""

    component Entry: Button {
        property int badge: 0
        width: 280
        height: 150
        Rectangle {
            objectName: "badge"
            visible: parent.badge > 0
            anchors.right: parent.right
            anchors.top: parent.top
            anchors.margins: 10
            width: Math.max(height, count.implicitWidth + 16)
            height: 36
            radius: 18
            color: Theme.reject
            Text {
                id: count
                anchors.centerIn: parent
                text: parent.parent.badge
                color: Theme.text
                font { family: Theme.font; pixelSize: 22 }
            }
        }
    }

    Grid {
        columns: 4
        spacing: 24
        Entry {
            text: qsTr("Keypad")
            slot: "showDialPad"
            onClicked: _hmiphoneController.showDialPad()
        }
        Entry {
            text: qsTr("Contacts")
            slot: "viewContacts"
            onClicked: _hmiphoneController.viewContacts()
        }
        Entry {
            text: qsTr("Recent calls")
            slot: "viewRecentCalls"
            onClicked: _hmiphoneController.viewRecentCalls()
        }
        Entry {
            text: qsTr("Messages")
            slot: "viewTextMessages"
            badge: page.phone.totalUnreadSmsCount
            onClicked: _hmiphoneController.viewTextMessages()
        }
        Entry {
            text: page.phone.siriActive ? qsTr("Assistant on") : qsTr("Voice assistant")
            slot: "toggleSiri"
            checked: page.phone.siriActive
            onClicked: _hmiphoneController.toggleSiri()
        }
        Entry {
            text: qsTr("Status alerts")
            slot: "viewStatusBarAlerts"
            badge: page.alerts.count
            onClicked: _hmiphoneController.viewStatusBarAlerts()
        }
        Entry {
            text: qsTr("Do not disturb")
            slot: "toggleDoNotDisturb"
            checked: page.phone.doNotDisturb
            onClicked: _hmiphoneController.toggleDoNotDisturb()
        }
        Entry {
            text: qsTr("Settings")
            slot: "gotoPhoneSettings"
            onClicked: _hmiphoneController.gotoPhoneSettings()
        }
    }
}
