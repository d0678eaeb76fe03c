#pragma once

#include <quorvel/hmilayeredstate.h>

class QEvent;

namespace Quorvel {
class HmiState;
class HmiViewState;
} // namespace Quorvel

namespace Mavrosk {
class PhoneSource;
}

namespace Brisken {
class ViewController;
}

namespace HmiPhone {

class HmiPhoneIntegration;

// The recent-calls screen: the list view and the four recent-calls popups in the screen's layer.
// It downloads the recent-call list once the phone reports it available, shows a popup for each
// download status, and reloads the list of the current type on request.
class RecentCallsViewState : public Quorvel::HmiLayeredState
{
    Q_OBJECT
public:
    RecentCallsViewState(HmiPhoneIntegration *integration, const QString &viewId,
                         const QString &name, Quorvel::HmiState *parent);

    // Back handling of the list view.
    void setHandlesBackEvent(bool handles);

protected:
    void onEntry(QEvent *event) override;

private slots:
    void dismissingTransitionTest();
    void downloadCallsIfAvailable();
    void handleRequestRecentCallList();

private:
    Quorvel::HmiViewState *m_listView = nullptr;
    Mavrosk::PhoneSource *m_phoneSource = nullptr;
    Brisken::ViewController *m_viewController = nullptr;
};

} // namespace HmiPhone
