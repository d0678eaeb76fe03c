.pragma library

// How the window draws a view of the phone: which generic page, and which buttons a popup or a
// notice page has, by view name (the end of the view identifier). Families of names share a
// page or a row of buttons; a name matched by nothing gets the notice page without buttons.

function nameOf(viewId) {
    var dot = viewId.lastIndexOf(".");
    return dot < 0 ? viewId : viewId.substring(dot + 1);
}

function isPhoneView(viewId) {
    return viewId.indexOf("PHONE.") === 0;
}

// "PhoneBookDownloadFailed" -> "Phone book download failed"
function title(name) {
    var words = name.replace(/Popup$/, "")
                    .replace(/([a-z0-9])([A-Z])/g, "$1 $2").replace(/([a-z])([0-9])/g, "$1 $2").replace(/([A-Z]+)([A-Z][a-z])/g, "$1 $2");
    return words.charAt(0).toUpperCase() + words.slice(1).toLowerCase()
                .replace(/\bsms\b/g, "text message").replace(/\bkova\b/g, "KOVA")
                .replace(/\bdtmf\b/g, "DTMF").replace(/\bsiri\b/g, "Siri");
}

var pages = [
    [/^PhoneMenu$/, "PhoneMenu"],
    [/^(DialKeypad|KeypadInCall)$/, "Keypad"],
    [/^CallInProgress$/, "Call"],
    [/^PhoneBook(List|Search)$/, "Contacts"],
    [/^RecentCalls$/, "RecentCalls"],
    [/^PhoneSms(List|View|ReplyView)$/, "Messages"],
    [/^Phone(Settings|SettingsRoot|ManageContactsSettings|RingtoneAboutSettings|TextMessageNotificationSettings)$/, "Settings"]
];

// The page file (in pages/) that draws a view on the screen area.
function pageFor(viewId) {
    if (viewId.length === 0)
        return "Blank";
    if (!isPhoneView(viewId))
        return "Placeholder";
    var name = nameOf(viewId);
    for (var i = 0; i < pages.length; ++i) {
        if (pages[i][0].test(name))
            return pages[i][1];
    }
    return "Notice";
}

