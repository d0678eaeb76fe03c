#include "dismisspopup.h"

#include "viewcontroller.h"

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

void DismissPopup::run() const
{
    // A popup state that is gone cannot be shown: there is nothing to dismiss.
    const QString view = viewId();
    if (!view.isEmpty())
        ViewController::instance()->dismissPopup(view);
}

} // namespace Brisken
