#pragma once

#include <quorvel/hmilayeredstate.h>

namespace Mavrosk {
class BluetoothSource;
class PhoneSource;
} // namespace Mavrosk

namespace Quorvel {
class GuardedPropertyTransition;
class HmiTransition;
class HmiViewState;
} // namespace Quorvel

namespace HmiPhone {

class HmiPhoneIntegration;

// The status-bar alerts screen: the alert list, a clear or fix popup for the alert the driver
// picks, the driver's decision forwarded to the phone, and retries of contact and message
// downloads whose failure is reported with a short popup.
class PhoneStatusAlerts : public Quorvel::HmiLayeredState
{
    Q_OBJECT
public:
    PhoneStatusAlerts(HmiPhoneIntegration *integration, const QString &name,
                      Quorvel::HmiState *parent);
    ~PhoneStatusAlerts() override;

protected:
    void onEntry(QEvent *event) override;

private slots:
    void clearAlertPermanently();
    void clearAlertForThisCycle();
    void callForFixAlert();
    void retryDownloadContact();
    void retryAccessTextMessages();
    void phoneBookStatusTransitionEventTest();
    void textMessagesStatusTransitionEventTest();
    void clearAlert1004();

private:
    HmiPhoneIntegration *m_integration = nullptr;
    Mavrosk::PhoneSource *m_phoneSource = nullptr;
    Mavrosk::BluetoothSource *m_bluetoothSource = nullptr;
    Quorvel::HmiViewState *m_viewState = nullptr;
    Quorvel::HmiTransition *m_clearAlertPermanentlyTransition = nullptr;
    Quorvel::HmiTransition *m_clearAlertForThisCycleTransition = nullptr;
    Quorvel::HmiTransition *m_callForFixAlertTransition = nullptr;
    Quorvel::HmiTransition *m_retryDownloadContactTransition = nullptr;
    Quorvel::GuardedPropertyTransition *m_phoneBookStatusTransition = nullptr;
    Quorvel::HmiTransition *m_retryAccessTextMessagesTransition = nullptr;
    Quorvel::GuardedPropertyTransition *m_messagesDownloadingStatusTransition = nullptr;
    bool m_contactRetryPending = false;
    int m_contactRetryAlertId = -1;
    bool m_smsRetryPending = false;
    int m_smsRetryAlertId = -1;
};

} // namespace HmiPhone
