#include "conditionalshowtransientorpopuprequest.h"

namespace Brisken {

ConditionalShowTransientOrPopupRequest::ConditionalShowTransientOrPopupRequest(
        StatusBarController *statusBar, const QString &transientName, const QString &popupViewId,
        QObject *object, const char *property, const QVariant &value)
    : m_show(statusBar, transientName, popupViewId)
    , m_object(object)
    , m_property(property)
    , m_value(value)
{ }

void ConditionalShowTransientOrPopupRequest::run() const
{
    if (m_object && m_object->property(m_property.constData()) == m_value)
        m_show.run();
}

} // namespace Brisken
