#include "eaphonesource.h"

namespace Mavrosk {

EAPhoneSource::EAPhoneSource()
    : DataSource(QStringLiteral("eaphone"))
{ }

EAPhoneSource *EAPhoneSource::instance()
{
    static EAPhoneSource *const source = adopt(new EAPhoneSource);
    return source;
}

void EAPhoneSource::setEventsBlocked(bool value)
{
    update(m_eventsBlocked, value, &EAPhoneSource::eventsBlockedChanged);
}

} // namespace Mavrosk
