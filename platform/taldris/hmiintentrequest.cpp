#include "hmiintentrequest.h"

#include "hmiintentmanager.h"

namespace Taldris {

HmiIntentRequest::HmiIntentRequest(int action, const QVariantList &arguments, bool flag,
                                   bool fromVoice, const QVariant &extra)
    : m_action(action)
    , m_arguments(arguments)
    , m_flag(flag)
    , m_fromVoice(fromVoice)
    , m_extra(extra)
{ }

bool HmiIntentRequest::run() const
{
    return HmiIntentManager::instance()->requestAction(m_action, m_arguments, m_flag, m_fromVoice,
                                                       m_extra);
}

} // namespace Taldris
