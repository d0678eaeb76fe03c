#pragma once

#include <quorvel/hmiviewstate.h>

namespace Mavrosk {
class PhoneSource;
}

namespace HmiPhone {

// The phone's main menu, shown when a phone is connected and no call is in progress. Of its own it
// only watches the phone's voice assistants: Siri or the phone's voice service turning active
// while the menu is shown fires a parallel-exclusive transition.
class PhoneMenuState : public Quorvel::HmiViewState
{
    Q_OBJECT
public:
    PhoneMenuState(const QString &viewId, const QString &name, Quorvel::HmiState *parent);

private:
    Mavrosk::PhoneSource *m_phoneSource = nullptr;
};

} // namespace HmiPhone
