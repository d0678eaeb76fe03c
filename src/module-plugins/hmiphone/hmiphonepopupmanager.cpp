#include "hmiphonepopupmanager.h"

#include "hmiphoneviews.h"

#include <brisken/viewcontroller.h>

#include <QCoreApplication>
#include <QPointer>
#include <QVariant>

namespace HmiPhone {

namespace {
// Guarded: should the application object delete the instance, the next caller gets a new one
// rather than a dangling pointer.
QPointer<HmiPhonePopupManager> s_instance;
} // namespace

HmiPhonePopupManager::HmiPhonePopupManager(QObject *parent)
    : QObject(parent)
    , m_viewController(Brisken::ViewController::instance())
{ }

HmiPhonePopupManager *HmiPhonePopupManager::instance()
{
    if (!s_instance)
        s_instance = new HmiPhonePopupManager(QCoreApplication::instance());
    return s_instance;
}

void HmiPhonePopupManager::request(const QString &viewId)
{
    // Popup data is always empty: the views read what they show from the data bridge.
    if (m_viewController)
        m_viewController->requestPopup(viewId, QVariant());
}

void HmiPhonePopupManager::dismiss(const QString &viewId)
{
    if (m_viewController)
        m_viewController->dismissPopup(viewId);
}

void HmiPhonePopupManager::showNoCellularSignal()
{
    request(Views::NoCellularSignal);
}

void HmiPhonePopupManager::showDialingFailure()
{
    request(Views::DialingFailed);
}

void HmiPhonePopupManager::hideDialingFailure()
{
    dismiss(Views::DialingFailed);
}

void HmiPhonePopupManager::showDialing3rdFailure()
{
    request(Views::Dialing3rdFailure);
}

void HmiPhonePopupManager::showIncomingCall()
{
    request(Views::IncomingCall);
}

void HmiPhonePopupManager::dismissIncomingCall()
{
    dismiss(Views::IncomingCall);
}

void HmiPhonePopupManager::showWaitingCall()
{
    request(Views::WaitingCall);
}

void HmiPhonePopupManager::dismissWaitingCall()
{
    dismiss(Views::WaitingCall);
}

void HmiPhonePopupManager::showCallAcceptanceFailure()
{
    request(Views::CallAnswerNotResponding);
}

void HmiPhonePopupManager::showDeviceIssueFixHint()
{
    request(Views::DeviceIssueFixHint);
}

void HmiPhonePopupManager::showCallEnded()
{
    request(Views::CallEnded);
}

void HmiPhonePopupManager::showMissedCall()
{
    request(Views::MissedCallPopup);
}

void HmiPhonePopupManager::showRoamingWarning()
{
    request(Views::RoamingWarning);
}

void HmiPhonePopupManager::showBatteryLow()
{
    request(Views::BatteryLow);
}

void HmiPhonePopupManager::showPhoneConnectionUnstablePopup()
{
    request(Views::PhoneConnectionUnstable);
}

void HmiPhonePopupManager::showPhoneConnectionLost()
{
    request(Views::PhoneConnectionLost);
}

void HmiPhonePopupManager::hidePhoneConnectionLost()
{
    dismiss(Views::PhoneConnectionLost);
}

void HmiPhonePopupManager::showUnableToConnect()
{
    request(Views::UnableToConnect);
}

void HmiPhonePopupManager::hideUnableToConnect()
{
    dismiss(Views::UnableToConnect);
}

void HmiPhonePopupManager::showHandsFreeError()
{
    request(Views::HandsFreeError);
}

void HmiPhonePopupManager::showRedial()
{
    request(Views::Redial);
}

void HmiPhonePopupManager::showTransferToPhone()
{
    request(Views::PhoneCallStandByModePopup);
}

void HmiPhonePopupManager::hideTransferToPhone()
{
    dismiss(Views::PhoneCallStandByModePopup);
}

void HmiPhonePopupManager::showPhoneBookDownloadFailedRetryAvailable()
{
    request(Views::PhoneBookDownloadFailedRetryAvailable);
}

void HmiPhonePopupManager::showPhoneBookDownloadFailed()
{
    request(Views::PhoneBookDownloadFailed);
}

void HmiPhonePopupManager::showSmsDownloadFailedRetryAvailable()
{
    request(Views::SmsDownloadFailedRetryAvailable);
}

void HmiPhonePopupManager::showSmsDownloadFailed()
{
    request(Views::SmsDownloadFailedFinal);
}

void HmiPhonePopupManager::newTextMessageAlert1Show()
{
    request(Views::NewTextMessageAlert1);
}

void HmiPhonePopupManager::newTextMessageAlert2Show()
{
    request(Views::NewTextMessageAlert2);
}

void HmiPhonePopupManager::newTextMessageAlert2Hide()
{
    dismiss(Views::NewTextMessageAlert2);
}

void HmiPhonePopupManager::showTextMessagingOff()
{
    request(Views::PhoneSmsTextMessagingOff);
}

void HmiPhonePopupManager::hideTextMessagingOff()
{
    dismiss(Views::PhoneSmsTextMessagingOff);
}

void HmiPhonePopupManager::showMessageAccessProfileNotSupported()
{
    request(Views::PhoneSmsNotSupported);
}

void HmiPhonePopupManager::showMessageAccessNotGranted()
{
    request(Views::PhoneSmsAccessNotGranted);
}

void HmiPhonePopupManager::showMessageWaitingForResponseFromPhone()
{
    request(Views::PhoneSmsWaitingForResponseFromPhone);
}

void HmiPhonePopupManager::hideMessageWaitingForResponseFromPhone()
{
    dismiss(Views::PhoneSmsWaitingForResponseFromPhone);
}

void HmiPhonePopupManager::showMessagesDownloading()
{
    request(Views::PhoneSmsDownloading);
}

void HmiPhonePopupManager::hideMessagesDownloading()
{
    dismiss(Views::PhoneSmsDownloading);
}

void HmiPhonePopupManager::showMessagesDownloadFailed()
{
    request(Views::PhoneSmsDownloadFailed);
}

void HmiPhonePopupManager::showMessagesRetryDownloadFailed()
{
    request(Views::PhoneSmsRetryDownloadFailed);
}

void HmiPhonePopupManager::hideMessagesDownloadFailed()
{
    dismiss(Views::PhoneSmsDownloadFailed);
}

void HmiPhonePopupManager::showSendTextMessage()
{
    request(Views::PhoneSmsSendTextMessage);
}

void HmiPhonePopupManager::hideSendTextMessage()
{
    dismiss(Views::PhoneSmsSendTextMessage);
}

void HmiPhonePopupManager::showSendTextMessageProgress()
{
    request(Views::PhoneSmsSendTextMessageProgress);
}

void HmiPhonePopupManager::hideSendTextMessageProgress()
{
    dismiss(Views::PhoneSmsSendTextMessageProgress);
}

void HmiPhonePopupManager::showSendTextMessageSuccess()
{
    request(Views::PhoneSmsSendTextMessageSuccess);
}

void HmiPhonePopupManager::showSendTextMessageNoResponseFromPhone()
{
    request(Views::PhoneSmsSendTextMessageNoResponseFromPhone);
}

void HmiPhonePopupManager::showSendTextMessageFailure()
{
    request(Views::PhoneSmsSendTextMessageFailure);
}

void HmiPhonePopupManager::hideSendTextMessageFailure()
{
    dismiss(Views::PhoneSmsSendTextMessageFailure);
}

void HmiPhonePopupManager::showPhoneBookDownloadCompletePopup()
{
    request(Views::PhoneBookDownloadComplete);
}

void HmiPhonePopupManager::hidePhoneBookDownloadCompletePopup()
{
    dismiss(Views::PhoneBookDownloadComplete);
}

void HmiPhonePopupManager::showRetrySendMessageFailure()
{
    request(Views::PhoneSmsRetrySendTextMessageFailure);
}

void HmiPhonePopupManager::showSendMessageNetworkFailure()
{
    request(Views::PhoneSmsSendTextMessageNetworkFailure);
}

void HmiPhonePopupManager::showMultipleTextMessagePopup()
{
    request(Views::MultipleTextMessagesReceived);
}

void HmiPhonePopupManager::hideMultipleTextMessagePopup()
{
    dismiss(Views::MultipleTextMessagesReceived);
}

void HmiPhonePopupManager::showDTMFKeyPressNoResponseErrorPopup()
{
    request(Views::DTMFKeyPressNoResponseErrorPopup);
}

void HmiPhonePopupManager::hideDTMFKeyPressNoResponseErrorPopup()
{
    dismiss(Views::DTMFKeyPressNoResponseErrorPopup);
}

void HmiPhonePopupManager::showPhoneAudioTransferErrorPopup()
{
    request(Views::PhoneAudioTransferErrorPopup);
}

void HmiPhonePopupManager::hidePhoneAudioTransferErrorPopup()
{
    dismiss(Views::PhoneAudioTransferErrorPopup);
}

void HmiPhonePopupManager::showPhoneCallStandByModePopup()
{
    request(Views::PhoneCallStandByModePopup);
}

void HmiPhonePopupManager::hidePhoneCallStandByModePopup()
{
    dismiss(Views::PhoneCallStandByModePopup);
}

void HmiPhonePopupManager::showUnstableConnectionWithKovaPopup()
{
    request(Views::UnstableDeviceConnectionWithKovaPopup);
}

void HmiPhonePopupManager::hideUnstableConnectionWithKovaPopup()
{
    dismiss(Views::UnstableDeviceConnectionWithKovaPopup);
}

void HmiPhonePopupManager::showPhoneSiriNoResponseErrorPopup()
{
    request(Views::SiriConnectionNotRespondingPopup);
}

void HmiPhonePopupManager::hidePhoneSiriNoResponseErrorPopup()
{
    dismiss(Views::SiriConnectionNotRespondingPopup);
}

void HmiPhonePopupManager::showPhoneContactsTooLargeErrorPopup()
{
    request(Views::ContactsListTooLargePopup);
}

void HmiPhonePopupManager::hidePhoneContactsTooLargeErrorPopup()
{
    dismiss(Views::ContactsListTooLargePopup);
}

void HmiPhonePopupManager::showSiriNotEnabledErrorPopup()
{
    request(Views::siriFeatureNotEnabledPopup);
}

void HmiPhonePopupManager::hideSiriNotEnabledErrorPopup()
{
    dismiss(Views::siriFeatureNotEnabledPopup);
}

void HmiPhonePopupManager::showPhoneDndActiveArdel()
{
    request(Views::PhoneDndActiveArdel);
}

void HmiPhonePopupManager::hidePhoneDndActiveArdel()
{
    dismiss(Views::PhoneDndActiveArdel);
}

} // namespace HmiPhone
