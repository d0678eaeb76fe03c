#include "intentactionrequest.h"

#include "hmiintentmanager.h"
#include "taldrislog.h"

namespace Taldris {

IntentActionRequest::IntentActionRequest(int action, IntentDataProvider *dataProvider)
    : m_action(action)
    , m_hasProvider(dataProvider != nullptr)
    , m_dataProvider(dataProvider)
{ }

bool IntentActionRequest::run() const
{
    // A request whose data provider is gone would lack its arguments: it is not made.
    if (m_hasProvider && !m_dataProvider) {
        qCWarning(taldrisLog, "IntentActionRequest: data provider of action %d is gone", m_action);
        return false;
    }
    QVariantList arguments;
    if (m_dataProvider)
        arguments = m_dataProvider->intentArguments();
    return HmiIntentManager::instance()->requestAction(m_action, arguments, false, false,
                                                       QVariant());
}

} // namespace Taldris
