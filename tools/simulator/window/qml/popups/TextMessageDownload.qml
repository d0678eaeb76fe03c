import QtQuick 2.15
import ".."

// Getting the text messages from the phone: access, waiting, downloading, failures.
PopupFrame {
    id: popup
    readonly property var phone: _hmiphoneController.phoneSource
    readonly property var texts: ({
        "PhoneSmsNotSupported": [qsTr("Messages not available"),
                                 qsTr("This phone does not share its messages.")],
        "PhoneSmsAccessNotGranted": [qsTr("No access to messages"),
                                     qsTr("Allow access to messages on the phone.")],
        "PhoneSmsWaitingForResponseFromPhone": [qsTr("Waiting for the phone"),
                                                qsTr("Confirm access to messages on the phone.")],
        "PhoneSmsDownloading": [qsTr("Downloading messages"),
                                qsTr("%n messages", "", phone.smsTotalCount)],
        "PhoneSmsDownloadFailed": [qsTr("Messages not downloaded"),
                                   qsTr("The messages could not be downloaded.")],
        "PhoneSmsRetryDownloadFailed": [qsTr("Messages not downloaded"),
                                        qsTr("Tried %n times.", "", phone.numOfSmsDownloadAttempts)],
        "SmsDownloadFailedRetryAvailable": [qsTr("Messages not downloaded"),
                                            qsTr("Try again?")],
        "SmsDownloadFailedFinal": [qsTr("Messages not downloaded"),
                                   qsTr("Please reconnect the phone.")],
        "PhoneSmsTextMessagingOff": [qsTr("Messages are off"),
                                     qsTr("Switch on text message notification in the settings.")]
    })
    readonly property var shown: texts[name] || ["", ""]

    title: shown[0]
    text: shown[1]
    actions: name === "PhoneSmsAccessNotGranted"
             ? [{ "text": qsTr("Try again"), "call": "requestMessageProfileAccessRetry" }, { "text": qsTr("Close") }]
             : name === "PhoneSmsDownloadFailed" || name === "SmsDownloadFailedRetryAvailable"
             ? [{ "text": qsTr("Try again"), "call": "retryMessagesDownloading" },
                { "text": qsTr("Cancel"), "call": "cancelMessagesDownloading" }]
             : name === "PhoneSmsDownloading" || name === "PhoneSmsWaitingForResponseFromPhone"
             ? [{ "text": qsTr("Cancel"), "call": "cancelMessagesDownloading" }]
             : [{ "text": qsTr("OK") }]
}
