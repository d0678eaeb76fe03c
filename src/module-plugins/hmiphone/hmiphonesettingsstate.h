#pragma once

#include <quorvel/hmistate.h>

namespace Quorvel {
class HmiConditionalState;
class HmiViewState;
} // namespace Quorvel

namespace HmiPhone {

class HmiPhoneController;

// The phone's settings pages under a state of the settings module, entered as "PhoneSettingsRoot".
// On entry it shows the "PhoneSettings" page only when a phone is paired, the Bluetooth module
// is up and a device is connected; otherwise it parks in a limbo state and hands over to the
// Bluetooth screens of other modules. It holds the manage-contacts page with its delete-all
// popup, the ringtone page and the text-message notification page, opened by the controller's
// page requests while the settings are active, and leaves the pages when the phone disconnects.
class HmiPhoneSettingsState : public Quorvel::HmiState
{
public:
    HmiPhoneSettingsState(HmiPhoneController *controller, Quorvel::HmiState *parent);

    // Entering the settings: the "PhoneSettings" page, or the limbo state and an intent.
    void chooseTargetState();
    // Going back to the "PhoneSettings" page: the page while a phone is connected, otherwise the
    // settings module's own state.
    void choosePhoneSettingsTargetState();

private:
    Quorvel::HmiConditionalState *m_entryConditionalState = nullptr;
    Quorvel::HmiConditionalState *m_backConditionalState = nullptr;
    Quorvel::HmiViewState *m_phoneSettingsViewState = nullptr;
    Quorvel::HmiViewState *m_limboState = nullptr;
};

} // namespace HmiPhone
