#include "requestview.h"

#include "briskenlog.h"
#include "viewcontroller.h"

#include <QAbstractState>

namespace Brisken {

RequestView::RequestView(const QString &viewId, const QVariant &data, bool flag,
                         const QVariant &extra)
    : m_viewId(viewId)
    , m_fromState(false)
    , m_data(data)
    , m_flag(flag)
    , m_extra(extra)
{ }

RequestView::RequestView(QAbstractState *viewState, const QVariant &data, bool flag,
                         const QVariant &extra)
    : m_fromState(true)
    , m_viewState(viewState)
    , m_data(data)
    , m_flag(flag)
    , m_extra(extra)
{ }

QString RequestView::viewId() const
{
    if (!m_fromState)
        return m_viewId;
    return m_viewState ? m_viewState->objectName() : QString();
}

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
