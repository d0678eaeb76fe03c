import QtQuick 2.15
import ".."

// A call that went wrong: dialling failed, no signal, the phone does not answer, the audio or the
// hands-free system failed, the phone is on stand-by.
PopupFrame {
    id: popup
    readonly property string number: _hmiphoneController.phoneSource.callNumberEntered
    readonly property var texts: ({
        "DialingFailed": [qsTr("Call failed"), qsTr("%1 could not be called.").arg(number)],
        "Dialing3rdFailure": [qsTr("Call failed again"),
                              qsTr("Please check the number and the phone's signal.")],
        "NoCellularSignal": [qsTr("No signal"), qsTr("The phone has no mobile network.")],
        "CallAnswerNotResponding": [qsTr("The phone does not answer"),
                                    qsTr("The call could not be answered.")],
        "PhoneCallStandByModePopup": [qsTr("Phone on stand-by"),
                                      qsTr("Calls wait until the phone is back.")],
        "DTMFKeyPressNoResponseErrorPopup": [qsTr("Tone not sent"),
                                             qsTr("The phone did not send the tone.")],
        "PhoneAudioTransferErrorPopup": [qsTr("Audio problem"),
                                         qsTr("The call's audio could not be moved.")],
        "HandsFreeError": [qsTr("Hands-free problem"),
                           qsTr("Use the phone itself for this call.")]
    })
    readonly property var shown: texts[name] || ["", ""]

    title: shown[0]
    text: shown[1]
    actions: name === "CallAnswerNotResponding"
             ? [{ "text": qsTr("Stop"), "call": "stopAnswering" }]
             : [{ "text": qsTr("OK") }]
}
