#pragma once

#include <QString>

// The names of the state-machine events that the phone posts and reacts to. Names are global in
// the HMI's state machine and case-sensitive; each constant is named exactly as its event.

// clang-format off
#define HMIPHONE_EVENT_NAMES(X) \
    X(HmiPhone_RootStateRequest) \
    X(HmiPhone_AddPhoneRequest) \
    X(HmiPhone_DoNotDisturbToggleRequest) \
    X(HmiPhone_MakeCallRequest) \
    X(HmiPhone_EndCallRequest) \
    X(HmiPhone_VoiceInputRequest) \
    X(HmiPhone_ShowContactsRequest) \
    X(HmiPhone_ShowPhoneKeyPadRequest) \
    X(HmiPhone_ShowCallKeyPadRequest) \
    X(HmiPhone_HideCallKeyPadRequest) \
    X(HmiPhone_ShowiPhoneRequest) \
    X(HmiPhone_ShowVoiceMailRequest) \
    X(HmiPhone_ShowSmsRequest) \
    X(HmiPhone_ShowSmsStatus) \
    X(HmiPhone_ShowSmsIphoneRequest) \
    X(HmiPhone_ShowContactsSearch) \
    X(HmiPhone_ShowRecentCallsRequest) \
    X(HmiPhone_SiriRequest) \
    X(HmiPhone_ShowStatusBarAlertsRequest) \
    X(HmiPhone_ShowMainMenu) \
    X(HmiPhone_RejectIncomingCall) \
    X(HmiPhone_AcceptIncomingCall) \
    X(HmiPhone_RejectWaitingCall) \
    X(HmiPhone_AcceptWaitingCall) \
    X(HmiPhone_MuteRequest) \
    X(HmiPhone_PrivacyRequest) \
    X(HmiPhone_PhoneIssueFixRequest) \
    X(HmiPhone_DialPadKeyPressed) \
    X(HmiPhone_DialPadBackSpace) \
    X(HmiPhone_DialPadBackSpaceLongPress) \
    X(HmiPhone_DialPadKeyTonePressed) \
    X(HmiPhone_SetDeviceAsPhone) \
    X(HmiPhone_SetDeviceAsMedia) \
    X(HmiPhone_SetDeviceAsPhoneAndMedia) \
    X(HmiPhone_AutoDownloadPhoneBookPositive) \
    X(HmiPhone_AutoDownloadPhoneBookNegative) \
    X(HmiPhone_RedialRequest) \
    X(HmiPhone_CancelRedialRequest) \
    X(HmiPhone_CallEndConfirmed) \
    X(HmiPhone_CallInProgressRequest) \
    X(HmiPhone_ConfirmRoamingCall) \
    X(HmiPhone_CancelRoamingCall) \
    X(HmiPhone_FixStatusAlertRequest) \
    X(HmiPhone_ClearStatusAlertRequest) \
    X(HmiPhone_ClearAlertPermanentlyRequest) \
    X(HmiPhone_ClearAlertForThisCycleRequest) \
    X(HmiPhone_CallForFixAlertRequest) \
    X(HmiPhone_ClearAlertRequest) \
    X(HmiPhone_RetryDownloadContactRequest) \
    X(HmiPhone_PhoneBookStatusCheck) \
    X(HmiPhone_PhoneBookDownloadCanceled) \
    X(HmiPhone_RetryAutomaticContactDownloadRequest) \
    X(HmiPhone_RetryPhnBookDownloadAccessRequest) \
    X(HmiPhone_RetryAccessTextMessagesRequest) \
    X(HmiPhone_StopAnswering) \
    X(HmiPhone_ShowPhoneBookWaitingForResponseRequest) \
    X(HmiPhone_LegacyPairingAccepted) \
    X(HmiPhone_FinishDeviceConnection) \
    X(HmiPhone_DownloadDataMessages) \
    X(HmiPhone_RetryDownloadTextMessages) \
    X(HmiPhone_CloseUnableDownloadTextMessagesRequest) \
    X(HmiPhone_HearNewTextMessage) \
    X(HmiPhone_StopHearNewTextMessage) \
    X(HmiPhone_ViewNewTextMessage) \
    X(HmiPhone_ReplyNewTextMessage) \
    X(HmiPhone_CallNewTextMessageNumber) \
    X(HmiPhone_HideNewTextMessageAlert) \
    X(HmiPhoneSms_RetryMessagesDownload) \
    X(HmiPhoneSms_CancelMessagesDownload) \
    X(HmiPhoneSms_ViewTextMessageOptions) \
    X(HmiPhoneSms_RefreshMessages) \
    X(HmiPhoneSms_ViewTextMessage) \
    X(HmiPhoneSms_ReplyTextMessage) \
    X(HmiPhoneSms_HearTextMessage) \
    X(HmiPhoneSms_SendTextMessage) \
    X(HmiPhoneSms_InitiateSendTextMessage) \
    X(HmiPhoneSms_RetrySendTextMessage) \
    X(HmiPhone_SearchPhoneBookForLetter) \
    X(HmiPhone_MessageProfileAccessRetry) \
    X(HmiPhone_HearSelectedTextMessage) \
    X(HmiPhone_HearSelectedReplyMessage) \
    X(HmiPhone_PrivacyRequestOn) \
    X(HmiPhone_ShowConnectToDevice) \
    X(HmiPhone_ClearExtendedModeTimer) \
    X(HmiPhone_RoamingMode) \
    X(HmiPhone_ShowSiriNotEnabledRequest) \
    X(HmiPhone_RequestRecentCallList) \
    X(HmiPhone_RequestPhoneManageContactsSettingsPage) \
    X(HmiPhone_RequestPhoneRingtoneSettingsPage) \
    X(HmiPhone_requestPhoneTextMessageNotificationSettingsPage) \
    X(HmiPhone_RequestPhoneDeleteAllContactsPopup)
// clang-format on

#define HMIPHONE_DECLARE_EVENT(name) extern const QString name;

namespace HmiPhone {
namespace Events {
HMIPHONE_EVENT_NAMES(HMIPHONE_DECLARE_EVENT)
} // namespace Events
} // namespace HmiPhone
