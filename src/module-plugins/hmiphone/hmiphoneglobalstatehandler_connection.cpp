// The handler's reactions to the phone link and the vehicle's extended mode: the notices when the
// link drops and comes back, the minute countdown that hands a call to the handset when the
// extended time runs out, the contacts-download messages and the download retries.

#include "hmiphoneglobalstatehandler.h"

#include "hmiphoneintegration.h"
#include "hmiphonenumbers.h"
#include "hmiphonepopupmanager.h"
#include "hmiphoneviews.h"

#include <brisken/viewmanager.h>
#include <mavrosk/bluetoothsource.h>
#include <mavrosk/globalsource.h>
#include <mavrosk/phonesource.h>
#include <quorvel/hmiviewstate.h>
#include <taldris/hmiintentmanager.h>

#include <QTimer>

namespace HmiPhone {

namespace {

// The phone's screens during which a dropped link is told by the reconnect notice, in the order
// they are looked for.
const QString *const reconnectNoticeViews[] = {
        &Views::RecentCalls,
        &Views::PhoneBookList,
        &Views::PhoneBookEmpty,
        &Views::PhoneBookSearch,
        &Views::ContactDetails,
        &Views::PhoneSmsList,
        &Views::PhoneSmsReplyView,
        &Views::PhoneSmsView,
        &Views::DialKeypad,
        &Views::CallInProgress,
        &Views::KeypadInCall,
        &Views::PhoneSettings,
        &Views::PhoneManageContactsSettings,
        &Views::PhoneRingtoneAboutSettings,
        &Views::PhoneTextMessageNotificationSettings,
};

// The settings pages of the projection apps, which the settings module names itself.
const QLatin1String reconnectNoticeViewEndings[]
        = {QLatin1String("ZentroAllAppsSettings"), QLatin1String("ZentroSingleAppSettings")};

// The extended time left when the driver is warned that the call will move to the handset.
constexpr int extendedModeWarningMinutes = 3;

bool showsReconnectNotice(const QString &viewId)
{
    for (const QString *view : reconnectNoticeViews) {
        if (viewId == *view)
            return true;
    }
    for (const QLatin1String &ending : reconnectNoticeViewEndings) {
        if (viewId.endsWith(ending))
            return true;
    }
    return false;
}

} // namespace

// --- Link loss and reconnection ----------------------------------------------------------------

void HmiPhoneGlobalStateHandler::handleLinklossReconnectSuccessTransition()
{
    // Whatever told the driver of the loss goes, even when nothing is shown.
    m_popupManager->hidePhoneConnectionLost();
    m_popupManager->hideUnableToConnect();
    showPhoneConnectSuccessTransient();
}

void HmiPhoneGlobalStateHandler::showPhoneConnectSuccessTransient()
{
    Taldris::HmiIntentManager::instance()->requestAction(IntentAction::PhoneConnectSuccess);
}

void HmiPhoneGlobalStateHandler::showPhoneAttemptingReconnectTransient()
{
    Quorvel::HmiViewState *active = Quorvel::HmiViewState::activeViewState();
    const QString viewId = active ? active->targetView() : QString();
    // Outside the phone's screens the driver is not told of the reconnection attempts.
    if (showsReconnectNotice(viewId))
        Taldris::HmiIntentManager::instance()->requestAction(
                IntentAction::PhoneAttemptingReconnect);
}

// --- Extended mode -----------------------------------------------------------------------------

void HmiPhoneGlobalStateHandler::handleExtendedModeChangeRequest()
{
    // A further change of mode while counting keeps the count: the extended time runs from the
    // first one.
    if (m_extendedModeTimer->isActive())
        return;
    m_extendedModeTimer->start();
    m_extendedModeMinutesElapsed = 0;
}

void HmiPhoneGlobalStateHandler::clearExtendedModeTimer()
{
    m_phoneSource->setPhoneCallStandByMode(false);
    m_extendedModeMinutesElapsed = 0;
    m_extendedModeTimer->stop();
}

void HmiPhoneGlobalStateHandler::extendedModeTimerMinuteElapsed()
{
    ++m_extendedModeMinutesElapsed;
    // The length comes from the phone: any int, so the difference is taken in 64 bits.
    const qint64 extendedMinutes = m_phoneSource->extendedModeTimerValue();
    if (extendedMinutes - m_extendedModeMinutesElapsed == extendedModeWarningMinutes
        && m_phoneSource->callConnected()) {
        m_popupManager->showPhoneCallStandByModePopup();
        return;
    }
    // The extended time may have been shortened below the minutes already counted: the time is
    // up then as well, or the countdown would never end.
    if (m_extendedModeMinutesElapsed < extendedMinutes) {
        qCDebug(hmiphone()).nospace()
                << "ExtendedModeTimerMinuteElapsed : " << m_extendedModeMinutesElapsed;
        return;
    }
    // The time is up: the call goes to the handset and the display-only mode ends.
    if (!m_phoneSource->privateMode())
        m_phoneSource->togglePrivacyMode();
    Mavrosk::GlobalSource::instance()->sendDisplayOnlyModeBeginShutdownRequest();
    m_extendedModeMinutesElapsed = 0;
    m_extendedModeTimer->stop();
}

// --- Contacts download -------------------------------------------------------------------------

void HmiPhoneGlobalStateHandler::showPhonebookDownloadInitiatedTransientMessage()
{
    requestTransient(Transients::PhonebookDownloadInitiated);
}

void HmiPhoneGlobalStateHandler::hidePhonePhonebookDownloadInitiatedTransientMessage()
{
    qCDebug(hmiphone()) << "hide transient";
    hideTransient(Transients::PhonebookDownloadInitiated);
}

void HmiPhoneGlobalStateHandler::showPhonebookDownloadCompleteTransientMessage()
{
    // A phone gone meanwhile has nothing to report.
    if (!m_bluetoothSource->deviceConnected())
        return;
    qCDebug(hmiphone()) << "show complete transient";
    requestTransient(Transients::PhonebookDownloadComplete);
}

void HmiPhoneGlobalStateHandler::handlePhonebookDownloadCompleteDisplay()
{
    // Two display contexts tell it by the popup, which closes itself; the others by the transient.
    const int displayContext = m_viewManager->displayContext();
    if (displayContext == DisplayContext::DownloadCompletePopup
        || displayContext == DisplayContext::DownloadCompletePopupToo)
        m_popupManager->showPhoneBookDownloadCompletePopup();
    else
        showPhonebookDownloadCompleteTransientMessage();
}

// --- Retries -----------------------------------------------------------------------------------

void HmiPhoneGlobalStateHandler::handleRetryPhnBookDownloadContactAccess()
{
    m_phoneSource->retryPhnBookDownloadAccess();
}

void HmiPhoneGlobalStateHandler::handleRetryPhnBookAutomaticContactDownload()
{
    m_phoneSource->retryPhoneBookDownload(m_bluetoothSource->phoneDevice());
}

void HmiPhoneGlobalStateHandler::retryPhoneBookDownload()
{
    m_phoneSource->retryPhoneBookDownload(m_bluetoothSource->selectedDevice());
}

void HmiPhoneGlobalStateHandler::retrySmsDownload()
{
    m_phoneSource->retrySmsDownload(m_bluetoothSource->selectedDevice());
}

void HmiPhoneGlobalStateHandler::phoneFixHintTimeout() { }

} // namespace HmiPhone
