#include "dismisspopup.h"

#include <QAbstractState>

namespace Brisken {

DismissPopup::DismissPopup(const QString &viewId)
    : m_viewId(viewId)
    , m_fromState(false)
{ }

DismissPopup::DismissPopup(QAbstractState *popupState)
    : m_fromState(true)
    , m_popupState(popupState)
{ }

QString DismissPopup::viewId() const
{
    if (!m_fromState)
        return m_viewId;
    return m_popupState ? m_popupState->objectName() : QString();
}

void DismissPopup::run() const { }

} // namespace Brisken
