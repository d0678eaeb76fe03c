#include "phonebook_cmp.h"

#include "hmiphoneevents.h"
#include "hmiphoneviews.h"

#include <brisken/requestpopup.h>
#include <brisken/viewcontroller.h>
#include <mavrosk/bluetoothsource.h>
#include <mavrosk/phonesource.h>
#include <quorvel/guardedpropertytransition.h>
#include <quorvel/hmiconditionalstate.h>
#include <quorvel/hmisignaltransition.h>
#include <quorvel/hmitransition.h>
#include <quorvel/hmiviewstate.h>
#include <quorvel/popupstate.h>

#include <QEvent>
#include <QStringList>

namespace HmiPhone {

namespace {

// Phonebook status as the phone reports it.
enum PhoneBookStatus {
    PhoneBookDownloaded = 1,
    PhoneBookDownloading = 2,
    PhoneBookEmpty = 3,
    PhoneBookAccessNotGranted = 4,
    PhoneBookDownloadFailed = 5,
};

const int WaitingForResponseTimeout = 30000;

} // namespace

PhoneBook_Cmp::PhoneBook_Cmp(HmiPhoneIntegration *integration, const QString &name,
                             Quorvel::HmiState *parent)
    : Quorvel::HmiLayeredState(name, parent)
    , m_phoneSource(Mavrosk::PhoneSource::instance())
    , m_bluetoothSource(Mavrosk::BluetoothSource::instance())
    , m_viewController(Brisken::ViewController::instance())
{
    Q_UNUSED(integration)

    m_emptyView = new Quorvel::HmiViewState(Views::PhoneBookEmpty,
                                            QStringLiteral("PhoneBookEmptyViewState"), this);
    m_emptyView->setHandlesBackEvent(true);

    m_listView = new Quorvel::HmiViewState(Views::PhoneBookList,
                                           QStringLiteral("PhoneBookListViewState"), this);

    m_searchView = new Quorvel::HmiViewState(Views::PhoneBookSearch,
                                             QStringLiteral("PhoneBookSearchViewState"), this);
    m_searchView->setHandlesBackEvent(true);
    connect(m_searchView, &QState::entered, this, &PhoneBook_Cmp::resetPhoneBookIfNeeded);

    m_contactDetailsView = new Quorvel::HmiViewState(
            Views::ContactDetails, QStringLiteral("ContactDetailsViewState"), this);
    m_contactDetailsView->setHandlesBackEvent(true);
    connect(m_contactDetailsView, &QState::entered, this, &PhoneBook_Cmp::resetPhoneBookIfNeeded);

    // The phonebook popups belong to no screen: the root hierarchy adopts them, so that a download
    // is followed wherever the driver is.
    const QStringList popupViews
            = {Views::PhoneBookDownloading,    Views::PhoneBookAccessNotGranted,
               Views::PhoneBookDownloadFailed, Views::PhoneBookDownloadFailedAgain,
               Views::PhoneBookAutoDownload,   Views::PhoneBookWaitingForResponseFromPhone};
    for (const QString &view : popupViews) {
        auto *popup = new Quorvel::PopupState(view, 1);
        if (view == Views::PhoneBookWaitingForResponseFromPhone) {
            popup->setAutoDismissTimeoutActive(true);
            popup->setAutoDismissTimeoutInterval(WaitingForResponseTimeout);
        }
        m_rootHierarchyPopups.append(qMakePair(Quorvel::StateLevel3, popup));
    }

    m_conditionalState = new Quorvel::HmiConditionalState(
            QStringLiteral("PhoneBook_CmpConditionalState"), this);
    connect(m_conditionalState, &Quorvel::HmiConditionalState::conditionTest, this,
            &PhoneBook_Cmp::chooseTargetState);

    // Back from the list leaves the contacts for the screen that contains them.
    m_listView->createDirectBackTransition(parent);
    m_listView->setBackStackStateId(m_conditionalState->objectName(), false);

    auto *showSearch = new Quorvel::HmiTransition(Events::HmiPhone_ShowContactsSearch, m_listView);
    showSearch->setTargetState(m_searchView);

    auto *searchReady = new Quorvel::HmiSignalTransition(
            m_phoneSource, SIGNAL(phonebookSearchReady()), m_searchView);
    searchReady->setTargetState(m_listView);

    auto *detailsReady = new Quorvel::HmiSignalTransition(
            m_phoneSource, SIGNAL(phonebookContactDetailsReady()), m_listView);
    detailsReady->setTargetState(m_contactDetailsView);

    // Every status change while the contacts are shown chooses the view and the popups again.
    // The change stays inside the contacts: as an external transition it would leave the whole
    // component and tell the phone that the driver left the phonebook at every status change.
    auto *statusChanged = new Quorvel::GuardedPropertyTransition(m_phoneSource, "phoneBookStatus",
                                                                 exclusiveState());
    statusChanged->setAllowTransitionDefault(true);
    statusChanged->setTransitionType(QAbstractTransition::InternalTransition);
    statusChanged->setTargetState(m_conditionalState);

    auto *waitingForResponse = new Quorvel::HmiTransition(
            Events::HmiPhone_ShowPhoneBookWaitingForResponseRequest, this);
    connect(waitingForResponse, &QAbstractTransition::triggered, this,
            Brisken::RequestPopup(Views::PhoneBookWaitingForResponseFromPhone, QVariant()));

    connect(m_conditionalState, &QState::entered, this, &PhoneBook_Cmp::checkPhonebookStatus);

    auto *statusCheck = new Quorvel::HmiTransition(Events::HmiPhone_PhoneBookStatusCheck);
    connect(statusCheck, &QAbstractTransition::triggered, this,
            &PhoneBook_Cmp::phoneBookStatusCheckForEmpty);
    m_rootHierarchyTransitions.append(qMakePair(Quorvel::StateLevel3, statusCheck));

    auto *downloadCanceled = new Quorvel::HmiTransition(Events::HmiPhone_PhoneBookDownloadCanceled);
    connect(downloadCanceled, &QAbstractTransition::triggered, this,
            &PhoneBook_Cmp::onPhoneBookDownloadCanceled);
    m_rootHierarchyTransitions.append(qMakePair(Quorvel::StateLevel3, downloadCanceled));

    setInitialHmiState(m_conditionalState);
}

QList<QPair<Quorvel::StateLevel, QAbstractTransition *>> PhoneBook_Cmp::rootHierarchyTransitions()
        const
{
    return m_rootHierarchyTransitions;
}

QList<QPair<Quorvel::StateLevel, Quorvel::PopupState *>> PhoneBook_Cmp::rootHierarchyPopups() const
{
    return m_rootHierarchyPopups;
}

void PhoneBook_Cmp::onEntry(QEvent *event)
{
    Quorvel::HmiLayeredState::onEntry(event);
}

void PhoneBook_Cmp::onExit(QEvent *event)
{
    Quorvel::HmiLayeredState::onExit(event);
    if (m_phoneSource)
        m_phoneSource->exitingPhoneBook();
    // The next visit asks the phone for a fresh phonebook view again.
    m_phoneBookResetDone = false;
}

void PhoneBook_Cmp::chooseTargetState()
{
    if (!m_phoneSource)
        return;

    switch (m_phoneSource->phoneBookStatus()) {
    case 0:
    case PhoneBookDownloading:
    case PhoneBookEmpty:
    case PhoneBookAccessNotGranted:
    case PhoneBookDownloadFailed:
    case 6:
        m_conditionalState->setTargetState(m_emptyView);
        m_phoneBookResetDone = false;
        break;
    default:
        resetPhoneBookIfNeeded();
        m_conditionalState->setTargetState(m_listView);
        break;
    }
}

void PhoneBook_Cmp::checkPhonebookStatus()
{
    if (!m_phoneSource || !m_bluetoothSource || !m_bluetoothSource->deviceConnected())
        return;

    const auto request
            = [this](const QString &view) { m_viewController->requestPopup(view, QVariant()); };
    const auto dismiss = [this](const QStringList &views) {
        for (const QString &view : views)
            m_viewController->dismissPopup(view);
    };

    const int status = m_phoneSource->phoneBookStatus();
    const bool noPhoneBookYet = status != PhoneBookDownloaded && status != PhoneBookDownloading;
    if (noPhoneBookYet) {
        // With automatic download off the driver is asked first; no status popup is shown.
        if (!m_phoneSource->automaticContactDownload()) {
            request(Views::PhoneBookAutoDownload);
            return;
        }
        dismiss({Views::PhoneBookAutoDownload});
        request(Views::PhoneBookWaitingForResponseFromPhone);
    }

    switch (status) {
    case PhoneBookDownloaded:
        dismiss({Views::PhoneBookDownloadFailed, Views::PhoneBookDownloadFailedAgain,
                 Views::PhoneBookAutoDownload, Views::PhoneBookDownloading,
                 Views::PhoneBookAccessNotGranted, Views::PhoneBookWaitingForResponseFromPhone});
        break;
    case PhoneBookDownloading:
        dismiss({Views::PhoneBookDownloadFailed, Views::PhoneBookDownloadFailedAgain,
                 Views::PhoneBookAccessNotGranted, Views::PhoneBookAutoDownload,
                 Views::PhoneBookWaitingForResponseFromPhone});
        request(Views::PhoneBookDownloading);
        break;
    case PhoneBookEmpty:
        dismiss({Views::PhoneBookDownloadFailed, Views::PhoneBookDownloadFailedAgain,
                 Views::PhoneBookDownloading, Views::PhoneBookWaitingForResponseFromPhone});
        break;
    case PhoneBookAccessNotGranted:
        dismiss({Views::PhoneBookDownloadFailed, Views::PhoneBookDownloadFailedAgain,
                 Views::PhoneBookDownloading, Views::PhoneBookWaitingForResponseFromPhone});
        request(Views::PhoneBookAccessNotGranted);
        break;
    case PhoneBookDownloadFailed:
        if (m_firstDownloadFailure) {
            dismiss({Views::PhoneBookDownloading, Views::PhoneBookWaitingForResponseFromPhone});
            request(Views::PhoneBookDownloadFailed);
            m_firstDownloadFailure = false;
        } else {
            dismiss({Views::PhoneBookDownloading, Views::PhoneBookWaitingForResponseFromPhone,
                     Views::PhoneBookDownloadFailed});
            request(Views::PhoneBookDownloadFailedAgain);
        }
        break;
    default:
        break;
    }
}

void PhoneBook_Cmp::onPhoneBookDownloadCanceled()
{
    if (isActive()) {
        m_viewController->back(1);
    } else if (m_phoneSource) {
        m_phoneSource->exitingPhoneBook();
    }
}

void PhoneBook_Cmp::phoneBookStatusCheckForEmpty()
{
    if (m_phoneSource && m_phoneSource->phoneBookStatus() == PhoneBookEmpty) {
        for (const QString &view :
             {Views::PhoneBookDownloadFailed, Views::PhoneBookDownloadFailedAgain,
              Views::PhoneBookDownloading, Views::PhoneBookWaitingForResponseFromPhone})
            m_viewController->dismissPopup(view);
        return;
    }
    checkPhonebookStatus();
}

void PhoneBook_Cmp::resetPhoneBookIfNeeded()
{
    if (m_phoneBookResetDone || !m_phoneSource)
        return;
    m_phoneSource->resetPhoneBook();
    m_phoneBookResetDone = true;
}

} // namespace HmiPhone
