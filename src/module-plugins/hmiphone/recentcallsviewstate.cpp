#include "recentcallsviewstate.h"

#include "hmiphoneevents.h"
#include "hmiphoneviews.h"

#include <brisken/popuputils.h>
#include <brisken/requestpopup.h>
#include <brisken/viewcontroller.h>
#include <mavrosk/phonesource.h>
#include <quorvel/guardedpropertychangetransition.h>
#include <quorvel/guardedsignaltransition.h>
#include <quorvel/hmitransition.h>
#include <quorvel/hmiviewstate.h>
#include <quorvel/popupstate.h>
#include <quorvel/statemachine.h>

#include <QEvent>

namespace HmiPhone {

namespace {

// Recent-call list status as the phone reports it.
enum RecentCallListStatus {
    ListDownloadFailed = 0,
    ListAvailable = 1,
    ListDownloading = 3,
    ListFailedCall = 4,
    ListRetryError = 5,
    ListDownloadFailedFinal = 6,
};

} // namespace

RecentCallsViewState::RecentCallsViewState(HmiPhoneIntegration *integration, const QString &viewId,
                                           const QString &name, Quorvel::HmiState *parent)
    : Quorvel::HmiLayeredState(name, parent)
{
    Q_UNUSED(integration)

    m_listView = new Quorvel::HmiViewState(viewId, name + QLatin1String("View"), this);
    setInitialHmiState(m_listView);

    m_phoneSource = Mavrosk::PhoneSource::instance();
    m_viewController = Brisken::ViewController::instance();

    auto *downloading = new Quorvel::PopupState(Views::RecentCallsDownloading, this, 1);
    auto *downloadFailed = new Quorvel::PopupState(Views::RecentCallsDownloadFailed, this, 1);
    auto *retryError = new Quorvel::PopupState(Views::RecentCallsRetryError, this, 1);
    auto *failedCall = new Quorvel::PopupState(Views::RecentCallsFailedCallKOVA, this, 1);

    const QList<QPair<int, Quorvel::PopupState *>> statusPopups
            = {{ListDownloadFailed, downloadFailed},
               {ListDownloadFailedFinal, downloadFailed},
               {ListDownloading, downloading},
               {ListFailedCall, failedCall},
               {ListRetryError, retryError}};
    for (const auto &statusPopup : statusPopups) {
        auto *toStatus = new Quorvel::GuardedPropertyChangeTransition(
                m_phoneSource, "recentCallListStatus", QVariantList(), statusPopup.first, this);
        connect(toStatus, &QAbstractTransition::triggered, this,
                Brisken::RequestPopup(statusPopup.second, QVariant()));
    }

    auto *statusChanged = new Quorvel::GuardedSignalTransition(
            m_phoneSource, SIGNAL(recentCallListStatusChanged(int)), this);
    connect(statusChanged, &Quorvel::GuardedSignalTransition::transitionTest, this,
            &RecentCallsViewState::dismissingTransitionTest);
    connect(statusChanged, &QAbstractTransition::triggered, this,
            &RecentCallsViewState::downloadCallsIfAvailable);

    auto *requestList = new Quorvel::HmiTransition(Events::HmiPhone_RequestRecentCallList, this);
    connect(requestList, &QAbstractTransition::triggered, this,
            &RecentCallsViewState::handleRequestRecentCallList);

    // A status change closes whatever status popup is shown; the popup of the new status, if
    // any, is requested by its own transition for the same change.
    Brisken::PopupUtils::makeExclusive(statusChanged,
                                       {downloading, downloadFailed, retryError, failedCall});
}

void RecentCallsViewState::setHandlesBackEvent(bool handles)
{
    m_listView->setHandlesBackEvent(handles);
}

void RecentCallsViewState::onEntry(QEvent *event)
{
    Quorvel::HmiLayeredState::onEntry(event);

    QString popup;
    switch (m_phoneSource->recentCallListStatus()) {
    case ListDownloading:
        popup = Views::RecentCallsDownloading;
        break;
    case ListFailedCall:
        popup = Views::RecentCallsFailedCallKOVA;
        break;
    case ListRetryError:
        popup = Views::RecentCallsRetryError;
        break;
    case ListDownloadFailedFinal:
        popup = Views::RecentCallsDownloadFailed;
        break;
    default:
        break;
    }
    if (!popup.isEmpty())
        Brisken::RequestPopup(popup, QVariant())();

    // A return by the back event keeps the list type the driver chose.
    if (!event || event->type() != Quorvel::StateMachine::BackEventType)
        m_phoneSource->setCurrentRecentCallListType(0);

    downloadCallsIfAvailable();
}

void RecentCallsViewState::dismissingTransitionTest()
{
    // Every status change closes the status popups.
    if (auto *transition = qobject_cast<Quorvel::GuardedSignalTransition *>(sender()))
        transition->setAllowTransition(true);
}

void RecentCallsViewState::downloadCallsIfAvailable()
{
    if (m_phoneSource->recentCallListStatus() == ListAvailable)
        m_phoneSource->downloadRecentCallsList();
}

void RecentCallsViewState::handleRequestRecentCallList()
{
    m_phoneSource->downloadRecentCallsList(m_phoneSource->currentRecentCallListType());
}

} // namespace HmiPhone
