import QtQuick 2.15
import ".."
import "../StatusAlerts.js" as StatusAlerts

// "PhoneStatusAlerts": the phone's status alerts not cleared yet, each with its fix and its
// clear, which open the alert's popup.
Page {
    id: page
    readonly property var alerts: _hmiphoneController.phoneSource.statusAlertList()

    title: qsTr("Status alerts")
    subtitle: qsTr("%n alerts", "", alerts.count)

    ListView {
        objectName: "alerts"
        width: parent.width
        height: parent.height
        clip: true
        model: page.alerts
        delegate: Item {
            id: alert
            required property int alertId
            required property string supportPhoneNumber
            width: ListView.view.width
            height: 96
            Text {
                y: 10
                width: parent.width - 420
                elide: Text.ElideRight
                text: StatusAlerts.title(alert.alertId)
                color: Theme.text
                font { family: Theme.font; pixelSize: 28 }
            }
            Text {
                y: 54
                width: parent.width - 420
                text: alert.supportPhoneNumber.length > 0
                      ? qsTr("Support: %1").arg(alert.supportPhoneNumber) : ""
                color: Theme.dim
                font { family: Theme.font; pixelSize: 22 }
            }
            Row {
                anchors.right: parent.right
                anchors.verticalCenter: parent.verticalCenter
                spacing: 16
                Button {
                    width: 180
                    text: qsTr("Fix")
                    slot: "fixStatusAlert"
                    onClicked: _hmiphoneController.fixStatusAlert(alert.alertId)
                }
                Button {
                    width: 180
                    text: qsTr("Clear")
                    slot: "clearStatusAlert"
                    onClicked: _hmiphoneController.clearStatusAlert(alert.alertId)
                }
            }
        }
    }
    Text {
        visible: page.alerts.count === 0
        text: qsTr("No alerts")
        color: Theme.dim
        font { family: Theme.font; pixelSize: 28 }
    }
}
