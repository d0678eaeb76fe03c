#include "phone_cmp.h"

#include "dialkeypadstate.h"
#include "hmiphonecontroller.h"
#include "hmiphoneevents.h"
#include "hmiphonenumbers.h"
#include "hmiphonepopupmanager.h"
#include "hmiphonesmsmanager.h"
#include "hmiphoneviews.h"
#include "phonebook_cmp.h"
#include "phonecall_cmp.h"
#include "phonemenustate.h"
#include "phonesms_cmp.h"
#include "phonestatusalerts.h"
#include "recentcallsviewstate.h"

#include <brisken/viewcontroller.h>
#include <mavrosk/ardelsource.h>
#include <mavrosk/bluetoothsource.h>
#include <mavrosk/phonesource.h>
#include <mavrosk/speechsource.h>
#include <quorvel/guardedpropertychangetransition.h>
#include <quorvel/guardedpropertytransition.h>
#include <quorvel/hmiconditionalstate.h>
#include <quorvel/hmisignaltransition.h>
#include <quorvel/hmitransition.h>
#include <quorvel/hmiviewstate.h>
#include <quorvel/popupstate.h>
#include <taldris/intentactionrequest.h>

#include <QEvent>

namespace HmiPhone {

namespace {

// Emergency-call status values that open the emergency-assistance state.
bool isEmergencyStatus(int emergencyCallStatus)
{
    return emergencyCallStatus == 1 || emergencyCallStatus == 2;
}

// Call states 3 to 5 are a call being set up or in progress; 0 to 2 are no call.
bool isCallStatus(int status)
{
    return status > CallStatus::LastWithoutCall && status <= CallStatus::LastCallInProgress;
}

} // namespace

Phone_Cmp::Phone_Cmp(HmiPhoneIntegration *integration, HmiPhoneController *controller,
                     const QString &name, Quorvel::HmiState *parent)
    : Quorvel::HmiLayeredState(name, parent)
    , m_bluetoothSource(Mavrosk::BluetoothSource::instance())
    , m_phoneSource(Mavrosk::PhoneSource::instance())
    , m_speechSource(Mavrosk::SpeechSource::instance())
{
    // Child states first: their creation order is the order of the phone's screen tree.
    m_phoneCallCmp = new PhoneCall_Cmp(integration, QStringLiteral("PhoneCallCmp"), this);
    m_phoneBookCmp = new PhoneBook_Cmp(integration, QStringLiteral("PhoneBookCmp"), this);

    m_phoneEmergencyAssist = new Quorvel::HmiState(QStringLiteral("PhoneEmgcyAsst"), this);

    m_phoneStatusAlerts
            = new PhoneStatusAlerts(integration, QStringLiteral("PhoneStatusAlertsCmp"), this);

    // Shown by the popup manager when the restricted key forbids switching do-not-disturb off.
    new Quorvel::PopupState(Views::PhoneDndActiveArdel, this, 1);

    m_doNotDisturbToggleTransition
            = new Quorvel::HmiTransition(Events::HmiPhone_DoNotDisturbToggleRequest, this);
    connect(m_doNotDisturbToggleTransition, &QAbstractTransition::triggered, this,
            &Phone_Cmp::doNotDisturbToggled);

    // Without a phone the platform takes over to pair one.
    m_addPhoneState = Quorvel::HmiViewState::createDummyViewState(QStringLiteral("HmiPhone_Limbo"),
                                                                  this, -1, false);
    connect(m_addPhoneState, &QAbstractState::entered, this,
            Taldris::IntentActionRequest(IntentAction::NoPhoneConnected, nullptr));

    m_phoneMenuState
            = new PhoneMenuState(Views::PhoneMenu, QStringLiteral("PhoneMenuViewState"), this);
    m_phoneMenuState->setBackStackStateId(name, false);

    m_dialKeypadState
            = new DialKeypadState(Views::DialKeypad, QStringLiteral("DialKeypadViewState"), this);
    m_dialKeypadState->setHandlesBackEvent(true);

    m_recentCallsViewState = new RecentCallsViewState(
            integration, Views::RecentCalls, QStringLiteral("RecentCallsListViewState"), this);
    m_recentCallsViewState->setHandlesBackEvent(true);

    m_rootConditionalState
            = new Quorvel::HmiConditionalState(QStringLiteral("Phone_CmpConditionalState"), this);
    connect(m_rootConditionalState, &Quorvel::HmiConditionalState::conditionTest, this,
            &Phone_Cmp::chooseTargetState);

    // Transitions. Those with Phone_Cmp as source act on whichever phone screen is active.
    auto *keypadTransition
            = new Quorvel::HmiTransition(Events::HmiPhone_ShowPhoneKeyPadRequest, m_phoneMenuState);
    keypadTransition->setTargetState(m_dialKeypadState);

    auto *recentCallsTransition
            = new Quorvel::HmiTransition(Events::HmiPhone_ShowRecentCallsRequest, this);
    recentCallsTransition->setTargetState(m_recentCallsViewState);

    auto *reconnectFailedTransition = new Quorvel::HmiSignalTransition(
            m_phoneSource,
            &Mavrosk::PhoneSource::phoneDriverDoorOpenLinkLossReconnectFailedReceived, this);
    reconnectFailedTransition->setTargetState(m_addPhoneState);

    // Exactly one of the two Siri transitions fires for each request: their guards are negations.
    m_siriRequestTransition = new Quorvel::HmiTransition(Events::HmiPhone_SiriRequest, this);
    connect(m_siriRequestTransition, &Quorvel::GuardedTransition::transitionTest, this,
            &Phone_Cmp::siriActivationRequestTest);
    connect(m_siriRequestTransition, &QAbstractTransition::triggered, this,
            &Phone_Cmp::siriActivationRequest);

    m_siriRequestFailedTransition = new Quorvel::HmiTransition(Events::HmiPhone_SiriRequest, this);
    connect(m_siriRequestFailedTransition, &Quorvel::GuardedTransition::transitionTest, this,
            &Phone_Cmp::siriActivationRequestFailTest);
    connect(m_siriRequestFailedTransition, &QAbstractTransition::triggered, this,
            &Phone_Cmp::siriActivationRequestFailed);

    m_callEndedTransition
            = new Quorvel::GuardedPropertyTransition(m_phoneSource, "status", m_phoneCallCmp);
    connect(m_callEndedTransition, &Quorvel::GuardedSignalTransition::transitionTest, this,
            &Phone_Cmp::closeCallInProgressIfNeeded);
    connect(m_callEndedTransition, &QAbstractTransition::triggered, this, &Phone_Cmp::back);

    auto *notificationTransition = new Quorvel::GuardedPropertyChangeTransition(
            m_phoneSource, "messageNotificationEnabled", QVariantList{false}, true,
            m_phoneMenuState);
    connect(notificationTransition, &QAbstractTransition::triggered, controller,
            &HmiPhoneController::viewTextMessages);

    m_smsManager = new HmiPhoneSmsManager(controller, this);
    m_smsManager->createSmsStates(this);

    // The contacts component's popups and transitions live at the root of the HMI's machine.
    m_rootHierarchyTransitions.append(m_phoneBookCmp->rootHierarchyTransitions());
    m_rootHierarchyPopups.append(m_phoneBookCmp->rootHierarchyPopups());

    setInitialHmiState(m_rootConditionalState);
}

Phone_Cmp::~Phone_Cmp() = default;

Quorvel::HmiViewState *Phone_Cmp::phoneSmsViewState() const
{
    return m_smsManager->phoneSmsViewState();
}

Quorvel::HmiViewState *Phone_Cmp::phoneSmsReplyViewState() const
{
    return m_smsManager->phoneSmsReplyViewState();
}

PhoneSms_Cmp *Phone_Cmp::phoneSmsCompositeState() const
{
    return m_smsManager->phoneSmsCompositeState();
}

void Phone_Cmp::chooseTargetState()
{
    QAbstractState *target = nullptr;
    if (!m_bluetoothSource->deviceConnected()) {
        target = m_addPhoneState;
    } else {
        // A call in progress wins over an emergency status.
        const bool inCall = isCallStatus(m_phoneSource->status()) || m_phoneSource->callConnected();
        if (inCall)
            target = m_phoneCallCmp;
        else if (isEmergencyStatus(m_phoneSource->emergencyCallStatus()))
            target = m_phoneEmergencyAssist;
        else
            target = m_phoneMenuState;
    }
    m_rootConditionalState->setTargetState(target);
}

void Phone_Cmp::makeCall()
{
    if (m_phoneSource->roaming() && m_phoneSource->roamingWarning()) {
        HmiPhonePopupManager::instance()->showRoamingWarning();
        return;
    }
    m_phoneSource->dialNumber(m_phoneSource->callNumberEntered());
}

void Phone_Cmp::closeCallInProgressIfNeeded(QEvent *event)
{
    Q_UNUSED(event)
    // Read as unsigned: a negative status is no valid "no call" value.
    if (m_phoneSource
        && static_cast<unsigned int>(m_phoneSource->status())
                <= static_cast<unsigned int>(CallStatus::LastWithoutCall))
        m_callEndedTransition->setAllowTransition(true);
}

void Phone_Cmp::back()
{
    Brisken::ViewController::instance()->back(1);
}

void Phone_Cmp::siriActivationRequestTest(QEvent *event)
{
    Q_UNUSED(event)
    const bool allowed = m_bluetoothSource->deviceConnected() && m_phoneSource->siriSupported()
            && m_phoneSource->siriEnabled();
    m_siriRequestTransition->setAllowTransition(allowed);
}

void Phone_Cmp::siriActivationRequestFailTest(QEvent *event)
{
    Q_UNUSED(event)
    const bool allowed = !m_bluetoothSource->deviceConnected() || !m_phoneSource->siriSupported()
            || !m_phoneSource->siriEnabled();
    m_siriRequestFailedTransition->setAllowTransition(allowed);
}

void Phone_Cmp::siriActivationRequest()
{
    if (m_speechSource->sessionState() != 0)
        m_speechSource->cancelVRSession();
    m_phoneSource->toggleSiriActivation(!m_phoneSource->siriActive());
}

void Phone_Cmp::siriActivationRequestFailed()
{
    HmiPhonePopupManager::instance()->showSiriNotEnabledErrorPopup();
}

void Phone_Cmp::doNotDisturbToggled()
{
    if (!m_phoneSource->doNotDisturb()) {
        m_phoneSource->enableDoNotDisturb();
        return;
    }
    // The restricted key may forbid switching do-not-disturb off.
    Mavrosk::ArdelSource *ardel = Mavrosk::ArdelSource::instance();
    if (ardel->ignitionKeyType() == 2 && !ardel->doNotDisturbOption()) {
        HmiPhonePopupManager::instance()->showPhoneDndActiveArdel();
        return;
    }
    m_phoneSource->disableDoNotDisturb();
}

void Phone_Cmp::onEntry(QEvent *event)
{
    Quorvel::HmiLayeredState::onEntry(event);
    if (m_bluetoothSource->deviceConnected())
        m_phoneSource->checkPhoneStatus();
}

} // namespace HmiPhone
