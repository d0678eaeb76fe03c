#include "hmiphonepopupmanager.h"

#include <QCoreApplication>
#include <QVariant>

namespace HmiPhone {

namespace {
HmiPhonePopupManager *s_instance = nullptr;
}

HmiPhonePopupManager::HmiPhonePopupManager(QObject *parent)
    : QObject(parent)
{ }

HmiPhonePopupManager *HmiPhonePopupManager::instance()
{
    if (!s_instance)
        s_instance = new HmiPhonePopupManager(QCoreApplication::instance());
    return s_instance;
}

void HmiPhonePopupManager::request(const QString &viewId)
{
    Q_UNUSED(viewId)
}

void HmiPhonePopupManager::dismiss(const QString &viewId)
{
    Q_UNUSED(viewId)
}

void HmiPhonePopupManager::showNoCellularSignal()
{
    request(QStringLiteral("NoCellularSignal"));
}

void HmiPhonePopupManager::showDialingFailure()
{
    request(QStringLiteral("DialingFailed"));
}

void HmiPhonePopupManager::hideDialingFailure()
{
    dismiss(QStringLiteral("DialingFailed"));
}

void HmiPhonePopupManager::showDialing3rdFailure()
{
    request(QStringLiteral("Dialing3rdFailure"));
}

void HmiPhonePopupManager::showIncomingCall()
{
    request(QStringLiteral("IncomingCall"));
}

void HmiPhonePopupManager::dismissIncomingCall()
{
    dismiss(QStringLiteral("IncomingCall"));
}

void HmiPhonePopupManager::showWaitingCall()
{
    request(QStringLiteral("WaitingCall"));
}

void HmiPhonePopupManager::dismissWaitingCall()
{
    dismiss(QStringLiteral("WaitingCall"));
}

void HmiPhonePopupManager::showCallAcceptanceFailure()
{
    request(QStringLiteral("CallAnswerNotResponding"));
}

void HmiPhonePopupManager::showDeviceIssueFixHint()
{
    request(QStringLiteral("DeviceIssueFixHint"));
}

void HmiPhonePopupManager::showCallEnded()
{
    request(QStringLiteral("CallEnded"));
}

void HmiPhonePopupManager::showMissedCall()
{
    request(QStringLiteral("MissedCallPopup"));
}

void HmiPhonePopupManager::showRoamingWarning()
{
    request(QStringLiteral("RoamingWarning"));
}

void HmiPhonePopupManager::showBatteryLow()
{
    request(QStringLiteral("BatteryLow"));
}

void HmiPhonePopupManager::showPhoneConnectionUnstablePopup()
{
    request(QStringLiteral("PhoneConnectionUnstable"));
}

void HmiPhonePopupManager::showPhoneConnectionLost()
{
    request(QStringLiteral("PhoneConnectionLost"));
}

void HmiPhonePopupManager::hidePhoneConnectionLost()
{
    dismiss(QStringLiteral("PhoneConnectionLost"));
}

void HmiPhonePopupManager::showUnableToConnect()
{
    request(QStringLiteral("UnableToConnect"));
}

void HmiPhonePopupManager::hideUnableToConnect()
{
    dismiss(QStringLiteral("UnableToConnect"));
}

void HmiPhonePopupManager::showHandsFreeError()
{
    request(QStringLiteral("HandsFreeError"));
}

void HmiPhonePopupManager::showRedial()
{
    request(QStringLiteral("Redial"));
}

void HmiPhonePopupManager::showTransferToPhone()
{
    request(QStringLiteral("PhoneCallStandByModePopup"));
}

void HmiPhonePopupManager::hideTransferToPhone()
{
    dismiss(QStringLiteral("PhoneCallStandByModePopup"));
}

void HmiPhonePopupManager::showPhoneBookDownloadFailedRetryAvailable()
{
    request(QStringLiteral("PhoneBookDownloadFailedRetryAvailable"));
}

void HmiPhonePopupManager::showPhoneBookDownloadFailed()
{
    request(QStringLiteral("PhoneBookDownloadFailed"));
}

void HmiPhonePopupManager::showSmsDownloadFailedRetryAvailable()
{
    request(QStringLiteral("SmsDownloadFailedRetryAvailable"));
}

void HmiPhonePopupManager::showSmsDownloadFailed()
{
    request(QStringLiteral("SmsDownloadFailedFinal"));
}

void HmiPhonePopupManager::newTextMessageAlert1Show()
{
    request(QStringLiteral("NewTextMessageAlert1"));
}

void HmiPhonePopupManager::newTextMessageAlert2Show()
{
    request(QStringLiteral("NewTextMessageAlert2"));
}

void HmiPhonePopupManager::newTextMessageAlert2Hide()
{
    dismiss(QStringLiteral("NewTextMessageAlert2"));
}

void HmiPhonePopupManager::showTextMessagingOff()
{
    request(QStringLiteral("PhoneSmsTextMessagingOff"));
}

void HmiPhonePopupManager::hideTextMessagingOff()
{
    dismiss(QStringLiteral("PhoneSmsTextMessagingOff"));
}

void HmiPhonePopupManager::showMessageAccessProfileNotSupported()
{
    request(QStringLiteral("PhoneSmsNotSupported"));
}

void HmiPhonePopupManager::showMessageAccessNotGranted()
{
    request(QStringLiteral("PhoneSmsAccessNotGranted"));
}

void HmiPhonePopupManager::showMessageWaitingForResponseFromPhone()
{
    request(QStringLiteral("PhoneSmsWaitingForResponseFromPhone"));
}

void HmiPhonePopupManager::hideMessageWaitingForResponseFromPhone()
{
    dismiss(QStringLiteral("PhoneSmsWaitingForResponseFromPhone"));
}

void HmiPhonePopupManager::showMessagesDownloading()
{
    request(QStringLiteral("PhoneSmsDownloading"));
}

void HmiPhonePopupManager::hideMessagesDownloading()
{
    dismiss(QStringLiteral("PhoneSmsDownloading"));
}

void HmiPhonePopupManager::showMessagesDownloadFailed()
{
    request(QStringLiteral("PhoneSmsDownloadFailed"));
}

void HmiPhonePopupManager::showMessagesRetryDownloadFailed()
{
    request(QStringLiteral("PhoneSmsRetryDownloadFailed"));
}

void HmiPhonePopupManager::hideMessagesDownloadFailed()
{
    dismiss(QStringLiteral("PhoneSmsDownloadFailed"));
}

void HmiPhonePopupManager::showSendTextMessage()
{
    request(QStringLiteral("PhoneSmsSendTextMessage"));
}

void HmiPhonePopupManager::hideSendTextMessage()
{
    dismiss(QStringLiteral("PhoneSmsSendTextMessage"));
}

void HmiPhonePopupManager::showSendTextMessageProgress()
{
    request(QStringLiteral("PhoneSmsSendTextMessageProgress"));
}

void HmiPhonePopupManager::hideSendTextMessageProgress()
{
    dismiss(QStringLiteral("PhoneSmsSendTextMessageProgress"));
}

void HmiPhonePopupManager::showSendTextMessageSuccess()
{
    request(QStringLiteral("PhoneSmsSendTextMessageSuccess"));
}

void HmiPhonePopupManager::showSendTextMessageNoResponseFromPhone()
{
    request(QStringLiteral("PhoneSmsSendTextMessageNoResponseFromPhone"));
}

void HmiPhonePopupManager::showSendTextMessageFailure()
{
    request(QStringLiteral("PhoneSmsSendTextMessageFailure"));
}

void HmiPhonePopupManager::hideSendTextMessageFailure()
{
    dismiss(QStringLiteral("PhoneSmsSendTextMessageFailure"));
}

void HmiPhonePopupManager::showPhoneBookDownloadCompletePopup()
{
    request(QStringLiteral("PhoneBookDownloadComplete"));
}

void HmiPhonePopupManager::hidePhoneBookDownloadCompletePopup()
{
    dismiss(QStringLiteral("PhoneBookDownloadComplete"));
}

void HmiPhonePopupManager::showRetrySendMessageFailure()
{
    request(QStringLiteral("PhoneSmsRetrySendTextMessageFailure"));
}

void HmiPhonePopupManager::showSendMessageNetworkFailure()
{
    request(QStringLiteral("PhoneSmsSendTextMessageNetworkFailure"));
}

void HmiPhonePopupManager::showMultipleTextMessagePopup()
{
    request(QStringLiteral("MultipleTextMessagesReceived"));
}

void HmiPhonePopupManager::hideMultipleTextMessagePopup()
{
    dismiss(QStringLiteral("MultipleTextMessagesReceived"));
}

void HmiPhonePopupManager::showDTMFKeyPressNoResponseErrorPopup()
{
    request(QStringLiteral("DTMFKeyPressNoResponseErrorPopup"));
}

void HmiPhonePopupManager::hideDTMFKeyPressNoResponseErrorPopup()
{
    dismiss(QStringLiteral("DTMFKeyPressNoResponseErrorPopup"));
}

void HmiPhonePopupManager::showPhoneAudioTransferErrorPopup()
{
    request(QStringLiteral("PhoneAudioTransferErrorPopup"));
}

void HmiPhonePopupManager::hidePhoneAudioTransferErrorPopup()
{
    dismiss(QStringLiteral("PhoneAudioTransferErrorPopup"));
}

void HmiPhonePopupManager::showPhoneCallStandByModePopup()
{
    request(QStringLiteral("PhoneCallStandByModePopup"));
}

void HmiPhonePopupManager::hidePhoneCallStandByModePopup()
{
    dismiss(QStringLiteral("PhoneCallStandByModePopup"));
}

void HmiPhonePopupManager::showUnstableConnectionWithKovaPopup()
{
    request(QStringLiteral("UnstableDeviceConnectionWithKovaPopup"));
}

void HmiPhonePopupManager::hideUnstableConnectionWithKovaPopup()
{
    dismiss(QStringLiteral("UnstableDeviceConnectionWithKovaPopup"));
}

void HmiPhonePopupManager::showPhoneSiriNoResponseErrorPopup()
{
    request(QStringLiteral("SiriConnectionNotRespondingPopup"));
}

void HmiPhonePopupManager::hidePhoneSiriNoResponseErrorPopup()
{
    dismiss(QStringLiteral("SiriConnectionNotRespondingPopup"));
}

void HmiPhonePopupManager::showPhoneContactsTooLargeErrorPopup()
{
    request(QStringLiteral("ContactsListTooLargePopup"));
}

void HmiPhonePopupManager::hidePhoneContactsTooLargeErrorPopup()
{
    dismiss(QStringLiteral("ContactsListTooLargePopup"));
}

void HmiPhonePopupManager::showSiriNotEnabledErrorPopup()
{
    request(QStringLiteral("siriFeatureNotEnabledPopup"));
}

void HmiPhonePopupManager::hideSiriNotEnabledErrorPopup()
{
    dismiss(QStringLiteral("siriFeatureNotEnabledPopup"));
}

void HmiPhonePopupManager::showPhoneDndActiveArdel()
{
    request(QStringLiteral("PhoneDndActiveArdel"));
}

void HmiPhonePopupManager::hidePhoneDndActiveArdel()
{
    dismiss(QStringLiteral("PhoneDndActiveArdel"));
}

} // namespace HmiPhone
