#include "hmiphonesmsmanager.h"

#include "hmiphonecontroller.h"
#include "hmiphoneevents.h"
#include "hmiphoneintegration.h"
#include "hmiphonepopupmanager.h"
#include "hmiphoneviews.h"
#include "phone_cmp.h"
#include "phonemenustate.h"
#include "phonesms_cmp.h"

#include <mavrosk/bluetoothsource.h>
#include <mavrosk/phonesource.h>
#include <quorvel/hmisignaltransition.h>
#include <quorvel/hmitransition.h>
#include <quorvel/intsignaltransition.h>
#include <quorvel/popupstate.h>

namespace HmiPhone {

namespace {

// Messages downloading status as the phone reports it.
constexpr int DownloadRunning = 2;
constexpr int DownloadFinished = 3;
constexpr int DownloadFailed = 4;

// Retries the user may make from the download-failed popup before the final popup is shown;
// they are counted for the manager's whole life.
constexpr int MaxDownloadRetries = 2;

} // namespace

HmiPhoneSmsManager::HmiPhoneSmsManager(HmiPhoneController *controller, QObject *parent)
    : QObject(parent)
    , m_popupManager(HmiPhonePopupManager::instance())
    , m_phoneSource(Mavrosk::PhoneSource::instance())
    , m_controller(controller)
{
    connect(m_phoneSource, &Mavrosk::PhoneSource::newTextMessageAlert, this,
            &HmiPhoneSmsManager::onSmsInboxChanged);
    connect(m_phoneSource, &Mavrosk::PhoneSource::smsTotalCountChanged, this,
            &HmiPhoneSmsManager::onSmsInboxChanged);
    connect(m_phoneSource, &Mavrosk::PhoneSource::totalUnreadSmsCountChanged, this,
            &HmiPhoneSmsManager::onSmsInboxChanged);
    connect(Mavrosk::BluetoothSource::instance(), &Mavrosk::BluetoothSource::phoneDeviceChanged,
            this, &HmiPhoneSmsManager::onSmsInboxChanged);
}

void HmiPhoneSmsManager::createSmsStates(Phone_Cmp *phone)
{
    m_phoneSmsCmp = new PhoneSms_Cmp(QStringLiteral("PhoneSmsCmp"), phone);
    connect(m_phoneSmsCmp, &PhoneSms_Cmp::phnSmsRequestInbox, this,
            &HmiPhoneSmsManager::handlePhnSmsRequestInbox);
    connect(m_phoneSmsCmp, &PhoneSms_Cmp::phnSmsRequestInboxForce, m_phoneSource,
            &Mavrosk::PhoneSource::requestTextMessagesInbox);

    new Quorvel::PopupState(Views::PhoneSmsNotSupported, phone, 1);
    auto *waitingPopup
            = new Quorvel::PopupState(Views::PhoneSmsWaitingForResponseFromPhone, phone, 1);
    auto *accessNotGrantedPopup
            = new Quorvel::PopupState(Views::PhoneSmsAccessNotGranted, phone, 1);
    m_downloadingPopup = new Quorvel::PopupState(Views::PhoneSmsDownloading, phone, 1);
    m_downloadFailedPopup = new Quorvel::PopupState(Views::PhoneSmsDownloadFailed, phone, 1);
    new Quorvel::PopupState(Views::PhoneSmsRetryDownloadFailed, phone, 1);

    m_downloadDoneTransition = new Quorvel::IntSignalTransition(
            m_phoneSource, &Mavrosk::PhoneSource::messagesDownloadingStatusChanged,
            DownloadFinished, m_downloadingPopup);
    connect(m_downloadDoneTransition, &QAbstractTransition::triggered, m_popupManager,
            &HmiPhonePopupManager::hideMessagesDownloading);
    m_downloadDoneTransition->setTargetState(m_phoneSmsCmp);

    m_cancelTransition = new Quorvel::HmiTransition(Events::HmiPhoneSms_CancelMessagesDownload,
                                                    m_downloadingPopup);
    connect(m_cancelTransition, &QAbstractTransition::triggered, m_popupManager,
            &HmiPhonePopupManager::hideMessagesDownloading);
    m_cancelTransition->setTargetState(phone->phoneIdleState());

    m_downloadFailedTransition = new Quorvel::IntSignalTransition(
            m_phoneSource, &Mavrosk::PhoneSource::messagesDownloadingStatusChanged, DownloadFailed,
            m_downloadingPopup);
    connect(m_downloadFailedTransition, &QAbstractTransition::triggered, this,
            &HmiPhoneSmsManager::handleMessageDownloadFailure);

    m_retryTransition = new Quorvel::HmiTransition(Events::HmiPhoneSms_RetryMessagesDownload,
                                                   m_downloadFailedPopup);
    connect(m_retryTransition, &QAbstractTransition::triggered, this,
            &HmiPhoneSmsManager::handleMessagesRetryDownloadFailed);

    auto *declinedTransition = new Quorvel::HmiSignalTransition(
            m_phoneSource, &Mavrosk::PhoneSource::smsPhoneDeclinedAccess, waitingPopup);
    connect(declinedTransition, &QAbstractTransition::triggered, this,
            &HmiPhoneSmsManager::smsHandlePhoneDeclinedAccess);

    auto *accessRetryTransition = new Quorvel::HmiTransition(
            Events::HmiPhone_MessageProfileAccessRetry, accessNotGrantedPopup);
    connect(accessRetryTransition, &QAbstractTransition::triggered, this,
            &HmiPhoneSmsManager::handleMessageProfileAccessRetryRequest);
}

Quorvel::HmiViewState *HmiPhoneSmsManager::phoneSmsViewState() const
{
    return m_phoneSmsCmp ? m_phoneSmsCmp->smsViewState() : nullptr;
}

Quorvel::HmiViewState *HmiPhoneSmsManager::phoneSmsReplyViewState() const
{
    return m_phoneSmsCmp ? m_phoneSmsCmp->smsReplyViewState() : nullptr;
}

void HmiPhoneSmsManager::handleMessageDownloadFailure()
{
    m_popupManager->hideMessagesDownloading();
    if (m_retryCount < MaxDownloadRetries)
        m_popupManager->showMessagesDownloadFailed();
    else
        m_popupManager->showMessagesRetryDownloadFailed();
}

void HmiPhoneSmsManager::handleMessagesRetryDownloadFailed()
{
    ++m_retryCount;
    m_phoneSource->retrySmsDownload();
    m_popupManager->hideMessagesDownloadFailed();
}

void HmiPhoneSmsManager::handleMessageProfileAccessRetryRequest()
{
    m_phoneSource->retryMessageProfileAccess();
}

void HmiPhoneSmsManager::handlePhnSmsRequestInbox()
{
    if (!m_inboxChanged)
        return;
    // A running download brings the inbox with it: the change counts as handled either way.
    if (m_phoneSource->messagesDownloadingStatus() != DownloadRunning)
        m_phoneSource->requestTextMessagesInbox();
    m_inboxChanged = false;
}

void HmiPhoneSmsManager::smsHandlePhoneDeclinedAccess()
{
    m_popupManager->hideMessageWaitingForResponseFromPhone();
    if (!m_controller) {
        qCWarning(hmiphone) << "HmiPhoneSmsManager: the controller is gone, no text messages shown";
        return;
    }
    m_controller->showTextMessages();
}

void HmiPhoneSmsManager::onSmsInboxChanged()
{
    m_inboxChanged = true;
}

} // namespace HmiPhone
