#include "showtransientorpopuprequest.h"

#include "statusbarcontroller.h"
#include "viewcontroller.h"

namespace Brisken {

ShowTransientOrPopupRequest::ShowTransientOrPopupRequest(StatusBarController *statusBar,
                                                         const QString &transientName,
                                                         const QString &popupViewId)
    : m_statusBar(statusBar)
    , m_transientName(transientName)
    , m_popupViewId(popupViewId)
{ }

void ShowTransientOrPopupRequest::run() const
{
    // A transient needs a visible status bar; without one the message comes as a popup.
    if (m_statusBar && m_statusBar->statusBarVisible())
        m_statusBar->requestTransientWidget(m_transientName, 0);
    else
        ViewController::instance()->requestPopup(m_popupViewId);
}

} // namespace Brisken
