.pragma library

// Which file draws a view of the phone: a screen file (screens/) or a popup file (popups/), by
// view name, the end of the view identifier. A popup file draws one kind of popup and may serve
// several names of that kind.

function nameOf(viewId) {
    var dot = viewId.lastIndexOf(".");
    return dot < 0 ? viewId : viewId.substring(dot + 1);
}

var screens = {
    "PhoneMenu": "PhoneMenu",
    "DialKeypad": "DialKeypad",
    "CallInProgress": "CallInProgress",
    "KeypadInCall": "KeypadInCall",
    "PhoneBookList": "PhoneBookList",
    "PhoneBookSearch": "PhoneBookSearch",
    "PhoneBookEmpty": "PhoneBookEmpty",
    "ContactDetails": "ContactDetails",
    "RecentCalls": "RecentCalls",
    "PhoneSmsList": "PhoneSmsList",
    "PhoneSmsView": "PhoneSmsView",
    "PhoneSmsReplyView": "PhoneSmsReplyView",
    "PhoneStatusAlerts": "PhoneStatusAlerts",
    "PhoneSettingsRoot": "PhoneSettingsRoot",
    "PhoneSettings": "PhoneSettings",
    "PhoneManageContactsSettings": "PhoneManageContactsSettings",
    "PhoneRingtoneAboutSettings": "PhoneRingtoneAboutSettings",
    "PhoneTextMessageNotificationSettings": "PhoneTextMessageNotificationSettings"
};

var popups = (function () {
    var kinds = {
        "IncomingCall": ["IncomingCall"],
        "WaitingCall": ["WaitingCall"],
        "CallEnded": ["CallEnded"],
        "Redial": ["Redial"],
        "MissedCall": ["MissedCallPopup"],
        "RoamingWarning": ["RoamingWarning"],
        "CallProblem": ["DialingFailed", "Dialing3rdFailure", "NoCellularSignal",
                        "CallAnswerNotResponding", "PhoneCallStandByModePopup",
                        "DTMFKeyPressNoResponseErrorPopup", "PhoneAudioTransferErrorPopup",
                        "HandsFreeError"],
        "Connection": ["PhoneConnectionLost", "PhoneConnectionUnstable", "UnableToConnect",
                       "UnstableDeviceConnectionWithKovaPopup", "DeviceIssueFixHint",
                       "PairingDeviceFailure"],
        "BatteryLow": ["BatteryLow"],
        "VoiceService": ["PhoneVoiceServiceActivatedPopup", "SiriConnectionNotRespondingPopup",
                         "siriFeatureNotEnabledPopup"],
        "NewTextMessage": ["NewTextMessageAlert1", "NewTextMessageAlert2"],
        "MultipleTextMessages": ["MultipleTextMessagesReceived"],
        "SendTextMessage": ["PhoneSmsSendTextMessage", "PhoneSmsSendTextMessageProgress",
                            "PhoneSmsSendTextMessageSuccess",
                            "PhoneSmsSendTextMessageNoResponseFromPhone",
                            "PhoneSmsSendTextMessageNetworkFailure",
                            "PhoneSmsSendTextMessageFailure",
                            "PhoneSmsRetrySendTextMessageFailure"],
        "TextMessageDownload": ["PhoneSmsNotSupported", "PhoneSmsAccessNotGranted",
                                "PhoneSmsWaitingForResponseFromPhone", "PhoneSmsDownloading",
                                "PhoneSmsDownloadFailed", "PhoneSmsRetryDownloadFailed",
                                "SmsDownloadFailedRetryAvailable", "SmsDownloadFailedFinal",
                                "PhoneSmsTextMessagingOff"],
        "ContactsDownload": ["PhoneBookDownloading", "PhoneBookWaitingForResponseFromPhone",
                             "PhoneBookAccessNotGranted", "PhoneBookDownloadFailed",
                             "PhoneBookDownloadFailedAgain", "PhoneBookAutoDownload",
                             "PhoneBookDownloadFailedRetryAvailable", "ContactsListTooLargePopup",
                             "PhoneBookDownloadComplete"],
        "RecentCallsDownload": ["RecentCallsDownloading", "RecentCallsDownloadFailed",
                                "RecentCallsRetryError", "RecentCallsFailedCallKOVA"],
        "DeleteAllContacts": ["PhoneDeleteAllContactsPopup"],
        "DoNotDisturb": ["PhoneDndActiveArdel"]
    };
    var byName = {};
    for (var kind in kinds) {
        for (var i = 0; i < kinds[kind].length; ++i)
            byName[kinds[kind][i]] = kind;
    }
    // The status alerts' clear (50 to 59), fix (60 to 69) and retry-failed (70, 75) popups.
    for (var number = 50; number <= 75; ++number) {
        if (number !== 53 && (number <= 70 || number === 75))
            byName["PhoneStatusAlertPopup" + number] = "StatusAlert";
    }
    return byName;
})();

// The screen file that draws a view on the screen area.
function screenFor(viewId) {
    if (viewId.length === 0)
        return "Blank";
    if (viewId.indexOf("PHONE.") !== 0)
        return "OtherModule";
    return screens[nameOf(viewId)] || "UnknownView";
}

// The popup file that draws a popup.
function popupFor(viewId) {
    return popups[nameOf(viewId)] || "UnknownPopup";
}
