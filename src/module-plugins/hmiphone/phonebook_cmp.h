#pragma once

#include <quorvel/hmilayeredstate.h>
#include <quorvel/statelevel.h>

#include <QList>
#include <QPair>

class QAbstractTransition;
class QEvent;

namespace Quorvel {
class HmiConditionalState;
class HmiState;
class HmiViewState;
class PopupState;
} // namespace Quorvel

namespace Mavrosk {
class BluetoothSource;
class PhoneSource;
} // namespace Mavrosk

namespace Brisken {
class ViewController;
}

namespace HmiPhone {

class HmiPhoneIntegration;

// The contacts screens: empty phonebook, contact list, search and contact details, chosen from the
// phone's phonebook status, and the six phonebook popups that follow the contacts download. The
// popups and two transitions are handed up as root-hierarchy entries so that they work wherever
// the driver is in the HMI.
class PhoneBook_Cmp : public Quorvel::HmiLayeredState
{
    Q_OBJECT
public:
    PhoneBook_Cmp(HmiPhoneIntegration *integration, const QString &name, Quorvel::HmiState *parent);

    QList<QPair<Quorvel::StateLevel, QAbstractTransition *>> rootHierarchyTransitions() const;
    QList<QPair<Quorvel::StateLevel, Quorvel::PopupState *>> rootHierarchyPopups() const;

protected:
    void onEntry(QEvent *event) override;
    void onExit(QEvent *event) override;

private slots:
    void chooseTargetState();
    void checkPhonebookStatus();
    void onPhoneBookDownloadCanceled();
    void phoneBookStatusCheckForEmpty();
    void resetPhoneBookIfNeeded();

private:
    // The next download failure is the first one of the component's life.
    bool m_firstDownloadFailure = true;
    // The phone has been asked to reset the phonebook view during this visit.
    bool m_phoneBookResetDone = false;

    Mavrosk::PhoneSource *m_phoneSource = nullptr;
    Mavrosk::BluetoothSource *m_bluetoothSource = nullptr;
    Brisken::ViewController *m_viewController = nullptr;
    Quorvel::HmiConditionalState *m_conditionalState = nullptr;
    Quorvel::HmiViewState *m_emptyView = nullptr;
    Quorvel::HmiViewState *m_listView = nullptr;
    Quorvel::HmiViewState *m_searchView = nullptr;
    Quorvel::HmiViewState *m_contactDetailsView = nullptr;
    QList<QPair<Quorvel::StateLevel, QAbstractTransition *>> m_rootHierarchyTransitions;
    QList<QPair<Quorvel::StateLevel, Quorvel::PopupState *>> m_rootHierarchyPopups;
};

} // namespace HmiPhone
