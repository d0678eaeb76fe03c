#include "phonestatusalerts.h"

#include "hmiphoneevents.h"
#include "hmiphoneintegration.h"
#include "hmiphoneviews.h"

#include <brisken/requestpopup.h>
#include <brisken/viewmanager.h>
#include <mavrosk/bluetoothsource.h>
#include <mavrosk/phonesource.h>
#include <quorvel/guardedpropertytransition.h>
#include <quorvel/hmitransition.h>
#include <quorvel/hmiviewstate.h>
#include <quorvel/popupstate.h>

#include <QEvent>

#include <array>

namespace HmiPhone {

namespace {

constexpr int RetryFailedPopupTimeout = 3000;
constexpr int ClearAlertRightAway = 1004;

// The alerts this screen knows, with the popups offered to clear and to fix each of them. Alert
// 1004 has no clear popup: clearing it needs no confirmation.
struct AlertPopups
{
    int alertId;
    const QString *clearView;
    const QString *fixView;
};

const std::array<AlertPopups, 10> &alertPopups()
{
    static const std::array<AlertPopups, 10> table = {{
            {1001, &Views::PhoneStatusAlertPopup50, &Views::PhoneStatusAlertPopup60},
            {1002, &Views::PhoneStatusAlertPopup51, &Views::PhoneStatusAlertPopup61},
            {1003, &Views::PhoneStatusAlertPopup52, &Views::PhoneStatusAlertPopup62},
            {1004, nullptr, &Views::PhoneStatusAlertPopup63},
            {1005, &Views::PhoneStatusAlertPopup54, &Views::PhoneStatusAlertPopup64},
            {1006, &Views::PhoneStatusAlertPopup55, &Views::PhoneStatusAlertPopup65},
            {1007, &Views::PhoneStatusAlertPopup56, &Views::PhoneStatusAlertPopup66},
            {1008, &Views::PhoneStatusAlertPopup57, &Views::PhoneStatusAlertPopup67},
            {1009, &Views::PhoneStatusAlertPopup58, &Views::PhoneStatusAlertPopup68},
            {1010, &Views::PhoneStatusAlertPopup59, &Views::PhoneStatusAlertPopup69},
    }};
    return table;
}

// Lets `transition` fire only for the requests about `alertId`.
void acceptOnlyAlert(Quorvel::HmiTransition *transition, int alertId)
{
    QObject::connect(transition, &Quorvel::HmiAbstractTransition::transitionTest, transition,
                     [transition, alertId]() {
                         bool ok = false;
                         const int id = transition->transitionData().toInt(&ok);
                         transition->setAllowTransition(ok && id == alertId);
                     });
}

// The alert id carried by a clear or retry request; -1 when the data holds no usable id.
int alertIdOf(const QVariant &data)
{
    bool ok = false;
    const int id = data.toInt(&ok);
    return ok && id >= 0 ? id : -1;
}

} // namespace

PhoneStatusAlerts::PhoneStatusAlerts(HmiPhoneIntegration *integration, const QString &name,
                                     Quorvel::HmiState *parent)
    : Quorvel::HmiLayeredState(name, parent)
    , m_integration(integration)
    , m_phoneSource(Mavrosk::PhoneSource::instance())
    , m_bluetoothSource(Mavrosk::BluetoothSource::instance())
{
    const QString moduleId = m_integration ? m_integration->moduleId() : ModuleName;
    m_viewState = new Quorvel::HmiViewState(
            Brisken::ViewManager::viewIdentifier(moduleId, QStringLiteral("PhoneStatusAlerts")),
            QStringLiteral("PhoneStatusAlertsViewState"), this);
    m_viewState->setHandlesBackEvent(true);
    setInitialHmiState(m_viewState);

    m_clearAlertPermanentlyTransition
            = new Quorvel::HmiTransition(Events::HmiPhone_ClearAlertPermanentlyRequest, this);
    connect(m_clearAlertPermanentlyTransition, &QAbstractTransition::triggered, this,
            &PhoneStatusAlerts::clearAlertPermanently);
    m_clearAlertForThisCycleTransition
            = new Quorvel::HmiTransition(Events::HmiPhone_ClearAlertForThisCycleRequest, this);
    connect(m_clearAlertForThisCycleTransition, &QAbstractTransition::triggered, this,
            &PhoneStatusAlerts::clearAlertForThisCycle);
    m_callForFixAlertTransition
            = new Quorvel::HmiTransition(Events::HmiPhone_CallForFixAlertRequest, this);
    connect(m_callForFixAlertTransition, &QAbstractTransition::triggered, this,
            &PhoneStatusAlerts::callForFixAlert);
    m_retryDownloadContactTransition
            = new Quorvel::HmiTransition(Events::HmiPhone_RetryDownloadContactRequest, this);
    connect(m_retryDownloadContactTransition, &QAbstractTransition::triggered, this,
            &PhoneStatusAlerts::retryDownloadContact);
    m_phoneBookStatusTransition = new Quorvel::GuardedPropertyTransition(
            m_phoneSource, QStringLiteral("phoneBookStatus"), this);
    connect(m_phoneBookStatusTransition, &Quorvel::GuardedPropertyTransition::transitionTest, this,
            &PhoneStatusAlerts::phoneBookStatusTransitionEventTest);
    m_retryAccessTextMessagesTransition
            = new Quorvel::HmiTransition(Events::HmiPhone_RetryAccessTextMessagesRequest, this);
    connect(m_retryAccessTextMessagesTransition, &QAbstractTransition::triggered, this,
            &PhoneStatusAlerts::retryAccessTextMessages);
    m_messagesDownloadingStatusTransition = new Quorvel::GuardedPropertyTransition(
            m_phoneSource, QStringLiteral("messagesDownloadingStatus"), this);
    connect(m_messagesDownloadingStatusTransition,
            &Quorvel::GuardedPropertyTransition::transitionTest, this,
            &PhoneStatusAlerts::textMessagesStatusTransitionEventTest);

    for (const AlertPopups &alert : alertPopups()) {
        auto *clear = new Quorvel::HmiTransition(Events::HmiPhone_ClearStatusAlertRequest, this);
        acceptOnlyAlert(clear, alert.alertId);
        if (alert.clearView) {
            new Quorvel::PopupState(*alert.clearView, this, 1);
            connect(clear, &QAbstractTransition::triggered,
                    Brisken::RequestPopup(*alert.clearView, QVariant()));
        } else {
            connect(clear, &QAbstractTransition::triggered, this,
                    &PhoneStatusAlerts::clearAlert1004);
        }

        auto *fix = new Quorvel::HmiTransition(Events::HmiPhone_FixStatusAlertRequest, this);
        acceptOnlyAlert(fix, alert.alertId);
        new Quorvel::PopupState(*alert.fixView, this, 1);
        connect(fix, &QAbstractTransition::triggered,
                Brisken::RequestPopup(*alert.fixView, QVariant()));
    }

    auto *contactRetryFailed = new Quorvel::PopupState(Views::PhoneStatusAlertPopup70, this, 1);
    contactRetryFailed->setAutoDismissTimeoutActive(true);
    contactRetryFailed->setAutoDismissTimeoutInterval(RetryFailedPopupTimeout);
    connect(m_phoneBookStatusTransition, &QAbstractTransition::triggered,
            Brisken::RequestPopup(Views::PhoneStatusAlertPopup70, QVariant()));

    auto *smsRetryFailed = new Quorvel::PopupState(Views::PhoneStatusAlertPopup75, this, 1);
    smsRetryFailed->setAutoDismissTimeoutActive(true);
    smsRetryFailed->setAutoDismissTimeoutInterval(RetryFailedPopupTimeout);
    connect(m_messagesDownloadingStatusTransition, &QAbstractTransition::triggered,
            Brisken::RequestPopup(Views::PhoneStatusAlertPopup75, QVariant()));
}

PhoneStatusAlerts::~PhoneStatusAlerts() = default;

void PhoneStatusAlerts::onEntry(QEvent *event)
{
    // A contact retry belongs to one visit of the screen; a message retry outlives it.
    m_contactRetryPending = false;
    m_contactRetryAlertId = -1;
    Quorvel::HmiLayeredState::onEntry(event);
}

void PhoneStatusAlerts::clearAlertPermanently()
{
    const int id = alertIdOf(m_clearAlertPermanentlyTransition->transitionData());
    if (m_phoneSource && id >= 0)
        m_phoneSource->clearAlertPermanently(id);
}

void PhoneStatusAlerts::clearAlertForThisCycle()
{
    const int id = alertIdOf(m_clearAlertForThisCycleTransition->transitionData());
    if (m_phoneSource && id >= 0)
        m_phoneSource->clearAlertForThisCycle(id);
}

void PhoneStatusAlerts::callForFixAlert()
{
    const QVariantMap data = m_callForFixAlertTransition->transitionData().toMap();
    bool ok = false;
    const int id = data.value(QStringLiteral("alertId")).toInt(&ok);
    const QString number = data.value(QStringLiteral("supportPhoneNumber")).toString();
    if (m_phoneSource && ok && id >= 0 && !number.isEmpty())
        m_phoneSource->callForFixAlert(id, number);
}

void PhoneStatusAlerts::retryDownloadContact()
{
    const int id = alertIdOf(m_retryDownloadContactTransition->transitionData());
    if (!m_phoneSource || id < 0)
        return;
    m_contactRetryPending = true;
    m_contactRetryAlertId = id;
    m_phoneSource->retryPhoneBookDownload(m_bluetoothSource ? m_bluetoothSource->phoneDevice() : 0);
}

void PhoneStatusAlerts::retryAccessTextMessages()
{
    const int id = alertIdOf(m_retryAccessTextMessagesTransition->transitionData());
    if (!m_phoneSource || id < 0)
        return;
    m_smsRetryPending = true;
    m_smsRetryAlertId = id;
    m_phoneSource->retrySmsDownload();
}

void PhoneStatusAlerts::phoneBookStatusTransitionEventTest()
{
    if (!m_phoneSource || !m_contactRetryPending || m_contactRetryAlertId < 0)
        return;
    switch (m_phoneSource->phoneBookStatus()) {
    case 1:
    case 2:
    case 3:
        // The retried download is under way or done: the alert has served its purpose.
        m_phoneSource->clearAlertForThisCycle(m_contactRetryAlertId);
        m_phoneBookStatusTransition->setAllowTransition(false);
        break;
    default:
        m_phoneBookStatusTransition->setAllowTransition(true);
        break;
    }
}

void PhoneStatusAlerts::textMessagesStatusTransitionEventTest()
{
    if (!m_phoneSource || !m_smsRetryPending || m_smsRetryAlertId < 0)
        return;
    const int status = m_phoneSource->messagesDownloadingStatus();
    switch (status) {
    case 0:
    case 1:
    case 2:
    case 3:
        // Still in progress, or done (3): no failure to report.
        if (status == 3)
            m_phoneSource->clearAlertForThisCycle(m_smsRetryAlertId);
        m_messagesDownloadingStatusTransition->setAllowTransition(false);
        break;
    default:
        m_messagesDownloadingStatusTransition->setAllowTransition(true);
        break;
    }
}

void PhoneStatusAlerts::clearAlert1004()
{
    if (m_phoneSource)
        m_phoneSource->clearAlertForThisCycle(ClearAlertRightAway);
}

} // namespace HmiPhone
