#include "ardelsource.h"

namespace Mavrosk {

ArdelSource::ArdelSource()
    : DataSource(QStringLiteral("ardel"))
{ }

ArdelSource *ArdelSource::instance()
{
    static ArdelSource *const source = adopt(new ArdelSource);
    return source;
}

void ArdelSource::setIgnitionKeyType(int value)
{
    update(m_ignitionKeyType, value, &ArdelSource::ignitionKeyTypeChanged);
}

void ArdelSource::setDoNotDisturbOption(bool value)
{
    update(m_doNotDisturbOption, value, &ArdelSource::doNotDisturbOptionChanged);
}

} // namespace Mavrosk
