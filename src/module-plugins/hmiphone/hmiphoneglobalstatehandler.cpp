#include "hmiphoneglobalstatehandler.h"

#include "hmiphonecontroller.h"
#include "hmiphoneevents.h"
#include "hmiphoneintegration.h"
#include "hmiphonepopupmanager.h"
#include "hmiphoneviews.h"
#include "phone_cmp.h"
#include "phonebook_cmp.h"
#include "phonecall_cmp.h"
#include "phonestatusalerts.h"

#include <brisken/datastore.h>
#include <brisken/dismisspopup.h>
#include <brisken/statusbarcontroller.h>
#include <brisken/viewcontroller.h>
#include <brisken/viewmanager.h>
#include <mavrosk/bluetoothsource.h>
#include <mavrosk/keysource.h>
#include <mavrosk/navsource.h>
#include <mavrosk/phonesource.h>
#include <mavrosk/projectionsource.h>
#include <mavrosk/speechsource.h>
#include <quorvel/guardedpropertychangetransition.h>
#include <quorvel/guardedpropertytransition.h>
#include <quorvel/guardedsignaltransition.h>
#include <quorvel/hmievent.h>
#include <quorvel/hmisignaltransition.h>
#include <quorvel/hmitransition.h>
#include <quorvel/hmiviewstate.h>
#include <quorvel/intsignaltransition.h>
#include <quorvel/keysignaltransition.h>
#include <quorvel/popupstate.h>
#include <taldris/hardkeycontroller.h>
#include <taldris/hmiintentmanager.h>

#include <QTimer>

