#include "hidetransientrequest.h"

#include "statusbarcontroller.h"

namespace Brisken {

HideTransientRequest::HideTransientRequest(StatusBarController *statusBar,
                                           const QString &transientName)
    : m_statusBar(statusBar)
    , m_transientName(transientName)
{ }

void HideTransientRequest::run() const
{
    if (m_statusBar)
        m_statusBar->hideTransientWidget(m_transientName);
}

} // namespace Brisken
