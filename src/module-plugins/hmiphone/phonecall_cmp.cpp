#include "phonecall_cmp.h"

#include "callconnectedviewstate.h"
#include "hmiphoneevents.h"
#include "hmiphoneviews.h"

#include <mavrosk/phonesource.h>
#include <quorvel/hmitransition.h>
#include <quorvel/hmiviewstate.h>

namespace HmiPhone {

PhoneCall_Cmp::PhoneCall_Cmp(HmiPhoneIntegration *integration, const QString &name,
                             Quorvel::HmiState *parent)
    : Quorvel::HmiState(name, parent)
    , m_phoneSource(Mavrosk::PhoneSource::instance())
{
    Q_UNUSED(integration)

    m_callInProgressView = new CallConnectedViewState(
            Views::CallInProgress, QStringLiteral("CallInProgressViewState"), this);
    m_callInProgressView->setHandlesBackEvent(true);
    // Going back from the call lands where the phone's root component was left from.
    if (parent)
        m_callInProgressView->setBackStackStateId(parent->name(), true);

    m_keypadInCallView = new Quorvel::HmiViewState(Views::KeypadInCall,
                                                   QStringLiteral("KeypadInCallViewState"), this);
    m_keypadInCallView->setHandlesBackEvent(true);
    m_keypadInCallView->setHasBackStackPresence(false);
    m_keypadInCallView->setBackTargetProviderState(m_callInProgressView);

    auto *showKeypad = new Quorvel::HmiTransition(Events::HmiPhone_ShowCallKeyPadRequest,
                                                  m_callInProgressView);
    showKeypad->setTargetState(m_keypadInCallView);

    auto *hideKeypad = new Quorvel::HmiTransition(Events::HmiPhone_HideCallKeyPadRequest,
                                                  m_keypadInCallView);
    hideKeypad->setTargetState(m_callInProgressView);

    m_keyToneTransition = new Quorvel::HmiTransition(Events::HmiPhone_DialPadKeyTonePressed,
                                                     m_keypadInCallView);
    connect(m_keyToneTransition, &QAbstractTransition::triggered, this,
            &PhoneCall_Cmp::dialPadKeyTonePressed);

    // Privacy and mute are offered by the call view only, not by the in-call keypad.
    auto *privacy
            = new Quorvel::HmiTransition(Events::HmiPhone_PrivacyRequest, m_callInProgressView);
    connect(privacy, &QAbstractTransition::triggered, this, &PhoneCall_Cmp::togglePrivacyMode);

    auto *mute = new Quorvel::HmiTransition(Events::HmiPhone_MuteRequest, m_callInProgressView);
    connect(mute, &QAbstractTransition::triggered, this, &PhoneCall_Cmp::toggleMute);

    setInitialHmiState(m_callInProgressView);
}

void PhoneCall_Cmp::togglePrivacyMode()
{
    if (m_phoneSource)
        m_phoneSource->togglePrivacyMode();
}

void PhoneCall_Cmp::toggleMute()
{
    if (m_phoneSource)
        m_phoneSource->toggleMuted();
}

void PhoneCall_Cmp::dialPadKeyTonePressed()
{
    // The event carries [key code, key text].
    const QVariantList data = m_keyToneTransition->transitionData().toList();
    if (data.size() < 2 || !m_phoneSource)
        return;

    bool isCode = false;
    const int code = data.at(0).toInt(&isCode);
    const QVariant text = data.at(1);

    // Sending the tone and recording it are independent: either may go ahead alone.
    if (isCode)
        m_phoneSource->dialPadKeyTonePressed(code);
    if (text.isValid() && text.canConvert<QString>())
        m_phoneSource->setDTMFNumberEntered(m_phoneSource->dtmfNumberEntered() + text.toString());
}

} // namespace HmiPhone
