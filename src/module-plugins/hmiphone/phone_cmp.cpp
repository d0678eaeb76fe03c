#include "phone_cmp.h"

#include "hmiphonesmsmanager.h"

namespace HmiPhone {

Phone_Cmp::Phone_Cmp(HmiPhoneIntegration *integration, HmiPhoneController *controller,
                     const QString &name, Quorvel::HmiState *parent)
    : Quorvel::HmiLayeredState(name, parent)
{
    Q_UNUSED(integration)
    m_smsManager = new HmiPhoneSmsManager(controller, this);
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

void Phone_Cmp::chooseTargetState() { }
void Phone_Cmp::makeCall() { }
void Phone_Cmp::closeCallInProgressIfNeeded(QEvent *) { }
void Phone_Cmp::back() { }
void Phone_Cmp::siriActivationRequestTest(QEvent *) { }
void Phone_Cmp::siriActivationRequestFailTest(QEvent *) { }
void Phone_Cmp::siriActivationRequest() { }
void Phone_Cmp::siriActivationRequestFailed() { }
void Phone_Cmp::doNotDisturbToggled() { }

void Phone_Cmp::onEntry(QEvent *event)
{
    Quorvel::HmiLayeredState::onEntry(event);
}

} // namespace HmiPhone