namespace HmiPhone {

using Quorvel::GuardedPropertyChangeTransition;
using Quorvel::GuardedPropertyTransition;
using Quorvel::GuardedSignalTransition;
using Quorvel::HmiSignalTransition;
using Quorvel::HmiTransition;
using Quorvel::IntSignalTransition;
using Quorvel::PopupState;

namespace {

// The global popup states in creation order: view, auto-dismiss time (0: stays until dismissed)
// and place in the root-hierarchy popup list.
struct GlobalPopup
{
    const QString *view;
    int autoDismissMs;
    int listPosition;
};

const GlobalPopup globalPopups[] = {
        {&Views::MissedCallPopup, 5000, 1},
        {&Views::CallAnswerNotResponding, 0, 16},
        {&Views::IncomingCall, 0, 2},
        {&Views::WaitingCall, 0, 3},
        {&Views::Redial, 0, 4},
        {&Views::CallEnded, 3000, 5},
        {&Views::DeviceIssueFixHint, 0, 6},
        {&Views::DialingFailed, 0, 8},
        {&Views::Dialing3rdFailure, 0, 9},
        {&Views::BatteryLow, 0, 11},
        {&Views::NoCellularSignal, 3000, 7},
        {&Views::RoamingWarning, 0, 10},
        {&Views::PhoneConnectionUnstable, 0, 12},
        {&Views::PhoneConnectionLost, 0, 13},
        {&Views::UnableToConnect, 0, 14},
        {&Views::HandsFreeError, 0, 15},
        {&Views::MultipleTextMessagesReceived, 8000, 19},
        {&Views::NewTextMessageAlert1, 8000, 17},
        {&Views::NewTextMessageAlert2, 8000, 18},
        {&Views::PhoneSmsSendTextMessage, 0, 20},
        {&Views::PhoneSmsSendTextMessageProgress, 0, 22},
        {&Views::PhoneSmsSendTextMessageSuccess, 5000, 23},
        {&Views::PhoneSmsSendTextMessageFailure, 0, 24},
        {&Views::PhoneSmsSendTextMessageNetworkFailure, 0, 25},
        {&Views::PhoneSmsRetrySendTextMessageFailure, 0, 26},
        {&Views::PhoneSmsSendTextMessageNoResponseFromPhone, 0, 27},
        {&Views::DTMFKeyPressNoResponseErrorPopup, 3000, 28},
        {&Views::PhoneAudioTransferErrorPopup, 5000, 29},
        {&Views::PhoneBookDownloadComplete, 3000, 36},
        {&Views::PhoneCallStandByModePopup, 0, 30},
        {&Views::PhoneSmsTextMessagingOff, 0, 21},
        {&Views::UnstableDeviceConnectionWithKovaPopup, 5000, 31},
        {&Views::SiriConnectionNotRespondingPopup, 3000, 32},
        {&Views::siriFeatureNotEnabledPopup, 0, 34},
        {&Views::PhoneVoiceServiceActivatedPopup, 0, 35},
        {&Views::ContactsListTooLargePopup, 0, 33},
};

const int globalPopupCount = int(sizeof(globalPopups) / sizeof(globalPopups[0]));

Brisken::StatusBarController *statusBarController()
{
    return qobject_cast<Brisken::StatusBarController *>(
            Brisken::DataStore::get(QStringLiteral("StatusBarController")));
}

} // namespace

HmiPhoneGlobalStateHandler::HmiPhoneGlobalStateHandler(HmiPhoneController *controller,
                                                       QObject *parent)
    : QObject(parent)
    , m_controller(controller)
    , m_popupManager(nullptr)
    , m_viewController(Brisken::ViewController::instance())
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
{
    m_popupManager = HmiPhonePopupManager::instance();
    m_bluetoothSource = Mavrosk::BluetoothSource::instance();
    m_phoneSource = Mavrosk::PhoneSource::instance();
    m_speechSource = Mavrosk::SpeechSource::instance();
    m_keySource = Mavrosk::KeySource::instance();
    m_navSource = Mavrosk::NavSource::instance();
    m_projectionSource = Mavrosk::ProjectionSource::instance();
    m_hardKeyController = Taldris::HardKeyController::instance();
    m_viewManager = qobject_cast<Brisken::ViewManager *>(
            Brisken::DataStore::get(QStringLiteral("ViewManager")));
}

// Builds the global popups and transitions once, in a fixed order: the order of creation is the
// order in which transitions sharing a trigger are offered a notification, and the order of the
// lists (ListPosition) is what the framework installs. The groups in brackets belong at
// those places, in that order.
void HmiPhoneGlobalStateHandler::produceGlobalStateAndTransitions(Phone_Cmp *phoneCmp)
{
    m_collectedTransitions.fill(qMakePair(Quorvel::StateLevel3, nullptr), ListPositionCount);

    // The popup states, each with the transitions that leave from it; the root component's popups
    // follow the global ones.
    createPopupStates();
    for (const auto &entry : phoneCmp->rootHierarchyPopups())
        m_rootHierarchyPopups.append(entry);

    // [adding a phone, the pairing request] Calls, from ringing to end.
    createCallTransitions(phoneCmp);
    // [key transitions]
    // Roaming confirmation, status alerts and making a call [with battery, text-message requests,
    // transfer to the handset, link loss, new messages, replying and sending in between].
    createCallRequestTransitions(phoneCmp);
    // [extended mode; audio, connection and contacts errors] Screens asked for from elsewhere
    // and roaming notices.
    createScreenRequestTransitions(phoneCmp);
    // [voice service, with the status-bar controller when there is one] The contacts request.
    createContactsRequestTransition(phoneCmp);
    // [dismissals of the send-message popup]

    listCollectedTransitions(phoneCmp);
}

HmiPhoneGlobalStateHandler::TransitionList HmiPhoneGlobalStateHandler::rootHierarchyTransitions()
        const
{
    return m_rootHierarchyTransitions;
}

HmiPhoneGlobalStateHandler::PopupList HmiPhoneGlobalStateHandler::rootHierarchyPopups() const
{
    return m_rootHierarchyPopups;
}

void HmiPhoneGlobalStateHandler::list(ListPosition position, QAbstractTransition *transition,
                                      Quorvel::StateLevel level)
{
    m_collectedTransitions[position] = qMakePair(level, transition);
}

void HmiPhoneGlobalStateHandler::listCollectedTransitions(Phone_Cmp *phoneCmp)
{
    for (const auto &entry : qAsConst(m_collectedTransitions)) {
        if (entry.second)
            m_rootHierarchyTransitions.append(entry);
    }
    m_collectedTransitions.clear();
    for (const auto &entry : phoneCmp->rootHierarchyTransitions())
        m_rootHierarchyTransitions.append(entry);
}

void HmiPhoneGlobalStateHandler::createPopupStates()
{
    QVector<PopupState *> popups(globalPopupCount, nullptr);
    for (int i = 0; i < globalPopupCount; ++i) {
        const GlobalPopup &row = globalPopups[i];
        auto *popup = new PopupState(*row.view, 1);
        if (row.autoDismissMs > 0) {
            popup->setAutoDismissTimeoutActive(true);
            popup->setAutoDismissTimeoutInterval(row.autoDismissMs);
        }
        popups[row.listPosition - 1] = popup;
        m_popupsByView.insert(*row.view, popup);
    }
    for (PopupState *popup : qAsConst(popups))
        m_rootHierarchyPopups.append(qMakePair(Quorvel::StateLevel3, popup));

    connect(m_popupsByView.value(Views::MissedCallPopup), &QAbstractState::exited, this,
            &HmiPhoneGlobalStateHandler::onMissedCallPopupExited);

    // Incoming call: the driver's or the caller's answer.
    m_incomingCallPopup = m_popupsByView.value(Views::IncomingCall);
    auto *rejectIncoming = new HmiTransition(Events::HmiPhone_RejectIncomingCall, nullptr);
    connect(rejectIncoming, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::rejectIncomingCall);
    list(RejectIncomingCallRequest, rejectIncoming);
    auto *acceptIncoming = new HmiTransition(Events::HmiPhone_AcceptIncomingCall, nullptr);
    connect(acceptIncoming, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::acceptIncomingCall);
    list(AcceptIncomingCallRequest, acceptIncoming);
    auto *remoteRejection = new HmiSignalTransition(
            m_phoneSource, &Mavrosk::PhoneSource::phoneIncomingCallRemoteRejection, nullptr);
    connect(remoteRejection, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::rejectIncomingCall);
    list(IncomingCallRemoteRejection, remoteRejection);

    // Waiting call: ringing, then rejected or accepted; an accepted call the phone fails to take
    // turns into "CallAnswerNotResponding".
    m_waitingCallPopup = m_popupsByView.value(Views::WaitingCall);
    auto *ringing = new QState(m_waitingCallPopup);
    ringing->setObjectName(QStringLiteral("WaitingCallRinging"));
    auto *rejected = new QState(m_waitingCallPopup);
    rejected->setObjectName(QStringLiteral("WaitingCallRejected"));
    auto *accepted = new QState(m_waitingCallPopup);
    accepted->setObjectName(QStringLiteral("WaitingCallAccepted"));
    auto *rejectWaiting = new HmiTransition(Events::HmiPhone_RejectWaitingCall, ringing);
    rejectWaiting->setTargetState(rejected);
    connect(rejectWaiting, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::rejectIncomingCall);
    auto *acceptWaiting = new HmiTransition(Events::HmiPhone_AcceptWaitingCall, ringing);
    acceptWaiting->setTargetState(accepted);
    connect(acceptWaiting, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::acceptIncomingCall);
    auto *acceptFailed = new HmiSignalTransition(
            m_phoneSource, &Mavrosk::PhoneSource::phoneCallAcceptingFailed, accepted);
    acceptFailed->setTargetState(m_popupsByView.value(Views::CallAnswerNotResponding));
    auto *waitingRemoteRejection = new HmiSignalTransition(
            m_phoneSource, &Mavrosk::PhoneSource::phoneWaitingCallRemoteRejection, nullptr);
    connect(waitingRemoteRejection, &QAbstractTransition::triggered, m_popupManager,
            &HmiPhonePopupManager::dismissWaitingCall);
    list(WaitingCallRemoteRejection, waitingRemoteRejection);
    m_waitingCallPopup->setInitialState(ringing);

    // Redial and call ended only close their popups.
    PopupState *redial = m_popupsByView.value(Views::Redial);
    auto *redialRequested = new HmiTransition(Events::HmiPhone_RedialRequest, redial);
    connect(redialRequested, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::redialRequest);
    auto *redialCancelled = new HmiTransition(Events::HmiPhone_CancelRedialRequest, redial);
    connect(redialCancelled, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::cancelRedialRequest);
    auto *callEndConfirmation = new HmiTransition(Events::HmiPhone_CallEndConfirmed,
                                                  m_popupsByView.value(Views::CallEnded));
    connect(callEndConfirmation, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::callEndConfirmed);

    // Text-message alerts: the multiple-messages alert replaces both single-message alerts.
    m_multipleTextMessagesPopup = m_popupsByView.value(Views::MultipleTextMessagesReceived);
    connect(m_multipleTextMessagesPopup, &QAbstractState::entered, this,
            &HmiPhoneGlobalStateHandler::enableMultipleMessagesState);
    connect(m_multipleTextMessagesPopup, &QAbstractState::exited, this,
            &HmiPhoneGlobalStateHandler::resetAlertStateOnMultipleMessagesTimeout);
    m_popupsByView.value(Views::NewTextMessageAlert1)
            ->registerDismissingPopup(m_multipleTextMessagesPopup);
    m_newTextMessageAlertPopup = m_popupsByView.value(Views::NewTextMessageAlert2);
    connect(m_newTextMessageAlertPopup, &QAbstractState::entered, this,
            &HmiPhoneGlobalStateHandler::enableSingleMessageState);
    connect(m_newTextMessageAlertPopup, &QAbstractState::exited, this,
            &HmiPhoneGlobalStateHandler::resetAlertStateOnSingleMessageTimeout);
    m_newTextMessageAlertPopup->registerDismissingPopup(m_multipleTextMessagesPopup);

    connect(m_popupsByView.value(Views::PhoneSmsSendTextMessageSuccess), &QAbstractState::exited,
            m_controller, &HmiPhoneController::viewTextMessages);
}

void HmiPhoneGlobalStateHandler::createCallTransitions(Phone_Cmp *phoneCmp)
{
    auto *endCallRequest = new HmiTransition(Events::HmiPhone_EndCallRequest, nullptr);
    connect(endCallRequest, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::endCall);
    list(EndCallRequest, endCallRequest);

    // The phone rings: two guarded transitions on the same change of "incomingCall" split the
    // start and the end of the ringing; a projection that gives the call back starts it too.
    m_incomingCallTransition
            = new GuardedPropertyTransition(m_phoneSource, "incomingCall", nullptr);
    connect(m_incomingCallTransition, &GuardedSignalTransition::transitionTest, this,
            &HmiPhoneGlobalStateHandler::incomingCallTransitionEventTest);
    connect(m_incomingCallTransition, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::incomingCall);
    list(IncomingCallChanged, m_incomingCallTransition);

    m_incomingCallOnProjectionDisconnectTransition = new GuardedSignalTransition(
            m_projectionSource, &Mavrosk::ProjectionSource::projectionNotActive, nullptr);
    connect(m_incomingCallOnProjectionDisconnectTransition,
            &GuardedSignalTransition::transitionTest, this,
            &HmiPhoneGlobalStateHandler::incomingCallonPrjDisconnectTransitionEventTest);
    connect(m_incomingCallOnProjectionDisconnectTransition, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::incomingCall);
    list(ProjectionNotActive, m_incomingCallOnProjectionDisconnectTransition);

    auto *acceptingFailed = new HmiSignalTransition(
            m_phoneSource, &Mavrosk::PhoneSource::phoneCallAcceptingFailed, nullptr);
    connect(acceptingFailed, &QAbstractTransition::triggered, m_popupManager,
            &HmiPhonePopupManager::showCallAcceptanceFailure);
    list(CallAcceptingFailed, acceptingFailed);

    m_missedCallTransition = new GuardedPropertyTransition(m_phoneSource, "incomingCall", nullptr);
    connect(m_missedCallTransition, &GuardedSignalTransition::transitionTest, this,
            &HmiPhoneGlobalStateHandler::missedCallTransitionEventTest);
    connect(m_missedCallTransition, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::incomingCallOutbound);
    list(IncomingCallEnded, m_missedCallTransition);

    auto *multipartyEnded = new HmiSignalTransition(
            m_phoneSource, &Mavrosk::PhoneSource::multipartyActiveCallEnded, nullptr);
    connect(multipartyEnded, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::hidePhoneDialingTransientMessage);
    connect(multipartyEnded, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::showCallEnded);
    list(MultipartyActiveCallEnded, multipartyEnded);

    auto *missedCalls = new GuardedSignalTransition(
            m_phoneSource, &Mavrosk::PhoneSource::missedCallsPresent, nullptr);
    connect(missedCalls, &GuardedSignalTransition::transitionTest, this,
            &HmiPhoneGlobalStateHandler::missedCallPresentTransitionEventTest);
    connect(missedCalls, &QAbstractTransition::triggered, m_popupManager,
            &HmiPhonePopupManager::dismissIncomingCall);
    connect(missedCalls, &QAbstractTransition::triggered, m_popupManager,
            &HmiPhonePopupManager::showMissedCall);
    list(MissedCallsPresent, missedCalls);

    // The call status: dialling, entering the call screens, connected outgoing calls.
    const auto statusChange = [this](const QVariantList &from, int to) {
        auto *transition = new GuardedPropertyChangeTransition(m_phoneSource, "status", from,
                                                               QVariant(to), nullptr);
        transition->makeParallelExclusive(0);
        return transition;
    };
    auto *dialing3 = statusChange({}, 3);
    connect(dialing3, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::showPhoneDialingTransientMessage);
    list(DialingStatus3, dialing3);
    auto *dialing4 = statusChange({}, 4);
    connect(dialing4, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::showPhoneDialingTransientMessage);
    list(DialingStatus4, dialing4);

    m_callConnectedTransition = new GuardedPropertyTransition(m_phoneSource, "status", nullptr);
    m_callConnectedTransition->makeParallelExclusive(1);
    m_callConnectedTransition->setTargetState(phoneCmp->phoneCallCompositeState());
    connect(m_callConnectedTransition, &GuardedSignalTransition::transitionTest, this,
            &HmiPhoneGlobalStateHandler::callConnectedTransitionEventTest);
    list(CallConnected, m_callConnectedTransition);

    auto *callConnectedNow = new GuardedPropertyChangeTransition(
            m_phoneSource, "callConnected", {QVariant(false)}, QVariant(true), nullptr);
    connect(callConnectedNow, &QAbstractTransition::triggered, this,
            Brisken::DismissPopup(Views::PhoneSmsDownloading));
    connect(callConnectedNow, &QAbstractTransition::triggered, this,
            Brisken::DismissPopup(Views::PhoneBookDownloading));
    list(CallConnectedBecomesTrue, callConnectedNow);

    const struct
    {
        int from;
        int to;
        ListPosition position;
    } outgoingConnected[] = {{3, 7, OutgoingConnected3To7},
                             {4, 9, OutgoingConnected4To9},
                             {5, 10, OutgoingConnected5To10},
                             {6, 11, OutgoingConnected6To11}};
    for (const auto &passage : outgoingConnected) {
        auto *transition = statusChange({QVariant(passage.from)}, passage.to);
        connect(transition, &QAbstractTransition::triggered, this,
                &HmiPhoneGlobalStateHandler::showPhoneConnectedOutgoingCallTransientMessage);
        // Only a single call getting through clears a dialling failure still on screen.
        if (passage.from == 3)
            connect(transition, &QAbstractTransition::triggered, this,
                    &HmiPhoneGlobalStateHandler::hideDialingFailed);
        list(passage.position, transition);
    }

    auto *privateModeOn = new GuardedPropertyChangeTransition(m_phoneSource, "privateMode", {},
                                                              QVariant(1), nullptr);
    connect(privateModeOn, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::hideCallKeyPad);
    list(PrivateModeOn, privateModeOn);

    // Dialling failures.
    auto *issueFix = new HmiTransition(Events::HmiPhone_PhoneIssueFixRequest, nullptr);
    connect(issueFix, &QAbstractTransition::triggered, m_popupManager,
            &HmiPhonePopupManager::showDeviceIssueFixHint);
    list(PhoneIssueFixRequest, issueFix);
    auto *dialingFailed = new IntSignalTransition(
            m_phoneSource, &Mavrosk::PhoneSource::phoneDialingFailed, 1, nullptr);
    connect(dialingFailed, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::handleDialingFailure);
    list(DialingFailed1, dialingFailed);
    auto *noSignal = new IntSignalTransition(m_phoneSource,
                                             &Mavrosk::PhoneSource::phoneDialingFailed, 0, nullptr);
    connect(noSignal, &QAbstractTransition::triggered, m_popupManager,
            &HmiPhonePopupManager::showNoCellularSignal);
    list(DialingFailed0, noSignal);

    auto *stopAnsweringRequest = new HmiTransition(Events::HmiPhone_StopAnswering, nullptr);
    connect(stopAnsweringRequest, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::stopAnswering);
    list(StopAnswering, stopAnsweringRequest);
}

void HmiPhoneGlobalStateHandler::createCallRequestTransitions(Phone_Cmp *phoneCmp)
{
    auto *confirmRoaming = new HmiTransition(Events::HmiPhone_ConfirmRoamingCall, nullptr);
    connect(confirmRoaming, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::roamingCallConfirmed);
    list(ConfirmRoamingCall, confirmRoaming);
    auto *cancelRoaming = new HmiTransition(Events::HmiPhone_CancelRoamingCall, nullptr);
    connect(cancelRoaming, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::roamingCallCancelled);
    list(CancelRoamingCall, cancelRoaming);

    auto *statusAlerts = new HmiTransition(Events::HmiPhone_ShowStatusBarAlertsRequest, nullptr);
    statusAlerts->setTargetState(phoneCmp->phoneStatusAlerts());
    list(ShowStatusBarAlertsRequest, statusAlerts);

    // The root component dials, or asks for the roaming warning first.
    auto *makeCallRequest = new HmiTransition(Events::HmiPhone_MakeCallRequest, nullptr);
    connect(makeCallRequest, &QAbstractTransition::triggered, phoneCmp, &Phone_Cmp::makeCall);
    list(MakeCallRequest, makeCallRequest);
}

void HmiPhoneGlobalStateHandler::createScreenRequestTransitions(Phone_Cmp *phoneCmp)
{
    auto *connectToDevice = new HmiTransition(Events::HmiPhone_ShowConnectToDevice, nullptr);
    connectToDevice->setTargetState(phoneCmp->addPhoneState());
    list(ShowConnectToDevice, connectToDevice);
    auto *rootState = new HmiTransition(Events::HmiPhone_RootStateRequest, nullptr);
    rootState->setTargetState(phoneCmp);
    list(RootStateRequest, rootState);

    auto *roamingMode = new HmiTransition(Events::HmiPhone_RoamingMode, nullptr);
    connect(roamingMode, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::handleRoamingWarning);
    list(RoamingModeRequest, roamingMode);
    auto *roamingReceived = new HmiSignalTransition(
            m_phoneSource, &Mavrosk::PhoneSource::phoneRoamingModeReceived, nullptr);
    connect(roamingReceived, &QAbstractTransition::triggered, this,
            &HmiPhoneGlobalStateHandler::handleRoamingWarning);
    list(RoamingModeReceived, roamingReceived);
}

void HmiPhoneGlobalStateHandler::createContactsRequestTransition(Phone_Cmp *phoneCmp)
{
    auto *contacts = new HmiTransition(Events::HmiPhone_ShowContactsRequest, nullptr);
    contacts->setTargetState(phoneCmp->phoneBookCompositeState());
    list(ShowContactsRequest, contacts, Quorvel::StateLevel2);
}

// --- Call reactions ----------------------------------------------------------------------------

void HmiPhoneGlobalStateHandler::incomingCall()
{
    // A call the driver cannot take now is refused at once, without a popup or a transient.
    if (m_phoneSource->doNotDisturb() || m_phoneSource->multipleCallsConnected()
        || m_phoneSource->status() == 11) {
        m_phoneSource->rejectIncomingCall();
        return;
    }
    if (!m_phoneSource->callConnected()) {
        if (m_speechSource->ttsSessionActive())
            m_phoneSource->stopTextMessagePlayback();
        m_popupManager->showIncomingCall();
    } else {
        m_popupManager->showWaitingCall();
    }
}

void HmiPhoneGlobalStateHandler::incomingCallOutbound()
{
    if (m_phoneSource->callConnected())
        m_popupManager->dismissWaitingCall();
    else
        m_popupManager->dismissIncomingCall();
}

void HmiPhoneGlobalStateHandler::acceptIncomingCall()
{
    m_popupManager->dismissIncomingCall();
    m_phoneSource->acceptIncomingCall();
    showPhoneAcceptedCallTransientMessage();
}

void HmiPhoneGlobalStateHandler::rejectIncomingCall()
{
    m_popupManager->dismissIncomingCall();
    m_phoneSource->rejectIncomingCall();
    showPhoneRejectedCallTransientMessage();
}

void HmiPhoneGlobalStateHandler::endCall()
{
    m_phoneSource->endCall();
}

void HmiPhoneGlobalStateHandler::stopAnswering()
{
    m_phoneSource->stopAcceptingAttempts();
}

void HmiPhoneGlobalStateHandler::showCallEnded()
{
    // Without a visible status bar (or without a status bar at all) the end of the call is told
    // by the popup, which closes itself.
    Brisken::StatusBarController *statusBar = statusBarController();
    if (statusBar && statusBar->statusBarVisible())
        showPhoneCallEndedTransientMessage();
    else
        m_popupManager->showCallEnded();
}

void HmiPhoneGlobalStateHandler::callEndConfirmed()
{
    m_viewController->dismissPopup(Views::CallEnded);
}

void HmiPhoneGlobalStateHandler::redialRequest()
{
    m_viewController->dismissPopup(Views::Redial);
}

void HmiPhoneGlobalStateHandler::cancelRedialRequest()
{
    m_viewController->dismissPopup(Views::Redial);
}

void HmiPhoneGlobalStateHandler::handleRoamingWarning()
{
    m_popupManager->showRoamingWarning();
}

void HmiPhoneGlobalStateHandler::roamingCallConfirmed()
{
    if (m_phoneSource->outboundRoamingCallIsFromRecentList()) {
        m_phoneSource->dialRecentCall(m_phoneSource->outboundRoamingRecentCallType(),
                                      m_phoneSource->outboundRoamingRecentCallIndex());
        m_phoneSource->setOutboundRoamingCallIsFromRecentList(false);
    } else {
        m_phoneSource->dialNumber(m_phoneSource->callNumberEntered());
    }
}

void HmiPhoneGlobalStateHandler::roamingCallCancelled()
{
    m_phoneSource->cancelRoamingCall();
}

void HmiPhoneGlobalStateHandler::handleDialingFailure()
{
    switch (m_phoneSource->status()) {
    case 3:
    case 4:
    case 5:
    case 6:
    case 0:
    case 1:
        // Two failures in a row show the ordinary popup, the third the one with more help.
        if (m_dialingFailureCount > 1) {
            m_dialingFailureCount = 0;
            m_popupManager->showDialing3rdFailure();
        } else {
            ++m_dialingFailureCount;
            m_popupManager->showDialingFailure();
        }
        break;
    default:
        qCDebug(hmiphone()) << "Phone status: not in Dialing, Idle or Failure state, ignoring "
                               "event.";
        break;
    }
}

void HmiPhoneGlobalStateHandler::hideDialingFailed()
{
    m_popupManager->hideDialingFailure();
}

void HmiPhoneGlobalStateHandler::hideCallKeyPad()
{
    postEvent(Events::HmiPhone_HideCallKeyPadRequest);
}

void HmiPhoneGlobalStateHandler::onMissedCallPopupExited()
{
    const int listType = m_phoneSource->currentRecentCallListType();
    if (listType == 3 || listType == 0)
        postEvent(Events::HmiPhone_RequestRecentCallList);
}

void HmiPhoneGlobalStateHandler::addPhoneRequested()
{
    Taldris::HmiIntentManager::instance()->requestAction(14, {QVariant(ModuleName)}, false, false,
                                                         QVariant());
}

// Posted through the controller, at normal priority, to the HMI's one machine, like every other
// event of the module.
void HmiPhoneGlobalStateHandler::postEvent(const QString &name)
{
    m_controller->postEvent(new Quorvel::HmiEvent(name, QVariant()));
}

// --- Transient messages ------------------------------------------------------------------------

// The status-bar controller is asked for each time: the host may run without one, and then there
// is nothing to show a transient in.
void HmiPhoneGlobalStateHandler::requestTransient(const QString &name)
{
    if (Brisken::StatusBarController *statusBar = statusBarController())
        statusBar->requestTransientWidget(name, 0);
}

void HmiPhoneGlobalStateHandler::hideTransient(const QString &name)
{
    if (Brisken::StatusBarController *statusBar = statusBarController())
        statusBar->hideTransientWidget(name);
}

void HmiPhoneGlobalStateHandler::showPhoneAcceptedCallTransientMessage()
{
    requestTransient(Transients::PhoneAcceptedIncomingCall);
}

void HmiPhoneGlobalStateHandler::showPhoneRejectedCallTransientMessage()
{
    requestTransient(Transients::PhoneRejectedIncomingCall);
}

void HmiPhoneGlobalStateHandler::showPhoneCallEndedTransientMessage()
{
    requestTransient(Transients::PhoneCallEnded);
}

void HmiPhoneGlobalStateHandler::showPhoneConnectedOutgoingCallTransientMessage()
{
    requestTransient(Transients::PhoneConnectedOutgoingCall);
}

void HmiPhoneGlobalStateHandler::showPhoneDialingTransientMessage()
{
    requestTransient(Transients::PhoneOutgoingDialing);
}

void HmiPhoneGlobalStateHandler::hidePhoneDialingTransientMessage()
{
    hideTransient(Transients::PhoneOutgoingDialing);
}

void HmiPhoneGlobalStateHandler::showPhonebookDownloadInitiatedTransientMessage()
{
    requestTransient(Transients::PhonebookDownloadInitiated);
}

void HmiPhoneGlobalStateHandler::hidePhonePhonebookDownloadInitiatedTransientMessage()
{
    hideTransient(Transients::PhonebookDownloadInitiated);
}

void HmiPhoneGlobalStateHandler::showPhonebookDownloadCompleteTransientMessage()
{
    if (m_bluetoothSource->deviceConnected())
        requestTransient(Transients::PhonebookDownloadComplete);
}

} // namespace HmiPhone
