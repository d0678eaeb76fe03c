#include "hmiphonecontroller.h"

#include "hmiphoneproductconfig.h"

namespace HmiPhone {

HmiPhoneController::HmiPhoneController(HmiPhoneIntegration *integration)
    : Brisken::ModuleController(reinterpret_cast<QObject *>(integration))
    , m_integration(integration)
    , m_longPressInterval(ProductConfig::DefaultLongPressInterval)
    , m_maximumSizeOfNumber(ProductConfig::DefaultMaximumSizeOfNumber)
    , m_maxKnownBluetoothDevices(ProductConfig::DefaultMaxKnownBluetoothDevices)
    , m_batteryLowLevel(ProductConfig::DefaultBatteryLowLevel)
{
    m_bluetoothSource = Mavrosk::BluetoothSource::instance();
    m_phoneSource = Mavrosk::PhoneSource::instance();
}

Mavrosk::EAPhoneSource *HmiPhoneController::eaPhoneSource() const
{
    return Mavrosk::EAPhoneSource::instance();
}

bool HmiPhoneController::shouldBatteryWarningBeShown(int)
{
    return false;
}

void HmiPhoneController::viewRecentCalls() { }

void HmiPhoneController::viewContacts() { }

void HmiPhoneController::searchContacts() { }

void HmiPhoneController::showPhoneBookWaitingForResponseFromPhone() { }

void HmiPhoneController::viewVoiceMail() { }

void HmiPhoneController::viewiPhone() { }

void HmiPhoneController::viewTextMessages() { }

void HmiPhoneController::showTextMessages() { }

void HmiPhoneController::viewIphoneTextMessages() { }

void HmiPhoneController::toggleSiri() { }

void HmiPhoneController::viewStatusBarAlerts() { }

void HmiPhoneController::showDialPad() { }

void HmiPhoneController::showCallKeyPad() { }

void HmiPhoneController::hideCallKeyPad() { }

void HmiPhoneController::toggleDoNotDisturb() { }

void HmiPhoneController::dialPadButtonPressed(const QString &) { }

void HmiPhoneController::dialPadBackSpacePressed() { }

void HmiPhoneController::dialPadBackSpaceLongPress() { }

void HmiPhoneController::dialPadSpeakItPressed() { }

void HmiPhoneController::dialPadTonePressed(const QString &, const QString &) { }

void HmiPhoneController::makeCall() { }

void HmiPhoneController::endCall() { }

void HmiPhoneController::acceptIncomingCall() { }

void HmiPhoneController::rejectIncomingCall() { }

void HmiPhoneController::acceptWaitingCall() { }

void HmiPhoneController::rejectWaitingCall() { }

void HmiPhoneController::stopAnswering() { }

void HmiPhoneController::requestMute() { }

void HmiPhoneController::requestPrivacy() { }

void HmiPhoneController::privacyModeOn() { }

void HmiPhoneController::requestPhoneIssueFix() { }

void HmiPhoneController::setDeviceAsPhone() { }

void HmiPhoneController::setDeviceAsMedia() { }

void HmiPhoneController::setDeviceAsPhoneAndMedia() { }

void HmiPhoneController::autoDownloadPhoneBookPositive() { }

void HmiPhoneController::autoDownloadPhoneBookNegative() { }

void HmiPhoneController::redialRequest() { }

void HmiPhoneController::cancelRedialRequest() { }

void HmiPhoneController::callEndConfirmed() { }

void HmiPhoneController::confirmRoamingCall() { }

void HmiPhoneController::cancelRoamingCall() { }

void HmiPhoneController::fixStatusAlert(int) { }

void HmiPhoneController::clearStatusAlert(int) { }

void HmiPhoneController::clearAlertPermanently(int) { }

void HmiPhoneController::clearAlertForThisCycle(int) { }

void HmiPhoneController::callForFixAlert(int, const QString &) { }

void HmiPhoneController::clearAlert(int) { }

void HmiPhoneController::retryDownloadContact(int) { }

void HmiPhoneController::retryAutomaticContactDownload() { }

void HmiPhoneController::retryPhnBookDownloadAccess() { }

void HmiPhoneController::retryAccessTextMessages(int) { }

void HmiPhoneController::hearNewTextMessage() { }

void HmiPhoneController::stopHearNewTextMessage() { }

void HmiPhoneController::viewNewTextMessage() { }

void HmiPhoneController::callNewTextMessageNumber() { }

void HmiPhoneController::replyNewTextMessage() { }

void HmiPhoneController::hideNewTextMessageAlert() { }

void HmiPhoneController::retryMessagesDownloading() { }

void HmiPhoneController::cancelMessagesDownloading() { }

void HmiPhoneController::viewTextMessageOptions(int) { }

void HmiPhoneController::refreshMessages() { }

void HmiPhoneController::viewTextMessage() { }

void HmiPhoneController::replyTextMessage() { }

void HmiPhoneController::sendTextMessage() { }

void HmiPhoneController::initiateSendTextMessage() { }

void HmiPhoneController::retrySendTextMessage() { }

void HmiPhoneController::hearTextMessage() { }

void HmiPhoneController::hearSelectedTextMessage(int) { }

void HmiPhoneController::requestMessageProfileAccessRetry() { }

void HmiPhoneController::hearSelectedReplyMessage() { }

void HmiPhoneController::showConnectToDevice() { }

void HmiPhoneController::clearExtendedModeTimer() { }

void HmiPhoneController::cancelPhoneBookDownload() { }

void HmiPhoneController::requestPhoneManageContactsSettingsPage() { }

void HmiPhoneController::requestPhoneRingtoneSettingsPage() { }

void HmiPhoneController::requestPhoneTextMessageNotificationSettingsPage() { }

void HmiPhoneController::requestPhoneDeleteAllContactsPopup() { }

void HmiPhoneController::addPhonePressed() { }

void HmiPhoneController::gotoPhoneSettings() { }

void HmiPhoneController::viewBluetoothDevices() { }

void HmiPhoneController::showConnectedDeviceSettings() { }

void HmiPhoneController::showNavPOIByAddress(const QString &, const QString &, const QString &,
                                             const QString &, const QString &, const QString &)
{ }

void HmiPhoneController::swapCall() { }

void HmiPhoneController::joinCalls() { }

void HmiPhoneController::selectPhoneBookEntry(int) { }

void HmiPhoneController::requestRecentCallsList(int) { }

void HmiPhoneController::retryRecentCallsDownload() { }

void HmiPhoneController::cancelRecentCallsDownload() { }

void HmiPhoneController::sendMessageNotificationEnabled(bool) { }

void HmiPhoneController::playText(const QString &) { }

void HmiPhoneController::playContactName(const QString &) { }

void HmiPhoneController::siriCancelPressed() { }

void HmiPhoneController::phoneVoiceServiceCancelPressed() { }

void HmiPhoneController::setPhonebookContactDisplayType(int) { }

void HmiPhoneController::setPhoneMuteAudioInPrivacyEnabled(bool) { }

void HmiPhoneController::setRoamingWarningEnabled(bool) { }

void HmiPhoneController::setLowBatteryNotificationEnabled(bool) { }

void HmiPhoneController::setContactSortOrder(int) { }

void HmiPhoneController::requestReDownloadContacts() { }

void HmiPhoneController::requestDeleteAllContacts() { }

void HmiPhoneController::playRingtone(int) { }

void HmiPhoneController::stopPlayRingtone() { }

void HmiPhoneController::playAlert(int) { }

void HmiPhoneController::setRingtone(int) { }

void HmiPhoneController::setAlert(int) { }

void HmiPhoneController::callNumber(const QString &) { }

void HmiPhoneController::dialRecentCall(int, int) { }

void HmiPhoneController::callKovaSupport() { }

void HmiPhoneController::setAutomaticContactDownloadEnabled(bool) { }

void HmiPhoneController::jumpToPhoneSection() { }

void HmiPhoneController::calculateDriverRestrictedPhonebookMinMaxRows(int, int, int) { }

void HmiPhoneController::driverRestrictedPhonebookFilterByAlpha(const QString &) { }

void HmiPhoneController::searchPhoneBook(const QString &) { }

void HmiPhoneController::setLongPressInterval(int) { }

void HmiPhoneController::setMaximumSizeOfNumber(int) { }

void HmiPhoneController::setMaxKnownBluetoothDevices(int) { }

void HmiPhoneController::setBatteryLowLevel(int) { }

void HmiPhoneController::setLastKnownPhonebookIndex(int) { }

void HmiPhoneController::checkSizeOfNumber(const QString &) { }

void HmiPhoneController::phoneDeviceChanged() { }

} // namespace HmiPhone
