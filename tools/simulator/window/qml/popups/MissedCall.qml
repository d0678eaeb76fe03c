import QtQuick 2.15
import ".."

// "MissedCallPopup": a call was missed; the recent calls show who.
PopupFrame {
    title: qsTr("Missed call")
    text: qsTr("See the recent calls for who called.")
    actions: [{ "text": qsTr("Recent calls"), "call": "viewRecentCalls" }, { "text": qsTr("Close") }]
}
