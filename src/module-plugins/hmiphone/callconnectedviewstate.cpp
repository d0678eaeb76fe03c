#include "callconnectedviewstate.h"

#include "hmiphoneviews.h"

#include <brisken/datastore.h>
#include <brisken/statusbarcontroller.h>
#include <mavrosk/phonesource.h>
#include <quorvel/namedstate.h>

namespace HmiPhone {

namespace {
// The phone screens from which an accepted call is announced when its call view opens.
bool isPhoneCallOrigin(const QString &view)
{
    return view == Views::DialKeypad || view == Views::RecentCalls || view == Views::PhoneMenu;
}
} // namespace

CallConnectedViewState::CallConnectedViewState(const QString &viewId, const QString &name,
                                               Quorvel::HmiState *parent)
    : Quorvel::HmiViewState(viewId, name, parent)
    , m_phoneSource(Mavrosk::PhoneSource::instance())
{ }

void CallConnectedViewState::onEntry(QEvent *event)
{
    auto *statusBar = Brisken::DataStore::get<Brisken::StatusBarController>(
            QStringLiteral("StatusBarController"));
    if (statusBar && m_phoneSource) {
        if (m_phoneSource->dialingInProgress()) {
            statusBar->requestTransientWidget(Transients::PhoneOutgoingDialing, 0);
        } else if (m_phoneSource->callConnected()) {
            const auto *previous = qobject_cast<Quorvel::HmiViewState *>(
                    Quorvel::NamedState::stateForName(Quorvel::HmiViewState::lastKnownViewState()));
            if (previous && isPhoneCallOrigin(previous->targetView()))
                statusBar->requestTransientWidget(Transients::PhoneAcceptedIncomingCall, 0);
        }
    }
    Quorvel::HmiViewState::onEntry(event);
}

} // namespace HmiPhone
