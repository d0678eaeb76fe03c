#pragma once

#include "showtransientorpopuprequest.h"

#include <QByteArray>
#include <QPointer>
#include <QVariant>

namespace Brisken {

// Like ShowTransientOrPopupRequest, but shows the message only while the property `property` of
// `object` equals `value` when the request runs.
class ConditionalShowTransientOrPopupRequest
{
public:
    ConditionalShowTransientOrPopupRequest(StatusBarController *statusBar,
                                           const QString &transientName, const QString &popupViewId,
                                           QObject *object, const char *property,
                                           const QVariant &value);

    void run() const;
    void operator()() const { run(); }

private:
    ShowTransientOrPopupRequest m_show;
    QPointer<QObject> m_object;
    QByteArray m_property;
    QVariant m_value;
};

} // namespace Brisken
