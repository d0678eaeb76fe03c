import QtQuick 2.15
import ".."
import "../StatusAlerts.js" as StatusAlerts

// A status alert's popups: clearing it (popups 50 to 59 for alerts 1001 to 1010), fixing it
// (60 to 69), and a retry that failed (70 contacts, 75 messages).
PopupFrame {
    id: popup
    readonly property int number: parseInt(name.substring("PhoneStatusAlertPopup".length))
    readonly property bool clearing: number >= 50 && number < 60
    readonly property bool fixing: number >= 60 && number < 70
    readonly property int alertId: 1001 + number % 10
    readonly property var alerts: _hmiphoneController.phoneSource.statusAlertList()
    readonly property string supportNumber: {
        for (var row = 0; row < alerts.count; ++row) {
            if (alerts.get(row, "alertId") === alertId)
                return alerts.get(row, "supportPhoneNumber") || "";
        }
        return "";
    }
    readonly property string fix: StatusAlerts.fix(alertId)

    title: number === 70 ? qsTr("Contacts still not downloaded")
           : number === 75 ? qsTr("Messages still not downloaded")
           : StatusAlerts.title(alertId)
    text: clearing ? qsTr("Clear this alert?")
          : !fixing ? qsTr("The alert stays.")
          : fix === "contacts" ? qsTr("Download the contacts again?")
          : fix === "messages" ? qsTr("Download the messages again?")
          : supportNumber.length > 0 ? qsTr("Call support on %1?").arg(supportNumber)
          : qsTr("Please see the phone's manual.")
    actions: clearing
             ? [{ "text": qsTr("For good"), "call": "clearAlertPermanently", "args": [alertId] },
                { "text": qsTr("For this drive"), "call": "clearAlertForThisCycle", "args": [alertId] },
                { "text": qsTr("Cancel") }]
             : !fixing ? [{ "text": qsTr("OK") }]
             : fix === "contacts"
             ? [{ "text": qsTr("Download"), "call": "retryDownloadContact", "args": [alertId] },
                { "text": qsTr("Cancel") }]
             : fix === "messages"
             ? [{ "text": qsTr("Download"), "call": "retryAccessTextMessages", "args": [alertId] },
                { "text": qsTr("Cancel") }]
             : supportNumber.length > 0
             ? [{ "text": qsTr("Call"), "call": "callForFixAlert", "args": [alertId, supportNumber],
                  "tint": "accept" }, { "text": qsTr("Cancel") }]
             : [{ "text": qsTr("OK") }]
}
