#include "showtransientorpopuprequest.h"

#include "statusbarcontroller.h"

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
    if (m_statusBar && m_statusBar->statusBarVisible())
        m_statusBar->requestTransientWidget(m_transientName, 0);
}

} // namespace Brisken
