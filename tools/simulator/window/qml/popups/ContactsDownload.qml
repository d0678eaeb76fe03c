import QtQuick 2.15
import ".."

// Getting the contacts from the phone: the question, waiting, downloading, done, failures.
PopupFrame {
    id: popup
    readonly property int contacts: _hmiphoneController.phoneSource.phoneBook().listLength
    readonly property var texts: ({
        "PhoneBookDownloading": [qsTr("Downloading contacts"), qsTr("This may take a moment.")],
        "PhoneBookWaitingForResponseFromPhone": [qsTr("Waiting for the phone"),
                                                 qsTr("Allow access to contacts on the phone.")],
        "PhoneBookAccessNotGranted": [qsTr("No access to contacts"),
                                      qsTr("Allow access to contacts on the phone.")],
        "PhoneBookDownloadFailed": [qsTr("Contacts not downloaded"),
                                    qsTr("The contacts could not be downloaded.")],
        "PhoneBookDownloadFailedAgain": [qsTr("Contacts not downloaded"),
                                         qsTr("The download failed again.")],
        "PhoneBookAutoDownload": [qsTr("Download contacts?"),
                                  qsTr("The contacts of this phone can be downloaded every time it connects.")],
        "PhoneBookDownloadFailedRetryAvailable": [qsTr("Contacts not downloaded"),
                                                  qsTr("Try again?")],
        "ContactsListTooLargePopup": [qsTr("Too many contacts"),
                                      qsTr("Only part of the contacts could be downloaded.")],
        "PhoneBookDownloadComplete": [qsTr("Contacts downloaded"),
                                      qsTr("%n contacts", "", contacts)]
    })
    readonly property var shown: texts[name] || ["", ""]

    title: shown[0]
    text: shown[1]
    actions: name === "PhoneBookAutoDownload"
             ? [{ "text": qsTr("Yes"), "call": "autoDownloadPhoneBookPositive", "tint": "accept" },
                { "text": qsTr("No"), "call": "autoDownloadPhoneBookNegative" }]
             : name === "PhoneBookAccessNotGranted"
             ? [{ "text": qsTr("Try again"), "call": "retryPhnBookDownloadAccess" }, { "text": qsTr("Close") }]
             : name === "PhoneBookDownloadFailed" || name === "PhoneBookDownloadFailedAgain"
               || name === "PhoneBookDownloadFailedRetryAvailable"
             ? [{ "text": qsTr("Try again"), "call": "retryAutomaticContactDownload" }, { "text": qsTr("Close") }]
             : name === "PhoneBookDownloading" || name === "PhoneBookWaitingForResponseFromPhone"
             ? [{ "text": qsTr("Cancel"), "call": "cancelPhoneBookDownload" }]
             : [{ "text": qsTr("OK") }]
}
