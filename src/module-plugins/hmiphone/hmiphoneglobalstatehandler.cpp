#include "hmiphoneglobalstatehandler.h"

#include "hmiphonecontroller.h"
#include "hmiphoneevents.h"
#include "hmiphoneglobalchart.h"
#include "hmiphoneintegration.h"
#include "hmiphonenumbers.h"
#include "hmiphonepopupmanager.h"
#include "hmiphoneviews.h"
#include "phone_cmp.h"
#include "phonebook_cmp.h"
#include "phonecall_cmp.h"
#include "phonesms_cmp.h"
#include "phonestatusalerts.h"

#include <brisken/conditionalshowtransientorpopuprequest.h>
#include <brisken/datastore.h>
#include <brisken/dismisspopup.h>
#include <brisken/hidetransientrequest.h>
#include <brisken/showtransientorpopuprequest.h>
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
#include <quorvel/statemachine.h>
#include <taldris/hardkeycontroller.h>
#include <taldris/hmiintentmanager.h>
#include <taldris/hmiintentrequest.h>

#include <QTimer>
#include <QVector>

namespace HmiPhone {

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

// Builds the global popups and transitions once: the popup states first, then the transition
// chart, then the two lists the framework installs.
void HmiPhoneGlobalStateHandler::produceGlobalStateAndTransitions(Phone_Cmp *phoneCmp)
{
    // The popup states; the root component's popups follow the global ones.
    createPopupStates();
    for (const auto &entry : phoneCmp->rootHierarchyPopups())
        m_rootHierarchyPopups.append(entry);

    GlobalChart chart(this, m_keySource);
    buildTransitionChart(chart, phoneCmp);
    m_rootHierarchyTransitions = chart.listed();
    for (const auto &entry : phoneCmp->rootHierarchyTransitions())
        m_rootHierarchyTransitions.append(entry);
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

Quorvel::PopupState *HmiPhoneGlobalStateHandler::popup(const QString &view) const
{
    return m_popupsByView.value(view);
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

    connect(popup(Views::MissedCallPopup), &QAbstractState::exited, this,
            &HmiPhoneGlobalStateHandler::onMissedCallPopupExited);
    m_incomingCallPopup = popup(Views::IncomingCall);
    m_waitingCallPopup = popup(Views::WaitingCall);

    // Text-message alerts: the multiple-messages alert replaces both single-message alerts.
    m_multipleTextMessagesPopup = popup(Views::MultipleTextMessagesReceived);
    connect(m_multipleTextMessagesPopup, &QAbstractState::entered, this,
            &HmiPhoneGlobalStateHandler::enableMultipleMessagesState);
    connect(m_multipleTextMessagesPopup, &QAbstractState::exited, this,
            &HmiPhoneGlobalStateHandler::resetAlertStateOnMultipleMessagesTimeout);
    popup(Views::NewTextMessageAlert1)->registerDismissingPopup(m_multipleTextMessagesPopup);
    m_newTextMessageAlertPopup = popup(Views::NewTextMessageAlert2);
    connect(m_newTextMessageAlertPopup, &QAbstractState::entered, this,
            &HmiPhoneGlobalStateHandler::enableSingleMessageState);
    connect(m_newTextMessageAlertPopup, &QAbstractState::exited, this,
            &HmiPhoneGlobalStateHandler::resetAlertStateOnSingleMessageTimeout);
    m_newTextMessageAlertPopup->registerDismissingPopup(m_multipleTextMessagesPopup);

    connect(popup(Views::PhoneSmsSendTextMessageSuccess), &QAbstractState::exited, m_controller,
            &HmiPhoneController::viewTextMessages);
}

// The global transition chart: one statement per row, in the order of creation (the row
// vocabulary is in hmiphoneglobalchart.h). list(n) is the row's place n in the root-hierarchy
// transition list, at level 3 unless L2 is given; a row without list() keeps its source state.
//
// Adding a row: write it at its place in the creation order, where the bracketed note says,
// not at the end: transitions sharing a trigger are offered it in creation order. Its slots
// and guard are private slots of the handler, declared in the header and defined in any of its
// source units. A row whose guard or slots reach the transition through a handler field stores
// it there with keep(). Then mark the row as armed in the structure test's list and take its
// guard off that test's pending list.
void HmiPhoneGlobalStateHandler::buildTransitionChart(GlobalChart &chart, Phone_Cmp *phoneCmp)
{
    using H = HmiPhoneGlobalStateHandler;
    using PM = HmiPhonePopupManager;
    using Mavrosk::PhoneSource;
    namespace Status = CallStatus;
    const auto L2 = Quorvel::StateLevel2;
    PhoneSource *phone = m_phoneSource;
    PM *pm = m_popupManager;

    // clang-format off

    // --- With the popups ---------------------------------------------------------------------

    // "IncomingCall": the driver's or the caller's answer.
    chart.event(Events::HmiPhone_RejectIncomingCall).run(&H::rejectIncomingCall).list(110);
    chart.event(Events::HmiPhone_AcceptIncomingCall).run(&H::acceptIncomingCall).list(111);
    chart.signal(phone, &PhoneSource::phoneIncomingCallRemoteRejection)
            .run(&H::rejectIncomingCall).list(77);

    // "WaitingCall": ringing, then rejected or accepted; an accepted call the phone fails to take
    // turns into "CallAnswerNotResponding".
    auto *ringing = new QState(m_waitingCallPopup);
    ringing->setObjectName(QStringLiteral("WaitingCallRinging"));
    auto *rejected = new QState(m_waitingCallPopup);
    rejected->setObjectName(QStringLiteral("WaitingCallRejected"));
    auto *accepted = new QState(m_waitingCallPopup);
    accepted->setObjectName(QStringLiteral("WaitingCallAccepted"));
    chart.event(Events::HmiPhone_RejectWaitingCall, ringing).to(rejected).run(&H::rejectIncomingCall);
    chart.event(Events::HmiPhone_AcceptWaitingCall, ringing).to(accepted).run(&H::acceptIncomingCall);
    chart.signal(phone, &PhoneSource::phoneCallAcceptingFailed, accepted)
            .to(popup(Views::CallAnswerNotResponding));
    chart.signal(phone, &PhoneSource::phoneWaitingCallRemoteRejection)
            .run(pm, &PM::dismissWaitingCall).list(76);
    m_waitingCallPopup->setInitialState(ringing);

    // "Redial" and "CallEnded" only close.
    chart.event(Events::HmiPhone_RedialRequest, popup(Views::Redial)).run(&H::redialRequest);
    chart.event(Events::HmiPhone_CancelRedialRequest, popup(Views::Redial)).run(&H::cancelRedialRequest);
    chart.event(Events::HmiPhone_CallEndConfirmed, popup(Views::CallEnded)).run(&H::callEndConfirmed);

    // "NewTextMessageAlert2": hear it, stop, hide, or leave for the message or the replies.
    chart.event(Events::HmiPhone_HearNewTextMessage, m_newTextMessageAlertPopup).run(&H::hearNewTextMessageAlert);
    chart.event(Events::HmiPhone_StopHearNewTextMessage, m_newTextMessageAlertPopup).run(&H::stopHearNewTextMessageAlert);
    chart.event(Events::HmiPhone_HideNewTextMessageAlert, m_newTextMessageAlertPopup).run(&H::hideNewTextMessageAlert);
    chart.event(Events::HmiPhone_ViewNewTextMessage, m_newTextMessageAlertPopup)
            .to(phoneCmp->phoneSmsViewState()).run(&H::viewNewTextMessageAlert);
    chart.event(Events::HmiPhone_ReplyNewTextMessage, m_newTextMessageAlertPopup).to(phoneCmp->phoneSmsReplyViewState());

    // "PhoneSmsTextMessagingOff" closes itself once messaging is turned on.
    chart.change(phone, "messageNotificationEnabled", {false}, true, popup(Views::PhoneSmsTextMessagingOff))
            .run(pm, &PM::hideTextMessagingOff);

    // --- Device and calls --------------------------------------------------------------------

    // Adding a phone: from the phone's screens, or when the voice system asks for the pairing.
    chart.event(Events::HmiPhone_AddPhoneRequest, phoneCmp).run(&H::addPhoneRequested).list(7);
    chart.signal(m_speechSource, &Mavrosk::SpeechSource::displayPairingPopup).voiceEvent()
            .run(Taldris::HmiIntentRequest(IntentAction::PairPhone, {ModuleName}, false, true,
                                           QVariant())).list(8);

    chart.event(Events::HmiPhone_EndCallRequest).run(&H::endCall).list(9);

    // The phone rings: two guarded transitions on the same change of "incomingCall" split the
    // start and the end of the ringing; a projection that gives the call back starts it too.
    chart.property(phone, "incomingCall").keep(m_incomingCallTransition)
            .guard(&H::incomingCallTransitionEventTest).run(&H::incomingCall).list(10);
    chart.guardedSignal(m_projectionSource, &Mavrosk::ProjectionSource::projectionNotActive)
            .keep(m_incomingCallOnProjectionDisconnectTransition)
            .guard(&H::incomingCallonPrjDisconnectTransitionEventTest)
            .run(&H::incomingCall).list(114);
    // Do-not-disturb switched on while a call rings: that call is refused like one that rings
    // under it.
    chart.change(phone, "doNotDisturb", {false}, true)
            .run(&H::rejectRingingCallOnDoNotDisturb).list(115);
    chart.signal(phone, &PhoneSource::phoneCallAcceptingFailed)
            .run(pm, &PM::showCallAcceptanceFailure).list(45);
    chart.property(phone, "incomingCall").keep(m_missedCallTransition)
            .guard(&H::missedCallTransitionEventTest).run(&H::incomingCallOutbound).list(11);
    chart.signal(phone, &PhoneSource::multipartyActiveCallEnded)
            .run(&H::hidePhoneDialingTransientMessage).run(&H::showCallEnded).list(66);
    chart.guardedSignal(phone, &PhoneSource::missedCallsPresent)
            .guard(&H::missedCallPresentTransitionEventTest)
            .run(pm, &PM::dismissIncomingCall).run(pm, &PM::showMissedCall).list(55);

    // The call status: dialling, entering the call screens, connected outgoing calls; only a
    // single call getting through clears a dialling failure still on screen.
    chart.change(phone, "status", {}, Status::OutgoingSetUp).parallelExclusive(0)
            .run(&H::showPhoneDialingTransientMessage).list(64);
    chart.change(phone, "status", {}, Status::OutgoingSetUpBesideCall).parallelExclusive(0)
            .run(&H::showPhoneDialingTransientMessage).list(65);
    chart.property(phone, "status").parallelExclusive(1).keep(m_callConnectedTransition)
            .to(phoneCmp->phoneCallCompositeState())
            .guard(&H::callConnectedTransitionEventTest).list(17);
    chart.change(phone, "callConnected", {false}, true)
            .run(Brisken::DismissPopup(Views::PhoneSmsDownloading))
            .run(Brisken::DismissPopup(Views::PhoneBookDownloading)).list(18);
    chart.change(phone, "status", {Status::OutgoingSetUp}, Status::OneCallConnected)
            .parallelExclusive(0)
            .run(&H::showPhoneConnectedOutgoingCallTransientMessage).run(&H::hideDialingFailed).list(12);
    chart.change(phone, "status", {Status::OutgoingSetUpBesideCall}, Status::SwappableCallsConnected)
            .parallelExclusive(0).run(&H::showPhoneConnectedOutgoingCallTransientMessage).list(13);
    chart.change(phone, "status", {Status::OutgoingSetUpBesideTwoCalls}, Status::TwoCallsConnected)
            .parallelExclusive(0).run(&H::showPhoneConnectedOutgoingCallTransientMessage).list(14);
    chart.change(phone, "status", {Status::OutgoingSetUpRefusing}, Status::FurtherCallRefused)
            .parallelExclusive(0).run(&H::showPhoneConnectedOutgoingCallTransientMessage).list(15);
    chart.change(phone, "privateMode", {}, 1).run(&H::hideCallKeyPad).list(16);

    // The contacts download starts, stops, and finishes (2 to 1 is both).
    chart.change(phone, "phoneBookStatus", {}, 2)
            .run(&H::showPhonebookDownloadInitiatedTransientMessage).list(84);
    chart.change(phone, "phoneBookStatus", {2}, QVariant())
            .run(&H::hidePhonePhonebookDownloadInitiatedTransientMessage).list(85);
    chart.change(phone, "phoneBookStatus", {2}, 1)
            .run(&H::handlePhonebookDownloadCompleteDisplay).list(83);
    chart.event(Events::HmiPhone_RetryPhnBookDownloadAccessRequest)
            .run(&H::handleRetryPhnBookDownloadContactAccess).list(92);
    chart.event(Events::HmiPhone_RetryAutomaticContactDownloadRequest)
            .run(&H::handleRetryPhnBookAutomaticContactDownload).list(93);

    // Dialling failures.
    chart.event(Events::HmiPhone_PhoneIssueFixRequest).run(pm, &PM::showDeviceIssueFixHint).list(32);
    chart.intSignal(phone, &PhoneSource::phoneDialingFailed, 1).run(&H::handleDialingFailure).list(33);
    chart.intSignal(phone, &PhoneSource::phoneDialingFailed, 0).run(pm, &PM::showNoCellularSignal).list(34);

    // Siri is not available.
    chart.event(Events::HmiPhone_ShowSiriNotEnabledRequest)
            .run(pm, &PM::showSiriNotEnabledErrorPopup).list(101);
    chart.signal(phone, &PhoneSource::phoneSiriSCOchannelNotActiveReceived)
            .run(pm, &PM::showSiriNotEnabledErrorPopup).list(102);
    chart.event(Events::HmiPhone_StopAnswering).run(&H::stopAnswering).list(39);

    // --- Keys --------------------------------------------------------------------------------

    // One key event may satisfy several rows; the guards keep the always-armed ones apart. The
    // "WaitingCall" rows listen only while that popup is open, unguarded, and add its dismissal
    // to what the always-armed row of the same key does.
    PM *keyPopups = HmiPhonePopupManager::instance();
    const int Press = KeyPress::Press, Short = KeyPress::ShortPress, Long = KeyPress::LongPress,
              Release = KeyPress::LongPressRelease;
    const auto notProjected = &H::isProjectionNotActive;
    PopupState *waiting = m_waitingCallPopup;
    chart.key(Key::Phone, Short).keep(m_phoneKeyTransition)
            .guard(&H::phoneKeyTransitionEventTest).to(phoneCmp).list(1);
    chart.key(Key::Phone, Short).guard(&H::incomingCallKeySignalTransitionEventTest)
            .run(&H::acceptIncomingCall).run(keyPopups, &PM::dismissIncomingCall).list(2);
    chart.key(Key::Phone, Long).keep(m_phoneEndCallKeyTransition)
            .guard(&H::phoneEndCallKeyTransitionEventTest).run(&H::processRejectKeyPhone).list(20);
    chart.key(Key::Phone, Long).guard(&H::incomingCallKeySignalTransitionEventTest)
            .run(&H::rejectIncomingCall).run(keyPopups, &PM::dismissIncomingCall).list(21);
    chart.key(Key::Phone, Short).keep(m_multipartySwitchKeyTransition)
            .guard(&H::phoneMultipartySwitchKeyTransitionEventTest)
            .run(&H::processMultipartySinglePressPhone).list(31);
    chart.key(Key::Phone, Short, waiting)
            .run(&H::acceptIncomingCall).run(keyPopups, &PM::dismissWaitingCall);
    chart.key(Key::Phone, Long, waiting)
            .run(&H::rejectIncomingCall).run(keyPopups, &PM::dismissWaitingCall);
    chart.key(Key::AcceptOrSeekLeft, Press).guard(notProjected).run(&H::processAcceptOrSeek).list(19);
    chart.key(Key::AcceptOrSeekLeft, Short, waiting).run(keyPopups, &PM::dismissWaitingCall);
    chart.key(Key::RejectOrSeekRight, Press).guard(notProjected).run(&H::processRejectOrSeek).list(22);
    // The same press as the row above, which posts the rejection to this very popup.
    chart.key(Key::RejectOrSeekRight, Press, waiting).runLater(keyPopups, &PM::dismissWaitingCall);
    chart.key(Key::SendAccept, Press).guard(notProjected).run(&H::processPhoneSendAcceptKey).list(23);
    chart.key(Key::SendAccept, Short, waiting).run(keyPopups, &PM::dismissWaitingCall);
    chart.key(Key::EndReject, Press).guard(notProjected).run(&H::processPhoneEndRejectKey).list(24);
    chart.key(Key::EndReject, Short, waiting).run(keyPopups, &PM::dismissWaitingCall);
    chart.key(Key::SendAccept2, Press).guard(notProjected).run(&H::processPhoneSendAcceptKey).list(3);
    chart.key(Key::SendAccept2, Short, waiting).run(keyPopups, &PM::dismissWaitingCall);
    chart.key(Key::EndReject2, Press).guard(notProjected).run(&H::processPhoneEndRejectKey).list(4);
    chart.key(Key::EndReject2, Short, waiting).run(keyPopups, &PM::dismissWaitingCall);
    chart.key(Key::SteeringWheelSeekDown, Short).guard(notProjected)
            .run(&H::processSWCAcceptOrSeek).list(25);
    chart.key(Key::SteeringWheelSeekUp, Short, waiting)
            .run(&H::rejectIncomingCall).run(keyPopups, &PM::dismissWaitingCall);
    chart.key(Key::SteeringWheelSeekUp, Short).guard(notProjected)
            .run(&H::processSWCRejectOrSeek).list(26);
    chart.key(Key::SteeringWheelSeekDown, Long).guard(notProjected)
            .run(&H::processSWCAcceptOrSeekLongPress).list(27);
    chart.key(Key::SteeringWheelSeekDown, Release).guard(notProjected)
            .run(&H::processSWCAcceptOrSeekLongRelease).list(28);
    chart.key(Key::SteeringWheelSeekUp, Long).guard(notProjected)
            .run(&H::processSWCRejectOrSeekLongPress).list(29);
    chart.key(Key::SteeringWheelSeekUp, Release).guard(notProjected)
            .run(&H::processSWCRejectOrSeekLongRelease).list(30);

    // --- Requests, messages and connection ---------------------------------------------------

    // Roaming confirmation.
    chart.event(Events::HmiPhone_ConfirmRoamingCall).run(&H::roamingCallConfirmed).list(35);
    chart.event(Events::HmiPhone_CancelRoamingCall).run(&H::roamingCallCancelled).list(36);
    chart.property(phone, "deviceBatteryLevel").keep(m_batteryLevelTransition)
            .guard(&H::batteryLevelTransitionEventTest).run(pm, &PM::showBatteryLow).list(37);
    chart.event(Events::HmiPhone_ShowStatusBarAlertsRequest).to(phoneCmp->phoneStatusAlerts()).list(38);
    // Opening the text messages: with messaging on, the phone's message access is checked;
    // then the messages in memory open at once, the others after the status check.
    chart.event(Events::HmiPhone_ShowSmsRequest).keep(m_smsNotificationDisabledTransition)
            .guard(&H::smsMessageNotificationNotEnabledTest).run(pm, &PM::showTextMessagingOff).list(96);
    chart.event(Events::HmiPhone_ShowSmsRequest).keep(m_smsNotificationEnabledTransition)
            .guard(&H::smsMessageNotificationEnabledTest).run(&H::smsCheckPrerequisites).list(95);
    chart.event(Events::HmiPhone_ShowSmsStatus).keep(m_smsInMemoryTransition)
            .guard(&H::smsMessagesInMemoryTest).to(phoneCmp->phoneSmsCompositeState()).list(97);
    chart.event(Events::HmiPhone_ShowSmsStatus).keep(m_smsNotInMemoryTransition)
            .guard(&H::smsMessagesNotInMemoryTest).run(&H::smsCheckStatus).list(98);
    chart.event(Events::HmiPhone_ShowSmsIphoneRequest).keep(m_smsIphoneTransition)
            .to(phoneCmp->phoneSmsCompositeState()).list(112);
    // The call moves to the handset (stand-by) and back.
    chart.property(phone, "status").parallelExclusive(0).keep(m_standbyTransition)
            .guard(&H::standbyTransitionEventTest).run(pm, &PM::showTransferToPhone).list(40);
    chart.change(phone, "status", {12}, QVariant()).parallelExclusive(0)
            .run(pm, &PM::hideTransferToPhone).list(41);
    // The link drops: the popup during a call, the reconnect notice without one; the door opened
    // after a failed reconnection; the phone back.
    chart.guardedSignal(phone, &PhoneSource::nonUserDeviceDisconnectReceived)
            .keep(m_connectionLostTransition).guard(&H::showPhoneConnectionLostTest)
            .run(pm, &PM::showPhoneConnectionLost).list(42);
    chart.guardedSignal(phone, &PhoneSource::nonUserDeviceDisconnectReceived)
            .keep(m_attemptingReconnectTransition).guard(&H::showPhoneAttemptingReconnectTest)
            .run(&H::showPhoneAttemptingReconnectTransient).list(43);
    chart.change(m_bluetoothSource, "deviceConnected", {false}, true)
            .run(&H::handleLinklossReconnectSuccessTransition).list(91);
    chart.guardedSignal(phone, &PhoneSource::phoneDriverDoorOpenLinkLossReconnectFailedReceived)
            .keep(m_doorOpenLinklossTransition).guard(&H::showPhoneDoorOpenLinklossTest)
            .run(pm, &PM::showPhoneConnectionLost).run(pm, &PM::hideSendTextMessage).list(88);
    chart.guardedSignal(phone, &PhoneSource::phoneDriverDoorOpenLinkLossReconnectFailedReceived)
            .keep(m_doorNoCallOpenLinklossTransition).guard(&H::showPhoneDoorNoCallOpenLinklossTest)
            .run(pm, &PM::showUnableToConnect).run(pm, &PM::hideSendTextMessage).list(89);
    chart.signal(phone, &PhoneSource::deviceReconnectFailReceived)
            .run(pm, &PM::showUnableToConnect).list(75);
    // New messages: the alert state picks the single or the multiple alert. Reading aloud: the
    // new message once hear-it is pressed, a message of the list once its details are in.
    chart.guardedSignal(phone, &PhoneSource::newTextMessageAlert).keep(m_newTextMessageTransition)
            .guard(&H::newTextMessageTest).run(&H::processNewTextMessageAlert).list(44);
    chart.guardedSignal(phone, &PhoneSource::newTextMessageAlert).keep(m_multipleNewTextMessagesTransition)
            .guard(&H::multipleNewTextMessagesTest).run(&H::processNewTextMessageAlert).list(51);
    chart.guardedSignal(phone, &PhoneSource::newTextMessageDetailsReady).keep(m_smsNewTextHearItTransition)
            .guard(&H::smsNewTextHearitEventTest).run(&H::handleSmsNewTextHearitRequest).list(46);
    chart.signal(phone, &PhoneSource::listenToMessageRequested).run(&H::handleListenMessageRequest).list(49);
    chart.guardedSignal(phone, &PhoneSource::textMessageDetailsReady).keep(m_requestedMessageDetailsReadyTransition)
            .guard(&H::requestedMessageDetailsReadyTest).run(&H::handleRequestedMessageDetailsReady).list(50);
    chart.signal(phone, &PhoneSource::showMessageListRequested).voiceEvent()
            .to(phoneCmp->phoneSmsCompositeState()).list(48);
    chart.signal(phone, &PhoneSource::phoneSmsNewTextClusterHearItRequestReceived)
            .run(&H::hearNewTextMessageAlert).list(86);
    chart.signal(phone, &PhoneSource::phoneSmsNewTextClusterIgnoreRequestReceived)
            .run(pm, &PM::newTextMessageAlert2Hide).list(87);
    // The root component dials, or asks for the roaming warning first.
    chart.event(Events::HmiPhone_MakeCallRequest).run(phoneCmp, &Phone_Cmp::makeCall).list(47);
    // Replying and sending: the replies, the reply chosen by voice, its confirmation, the send
    // and its retries. The outcome is heard while the progress popup is up, and that popup
    // closes when the connection changes.
    chart.signal(phone, &PhoneSource::showReplyMessagesRequested)
            .to(phoneCmp->phoneSmsReplyViewState()).run(pm, &PM::newTextMessageAlert2Hide).list(52);
    chart.signal(phone, &PhoneSource::replyMessageLineNoChanged).run(&H::handleVRSendReplyMessage).list(54);
    chart.event(Events::HmiPhoneSms_SendTextMessage, phoneCmp->phoneSmsReplyViewState())
            .run(pm, &PM::showSendTextMessage).list(53);
    chart.event(Events::HmiPhoneSms_InitiateSendTextMessage).run(&H::handleSendTextMessageRequest).list(56);
    chart.signal(phone, &PhoneSource::sendMessageRequested).run(&H::handleSendTextMessageRequest).list(62);
    chart.signal(phone, &PhoneSource::cancelSendMessageRequested).run(pm, &PM::hideSendTextMessage).list(63);
    chart.event(Events::HmiPhoneSms_RetrySendTextMessage).run(&H::handleRetrySendTextMessage).list(61);
    PopupState *sendProgress = popup(Views::PhoneSmsSendTextMessageProgress);
    chart.intSignal(phone, &PhoneSource::sendMessageStatusChanged, SendMessageStatus::Sent, sendProgress)
            .run(&H::handleSendTextMessageSuccess).list(57);
    chart.intSignal(phone, &PhoneSource::sendMessageStatusChanged, SendMessageStatus::Failed, sendProgress)
            .run(&H::handleSendTextMessageFailure).list(58);
    chart.intSignal(phone, &PhoneSource::sendMessageStatusChanged, SendMessageStatus::NetworkFailure, sendProgress)
            .run(&H::handleSendTextMessageNetworkFailure).list(59);
    chart.intSignal(phone, &PhoneSource::sendMessageStatusChanged, SendMessageStatus::NotSent, sendProgress)
            .run(&H::handleSendTextMessageFailure).list(60);
    chart.signal(phone, &PhoneSource::sendMessageNoResponseFromPhoneAlert)
            .run(&H::handleSendMessageNoResponseFromPhone).list(113);
    chart.signal(m_bluetoothSource, &Mavrosk::BluetoothSource::deviceConnectedChanged)
            .dismisses(sendProgress).list(107);

    // --- Extended mode, errors and screens asked for from elsewhere --------------------------

    // Extended mode, heard while the stand-by popup is up; the countdown runs on after it closes.
    PopupState *standby = popup(Views::PhoneCallStandByModePopup);
    chart.intSignal(phone, &PhoneSource::currentExtendedModeChanged, 2, standby)
            .run(&H::handleExtendedModeChangeRequest).list(71);
    chart.intSignal(phone, &PhoneSource::currentExtendedModeChanged, 3, standby)
            .run(&H::handleExtendedModeChangeRequest).list(72);
    chart.intSignal(phone, &PhoneSource::currentExtendedModeChanged, 1, standby)
            .run(pm, &PM::hidePhoneCallStandByModePopup).run(&H::clearExtendedModeTimer)
            .run(&H::handleExtendedModeChangeRequest).list(69);
    chart.intSignal(phone, &PhoneSource::currentExtendedModeChanged, 0, standby)
            .run(pm, &PM::hidePhoneCallStandByModePopup).run(&H::clearExtendedModeTimer).list(73);
    chart.event(Events::HmiPhone_PrivacyRequestOn, standby)
            .run(phone, &PhoneSource::togglePrivacyMode).run(&H::clearExtendedModeTimer).list(70);
    chart.event(Events::HmiPhone_ClearExtendedModeTimer, standby)
            .run(&H::clearExtendedModeTimer).list(94);
    m_extendedModeTimer = new QTimer(this);
    m_extendedModeTimer->setInterval(60000);
    connect(m_extendedModeTimer, &QTimer::timeout, this, &H::extendedModeTimerMinuteElapsed);

    // Errors: those of a call only while one is connected.
    chart.guardedSignal(phone, &PhoneSource::dtmfKeyPressNoResponseErrorReceived)
            .keep(m_dtmfNoResponseErrorTransition).guard(&H::dtmfKeyPressNoResponseErrorEventTest)
            .run(pm, &PM::showDTMFKeyPressNoResponseErrorPopup).list(67);
    chart.guardedSignal(phone, &PhoneSource::phoneAudioTransferErrorReceived)
            .keep(m_audioTransferErrorTransition).guard(&H::phoneAudioTransferErrorEventTest)
            .run(pm, &PM::showPhoneAudioTransferErrorPopup).list(68);
    chart.signal(phone, &PhoneSource::unstableDeviceConnectionWithKovaReceived)
            .run(pm, &PM::showUnstableConnectionWithKovaPopup).list(74);
    chart.guardedSignal(phone, &PhoneSource::phoneAudioHandsfreeErrorReceived)
            .keep(m_audioHandsfreeErrorTransition).guard(&H::phoneAudioHandsfreeErrorEventTest)
            .run(pm, &PM::showHandsFreeError).list(78);
    chart.signal(phone, &PhoneSource::phoneSiriNoResponseErrorReceived)
            .run(pm, &PM::showPhoneSiriNoResponseErrorPopup).list(80);
    chart.guardedSignal(phone, &PhoneSource::phoneAudioInternalErrorReceived)
            .keep(m_audioInternalErrorTransition).guard(&H::phoneAudioInternalErrorEventTest)
            .run(pm, &PM::showPhoneSiriNoResponseErrorPopup).list(81);
    chart.signal(phone, &PhoneSource::phoneContactsTooLargeErrorReceived)
            .run(pm, &PM::showPhoneContactsTooLargeErrorPopup).list(82);

    chart.event(Events::HmiPhone_ShowConnectToDevice).to(phoneCmp->addPhoneState()).list(90);
    chart.event(Events::HmiPhone_RootStateRequest).to(phoneCmp).list(99);
    chart.event(Events::HmiPhone_RoamingMode).run(&H::handleRoamingWarning).list(100);
    chart.signal(phone, &PhoneSource::phoneRoamingModeReceived).run(&H::handleRoamingWarning).list(79);

    // --- Voice service and contacts ----------------------------------------------------------

    // The phone's voice assistant listens: a message while it does, offered again when the phone
    // menu is left or the status bar comes or goes, removed when it stops or the menu is entered.
    // What needs the status bar is wired only when there is one; the popup goes in any case.
    auto siriOn = chart.change(phone, "siriActive", {false}, true).parallelExclusive(2).list(103, L2);
    auto siriOff = chart.change(phone, "siriActive", {true}, false).list(104, L2);
    auto voiceOn = chart.change(phone, "phoneVoiceServiceActive", {false}, true)
            .parallelExclusive(2).list(105, L2);
    auto voiceOff = chart.change(phone, "phoneVoiceServiceActive", {true}, false).list(106, L2);
    auto menuExited = chart.signal(m_controller.data(), &HmiPhoneController::phoneMenuExited).list(108, L2);
    auto menuEntered = chart.signal(m_controller.data(), &HmiPhoneController::phoneMenuEntered).list(109, L2);
    const QString &voiceMessage = Transients::PhoneVoiceServiceActivatedTransientMsg;
    const QString &voicePopup = Views::PhoneVoiceServiceActivatedPopup;
    if (Brisken::StatusBarController *statusBar = statusBarController()) {
        const Brisken::ConditionalShowTransientOrPopupRequest whileSiri(
                statusBar, voiceMessage, voicePopup, phone, "siriActive", true);
        const Brisken::ConditionalShowTransientOrPopupRequest whileVoiceService(
                statusBar, voiceMessage, voicePopup, phone, "phoneVoiceServiceActive", true);
        const Brisken::ShowTransientOrPopupRequest show(statusBar, voiceMessage, voicePopup);
        const Brisken::HideTransientRequest hide(statusBar, voiceMessage);
        chart.signal(statusBar, &Brisken::StatusBarController::statusBarVisibleChanged)
                .run(whileSiri).run(whileVoiceService).list(5, L2);
        siriOn.run(show);
        siriOff.run(hide);
        voiceOn.run(show);
        voiceOff.run(hide);
        menuExited.run(whileSiri).run(whileVoiceService);
        menuEntered.run(hide);
    }
    siriOff.run(Brisken::DismissPopup(voicePopup));
    voiceOff.run(Brisken::DismissPopup(voicePopup));
    menuEntered.run(Brisken::DismissPopup(voicePopup));
    chart.event(Events::HmiPhone_ShowContactsRequest).to(phoneCmp->phoneBookCompositeState()).list(6, L2);
    // The send confirmation closes when a new message arrives or the message list is asked for.
    PopupState *sendConfirmation = popup(Views::PhoneSmsSendTextMessage);
    chart.signal(phone, &PhoneSource::newTextMessageAlert, sendConfirmation).dismisses(sendConfirmation);
    chart.signal(phone, &PhoneSource::showMessageListRequested, sendConfirmation).dismisses(sendConfirmation);

    // clang-format on
}

// --- Call reactions ----------------------------------------------------------------------------

void HmiPhoneGlobalStateHandler::incomingCall()
{
    // A call the driver cannot take now is refused at once, without a popup or a transient.
    if (m_phoneSource->doNotDisturb() || m_phoneSource->multipleCallsConnected()
        || m_phoneSource->status() == CallStatus::FurtherCallRefused) {
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

// The ringing has ended, whatever ended it. A call answered on the handset may be reported
// connected before the ringing ends, so "IncomingCall" cannot be told from "WaitingCall" by the
// connection: "IncomingCall", which has no auto-dismiss, is always closed, "WaitingCall" as well
// while a call is connected.
void HmiPhoneGlobalStateHandler::incomingCallOutbound()
{
    // Whatever ended the ringing, neither call popup stays: the call the waiting call waited on
    // may have ended first.
    m_popupManager->dismissWaitingCall();
    m_popupManager->dismissIncomingCall();
}

// The driver asked not to be disturbed while a call rang: the call is refused as one that rings
// under do-not-disturb (no transient), and its popup closes at once, since the call keys no longer
// answer it. A call a projection owns stays the projection's.
void HmiPhoneGlobalStateHandler::rejectRingingCallOnDoNotDisturb()
{
    if (!m_phoneSource->incomingCall() || projectionOwnsCall())
        return;
    m_popupManager->dismissIncomingCall();
    m_popupManager->dismissWaitingCall();
    m_phoneSource->rejectIncomingCall();
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
    case CallStatus::OutgoingSetUp:
    case CallStatus::OutgoingSetUpBesideCall:
    case CallStatus::OutgoingSetUpBesideTwoCalls:
    case CallStatus::OutgoingSetUpRefusing:
    case CallStatus::NoCall:
    case CallStatus::SetUpOrFailure:
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
    Taldris::HmiIntentManager::instance()->requestAction(IntentAction::PairPhone,
                                                         {QVariant(ModuleName)});
}

// Posted straight to the HMI's one machine at normal priority: the module's own events must not
// depend on the controller, which QML may have deleted.
void HmiPhoneGlobalStateHandler::postEvent(const QString &name)
{
    Quorvel::StateMachine::instance()->postEvent(new Quorvel::HmiEvent(name, QVariant()));
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

} // namespace HmiPhone
