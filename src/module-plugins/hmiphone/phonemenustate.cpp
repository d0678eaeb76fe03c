#include "phonemenustate.h"

#include <mavrosk/phonesource.h>
#include <quorvel/guardedpropertychangetransition.h>

namespace HmiPhone {

PhoneMenuState::PhoneMenuState(const QString &viewId, const QString &name,
                               Quorvel::HmiState *parent)
    : Quorvel::HmiViewState(viewId, name, parent)
    , m_phoneSource(Mavrosk::PhoneSource::instance())
{
    // A voice assistant turning active while the menu is shown.
    auto *siriActivated = new Quorvel::GuardedPropertyChangeTransition(m_phoneSource, "siriActive",
                                                                       {false}, true, this);
    siriActivated->makeParallelExclusive(1);

    auto *voiceServiceActivated = new Quorvel::GuardedPropertyChangeTransition(
            m_phoneSource, "phoneVoiceServiceActive", {false}, true, this);
    voiceServiceActivated->makeParallelExclusive(1);
}

} // namespace HmiPhone
