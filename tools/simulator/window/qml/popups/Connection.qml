import QtQuick 2.15
import ".."

// The link to the phone: lost, unstable, or not made; what to do about it.
PopupFrame {
    id: popup
    readonly property var texts: ({
        "PhoneConnectionLost": [qsTr("Phone disconnected"),
                                qsTr("The connection to the phone was lost.")],
        "PhoneConnectionUnstable": [qsTr("Connection unstable"),
                                    qsTr("The connection to the phone keeps dropping.")],
        "UnableToConnect": [qsTr("Cannot connect"), qsTr("The phone could not be connected.")],
        "UnstableDeviceConnectionWithKovaPopup": [qsTr("Connection unstable"),
                                                  qsTr("Customer support can help with this phone.")],
        "DeviceIssueFixHint": [qsTr("Phone problem"), qsTr("A few steps may fix the phone.")],
        "PairingDeviceFailure": [qsTr("Pairing failed"), qsTr("The phone could not be paired.")]
    })
    readonly property var shown: texts[name] || ["", ""]

    title: shown[0]
    text: shown[1]
    actions: name === "DeviceIssueFixHint"
             ? [{ "text": qsTr("Fix"), "call": "requestPhoneIssueFix" }, { "text": qsTr("Close") }]
             : name === "UnstableDeviceConnectionWithKovaPopup"
             ? [{ "text": qsTr("Call support"), "call": "callKovaSupport" }, { "text": qsTr("Close") }]
             : [{ "text": qsTr("Connect"), "call": "showConnectToDevice" }, { "text": qsTr("Close") }]
}
