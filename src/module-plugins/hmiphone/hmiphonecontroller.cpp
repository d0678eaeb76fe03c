#include "hmiphonecontroller.h"

#include "hmiphoneevents.h"
#include "hmiphoneintegration.h"
#include "hmiphonenumbers.h"
#include "hmiphoneproductconfig.h"

#include <brisken/viewcontroller.h>
#include <mavrosk/infinitelistmodel.h>
#include <mavrosk/multidplistmodel.h>
#include <quorvel/hmievent.h>
#include <taldris/hmiintentmanager.h>

#include <QVariantMap>

namespace HmiPhone {

namespace {

// Five pages of contacts at most in the driver-restricted window; one letter at most 20 rows.
constexpr int DriverRestrictedPages = 5;
constexpr int DriverRestrictedLetterRows = 20;

// Display types of the phone source's contact list.
constexpr int ContactDisplayTypeList = 0;
constexpr int ContactDisplayTypeSearch = 1;

// The first character of a text, upper-cased as a Unicode code point; 0 when the text is empty.
// Whole code points, so that contact names outside Latin-1 keep their own letters.
uint upperFirstCodePoint(const QString &text)
{
    if (text.isEmpty())
        return 0;
    const QChar first = text.at(0);
    if (first.isHighSurrogate() && text.size() > 1 && text.at(1).isLowSurrogate())
        return QChar::toUpper(QChar::surrogateToUcs4(first, text.at(1)));
    return QChar::toUpper(first.unicode());
}

// The row at which an entry of the alphabet bar starts its letter's contacts, or -1 when the
// letter has none: the bridge's -1, and also a start that is no whole number or lies outside the
// contact list, which no window can show.
qint64 sectionStart(const Mavrosk::MultiDPListModel *alphabet, int entry, qint64 listLength)
{
    bool isNumber = false;
    const qint64 start = alphabet->get(entry, QStringLiteral("letterIndex")).toLongLong(&isNumber);
    return isNumber && start >= 0 && start < listLength ? start : -1;
}

} // namespace

HmiPhoneController::HmiPhoneController(HmiPhoneIntegration *integration)
    : Brisken::ModuleController(integration)
    , m_integration(integration)
    , m_longPressInterval(ProductConfig::DefaultLongPressInterval)
    , m_maximumSizeOfNumber(ProductConfig::DefaultMaximumSizeOfNumber)
    , m_maxKnownBluetoothDevices(ProductConfig::DefaultMaxKnownBluetoothDevices)
    , m_batteryLowLevel(ProductConfig::DefaultBatteryLowLevel)
{
    m_bluetoothSource = Mavrosk::BluetoothSource::instance();
    m_phoneSource = Mavrosk::PhoneSource::instance();

    if (!m_integration)
        qCCritical(hmiphone()) << "HmiPhoneController: Invalid HmiPhoneIntegration instance!";

    // The size flags keep their defaults until the entered number first changes.
    connect(m_phoneSource, &Mavrosk::PhoneSource::callNumberEnteredChanged, this,
            &HmiPhoneController::checkSizeOfNumber);
    connect(m_bluetoothSource, &Mavrosk::BluetoothSource::phoneDeviceChanged, this,
            &HmiPhoneController::phoneDeviceChanged);
}

Mavrosk::EAPhoneSource *HmiPhoneController::eaPhoneSource() const
{
    return Mavrosk::EAPhoneSource::instance();
}

bool HmiPhoneController::shouldBatteryWarningBeShown(int level)
{
    bool show = false;
    if (level <= m_batteryLowLevel && level != -1)
        show = m_lastBatteryLevel > m_batteryLowLevel || m_lastBatteryLevel == -1;
    // Also -1: a stored -1 means no level seen yet, so the next low reading warns again.
    m_lastBatteryLevel = level;
    return show;
}

void HmiPhoneController::incrementRecievedTextMessageCount()
{
    ++m_receivedTextMessageCount;
    emit receivedTextMessageCountChanged(m_receivedTextMessageCount);
}

void HmiPhoneController::resetRecievedTextMessageCount()
{
    if (m_receivedTextMessageCount == 0)
        return;
    m_receivedTextMessageCount = 0;
    emit receivedTextMessageCountChanged(0);
}

// --- Requests that become state-machine events ----------------------------------------------

void HmiPhoneController::viewRecentCalls()
{
    postHmiEvent(Events::HmiPhone_ShowRecentCallsRequest);
}

void HmiPhoneController::viewContacts()
{
    postHmiEvent(Events::HmiPhone_ShowContactsRequest);
}

void HmiPhoneController::searchContacts()
{
    postHmiEvent(Events::HmiPhone_ShowContactsSearch);
}

void HmiPhoneController::showPhoneBookWaitingForResponseFromPhone()
{
    postHmiEvent(Events::HmiPhone_ShowPhoneBookWaitingForResponseRequest);
}

void HmiPhoneController::viewVoiceMail()
{
    postHmiEvent(Events::HmiPhone_ShowVoiceMailRequest);
}

void HmiPhoneController::viewiPhone()
{
    postHmiEvent(Events::HmiPhone_ShowiPhoneRequest);
}

void HmiPhoneController::viewTextMessages()
{
    postHmiEvent(Events::HmiPhone_ShowSmsRequest);
}

void HmiPhoneController::showTextMessages()
{
    postHmiEvent(Events::HmiPhone_ShowSmsStatus);
}

void HmiPhoneController::viewIphoneTextMessages()
{
    postHmiEvent(Events::HmiPhone_ShowSmsIphoneRequest);
}

void HmiPhoneController::toggleSiri()
{
    postHmiEvent(Events::HmiPhone_SiriRequest);
}

void HmiPhoneController::viewStatusBarAlerts()
{
    postHmiEvent(Events::HmiPhone_ShowStatusBarAlertsRequest);
}

void HmiPhoneController::showDialPad()
{
    postHmiEvent(Events::HmiPhone_ShowPhoneKeyPadRequest);
}

void HmiPhoneController::showCallKeyPad()
{
    postHmiEvent(Events::HmiPhone_ShowCallKeyPadRequest);
}

void HmiPhoneController::hideCallKeyPad()
{
    postHmiEvent(Events::HmiPhone_HideCallKeyPadRequest);
}

void HmiPhoneController::toggleDoNotDisturb()
{
    postHmiEvent(Events::HmiPhone_DoNotDisturbToggleRequest);
}

void HmiPhoneController::dialPadButtonPressed(const QString &arg)
{
    postHmiEvent(Events::HmiPhone_DialPadKeyPressed, arg);
}

void HmiPhoneController::dialPadBackSpacePressed()
{
    postHmiEvent(Events::HmiPhone_DialPadBackSpace);
}

void HmiPhoneController::dialPadBackSpaceLongPress()
{
    postHmiEvent(Events::HmiPhone_DialPadBackSpaceLongPress);
}

void HmiPhoneController::dialPadSpeakItPressed()
{
    postHmiEvent(Events::HmiPhone_VoiceInputRequest);
}

void HmiPhoneController::dialPadTonePressed(const QString &tone, const QString &textButton)
{
    if (tone.isEmpty()) {
        qCCritical(hmiphone())
                << "Hmi Phone Controller: tone string empty, cannot extract tone char";
        return;
    }
    // The call component sends the tone as the key's 8-bit character code ('#' 35, '*' 42).
    // qint8 keeps the value the same on targets whose plain char is unsigned.
    const int toneChar = static_cast<qint8>(tone.at(0).toLatin1());
    postHmiEvent(Events::HmiPhone_DialPadKeyTonePressed, QVariantList{toneChar, textButton});
}

void HmiPhoneController::makeCall()
{
    postHmiEvent(Events::HmiPhone_MakeCallRequest);
}

void HmiPhoneController::endCall()
{
    postHmiEvent(Events::HmiPhone_EndCallRequest);
}

void HmiPhoneController::acceptIncomingCall()
{
    postHmiEvent(Events::HmiPhone_AcceptIncomingCall);
}

void HmiPhoneController::rejectIncomingCall()
{
    postHmiEvent(Events::HmiPhone_RejectIncomingCall);
}

void HmiPhoneController::acceptWaitingCall()
{
    postHmiEvent(Events::HmiPhone_AcceptWaitingCall);
}

void HmiPhoneController::rejectWaitingCall()
{
    postHmiEvent(Events::HmiPhone_RejectWaitingCall);
}

void HmiPhoneController::stopAnswering()
{
    postHmiEvent(Events::HmiPhone_StopAnswering);
}

void HmiPhoneController::requestMute()
{
    postHmiEvent(Events::HmiPhone_MuteRequest);
}

void HmiPhoneController::requestPrivacy()
{
    postHmiEvent(Events::HmiPhone_PrivacyRequest);
}

void HmiPhoneController::privacyModeOn()
{
    postHmiEvent(Events::HmiPhone_PrivacyRequestOn);
}

void HmiPhoneController::requestPhoneIssueFix()
{
    postHmiEvent(Events::HmiPhone_PhoneIssueFixRequest);
}

void HmiPhoneController::setDeviceAsPhone()
{
    postHmiEvent(Events::HmiPhone_SetDeviceAsPhone);
}

void HmiPhoneController::setDeviceAsMedia()
{
    postHmiEvent(Events::HmiPhone_SetDeviceAsMedia);
}

void HmiPhoneController::setDeviceAsPhoneAndMedia()
{
    postHmiEvent(Events::HmiPhone_SetDeviceAsPhoneAndMedia);
}

void HmiPhoneController::autoDownloadPhoneBookPositive()
{
    postHmiEvent(Events::HmiPhone_AutoDownloadPhoneBookPositive);
}

void HmiPhoneController::autoDownloadPhoneBookNegative()
{
    postHmiEvent(Events::HmiPhone_AutoDownloadPhoneBookNegative);
}

void HmiPhoneController::redialRequest()
{
    postHmiEvent(Events::HmiPhone_RedialRequest);
}

void HmiPhoneController::cancelRedialRequest()
{
    postHmiEvent(Events::HmiPhone_CancelRedialRequest);
}

void HmiPhoneController::callEndConfirmed()
{
    postHmiEvent(Events::HmiPhone_CallEndConfirmed);
}

void HmiPhoneController::confirmRoamingCall()
{
    postHmiEvent(Events::HmiPhone_ConfirmRoamingCall);
}

void HmiPhoneController::cancelRoamingCall()
{
    postHmiEvent(Events::HmiPhone_CancelRoamingCall);
}

void HmiPhoneController::fixStatusAlert(int alertId)
{
    postHmiEvent(Events::HmiPhone_FixStatusAlertRequest, alertId);
}

void HmiPhoneController::clearStatusAlert(int alertId)
{
    postHmiEvent(Events::HmiPhone_ClearStatusAlertRequest, alertId);
}

void HmiPhoneController::clearAlertPermanently(int alertId)
{
    postHmiEvent(Events::HmiPhone_ClearAlertPermanentlyRequest, alertId);
}

void HmiPhoneController::clearAlertForThisCycle(int alertId)
{
    postHmiEvent(Events::HmiPhone_ClearAlertForThisCycleRequest, alertId);
}

void HmiPhoneController::callForFixAlert(int alertId, const QString &supportPhoneNumber)
{
    // The status alerts read the entries by these keys.
    const QVariantMap value{{QStringLiteral("alertId"), alertId},
                            {QStringLiteral("supportPhoneNumber"), supportPhoneNumber}};
    postHmiEvent(Events::HmiPhone_CallForFixAlertRequest, value);
}

void HmiPhoneController::clearAlert(int alertId)
{
    postHmiEvent(Events::HmiPhone_ClearAlertRequest, alertId);
}

void HmiPhoneController::retryDownloadContact(int alertId)
{
    postHmiEvent(Events::HmiPhone_RetryDownloadContactRequest, alertId);
}

void HmiPhoneController::retryAutomaticContactDownload()
{
    postHmiEvent(Events::HmiPhone_RetryAutomaticContactDownloadRequest);
}

void HmiPhoneController::retryPhnBookDownloadAccess()
{
    postHmiEvent(Events::HmiPhone_RetryPhnBookDownloadAccessRequest);
}

void HmiPhoneController::retryAccessTextMessages(int alertId)
{
    postHmiEvent(Events::HmiPhone_RetryAccessTextMessagesRequest, alertId);
}

void HmiPhoneController::hearNewTextMessage()
{
    postHmiEvent(Events::HmiPhone_HearNewTextMessage);
}

void HmiPhoneController::stopHearNewTextMessage()
{
    postHmiEvent(Events::HmiPhone_StopHearNewTextMessage);
}

void HmiPhoneController::viewNewTextMessage()
{
    postHmiEvent(Events::HmiPhone_ViewNewTextMessage);
}

void HmiPhoneController::callNewTextMessageNumber()
{
    postHmiEvent(Events::HmiPhone_CallNewTextMessageNumber);
}

void HmiPhoneController::replyNewTextMessage()
{
    postHmiEvent(Events::HmiPhone_ReplyNewTextMessage);
}

void HmiPhoneController::hideNewTextMessageAlert()
{
    postHmiEvent(Events::HmiPhone_HideNewTextMessageAlert);
}

void HmiPhoneController::retryMessagesDownloading()
{
    postHmiEvent(Events::HmiPhoneSms_RetryMessagesDownload);
}

void HmiPhoneController::cancelMessagesDownloading()
{
    postHmiEvent(Events::HmiPhoneSms_CancelMessagesDownload);
}

void HmiPhoneController::viewTextMessageOptions(int arg)
{
    postHmiEvent(Events::HmiPhoneSms_ViewTextMessageOptions, arg);
}

void HmiPhoneController::refreshMessages()
{
    postHmiEvent(Events::HmiPhoneSms_RefreshMessages);
}

void HmiPhoneController::viewTextMessage()
{
    postHmiEvent(Events::HmiPhoneSms_ViewTextMessage);
}

void HmiPhoneController::replyTextMessage()
{
    postHmiEvent(Events::HmiPhoneSms_ReplyTextMessage);
}

void HmiPhoneController::sendTextMessage()
{
    postHmiEvent(Events::HmiPhoneSms_SendTextMessage);
}

void HmiPhoneController::initiateSendTextMessage()
{
    postHmiEvent(Events::HmiPhoneSms_InitiateSendTextMessage);
}

void HmiPhoneController::retrySendTextMessage()
{
    postHmiEvent(Events::HmiPhoneSms_RetrySendTextMessage);
}

void HmiPhoneController::hearTextMessage()
{
    postHmiEvent(Events::HmiPhoneSms_HearTextMessage);
}

void HmiPhoneController::hearSelectedTextMessage(int arg)
{
    postHmiEvent(Events::HmiPhone_HearSelectedTextMessage, arg);
}

void HmiPhoneController::requestMessageProfileAccessRetry()
{
    postHmiEvent(Events::HmiPhone_MessageProfileAccessRetry);
}

void HmiPhoneController::hearSelectedReplyMessage()
{
    postHmiEvent(Events::HmiPhone_HearSelectedReplyMessage);
}

void HmiPhoneController::showConnectToDevice()
{
    postHmiEvent(Events::HmiPhone_ShowConnectToDevice);
}

void HmiPhoneController::clearExtendedModeTimer()
{
    postHmiEvent(Events::HmiPhone_ClearExtendedModeTimer);
}

void HmiPhoneController::cancelPhoneBookDownload()
{
    postHmiEvent(Events::HmiPhone_PhoneBookDownloadCanceled);
}

void HmiPhoneController::requestPhoneManageContactsSettingsPage()
{
    postHmiEvent(Events::HmiPhone_RequestPhoneManageContactsSettingsPage);
}

void HmiPhoneController::requestPhoneRingtoneSettingsPage()
{
    postHmiEvent(Events::HmiPhone_RequestPhoneRingtoneSettingsPage);
}

void HmiPhoneController::requestPhoneTextMessageNotificationSettingsPage()
{
    postHmiEvent(Events::HmiPhone_requestPhoneTextMessageNotificationSettingsPage);
}

void HmiPhoneController::requestPhoneDeleteAllContactsPopup()
{
    postHmiEvent(Events::HmiPhone_RequestPhoneDeleteAllContactsPopup);
}

// --- Intent requests --------------------------------------------------------------------------

void HmiPhoneController::addPhonePressed()
{
    requestIntent(IntentAction::AddPhone);
}

void HmiPhoneController::gotoPhoneSettings()
{
    requestIntent(IntentAction::PhoneSettings);
}

void HmiPhoneController::viewBluetoothDevices()
{
    requestIntent(IntentAction::BluetoothDevices);
}

void HmiPhoneController::showConnectedDeviceSettings()
{
    requestIntent(IntentAction::ConnectedDeviceSettings);
}

void HmiPhoneController::showNavPOIByAddress(const QString &name, const QString &street,
                                             const QString &city, const QString &state,
                                             const QString &country, const QString &zip)
{
    requestIntent(IntentAction::NavigationPoiByAddress,
                  QVariantList{name, street, city, state, country, zip});
}

// --- Phone source commands --------------------------------------------------------------------

void HmiPhoneController::swapCall()
{
    if (m_phoneSource)
        m_phoneSource->swapCall();
}

void HmiPhoneController::joinCalls()
{
    if (m_phoneSource)
        m_phoneSource->joinCalls();
}

void HmiPhoneController::selectPhoneBookEntry(int index)
{
    m_phoneSource->selectPhoneBookEntry(index);
}

void HmiPhoneController::requestRecentCallsList(int callType)
{
    m_phoneSource->downloadRecentCallsList(callType);
}

void HmiPhoneController::retryRecentCallsDownload()
{
    m_phoneSource->downloadRecentCallsList();
}

void HmiPhoneController::cancelRecentCallsDownload()
{
    m_phoneSource->cancelRecentCallsDownload();
}

void HmiPhoneController::sendMessageNotificationEnabled(bool enabled)
{
    m_phoneSource->sendMessageNotificationEnabled(enabled);
}

void HmiPhoneController::playText(const QString &text)
{
    m_phoneSource->textMessagePlayback(text);
}

void HmiPhoneController::playContactName(const QString &name)
{
    m_phoneSource->contactNamePlayback(name);
}

void HmiPhoneController::siriCancelPressed()
{
    m_phoneSource->toggleSiriActivation(false);
}

void HmiPhoneController::phoneVoiceServiceCancelPressed()
{
    m_phoneSource->togglePhoneVoiceServiceActivation(false);
}

void HmiPhoneController::setPhonebookContactDisplayType(int)
{
    // The views always get the plain contact list back; the search sets its own type.
    m_phoneSource->setPhonebookContactDisplayType(ContactDisplayTypeList);
}

void HmiPhoneController::setPhoneMuteAudioInPrivacyEnabled(bool enabled)
{
    m_phoneSource->setMuteAudioInPrivacy(enabled);
}

void HmiPhoneController::setRoamingWarningEnabled(bool enabled)
{
    m_phoneSource->setRoamingWarning(enabled);
}

void HmiPhoneController::setLowBatteryNotificationEnabled(bool enabled)
{
    m_phoneSource->setLowBatteryNotification(enabled);
}

void HmiPhoneController::setContactSortOrder(int sortOrder)
{
    m_phoneSource->setContactSortOrder(sortOrder);
}

void HmiPhoneController::requestReDownloadContacts()
{
    m_phoneSource->reDownloadContacts();
}

void HmiPhoneController::requestDeleteAllContacts()
{
    m_phoneSource->deleteAllContacts();
}

void HmiPhoneController::playRingtone(int ringtone)
{
    m_phoneSource->playRingtone(ringtone);
}

void HmiPhoneController::stopPlayRingtone()
{
    m_phoneSource->stopPlayRingtone();
}

void HmiPhoneController::playAlert(int alert)
{
    m_phoneSource->playAlert(alert);
}

void HmiPhoneController::setRingtone(int ringtone)
{
    m_phoneSource->setPhoneRingtone(ringtone);
}

void HmiPhoneController::setAlert(int alert)
{
    m_phoneSource->setMessageNotification(alert);
}

// --- Requests with a decision of their own ----------------------------------------------------

bool HmiPhoneController::roamingPromptNeeded() const
{
    return m_bluetoothSource->deviceConnected() && m_phoneSource->roaming()
            && m_phoneSource->roamingWarning();
}

void HmiPhoneController::callNumber(const QString &phoneNumber)
{
    if (!m_phoneSource)
        return;
    if (roamingPromptNeeded()) {
        // The roaming warning asks first; confirming places the call from what the phone source
        // now holds.
        m_phoneSource->setCallNumberEntered(phoneNumber);
        m_phoneSource->setOutboundRoamingCallIsFromRecentList(false);
        postHmiEvent(Events::HmiPhone_RoamingMode);
        return;
    }
    m_phoneSource->dialNumber(phoneNumber);
}

void HmiPhoneController::dialRecentCall(int type, int index)
{
    if (roamingPromptNeeded()) {
        m_phoneSource->setOutboundRoamingRecentCallType(type);
        m_phoneSource->setOutboundRoamingRecentCallIndex(index);
        m_phoneSource->setOutboundRoamingCallIsFromRecentList(true);
        postHmiEvent(Events::HmiPhone_RoamingMode);
        return;
    }
    m_phoneSource->dialRecentCall(type, index);
}

void HmiPhoneController::callKovaSupport()
{
    m_phoneSource->dialNumber(QString::fromLatin1(ProductConfig::KovaSupportPhoneNumber));
}

void HmiPhoneController::setAutomaticContactDownloadEnabled(bool enabled)
{
    m_phoneSource->setAutomaticContactDownload(enabled);
    // Read back: the phone source may refuse the setting; then fetch the contacts once now.
    if (!m_phoneSource->automaticContactDownload())
        m_phoneSource->retryPhoneBookDownload(m_bluetoothSource->phoneDevice());
}

void HmiPhoneController::jumpToPhoneSection()
{
    Brisken::ViewController *views = viewController();
    if (!views || !m_integration)
        return;
    views->showView(QVariant(m_integration->rootStateIdentifier()), QVariant(), false, QVariant());
}

// --- Driver-restricted phonebook window -------------------------------------------------------

void HmiPhoneController::calculateDriverRestrictedPhonebookMinMaxRows(int topItemIndex,
                                                                      int bottomItemIndex,
                                                                      int itemsPerPage)
{
    // The arguments come from QML and the starts from the bridge: everything is worked out in
    // 64 bits on rows clamped to the list, so no value can overflow or lift the five-page limit.
    const qint64 listLength = m_phoneSource->phoneBook()->listLength();
    if (listLength <= 0) {
        setDriverRestrictedRows(-1, -1);
        return;
    }
    const qint64 lastRow = listLength - 1;
    const qint64 window = DriverRestrictedPages * qMax<qint64>(1, itemsPerPage);
    const qint64 top = qBound<qint64>(0, topItemIndex, lastRow);
    const qint64 bottom = qBound<qint64>(top, bottomItemIndex, lastRow);
    qint64 minRow = -1;
    qint64 maxRow = -1;

    if (top == 0 && bottom == lastRow) {
        // The whole list is on screen: it is its own window, within the five-page limit below.
        minRow = 0;
        maxRow = lastRow;
    } else {
        Mavrosk::MultiDPListModel *alphabet = m_phoneSource->AlphabetIndexModel();
        qint64 bottomSectionStart = -1;
        qint64 previousStart = 0;
        if (top == 0)
            minRow = 0;

        // A letter section runs from its start row up to the next letter that has contacts:
        // min is the start of the section holding the top row, max the last row of the section
        // holding the bottom row. Letters without contacts take no part.
        for (int entry = 0; entry < alphabet->count(); ++entry) {
            const qint64 start = sectionStart(alphabet, entry, listLength);
            if (start == -1)
                continue;
            if (minRow == -1 && previousStart <= top && top < start)
                minRow = previousStart;
            if (bottomSectionStart == -1 && previousStart <= bottom && bottom < start) {
                bottomSectionStart = previousStart;
            } else if (bottomSectionStart != -1) {
                maxRow = previousStart - 1;
                break;
            }
            previousStart = start;
        }

        // Rows in the last section, or a bottom section with no letter after it, run to the end.
        if (minRow == -1 && previousStart <= top)
            minRow = previousStart;
        if (bottomSectionStart == -1 || maxRow == -1)
            maxRow = lastRow;
        // Starts that do not increase give no section around the top row: it starts the window.
        if (minRow == -1 || minRow > top)
            minRow = top;

        if (top - minRow > window)
            minRow = top - window + 1;
        if (maxRow - bottom > window)
            maxRow = bottom + window - 1;
    }

    // Never more than five pages, counted from min, and never outside the list.
    maxRow = qBound(minRow, maxRow, qMin(lastRow, minRow + window - 1));
    setDriverRestrictedRows(int(minRow), int(maxRow));
}

void HmiPhoneController::driverRestrictedPhonebookFilterByAlpha(const QString &character)
{
    if (character.isEmpty())
        return;

    const uint letter = upperFirstCodePoint(character);
    const qint64 listLength = m_phoneSource->phoneBook()->listLength();
    Mavrosk::MultiDPListModel *alphabet = m_phoneSource->AlphabetIndexModel();
    qint64 minRow = -1;
    qint64 maxRow = -1;

    for (int entry = 0; entry < alphabet->count(); ++entry) {
        const QString entryText = alphabet->get(entry, QStringLiteral("alphabet")).toString();
        const qint64 start = sectionStart(alphabet, entry, listLength);
        // An empty entry is no letter and never matches.
        if (!entryText.isEmpty() && upperFirstCodePoint(entryText) == letter) {
            if (start == -1) {
                // The letter is in the bar but has no contacts.
                minRow = -1;
                maxRow = -1;
                break;
            }
            minRow = start;
        } else if (minRow != -1 && start != -1) {
            maxRow = start - 1;
            break;
        }
    }

    if (minRow != -1) {
        // The letter's section runs to the end of the list when no letter follows; a next start
        // before the letter's own gives the letter one row. At most 20 rows either way.
        if (maxRow == -1)
            maxRow = listLength - 1;
        maxRow = qBound(minRow, maxRow,
                        qMin(listLength - 1, minRow + DriverRestrictedLetterRows - 1));
    }
    setDriverRestrictedRows(int(minRow), int(maxRow));
}

void HmiPhoneController::searchPhoneBook(const QString &searchData)
{
    m_phoneSource->setPhonebookContactDisplayType(ContactDisplayTypeSearch);
    m_phoneSource->searchPhoneBook(searchData);
    driverRestrictedPhonebookFilterByAlpha(searchData);
}

void HmiPhoneController::setDriverRestrictedRows(int minRow, int maxRow)
{
    // Always min first, then max; -1 is handed on as it is.
    m_phoneSource->setDriverRestrictedPhonebookModelMinRow(minRow);
    m_phoneSource->setDriverRestrictedPhonebookModelMaxRow(maxRow);
}

// --- Property setters -------------------------------------------------------------------------

void HmiPhoneController::setLongPressInterval(int longPressInterval)
{
    // Clamp first, so that the announced value is the one stored and a repeated negative value
    // is no change.
    const int clamped = qMax(0, longPressInterval);
    if (clamped == m_longPressInterval)
        return;
    m_longPressInterval = clamped;
    emit longPressIntervalChanged(clamped);
}

void HmiPhoneController::setMaximumSizeOfNumber(int maximumSizeOfNumber)
{
    if (maximumSizeOfNumber == m_maximumSizeOfNumber)
        return;
    m_maximumSizeOfNumber = maximumSizeOfNumber;
    emit maximumSizeOfNumberChanged(maximumSizeOfNumber);
}

void HmiPhoneController::setMaxKnownBluetoothDevices(int arg)
{
    if (arg == m_maxKnownBluetoothDevices)
        return;
    m_maxKnownBluetoothDevices = arg;
    emit maxKnownBluetoothDevicesChanged(arg);
}

void HmiPhoneController::setBatteryLowLevel(int arg)
{
    if (arg == m_batteryLowLevel)
        return;
    m_batteryLowLevel = arg;
    emit batteryLowLevelChanged(arg);
}

void HmiPhoneController::setLastKnownPhonebookIndex(int index)
{
    if (index == m_lastKnownPhonebookIndex)
        return;
    m_lastKnownPhonebookIndex = index;
    emit lastKnownPhonebookIndexChanged(index);
}

// --- Private ----------------------------------------------------------------------------------

void HmiPhoneController::checkSizeOfNumber(const QString &number)
{
    // Full means exactly the maximum: a longer number is not full. The controller only publishes
    // the flags; the dial keypad state owns the entered number.
    const bool full = number.size() == m_maximumSizeOfNumber;
    const bool empty = number.isEmpty();
    if (full != m_isMaximumSizeOfNumber) {
        m_isMaximumSizeOfNumber = full;
        emit isMaximumSizeOfNumberChanged(full);
    }
    if (empty != m_isEmptyNumber) {
        m_isEmptyNumber = empty;
        emit isEmptyNumberChanged(empty);
    }
}

void HmiPhoneController::phoneDeviceChanged()
{
    // A newly selected phone warns again on its first low reading.
    m_lastBatteryLevel = -1;
}

void HmiPhoneController::postHmiEvent(const QString &name, const QVariant &value)
{
    postEvent(new Quorvel::HmiEvent(name, value));
}

void HmiPhoneController::requestIntent(int action, const QVariantList &arguments)
{
    Taldris::HmiIntentManager::instance()->requestAction(action, arguments, false, false,
                                                         QVariant());
}

} // namespace HmiPhone
