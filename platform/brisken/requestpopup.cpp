#include "requestpopup.h"

#include "briskenlog.h"
#include "viewcontroller.h"

#include <QAbstractState>

namespace Brisken {

RequestPopup::RequestPopup(const QString &viewId, const QVariant &data)
    : m_viewId(viewId)
    , m_fromState(false)
    , m_data(data)
{ }

RequestPopup::RequestPopup(QAbstractState *popupState, const QVariant &data)
    : m_fromState(true)
    , m_popupState(popupState)
    , m_data(data)
{ }

QString RequestPopup::viewId() const
{
    if (!m_fromState)
        return m_viewId;
    return m_popupState ? m_popupState->objectName() : QString();
}

void RequestPopup::run() const
{
    const QString view = viewId();
    if (view.isEmpty()) {
        qCWarning(briskenLog, "RequestPopup: the requested popup state is gone");
        return;
    }
    ViewController::instance()->requestPopup(view, m_data);
}

} // namespace Brisken
