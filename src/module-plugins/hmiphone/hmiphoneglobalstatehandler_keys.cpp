// What the phone keys do in each call situation: accept, reject, end or swap calls, or hand the
// key back to the platform's seek function when the phone has no use for it.

#include "hmiphoneglobalstatehandler.h"

#include "hmiphonecontroller.h"
#include "hmiphoneintegration.h"
#include "hmiphonenumbers.h"
#include "hmiphoneviews.h"

#include <brisken/viewcontroller.h>
#include <mavrosk/eaphonesource.h>
#include <mavrosk/phonesource.h>
#include <taldris/hardkeycontroller.h>

namespace HmiPhone {

namespace {

using FallBack = void (Taldris::HardKeyController::*)();

// While the phone's accessory channel blocks events, the accept, reject, end and seek keys do
// nothing at all.
bool eventsBlocked()
{
    return Mavrosk::EAPhoneSource::instance()->eventsBlocked();
}

// A call rings that the driver was shown. Under do-not-disturb none was: such a call is refused
// at once, and the phone may still report it ringing for a moment, so the call keys keep their
// meaning without a ringing call (a seek key seeks).
bool ringing(const Mavrosk::PhoneSource *phone)
{
    return phone->incomingCall() && !phone->doNotDisturb();
}

// A second call rings while one is connected.
bool waitingCall(const Mavrosk::PhoneSource *phone)
{
    return ringing(phone) && phone->status() == CallStatus::OneCallConnected;
}

// A call the driver may end with a key: private mode hands the call to the handset.
bool callActivity(const Mavrosk::PhoneSource *phone)
{
    return !phone->privateMode() && (phone->dialingInProgress() || phone->callConnected());
}

bool twoCalls(const Mavrosk::PhoneSource *phone)
{
    return phone->status() == CallStatus::SwappableCallsConnected
            || phone->status() == CallStatus::TwoCallsConnected;
}

// The accept and reject keys answer a waiting call, then a ringing one, through the controller;
// true when the key was used for that. With the controller gone (QML may delete it) the key is
// used up without answering.
bool answer(const Mavrosk::PhoneSource *phone, HmiPhoneController *controller, bool accept)
{
    if (!controller && ringing(phone)) {
        qCWarning(hmiphone()) << "HmiPhoneGlobalStateHandler: the controller is gone, the call "
                                 "is not answered";
        return true;
    }
    if (waitingCall(phone)) {
        if (accept)
            controller->acceptWaitingCall();
        else
            controller->rejectWaitingCall();
    } else if (ringing(phone)) {
        if (accept)
            controller->acceptIncomingCall();
        else
            controller->rejectIncomingCall();
    } else {
        return false;
    }
    return true;
}

// The combined and steering-wheel accept keys: answer, swap two calls, keep the key during a
// single call, or seek when the phone has no call of its own (or private mode has it).
void acceptOrSeek(Mavrosk::PhoneSource *phone, HmiPhoneController *controller,
                  Taldris::HardKeyController *hardKeys, FallBack fallBack)
{
    if (answer(phone, controller, true))
        return;
    if (!phone->privateMode() && phone->callConnected()) {
        if (twoCalls(phone))
            phone->swapCall();
    } else {
        (hardKeys->*fallBack)();
    }
}

// Long presses and their releases are not stopped by blocked events: while a call is being set up
// or is connected (outside private mode) the phone owns the key, otherwise the platform seeks.
void seekLongKey(const Mavrosk::PhoneSource *phone, Taldris::HardKeyController *hardKeys,
                 FallBack fallBack)
{
    const int status = phone->status();
    if (status >= CallStatus::OutgoingSetUp && status <= CallStatus::FurtherCallRefused
        && !phone->privateMode())
        return;
    (hardKeys->*fallBack)();
}

} // namespace

void HmiPhoneGlobalStateHandler::processAcceptOrSeek()
{
    if (!eventsBlocked())
        acceptOrSeek(m_phoneSource, m_controller, m_hardKeyController,
                     &Taldris::HardKeyController::processCombinedSeekLeftKey);
}

void HmiPhoneGlobalStateHandler::processRejectOrSeek()
{
    if (eventsBlocked() || answer(m_phoneSource, m_controller, false))
        return;
    if (callActivity(m_phoneSource))
        m_phoneSource->endCall();
    else
        m_hardKeyController->processCombinedSeekRightKey();
}

// The send key never seeks: with nothing to accept or swap it is dropped.
void HmiPhoneGlobalStateHandler::processPhoneSendAcceptKey()
{
    if (eventsBlocked() || answer(m_phoneSource, m_controller, true))
        return;
    if (!m_phoneSource->privateMode() && twoCalls(m_phoneSource))
        m_phoneSource->swapCall();
}

// The end key with no call at all opens the phone screens.
void HmiPhoneGlobalStateHandler::processPhoneEndRejectKey()
{
    if (eventsBlocked() || answer(m_phoneSource, m_controller, false)
        || m_phoneSource->privateMode())
        return;
    if (m_phoneSource->dialingInProgress() || m_phoneSource->callConnected())
        m_phoneSource->endCall();
    else if (m_phoneSource->status() == CallStatus::NoCall && m_controller)
        m_controller->jumpToPhoneSection();
}

void HmiPhoneGlobalStateHandler::processRejectKeyPhone()
{
    if (!eventsBlocked())
        m_phoneSource->endCall();
}

// Its guard already asked for two calls outside private mode.
void HmiPhoneGlobalStateHandler::processMultipartySinglePressPhone()
{
    m_phoneSource->swapCall();
}

void HmiPhoneGlobalStateHandler::processSWCAcceptOrSeek()
{
    if (eventsBlocked())
        return;
    const bool waiting = waitingCall(m_phoneSource);
    acceptOrSeek(m_phoneSource, m_controller, m_hardKeyController,
                 &Taldris::HardKeyController::processSWCSeekDownShortPress);
    if (waiting) {
        // The accept is a posted event that only the open popup takes: close the popup after the
        // machine has handled it, or the accept would be lost.
        Brisken::ViewController *viewController = m_viewController;
        QMetaObject::invokeMethod(
                viewController,
                [viewController] { viewController->dismissPopup(Views::WaitingCall); },
                Qt::QueuedConnection);
    }
}

void HmiPhoneGlobalStateHandler::processSWCRejectOrSeek()
{
    if (eventsBlocked())
        return;
    if (ringing(m_phoneSource) && m_controller)
        m_controller->rejectIncomingCall();
    else if (ringing(m_phoneSource))
        qCWarning(hmiphone()) << "HmiPhoneGlobalStateHandler: the controller is gone, the call "
                                 "is not rejected";
    else if (callActivity(m_phoneSource))
        m_phoneSource->endCall();
    else
        m_hardKeyController->processSWCSeekUpShortPress();
}

void HmiPhoneGlobalStateHandler::processSWCAcceptOrSeekLongPress()
{
    seekLongKey(m_phoneSource, m_hardKeyController,
                &Taldris::HardKeyController::processSWCSeekDownLongPress);
}

void HmiPhoneGlobalStateHandler::processSWCAcceptOrSeekLongRelease()
{
    seekLongKey(m_phoneSource, m_hardKeyController,
                &Taldris::HardKeyController::processSWCSeekDownLongRelease);
}

void HmiPhoneGlobalStateHandler::processSWCRejectOrSeekLongPress()
{
    if (callActivity(m_phoneSource))
        m_phoneSource->endCall();
    seekLongKey(m_phoneSource, m_hardKeyController,
                &Taldris::HardKeyController::processSWCSeekUpLongPress);
}

void HmiPhoneGlobalStateHandler::processSWCRejectOrSeekLongRelease()
{
    seekLongKey(m_phoneSource, m_hardKeyController,
                &Taldris::HardKeyController::processSWCSeekUpLongRelease);
}

} // namespace HmiPhone
