import QtQuick 2.15
import ".."

// "Redial": the call did not go through; dial the number again?
PopupFrame {
    readonly property string number: _hmiphoneController.phoneSource.callNumberEntered
    title: qsTr("Call failed")
    text: number.length > 0 ? qsTr("Call %1 again?").arg(number) : qsTr("Call again?")
    actions: [{ "text": qsTr("Redial"), "call": "redialRequest", "tint": "accept" },
              { "text": qsTr("Cancel"), "call": "cancelRedialRequest" }]
}
