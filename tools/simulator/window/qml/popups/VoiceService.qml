import QtQuick 2.15
import ".."

// The phone's voice assistant: listening, not responding, or not set up on the phone.
PopupFrame {
    id: popup
    readonly property var texts: ({
        "PhoneVoiceServiceActivatedPopup": [qsTr("Voice assistant"), qsTr("Speak now.")],
        "SiriConnectionNotRespondingPopup": [qsTr("Voice assistant"),
                                             qsTr("The phone's voice assistant does not respond.")],
        "siriFeatureNotEnabledPopup": [qsTr("Voice assistant off"),
                                       qsTr("Switch the voice assistant on in the phone's settings.")]
    })
    readonly property var shown: texts[name] || ["", ""]

    title: shown[0]
    text: shown[1]
    actions: name === "PhoneVoiceServiceActivatedPopup"
             ? [{ "text": qsTr("Cancel"), "call": "phoneVoiceServiceCancelPressed" }]
             : name === "SiriConnectionNotRespondingPopup"
             ? [{ "text": qsTr("Cancel"), "call": "siriCancelPressed" }]
             : [{ "text": qsTr("Settings"), "call": "gotoPhoneSettings" }, { "text": qsTr("Close") }]
}
