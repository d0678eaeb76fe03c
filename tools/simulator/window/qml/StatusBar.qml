import QtQuick 2.15

// The status bar: the clock, the transient messages as they come and go, the phone's connection
// and battery.
Rectangle {
    id: bar
    property var controller
    readonly property var phone: controller ? controller.phoneSource : null
    readonly property var bluetooth: controller ? controller.bluetoothSource : null
    readonly property bool connected: bluetooth ? bluetooth.deviceConnected : false
    readonly property int battery: phone ? phone.deviceBatteryLevel : -1

    // The module's transient messages, by name.
    function transientText(name) {
        switch (name) {
        case "PhoneAcceptedIncomingCall": return qsTr("Call accepted");
        case "PhoneRejectedIncomingCall": return qsTr("Call rejected");
        case "PhoneCallEnded": return qsTr("Call ended");
        case "PhoneOutgoingDialing": return qsTr("Dialling");
        case "PhoneConnectedOutgoingCall": return qsTr("Call connected");
        case "PhonebookDownloadInitiated": return qsTr("Downloading contacts");
        case "PhonebookDownloadComplete": return qsTr("Contacts downloaded");
        case "PhoneVoiceServiceActivatedTransientMsg": return qsTr("Voice assistant on");
        }
        return name;
    }

    color: "#0b0e12"

    // The car's clock starts at noon and follows the simulator's clock.
    Text {
        objectName: "clock"
        anchors.left: parent.left
        anchors.leftMargin: 24
        anchors.verticalCenter: parent.verticalCenter
        text: {
            var minutes = 12 * 60 + Math.floor(_headUnit.time / 60000);
            var m = minutes % 60;
            return Math.floor(minutes / 60) % 24 + ":" + (m < 10 ? "0" : "") + m;
        }
        color: Theme.text
        font.family: Theme.font
        font.pixelSize: 30
    }

    Row {
        objectName: "transients"
        anchors.centerIn: parent
        spacing: 12
        Repeater {
            model: _headUnit.transients
            Rectangle {
                objectName: "transient:" + modelData
                width: message.implicitWidth + 32
                height: 44
                radius: 22
                color: Theme.accent
                Text {
                    id: message
                    anchors.centerIn: parent
                    text: bar.transientText(modelData)
                    color: Theme.text
                    font.family: Theme.font
                    font.pixelSize: 22
                }
            }
        }
    }

    Row {
        anchors.right: parent.right
        anchors.rightMargin: 24
        anchors.verticalCenter: parent.verticalCenter
        spacing: 24
        Text {
            objectName: "connection"
            text: bar.connected ? "\u25CF " + qsTr("Phone") : "\u25CB " + qsTr("No phone")
            color: bar.connected ? Theme.accept : Theme.dim
            font.family: Theme.font
            font.pixelSize: 24
        }
        Row {
            objectName: "battery"
            visible: bar.connected && bar.battery >= 0
            spacing: 3
            anchors.verticalCenter: parent.verticalCenter
            Repeater {
                model: 5
                Rectangle {
                    width: 10
                    height: 24
                    color: index < bar.battery ? (bar.battery <= 1 ? Theme.reject : Theme.text)
                                               : "#3a4754"
                }
            }
        }
    }
}
