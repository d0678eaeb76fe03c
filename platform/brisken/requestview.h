#pragma once

#include "viewname.h"

#include <QString>
#include <QVariant>

namespace Brisken {

// A view request made once and run each time: connect it as a functor to a signal, or run it at
// once. Running it asks the view controller to show the view (or the state) it names.
class RequestView
{
public:
    RequestView(const QString &viewId, const QVariant &data = QVariant(), bool flag = false,
                const QVariant &extra = QVariant());
    // Names a view state of the machine; the state's view is requested when the request runs.
    RequestView(QAbstractState *viewState, const QVariant &data = QVariant(), bool flag = false,
                const QVariant &extra = QVariant());

    void run() const;
    void operator()() const { run(); }

    // The view requested when the request runs (empty when its state is gone).
    QString viewId() const { return m_view.toString(); }

private:
    ViewName m_view;
    QVariant m_data;
    bool m_flag;
    QVariant m_extra;
};

} // namespace Brisken
