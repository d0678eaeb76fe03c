// The text-message reactions of the global state machine: new-message alerts and what the driver
// does with them, reading messages aloud, the reply chosen by voice, sending a reply with its
// outcome popups and retries, and the checks made before the message screens open.

#include "hmiphoneglobalstatehandler.h"

#include "hmiphonecontroller.h"
#include "hmiphoneevents.h"
#include "hmiphoneintegration.h"
#include "hmiphonenumbers.h"
#include "hmiphonepopupmanager.h"
#include "hmiphoneviews.h"

#include <brisken/viewcontroller.h>
#include <mavrosk/bluetoothsource.h>
#include <mavrosk/phonesource.h>
#include <quorvel/popupstate.h>

namespace HmiPhone {

namespace {

// Retries of a failed send before the final failure popup.
constexpr int SendRetries = 2;
// Download attempts after which a failed text-message download offers no retry.
constexpr int SmsDownloadAttempts = 3;

// Once the phone was reported as not answering, a late outcome of that send is not shown.
bool closeSendProgress(Mavrosk::PhoneSource *phone, HmiPhonePopupManager *popupManager)
{
    if (phone->sendMessagePhoneSendReportStatus())
        return false;
    popupManager->hideSendTextMessageProgress();
    return true;
}

} // namespace

// --- New-message alerts ------------------------------------------------------------------------

void HmiPhoneGlobalStateHandler::processNewTextMessageAlert()
{
    if (m_phoneSource->doNotDisturb())
        return;
    // During a call, or while the phone rings, the small in-call alert is enough; the alert
    // state and the count are for the driver's own alerts only.
    if (m_phoneSource->callConnected() || m_phoneSource->incomingCall()) {
        m_popupManager->newTextMessageAlert1Show();
        return;
    }
    handleNewTextMessagesReceived();
}

void HmiPhoneGlobalStateHandler::handleNewTextMessagesReceived()
{
    if (m_controller) // QML may have deleted it
        m_controller->incrementRecievedTextMessageCount();
    switch (m_textMessageAlertState) {
    case TextMessageAlert::None:
        m_popupManager->newTextMessageAlert2Show();
        break;
    case TextMessageAlert::Single:
        // A second message while the single alert is up: the multiple-messages alert replaces it.
        m_popupManager->showMultipleTextMessagePopup();
        m_multipleTextMessagesPopup->restartAutoDismissTimer();
        break;
    case TextMessageAlert::Multiple:
        // Each further message keeps the multiple-messages alert up for its full time again.
        m_multipleTextMessagesPopup->restartAutoDismissTimer();
        break;
    default:
        break;
    }
}

void HmiPhoneGlobalStateHandler::enableSingleMessageState()
{
    m_textMessageAlertState = TextMessageAlert::Single;
}

void HmiPhoneGlobalStateHandler::resetAlertStateOnSingleMessageTimeout()
{
    // A state of 2 was set by the multiple-messages alert replacing this one: it stays.
    if (m_textMessageAlertState == TextMessageAlert::Single)
        m_textMessageAlertState = TextMessageAlert::None;
    if (m_phoneSource->hearItPressed()) {
        m_phoneSource->requestTextMessagesInbox();
        m_phoneSource->setHearItPressed(false);
    }
}

void HmiPhoneGlobalStateHandler::enableMultipleMessagesState()
{
    m_textMessageAlertState = TextMessageAlert::Multiple;
}

void HmiPhoneGlobalStateHandler::resetAlertStateOnMultipleMessagesTimeout()
{
    m_textMessageAlertState = TextMessageAlert::None;
    if (m_controller) // QML may have deleted it
        m_controller->resetRecievedTextMessageCount();
}

// --- What the driver does with an alert
// ------------------------------------------------------------

void HmiPhoneGlobalStateHandler::hearNewTextMessageAlert()
{
    // The alert stays while the message is fetched and read; the details arrive later
    // (handleSmsNewTextHearitRequest).
    m_newTextMessageAlertPopup->restartAutoDismissTimer();
    m_phoneSource->requestNewTextMessageDetails();
    m_phoneSource->setHearItPressed(true);
}

void HmiPhoneGlobalStateHandler::handleSmsNewTextHearitRequest()
{
    m_phoneSource->textMessagePlayback(m_phoneSource->textMessageBody());
}

void HmiPhoneGlobalStateHandler::stopHearNewTextMessageAlert()
{
    m_phoneSource->stopTextMessagePlayback();
}

void HmiPhoneGlobalStateHandler::hideNewTextMessageAlert()
{
    m_popupManager->newTextMessageAlert2Hide();
}

void HmiPhoneGlobalStateHandler::viewNewTextMessageAlert()
{
    m_phoneSource->requestNewTextMessageDetails();
}

// --- Listening from the message list -------------------------------------------------------------

void HmiPhoneGlobalStateHandler::handleListenMessageRequest()
{
    // The voice system counts lines from 1, the phone's messages from 0: a line before the first
    // names no message. Widened before subtracting: the smallest int has no index before it.
    const qint64 index = qint64(m_phoneSource->listenMessageLineNo()) - 1;
    if (index < 0) {
        qCDebug(hmiphone()) << "Listen Message Line No Index Out of Range ";
        return;
    }
    m_phoneSource->requestSelectedTextMessageDetails(int(index));
    m_listenMessageRequested = true;
}

void HmiPhoneGlobalStateHandler::handleRequestedMessageDetailsReady()
{
    m_phoneSource->textMessagePlayback(m_phoneSource->textMessageBody());
    m_listenMessageRequested = false;
}

// --- Replying and sending ------------------------------------------------------------------------

void HmiPhoneGlobalStateHandler::handleVRSendReplyMessage()
{
    const QVariantList replies = m_phoneSource->smsReplyMessages();
    // Widened before subtracting: the line number comes from the voice system.
    const qint64 index = qint64(m_phoneSource->replyMessageLineNo()) - 1;
    if (replies.isEmpty()) {
        qCDebug(hmiphone()) << "Reply Message List Empty ";
        return;
    }
    if (index < 0 || index >= replies.size()) {
        qCDebug(hmiphone()) << "Reply Message Line No Index Out of Range ";
        return;
    }
    const QString text = replies.at(int(index)).toMap().value(QStringLiteral("text")).toString();
    m_phoneSource->setReplyTextSelected(text);
    m_popupManager->showSendTextMessage();
}

// Every failure popup of a send closes before the next send goes out (or once a send went
// through): none of them closes by itself, and the retry button of one left open, covered, would
// send again a text that already went.
void HmiPhoneGlobalStateHandler::hideSendFailures()
{
    m_popupManager->hideSendTextMessageFailure();
    for (const QString *view : {&Views::PhoneSmsSendTextMessageNetworkFailure,
                                &Views::PhoneSmsRetrySendTextMessageFailure,
                                &Views::PhoneSmsSendTextMessageNoResponseFromPhone})
        m_viewController->dismissPopup(*view);
}

// A new message starts with no retries made.
void HmiPhoneGlobalStateHandler::handleSendTextMessageRequest()
{
    m_popupManager->hideSendTextMessage();
    hideSendFailures();
    m_sendMessageRetryCount = 0;
    m_phoneSource->initiateSendTextMessage();
    m_popupManager->showSendTextMessageProgress();
    m_phoneSource->setSendMessagePhoneSendReportStatus(false);
}

// Two retries of a message resend; the third request ends the cycle with the final failure popup,
// and the next failure starts counting again.
void HmiPhoneGlobalStateHandler::handleRetrySendTextMessage()
{
    hideSendFailures();
    if (m_sendMessageRetryCount >= SendRetries) {
        m_popupManager->showRetrySendMessageFailure();
        m_sendMessageRetryCount = 0;
        return;
    }
    ++m_sendMessageRetryCount;
    m_popupManager->showSendTextMessageProgress();
    m_phoneSource->initiateSendTextMessage();
    // A retry is a fresh send: an earlier report that the phone did not answer must not make the
    // outcome of this one be ignored, or the progress popup would never close.
    m_phoneSource->setSendMessagePhoneSendReportStatus(false);
}

void HmiPhoneGlobalStateHandler::handleSendTextMessageSuccess()
{
    if (closeSendProgress(m_phoneSource, m_popupManager)) {
        hideSendFailures();
        m_popupManager->showSendTextMessageSuccess();
    }
}

void HmiPhoneGlobalStateHandler::handleSendTextMessageFailure()
{
    if (closeSendProgress(m_phoneSource, m_popupManager))
        m_popupManager->showSendTextMessageFailure();
}

void HmiPhoneGlobalStateHandler::handleSendTextMessageNetworkFailure()
{
    if (closeSendProgress(m_phoneSource, m_popupManager))
        m_popupManager->showSendMessageNetworkFailure();
}

void HmiPhoneGlobalStateHandler::handleSendMessageNoResponseFromPhone()
{
    m_phoneSource->setSendMessagePhoneSendReportStatus(true);
    m_popupManager->hideSendTextMessageProgress();
    m_popupManager->showSendTextMessageNoResponseFromPhone();
}

// --- Opening the message screens -----------------------------------------------------------------

void HmiPhoneGlobalStateHandler::smsCheckPrerequisites()
{
    if (!m_phoneSource->smsMessageAccessProfileAvailable())
        m_popupManager->showMessageAccessProfileNotSupported();
    else if (m_phoneSource->getSmsPhoneDeclinedAccess())
        postEvent(Events::HmiPhone_ShowSmsStatus);
    else
        m_popupManager->showMessageWaitingForResponseFromPhone();
}

void HmiPhoneGlobalStateHandler::smsCheckStatus()
{
    // An Apple phone keeps its messages itself: access alone decides.
    if (m_bluetoothSource->iOSAppleDeviceConnected()) {
        if (!m_phoneSource->messageAccessProfileStatus())
            m_popupManager->showMessageAccessNotGranted();
        else if (m_controller)
            m_controller->viewIphoneTextMessages();
        return;
    }
    if (!m_phoneSource->messageAccessProfileStatus()) {
        m_popupManager->showMessageAccessNotGranted();
        return;
    }
    const int status = m_phoneSource->messagesDownloadingStatus();
    if (status >= MessagesDownload::NotStarted && status <= MessagesDownload::Finished) {
        // A finished download of an empty inbox has nothing to wait for: open the screens.
        if (status == MessagesDownload::Finished && m_phoneSource->messagesInboxEmptyStatus())
            postEvent(Events::HmiPhone_ShowSmsIphoneRequest);
        else
            m_popupManager->showMessagesDownloading();
    } else if (status == MessagesDownload::Failed) {
        m_popupManager->showMessagesDownloadFailed();
    }
}

void HmiPhoneGlobalStateHandler::checkSmsStatus()
{
    if (m_phoneSource->messagesDownloadingStatus() != MessagesDownload::Failed)
        return;
    if (m_phoneSource->numOfSmsDownloadAttempts() < SmsDownloadAttempts)
        m_popupManager->showSmsDownloadFailedRetryAvailable();
    else
        m_popupManager->showSmsDownloadFailed();
}

} // namespace HmiPhone
