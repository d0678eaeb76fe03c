import QtQuick 2.15
import ".."
import "../Format.js" as Format

// Sending a reply: the question, the sending, and how it went.
PopupFrame {
    id: popup
    readonly property var phone: _hmiphoneController.phoneSource
    readonly property string recipient: Format.who(phone.textMessageSenderName,
                                                   phone.textMessageSenderNumber)
    readonly property var texts: ({
        "PhoneSmsSendTextMessage": [qsTr("Send to %1?").arg(recipient),
                                    "\u201C" + phone.replyTextSelected + "\u201D"],
        "PhoneSmsSendTextMessageProgress": [qsTr("Sending"), qsTr("To %1").arg(recipient)],
        "PhoneSmsSendTextMessageSuccess": [qsTr("Message sent"), qsTr("To %1").arg(recipient)],
        "PhoneSmsSendTextMessageNoResponseFromPhone": [qsTr("Not sent"),
                                                       qsTr("The phone did not answer.")],
        "PhoneSmsSendTextMessageNetworkFailure": [qsTr("Not sent"),
                                                  qsTr("The phone has no network.")],
        "PhoneSmsSendTextMessageFailure": [qsTr("Not sent"),
                                           qsTr("The message to %1 could not be sent.").arg(recipient)],
        "PhoneSmsRetrySendTextMessageFailure": [qsTr("Not sent again"),
                                                qsTr("The message to %1 could not be sent.").arg(recipient)]
    })
    readonly property var shown: texts[name] || ["", ""]

    title: shown[0]
    text: shown[1]
    actions: name === "PhoneSmsSendTextMessage"
             ? [{ "text": qsTr("Send"), "call": "initiateSendTextMessage", "tint": "accept" },
                { "text": qsTr("Cancel") }]
             : name === "PhoneSmsSendTextMessageFailure"
               || name === "PhoneSmsSendTextMessageNetworkFailure"
               || name === "PhoneSmsSendTextMessageNoResponseFromPhone"
             ? [{ "text": qsTr("Try again"), "call": "retrySendTextMessage" }, { "text": qsTr("Close") }]
             : name === "PhoneSmsSendTextMessageProgress" ? [] : [{ "text": qsTr("OK") }]
}
