#pragma once

#include <QString>

// The phone's view identifiers and status-bar transient names. A view identifier is made once, at
// library load, by the view manager from the module name and the view name; the state that shows
// a view carries the same identifier as its name.

// clang-format off
#define HMIPHONE_VIEW_NAMES(X) \
    X(PhoneMenu) \
    X(DialKeypad) \
    X(CallInProgress) \
    X(KeypadInCall) \
    X(PhoneBook) \
    X(PairingDeviceFailure) \
    X(IncomingCall) \
    X(WaitingCall) \
    X(siriFeatureNotEnabledPopup) \
    X(Redial) \
    X(CallEnded) \
    X(DeviceIssueFixHint) \
    X(NoCellularSignal) \
    X(DialingFailed) \
    X(Dialing3rdFailure) \
    X(MissedCallPopup) \
    X(RoamingWarning) \
    X(BatteryLow) \
    X(PhoneStatusAlertPopup50) \
    X(PhoneStatusAlertPopup60) \
    X(PhoneStatusAlertPopup70) \
    X(PhoneConnectionUnstable) \
    X(PhoneConnectionLost) \
    X(UnableToConnect) \
    X(HandsFreeError) \
    X(CallAnswerNotResponding) \
    X(PhoneStatusAlertPopup51) \
    X(PhoneStatusAlertPopup61) \
    X(PhoneStatusAlertPopup52) \
    X(PhoneStatusAlertPopup62) \
    X(PhoneStatusAlertPopup63) \
    X(PhoneStatusAlertPopup54) \
    X(PhoneStatusAlertPopup64) \
    X(PhoneStatusAlertPopup55) \
    X(PhoneStatusAlertPopup65) \
    X(PhoneStatusAlertPopup56) \
    X(PhoneStatusAlertPopup66) \
    X(PhoneStatusAlertPopup57) \
    X(PhoneStatusAlertPopup67) \
    X(PhoneStatusAlertPopup58) \
    X(PhoneStatusAlertPopup68) \
    X(PhoneStatusAlertPopup59) \
    X(PhoneStatusAlertPopup69) \
    X(PhoneStatusAlertPopup75) \
    X(RecentCalls) \
    X(PhoneBookList) \
    X(PhoneBookEmpty) \
    X(PhoneBookSearch) \
    X(ContactDetails) \
    X(PhoneBookDownloading) \
    X(PhoneBookWaitingForResponseFromPhone) \
    X(PhoneBookAccessNotGranted) \
    X(PhoneBookDownloadFailed) \
    X(PhoneBookDownloadFailedAgain) \
    X(PhoneBookAutoDownload) \
    X(RecentCallsDownloading) \
    X(RecentCallsDownloadFailed) \
    X(RecentCallsRetryError) \
    X(RecentCallsFailedCallKOVA) \
    X(PhoneSmsList) \
    X(PhoneSmsView) \
    X(PhoneSmsReplyView) \
    X(PhoneSmsNotSupported) \
    X(PhoneSmsAccessNotGranted) \
    X(PhoneSmsWaitingForResponseFromPhone) \
    X(PhoneSmsDownloading) \
    X(PhoneSmsDownloadFailed) \
    X(PhoneSmsRetryDownloadFailed) \
    X(PhoneVoiceServiceActivatedPopup) \
    X(PhoneSmsTextMessagingOff) \
    X(NewTextMessageAlert1) \
    X(NewTextMessageAlert2) \
    X(PhoneSmsSendTextMessage) \
    X(PhoneSmsSendTextMessageProgress) \
    X(PhoneSmsSendTextMessageSuccess) \
    X(PhoneSmsSendTextMessageNoResponseFromPhone) \
    X(PhoneSmsSendTextMessageNetworkFailure) \
    X(PhoneSmsSendTextMessageFailure) \
    X(PhoneSmsRetrySendTextMessageFailure) \
    X(MultipleTextMessagesReceived) \
    X(PhoneAudioTransferErrorPopup) \
    X(DTMFKeyPressNoResponseErrorPopup) \
    X(PhoneCallStandByModePopup) \
    X(UnstableDeviceConnectionWithKovaPopup) \
    X(SiriConnectionNotRespondingPopup) \
    X(ContactsListTooLargePopup) \
    X(PhoneBookDownloadComplete) \
    X(PhoneBookDownloadFailedRetryAvailable) \
    X(SmsDownloadFailedRetryAvailable) \
    X(SmsDownloadFailedFinal) \
    X(PhoneDndActiveArdel) \
    X(PhoneSettingsRoot) \
    X(PhoneSettings) \
    X(PhoneManageContactsSettings) \
    X(PhoneRingtoneAboutSettings) \
    X(PhoneTextMessageNotificationSettings) \
    X(PhoneDeleteAllContactsPopup)

#define HMIPHONE_TRANSIENT_NAMES(X) \
    X(PhoneAcceptedIncomingCall) \
    X(PhoneRejectedIncomingCall) \
    X(PhoneCallEnded) \
    X(PhoneOutgoingDialing) \
    X(PhoneConnectedOutgoingCall) \
    X(PhonebookDownloadInitiated) \
    X(PhonebookDownloadComplete) \
    X(PhoneVoiceServiceActivatedTransientMsg)
// clang-format on

#define HMIPHONE_DECLARE_NAME(name) extern const QString name;

namespace HmiPhone {

// The name under which the framework knows the phone's views.
extern const QString ModuleName;

namespace Views {
HMIPHONE_VIEW_NAMES(HMIPHONE_DECLARE_NAME)
} // namespace Views

namespace Transients {
HMIPHONE_TRANSIENT_NAMES(HMIPHONE_DECLARE_NAME)
} // namespace Transients

} // namespace HmiPhone
