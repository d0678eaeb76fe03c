#pragma once

#include "viewname.h"

#include <QString>
#include <QVariant>

namespace Brisken {

// A popup request made once and run each time: connect it as a functor to a signal, or run it
// at once. Running it asks the view controller for the popup.
class RequestPopup
{
public:
    RequestPopup(const QString &viewId, const QVariant &data = QVariant());
    // Names a popup state; its view identifier is its name.
    RequestPopup(QAbstractState *popupState, const QVariant &data = QVariant());

    void run() const;
    void operator()() const { run(); }

    QString viewId() const { return m_view.toString(); }

private:
    ViewName m_view;
    QVariant m_data;
};

} // namespace Brisken
