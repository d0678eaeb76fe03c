#include "hmiphonesmsmanager.h"

#include "phonesms_cmp.h"

namespace HmiPhone {

HmiPhoneSmsManager::HmiPhoneSmsManager(HmiPhoneController *controller, QObject *parent)
    : QObject(parent)
    , m_controller(controller)
{ }

void HmiPhoneSmsManager::createSmsStates(Phone_Cmp *phone)
{
    Q_UNUSED(phone)
}

Quorvel::HmiViewState *HmiPhoneSmsManager::phoneSmsViewState() const
{
    return m_phoneSmsCmp ? m_phoneSmsCmp->smsViewState() : nullptr;
}

Quorvel::HmiViewState *HmiPhoneSmsManager::phoneSmsReplyViewState() const
{
    return m_phoneSmsCmp ? m_phoneSmsCmp->smsReplyViewState() : nullptr;
}

void HmiPhoneSmsManager::handleMessageDownloadFailure() { }
void HmiPhoneSmsManager::handleMessagesRetryDownloadFailed() { }
void HmiPhoneSmsManager::handleMessageProfileAccessRetryRequest() { }
void HmiPhoneSmsManager::handlePhnSmsRequestInbox() { }
void HmiPhoneSmsManager::smsHandlePhoneDeclinedAccess() { }
void HmiPhoneSmsManager::onSmsInboxChanged() { }

} // namespace HmiPhone
