#pragma once

#include <QPointer>
#include <QString>

namespace Brisken {

class StatusBarController;

// Shows a message made once and run each time: as the transient `transientName` while the status
// bar is visible, otherwise (or without a status bar) as the popup `popupViewId`.
class ShowTransientOrPopupRequest
{
public:
    ShowTransientOrPopupRequest(StatusBarController *statusBar, const QString &transientName,
                                const QString &popupViewId);

    void run() const;
    void operator()() const { run(); }

private:
    QPointer<StatusBarController> m_statusBar;
    QString m_transientName;
    QString m_popupViewId;
};

} // namespace Brisken
