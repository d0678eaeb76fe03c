#include "hmiphoneglobalstatehandler.h"

namespace HmiPhone {

HmiPhoneGlobalStateHandler::HmiPhoneGlobalStateHandler(HmiPhoneController *controller,
                                                       QObject *parent)
    : QObject(parent)
    , m_controller(controller)
    , m_popupManager(nullptr)
    , m_viewController(nullptr)
    , m_viewManager(nullptr)
    , m_bluetoothSource(nullptr)
    , m_phoneSource(nullptr)
    , m_speechSource(nullptr)
    , m_keySource(nullptr)
    , m_navSource(nullptr)
    , m_projectionSource(nullptr)
    , m_hardKeyController(nullptr)
    , m_incomingCallPopup(nullptr)
    , m_waitingCallPopup(nullptr)
    , m_incomingCallTransition(nullptr)
    , m_missedCallTransition(nullptr)
    , m_callConnectedTransition(nullptr)
    , m_batteryLevelTransition(nullptr)
    , m_standbyTransition(nullptr)
    , m_connectionLostTransition(nullptr)
    , m_attemptingReconnectTransition(nullptr)
    , m_doorOpenLinklossTransition(nullptr)
    , m_doorNoCallOpenLinklossTransition(nullptr)
    , m_newTextMessageTransition(nullptr)
    , m_requestedMessageDetailsReadyTransition(nullptr)
    , m_multipleNewTextMessagesTransition(nullptr)
    , m_dtmfNoResponseErrorTransition(nullptr)
    , m_audioTransferErrorTransition(nullptr)
    , m_audioHandsfreeErrorTransition(nullptr)
    , m_audioInternalErrorTransition(nullptr)
    , m_smsNewTextHearItTransition(nullptr)
    , m_smsInMemoryTransition(nullptr)
    , m_smsNotInMemoryTransition(nullptr)
    , m_smsIphoneTransition(nullptr)
    , m_incomingCallOnProjectionDisconnectTransition(nullptr)
    , m_phoneKeyTransition(nullptr)
    , m_phoneEndCallKeyTransition(nullptr)
    , m_multipartySwitchKeyTransition(nullptr)
    , m_newTextMessageAlertPopup(nullptr)
    , m_multipleTextMessagesPopup(nullptr)
    , m_listenMessageRequested(false)
    , m_textMessageAlertState(0)
    , m_sendMessageRetryCount(0)
    , m_dialingFailureCount(0)
    , m_extendedModeTimer(nullptr)
    , m_extendedModeMinutesElapsed(0)
    , m_smsNotificationDisabledTransition(nullptr)
    , m_smsNotificationEnabledTransition(nullptr)
{ }

void HmiPhoneGlobalStateHandler::produceGlobalStateAndTransitions(Phone_Cmp *) { }

HmiPhoneGlobalStateHandler::TransitionList HmiPhoneGlobalStateHandler::rootHierarchyTransitions()
        const
{
    return m_rootHierarchyTransitions;
}

HmiPhoneGlobalStateHandler::PopupList HmiPhoneGlobalStateHandler::rootHierarchyPopups() const
{
    return m_rootHierarchyPopups;
}

void HmiPhoneGlobalStateHandler::incomingCall() { }

void HmiPhoneGlobalStateHandler::incomingCallOutbound() { }

void HmiPhoneGlobalStateHandler::acceptIncomingCall() { }

void HmiPhoneGlobalStateHandler::rejectIncomingCall() { }

void HmiPhoneGlobalStateHandler::endCall() { }

void HmiPhoneGlobalStateHandler::stopAnswering() { }

void HmiPhoneGlobalStateHandler::showCallEnded() { }

void HmiPhoneGlobalStateHandler::callEndConfirmed() { }

void HmiPhoneGlobalStateHandler::redialRequest() { }

void HmiPhoneGlobalStateHandler::cancelRedialRequest() { }

void HmiPhoneGlobalStateHandler::handleRoamingWarning() { }

void HmiPhoneGlobalStateHandler::roamingCallConfirmed() { }

void HmiPhoneGlobalStateHandler::roamingCallCancelled() { }

void HmiPhoneGlobalStateHandler::handleDialingFailure() { }

void HmiPhoneGlobalStateHandler::hideDialingFailed() { }

void HmiPhoneGlobalStateHandler::hideCallKeyPad() { }

void HmiPhoneGlobalStateHandler::onMissedCallPopupExited() { }

void HmiPhoneGlobalStateHandler::addPhoneRequested() { }

void HmiPhoneGlobalStateHandler::showPhoneAcceptedCallTransientMessage() { }

void HmiPhoneGlobalStateHandler::showPhoneRejectedCallTransientMessage() { }

void HmiPhoneGlobalStateHandler::showPhoneCallEndedTransientMessage() { }

void HmiPhoneGlobalStateHandler::showPhoneConnectedOutgoingCallTransientMessage() { }

void HmiPhoneGlobalStateHandler::showPhoneDialingTransientMessage() { }

void HmiPhoneGlobalStateHandler::hidePhoneDialingTransientMessage() { }

void HmiPhoneGlobalStateHandler::showPhonebookDownloadInitiatedTransientMessage() { }

void HmiPhoneGlobalStateHandler::hidePhonePhonebookDownloadInitiatedTransientMessage() { }

void HmiPhoneGlobalStateHandler::showPhonebookDownloadCompleteTransientMessage() { }

void HmiPhoneGlobalStateHandler::enableSingleMessageState() { }

void HmiPhoneGlobalStateHandler::resetAlertStateOnSingleMessageTimeout() { }

void HmiPhoneGlobalStateHandler::enableMultipleMessagesState() { }

void HmiPhoneGlobalStateHandler::resetAlertStateOnMultipleMessagesTimeout() { }

void HmiPhoneGlobalStateHandler::incomingCallTransitionEventTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::incomingCallKeySignalTransitionEventTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::missedCallPresentTransitionEventTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::incomingCallonPrjDisconnectTransitionEventTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::missedCallTransitionEventTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::callConnectedTransitionEventTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::redialKeyTransitionEventTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::phoneKeyTransitionEventTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::phoneMultipartySwitchKeyTransitionEventTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::phoneEndCallKeyTransitionEventTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::isProjectionNotActive() { }

void HmiPhoneGlobalStateHandler::batteryLevelTransitionEventTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::standbyTransitionEventTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::showPhoneConnectionLostTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::showPhoneAttemptingReconnectTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::showPhoneDoorOpenLinklossTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::showPhoneDoorNoCallOpenLinklossTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::newTextMessageTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::multipleNewTextMessagesTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::requestedMessageDetailsReadyTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::smsNewTextHearitEventTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::dtmfKeyPressNoResponseErrorEventTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::phoneAudioTransferErrorEventTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::phoneAudioHandsfreeErrorEventTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::phoneAudioInternalErrorEventTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::smsMessagesInMemoryTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::smsMessagesNotInMemoryTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::smsMessageNotificationEnabledTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::smsMessageNotificationNotEnabledTest(QEvent *) { }

void HmiPhoneGlobalStateHandler::list(ListPosition, QAbstractTransition *, Quorvel::StateLevel) { }

void HmiPhoneGlobalStateHandler::createPopupStates() { }

void HmiPhoneGlobalStateHandler::createCallTransitions(Phone_Cmp *) { }

void HmiPhoneGlobalStateHandler::createScreenRequestTransitions(Phone_Cmp *) { }

void HmiPhoneGlobalStateHandler::createCallRequestTransitions() { }

void HmiPhoneGlobalStateHandler::listCollectedTransitions(Phone_Cmp *) { }

void HmiPhoneGlobalStateHandler::requestTransient(const QString &) { }

void HmiPhoneGlobalStateHandler::hideTransient(const QString &) { }

void HmiPhoneGlobalStateHandler::postEvent(const QString &) { }

} // namespace HmiPhone
