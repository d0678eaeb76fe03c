#pragma once

#include <quorvel/hmistate.h>

namespace Mavrosk {
class PhoneSource;
}

namespace Quorvel {
class HmiTransition;
class HmiViewState;
} // namespace Quorvel

namespace HmiPhone {

class CallConnectedViewState;
class HmiPhoneIntegration;

// The call in progress: the call view and the in-call keypad on which the driver sends touch
// tones. It turns the privacy, mute and touch-tone requests into phone commands.
class PhoneCall_Cmp : public Quorvel::HmiState
{
    Q_OBJECT
public:
    PhoneCall_Cmp(HmiPhoneIntegration *integration, const QString &name, Quorvel::HmiState *parent);

public slots:
    void togglePrivacyMode();
    void toggleMute();
    void dialPadKeyTonePressed();

private:
    Mavrosk::PhoneSource *m_phoneSource = nullptr;
    CallConnectedViewState *m_callInProgressView = nullptr;
    Quorvel::HmiViewState *m_keypadInCallView = nullptr;
    Quorvel::HmiTransition *m_keyToneTransition = nullptr;
};

} // namespace HmiPhone
