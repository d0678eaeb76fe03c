#include "requestpopup.h"

#include "briskenlog.h"
#include "viewcontroller.h"

namespace Brisken {

RequestPopup::RequestPopup(const QString &viewId, const QVariant &data)
    : m_view(viewId)
    , m_data(data)
{ }

RequestPopup::RequestPopup(QAbstractState *popupState, const QVariant &data)
    : m_view(popupState)
    , m_data(data)
{ }

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
