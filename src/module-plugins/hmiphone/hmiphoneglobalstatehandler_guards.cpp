// The guard tests of the global transitions: each reads the phone's data and allows or blocks the
// transition that asks, just before it would fire.

#include "hmiphoneglobalstatehandler.h"

#include "hmiphonecontroller.h"
#include "hmiphoneintegration.h"
#include "hmiphonenumbers.h"

#include <brisken/viewmanager.h>
#include <mavrosk/bluetoothsource.h>
#include <mavrosk/navsource.h>
#include <mavrosk/phonesource.h>
#include <mavrosk/projectionsource.h>
#include <quorvel/guardedpropertytransition.h>
#include <quorvel/guardedsignaltransition.h>
#include <quorvel/hmitransition.h>
#include <quorvel/keysignaltransition.h>

namespace HmiPhone {

namespace {

// The transition of a guard that reads it from its handler field. A guard asked while its field is
// empty belongs to a chart row that does not keep() its transition: that transition would be
// blocked for good, so it is said loudly.
template<class Transition> Transition *guarded(Transition *transition)
{
    if (!transition)
        qCWarning(hmiphone()) << "Guard asked without its transition: its chart row keeps none";
    return transition;
}

template<class Transition> void allow(Transition *transition, bool allowed)
{
    if (guarded(transition))
        transition->setAllowTransition(allowed);
}

// Allows when the condition holds and otherwise leaves the transition blocked, as it starts.
template<class Transition> void allowOnlyIf(Transition *transition, bool allowed)
{
    if (guarded(transition) && allowed)
        transition->setAllowTransition(true);
}

} // namespace

// A projection that owns the call but does not render it shows its own call screen.
bool HmiPhoneGlobalStateHandler::projectionOwnsCall() const
{
    return !m_projectionSource->isRendering()
            && m_projectionSource->projectionMode() == ProjectionMode::PhoneProjection;
}

// Do-not-disturb does not block: incomingCall() refuses such a call at once, where a blocked
// transition would leave it ringing unseen.
void HmiPhoneGlobalStateHandler::incomingCallTransitionEventTest(QEvent *)
{
    auto *transition = qobject_cast<Quorvel::GuardedSignalTransition *>(sender());
    if (!transition)
        return;
    transition->setAllowTransition(!projectionOwnsCall() && m_phoneSource->incomingCall());
}

void HmiPhoneGlobalStateHandler::incomingCallKeySignalTransitionEventTest(QEvent *)
{
    auto *transition = qobject_cast<Quorvel::GuardedSignalTransition *>(sender());
    if (!transition)
        return;
    transition->setAllowTransition(!projectionOwnsCall() && !m_phoneSource->doNotDisturb()
                                   && m_phoneSource->incomingCall()
                                   && !m_phoneSource->callConnected());
}

void HmiPhoneGlobalStateHandler::missedCallPresentTransitionEventTest(QEvent *)
{
    auto *transition = qobject_cast<Quorvel::GuardedSignalTransition *>(sender());
    if (!transition)
        return;
    // A rendering projection tells the driver about missed calls itself.
    transition->setAllowTransition(
            !(m_projectionSource->isRendering()
              && m_projectionSource->projectionMode() == ProjectionMode::PhoneProjection));
}

void HmiPhoneGlobalStateHandler::incomingCallonPrjDisconnectTransitionEventTest(QEvent *)
{
    // As for a call that starts ringing: under do-not-disturb incomingCall() refuses it.
    allow(m_incomingCallOnProjectionDisconnectTransition,
          m_phoneSource->incomingCall()
                  && Mavrosk::ProjectionSource::instance()->projectionMode()
                          == ProjectionMode::None);
}

void HmiPhoneGlobalStateHandler::missedCallTransitionEventTest(QEvent *)
{
    allow(m_missedCallTransition, !m_phoneSource->incomingCall());
}

void HmiPhoneGlobalStateHandler::callConnectedTransitionEventTest(QEvent *)
{
    if (!guarded(m_callConnectedTransition))
        return;
    // The display context is asked first, and again for the second test; with a route active in
    // CallScreensWithoutRoute the call screens stay closed whatever the call does.
    const auto context = [this] {
        return m_viewManager ? m_viewManager->displayContext() : DisplayContext::Default;
    };
    const auto callOngoing = [this] {
        return m_phoneSource->callConnected() || m_phoneSource->dialingInProgress();
    };
    if (context() == DisplayContext::CallScreensWithoutRoute)
        m_callConnectedTransition->setAllowTransition(!m_navSource->routeActive() && callOngoing());
    else if (context() == DisplayContext::WithoutCallScreens)
        m_callConnectedTransition->setAllowTransition(false);
    else
        m_callConnectedTransition->setAllowTransition(callOngoing());
}

void HmiPhoneGlobalStateHandler::redialKeyTransitionEventTest(QEvent *)
{
    if (guarded(m_phoneKeyTransition) && m_bluetoothSource->deviceConnected())
        allow(m_phoneKeyTransition,
              m_phoneSource->status() == CallStatus::NoCall
                      && m_projectionSource->projectionMode() == ProjectionMode::None);
}

void HmiPhoneGlobalStateHandler::phoneKeyTransitionEventTest(QEvent *)
{
    allow(m_phoneKeyTransition,
          !m_phoneSource->incomingCall() && m_phoneSource->status() == CallStatus::NoCall
                  && m_projectionSource->projectionMode() == ProjectionMode::None);
}

void HmiPhoneGlobalStateHandler::phoneMultipartySwitchKeyTransitionEventTest(QEvent *)
{
    allow(m_multipartySwitchKeyTransition,
          !m_phoneSource->privateMode()
                  && m_phoneSource->status() == CallStatus::SwappableCallsConnected
                  && m_projectionSource->projectionMode() == ProjectionMode::None);
}

void HmiPhoneGlobalStateHandler::phoneEndCallKeyTransitionEventTest(QEvent *)
{
    const bool callInProgress = m_phoneSource->dialingInProgress() || m_phoneSource->callConnected()
            || m_phoneSource->multipleCallsConnected();
    allow(m_phoneEndCallKeyTransition,
          !m_phoneSource->privateMode() && callInProgress && !m_phoneSource->incomingCall()
                  && m_projectionSource->projectionMode() == ProjectionMode::None);
}

void HmiPhoneGlobalStateHandler::isProjectionNotActive()
{
    auto *transition = qobject_cast<Quorvel::KeySignalTransition *>(sender());
    if (!transition)
        return;
    transition->setAllowTransition(Mavrosk::ProjectionSource::instance()->projectionMode()
                                   == ProjectionMode::None);
}

void HmiPhoneGlobalStateHandler::batteryLevelTransitionEventTest(QEvent *)
{
    if (guarded(m_batteryLevelTransition) && m_bluetoothSource->deviceConnected())
        allow(m_batteryLevelTransition,
              m_phoneSource->lowBatteryNotification() && m_controller
                      && m_controller->shouldBatteryWarningBeShown(
                              m_phoneSource->deviceBatteryLevel()));
}

void HmiPhoneGlobalStateHandler::standbyTransitionEventTest(QEvent *)
{
    allow(m_standbyTransition, m_phoneSource->status() == CallStatus::Standby);
}

void HmiPhoneGlobalStateHandler::showPhoneConnectionLostTest(QEvent *)
{
    allow(m_connectionLostTransition, m_phoneSource->callConnected());
}

void HmiPhoneGlobalStateHandler::showPhoneAttemptingReconnectTest(QEvent *)
{
    allow(m_attemptingReconnectTransition, !m_phoneSource->callConnected());
}

void HmiPhoneGlobalStateHandler::showPhoneDoorOpenLinklossTest(QEvent *)
{
    allow(m_doorOpenLinklossTransition, m_phoneSource->callConnected());
}

void HmiPhoneGlobalStateHandler::showPhoneDoorNoCallOpenLinklossTest(QEvent *)
{
    allow(m_doorNoCallOpenLinklossTransition, !m_phoneSource->callConnected());
}

// The single and the multiple new-message transitions share their signal; the alert state picks
// exactly one of them, and the other is left at its default (blocked).
void HmiPhoneGlobalStateHandler::newTextMessageTest(QEvent *)
{
    allowOnlyIf(m_newTextMessageTransition, m_textMessageAlertState == TextMessageAlert::None);
}

void HmiPhoneGlobalStateHandler::multipleNewTextMessagesTest(QEvent *)
{
    allowOnlyIf(m_multipleNewTextMessagesTransition,
                m_textMessageAlertState != TextMessageAlert::None);
}

void HmiPhoneGlobalStateHandler::requestedMessageDetailsReadyTest(QEvent *)
{
    allow(m_requestedMessageDetailsReadyTransition, m_listenMessageRequested);
}

void HmiPhoneGlobalStateHandler::smsNewTextHearitEventTest(QEvent *)
{
    allow(m_smsNewTextHearItTransition, m_phoneSource->hearItPressed());
}

void HmiPhoneGlobalStateHandler::dtmfKeyPressNoResponseErrorEventTest(QEvent *)
{
    allow(m_dtmfNoResponseErrorTransition, m_phoneSource->callConnected());
}

void HmiPhoneGlobalStateHandler::phoneAudioTransferErrorEventTest(QEvent *)
{
    allow(m_audioTransferErrorTransition, m_phoneSource->callConnected());
}

void HmiPhoneGlobalStateHandler::phoneAudioHandsfreeErrorEventTest(QEvent *)
{
    allow(m_audioHandsfreeErrorTransition, m_phoneSource->callConnected());
}

void HmiPhoneGlobalStateHandler::phoneAudioInternalErrorEventTest(QEvent *)
{
    allow(m_audioInternalErrorTransition, m_phoneSource->callConnected());
}

void HmiPhoneGlobalStateHandler::smsMessagesInMemoryTest(QEvent *)
{
    allow(m_smsInMemoryTransition, m_phoneSource->messagesInMemoryStatus());
}

void HmiPhoneGlobalStateHandler::smsMessagesNotInMemoryTest(QEvent *)
{
    allow(m_smsNotInMemoryTransition, !m_phoneSource->messagesInMemoryStatus());
}

void HmiPhoneGlobalStateHandler::smsMessageNotificationEnabledTest(QEvent *)
{
    allow(m_smsNotificationEnabledTransition, m_phoneSource->messageNotificationEnabled());
}

void HmiPhoneGlobalStateHandler::smsMessageNotificationNotEnabledTest(QEvent *)
{
    allow(m_smsNotificationDisabledTransition, !m_phoneSource->messageNotificationEnabled());
}

} // namespace HmiPhone
