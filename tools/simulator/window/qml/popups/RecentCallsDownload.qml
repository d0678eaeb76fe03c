import QtQuick 2.15
import ".."

// Getting the recent calls from the phone: downloading and its failures.
PopupFrame {
    id: popup
    readonly property var texts: ({
        "RecentCallsDownloading": [qsTr("Downloading recent calls"), ""],
        "RecentCallsDownloadFailed": [qsTr("Recent calls not downloaded"),
                                      qsTr("The recent calls could not be downloaded.")],
        "RecentCallsRetryError": [qsTr("Recent calls not downloaded"),
                                  qsTr("The download failed again.")],
        "RecentCallsFailedCallKOVA": [qsTr("Recent calls not downloaded"),
                                      qsTr("Customer support can help with this phone.")]
    })
    readonly property var shown: texts[name] || ["", ""]

    title: shown[0]
    text: shown[1]
    actions: name === "RecentCallsDownloading"
             ? [{ "text": qsTr("Cancel"), "call": "cancelRecentCallsDownload" }]
             : name === "RecentCallsFailedCallKOVA"
             ? [{ "text": qsTr("Call support"), "call": "callKovaSupport" }, { "text": qsTr("Close") }]
             : [{ "text": qsTr("Try again"), "call": "retryRecentCallsDownload" }, { "text": qsTr("Close") }]
}
