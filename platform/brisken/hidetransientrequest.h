#pragma once

#include <QPointer>
#include <QString>

namespace Brisken {

class StatusBarController;

// Hides the transient `transientName`; made once and run each time.
class HideTransientRequest
{
public:
    HideTransientRequest(StatusBarController *statusBar, const QString &transientName);

    void run() const;
    void operator()() const { run(); }

private:
    QPointer<StatusBarController> m_statusBar;
    QString m_transientName;
};

} // namespace Brisken
