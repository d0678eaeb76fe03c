import QtQuick 2.15
import ".."
import "../Format.js" as Format

// "RoamingWarning": the phone is roaming; the call waits for the driver's yes. The call is the
// number entered, or the recent call the driver picked.
PopupFrame {
    id: popup
    readonly property var phone: _hmiphoneController.phoneSource
    readonly property bool fromRecentList: phone.outboundRoamingCallIsFromRecentList
    readonly property string callee: fromRecentList
        ? Format.who(phone.recentCallList().get(phone.outboundRoamingRecentCallIndex, "name") || "",
                     phone.recentCallList().get(phone.outboundRoamingRecentCallIndex, "number") || "")
        : phone.callNumberEntered

    title: qsTr("Roaming")
    text: qsTr("Your phone is roaming: calling %1 may cost more.").arg(callee)
    actions: [{ "text": qsTr("Call"), "call": "confirmRoamingCall", "tint": "accept" },
              { "text": qsTr("Cancel"), "call": "cancelRoamingCall" }]
}
