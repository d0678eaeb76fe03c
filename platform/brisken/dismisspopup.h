#pragma once

#include "viewname.h"

#include <QString>

namespace Brisken {

// A popup dismissal made once and run each time: connect it as a functor to a signal, or run it
// at once. Running it asks the view controller to dismiss the popup.
class DismissPopup
{
public:
    DismissPopup(const QString &viewId);
    DismissPopup(QAbstractState *popupState);

    void run() const;
    void operator()() const { run(); }

    QString viewId() const { return m_view.toString(); }

private:
    ViewName m_view;
};

} // namespace Brisken
