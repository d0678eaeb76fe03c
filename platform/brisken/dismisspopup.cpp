#include "dismisspopup.h"

#include "viewcontroller.h"

namespace Brisken {

DismissPopup::DismissPopup(const QString &viewId)
    : m_view(viewId)
{ }

DismissPopup::DismissPopup(QAbstractState *popupState)
    : m_view(popupState)
{ }

void DismissPopup::run() const
{
    // A popup state that is gone cannot be shown: there is nothing to dismiss.
    const QString view = viewId();
    if (!view.isEmpty())
        ViewController::instance()->dismissPopup(view);
}

} // namespace Brisken