// [label, controller slot, arguments...] rows, in the order a popup shows them.
var actions = [
    [/^IncomingCall$/, [["Accept", "acceptIncomingCall"], ["Reject", "rejectIncomingCall"]]],
    [/^WaitingCall$/, [["Accept", "acceptWaitingCall"], ["Reject", "rejectWaitingCall"]]],
    [/^Redial$/, [["Redial", "redialRequest"], ["Cancel", "cancelRedialRequest"]]],
    [/^CallEnded$/, [["OK", "callEndConfirmed"]]],
    [/^RoamingWarning$/, [["Call", "confirmRoamingCall"], ["Cancel", "cancelRoamingCall"]]],
    [/^DeviceIssueFixHint$/, [["Fix", "requestPhoneIssueFix"]]],
    [/^CallAnswerNotResponding$/, [["Stop", "stopAnswering"]]],
    [/^MissedCallPopup$/, [["Recent calls", "viewRecentCalls"]]],
    [/^NewTextMessageAlert[12]$/, [["Hear", "hearNewTextMessage"], ["View", "viewNewTextMessage"],
                                   ["Reply", "replyNewTextMessage"], ["Call", "callNewTextMessageNumber"],
                                   ["Close", "hideNewTextMessageAlert"]]],
    [/^MultipleTextMessagesReceived$/, [["View", "viewTextMessages"], ["Close", "hideNewTextMessageAlert"]]],
    [/^PhoneSmsSendTextMessage$/, [["Send", "initiateSendTextMessage"]]],
    [/^Phone(Sms)?(Retry)?SendTextMessage.*(Failure|NoResponseFromPhone)$/, [["Retry", "retrySendTextMessage"]]],
    [/^PhoneVoiceServiceActivatedPopup$/, [["Cancel", "phoneVoiceServiceCancelPressed"]]],
    [/^SiriConnectionNotRespondingPopup$/, [["Cancel", "siriCancelPressed"]]],
    [/^Phone(ConnectionLost|ConnectionUnstable)$|^UnableToConnect$/, [["Connect", "showConnectToDevice"]]],
    [/^PhoneBookDownloadFailedRetryAvailable$/, [["Retry", "retryAutomaticContactDownload"]]],
    [/^(SmsDownloadFailedRetryAvailable|PhoneSmsDownloadFailed)$/, [["Retry", "retryMessagesDownloading"], ["Cancel", "cancelMessagesDownloading"]]],
    [/^PhoneSmsDownloading$/, [["Cancel", "cancelMessagesDownloading"]]],
    [/^PhoneSmsAccessNotGranted$/, [["Retry", "requestMessageProfileAccessRetry"]]],
    [/^PhoneDeleteAllContactsPopup$/, [["Delete", "requestDeleteAllContacts"]]],
    // Popups 50 to 59 offer to clear alerts 1001 to 1010, popups 60 to 69 to fix them; the
    // buttons name the alert, not the popup.
    [/^PhoneStatusAlertPopup(5\d)$/, function (m) { var alert = 1001 + parseInt(m[1]) % 10;
        return [["Clear", "clearAlertPermanently", alert], ["This drive", "clearAlertForThisCycle", alert]]; }],
    [/^PhoneStatusAlertPopup(6\d)$/, function (m) { var alert = 1001 + parseInt(m[1]) % 10;
        return [["Fix", "fixStatusAlert", alert]]; }],
    [/^PhoneStatusAlerts$/, [["Alerts", "viewStatusBarAlerts"]]],
    [/^PhoneBookAutoDownload$/, [["Yes", "autoDownloadPhoneBookPositive"], ["No", "autoDownloadPhoneBookNegative"]]],
    [/^PhoneBook(DownloadFailed|DownloadFailedAgain)$/, [["Retry", "retryAutomaticContactDownload"]]],
    [/^PhoneBookAccessNotGranted$/, [["Retry", "retryPhnBookDownloadAccess"]]],
    [/^PhoneBook(Downloading|WaitingForResponseFromPhone)$/, [["Cancel", "cancelPhoneBookDownload"]]],
    [/^PhoneBookEmpty$/, [["Add contacts", "retryAutomaticContactDownload"]]],
    [/^ContactDetails$/, [["Contacts", "viewContacts"]]],
    [/^RecentCalls(DownloadFailed|RetryError)$/, [["Retry", "retryRecentCallsDownload"]]],
    [/^RecentCallsDownloading$/, [["Cancel", "cancelRecentCallsDownload"]]],
    [/^RecentCallsFailedCallKOVA$/, [["Call support", "callKovaSupport"]]],
    [/^PhoneDndActiveArdel$/, [["Do not disturb off", "toggleDoNotDisturb"]]],
    [/^siriFeatureNotEnabledPopup$/, [["Settings", "gotoPhoneSettings"]]]
];

function actionsFor(name) {
    for (var i = 0; i < actions.length; ++i) {
        var match = actions[i][0].exec(name);
        if (match)
            return typeof actions[i][1] === "function" ? actions[i][1](match) : actions[i][1];
    }
    return [];
}

// The step of the driver's answer to a popup with a button's row: the popup, the controller
// call the button makes (none for a plain close button) and its arguments.
function answer(viewId, action) {
    var step = { "answer": viewId };
    if (action.length > 1) {
        step.call = action[1];
        step.args = action.slice(2);
    }
    return step;
}

// Calls the controller's slot as a view does: by name, with the row's arguments.
function invoke(controller, action) {
    if (!controller || typeof controller[action[1]] !== "function") {
        console.warn("hmiphone-sim: the controller has no slot " + action[1]);
        return;
    }
    controller[action[1]].apply(controller, action.slice(2));
}
