#include "requestview.h"

#include "briskenlog.h"
#include "viewcontroller.h"

namespace Brisken {

RequestView::RequestView(const QString &viewId, const QVariant &data, bool flag,
                         const QVariant &extra)
    : m_view(viewId)
    , m_data(data)
    , m_flag(flag)
    , m_extra(extra)
{ }

RequestView::RequestView(QAbstractState *viewState, const QVariant &data, bool flag,
                         const QVariant &extra)
    : m_view(viewState)
    , m_data(data)
    , m_flag(flag)
    , m_extra(extra)
{ }

void RequestView::run() const
{
    const QString view = viewId();
    if (view.isEmpty()) {
        qCWarning(briskenLog, "RequestView: the requested view state is gone");
        return;
    }
    ViewController::instance()->showView(view, m_data, m_flag, m_extra);
}

} // namespace Brisken
