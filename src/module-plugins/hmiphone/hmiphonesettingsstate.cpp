#include "hmiphonesettingsstate.h"

#include "hmiphonecontroller.h"
#include "hmiphoneevents.h"
#include "hmiphoneintegration.h"
#include "hmiphonenumbers.h"
#include "hmiphoneviews.h"

#include <brisken/requestpopup.h>
#include <brisken/requestview.h>
#include <mavrosk/bluetoothsource.h>
#include <mavrosk/phonesource.h>
#include <quorvel/guardedpropertychangetransition.h>
#include <quorvel/guardedpropertytransition.h>
#include <quorvel/hmiconditionalstate.h>
#include <quorvel/hmilayeredstate.h>
#include <quorvel/hmitransition.h>
#include <quorvel/hmiviewstate.h>
#include <quorvel/popupstate.h>
#include <taldris/hmiintentmanager.h>
#include <taldris/hmiintentrequest.h>

#include <QEvent>

namespace HmiPhone {

namespace {

// A page opened by an event while the settings are active: a targetless transition of the
// settings state whose firing requests the page's view.
void addPageRequest(Quorvel::HmiState *settings, const QString &event, QAbstractState *page)
{
    auto *transition = new Quorvel::HmiTransition(event, settings);
    QObject::connect(transition, &QAbstractTransition::triggered, transition,
                     Brisken::RequestView(page, QVariant(), false, QVariant()));
}

} // namespace

HmiPhoneSettingsState::HmiPhoneSettingsState(HmiPhoneController *controller,
                                             Quorvel::HmiState *parent)
    : Quorvel::HmiState(Views::PhoneSettingsRoot, parent)
{
    m_entryConditionalState = new Quorvel::HmiConditionalState(
            Views::PhoneSettingsRoot + QStringLiteral("ConditionalState"), this);
    connect(m_entryConditionalState, &Quorvel::HmiConditionalState::conditionTest, this,
            &HmiPhoneSettingsState::chooseTargetState);

    m_backConditionalState = new Quorvel::HmiConditionalState(
            QStringLiteral("PhoneSettingsBackConditionalState"), this);
    connect(m_backConditionalState, &Quorvel::HmiConditionalState::conditionTest, this,
            &HmiPhoneSettingsState::choosePhoneSettingsTargetState);

    m_limboState = Quorvel::HmiViewState::createDummyViewState(
            Views::PhoneSettings + QStringLiteral("Limbo"), this, -1, false);

    // Going back to the page decides again: the phone may have gone meanwhile.
    m_phoneSettingsViewState = new Quorvel::HmiViewState(Views::PhoneSettings, this);
    m_phoneSettingsViewState->setBackStackStateId(m_backConditionalState->objectName(), false);
    m_phoneSettingsViewState->setHandlesBackEvent(true);

    auto *manageContactsLayer
            = new Quorvel::HmiLayeredState(QStringLiteral("PhoneManageContactsSettings"), this);
    auto *manageContacts
            = new Quorvel::HmiViewState(Views::PhoneManageContactsSettings, manageContactsLayer);
    manageContacts->setHandlesBackEvent(true);
    manageContactsLayer->setInitialHmiState(manageContacts);
    addPageRequest(this, Events::HmiPhone_RequestPhoneManageContactsSettingsPage, manageContacts);

    auto *deleteAllContacts
            = new Quorvel::PopupState(Views::PhoneDeleteAllContactsPopup, manageContactsLayer, 1);
    auto *deleteAllTransition
            = new Quorvel::HmiTransition(Events::HmiPhone_RequestPhoneDeleteAllContactsPopup, this);
    connect(deleteAllTransition, &QAbstractTransition::triggered, deleteAllTransition,
            Brisken::RequestPopup(deleteAllContacts, QVariant()));

    auto *ringtone = new Quorvel::HmiViewState(Views::PhoneRingtoneAboutSettings, this);
    ringtone->setHandlesBackEvent(true);
    addPageRequest(this, Events::HmiPhone_RequestPhoneRingtoneSettingsPage, ringtone);
    // A ringtone preview never outlives its page, whichever way the page is left.
    if (controller)
        connect(ringtone, &QAbstractState::exited, controller,
                &HmiPhoneController::stopPlayRingtone);

    auto *textMessageNotification
            = new Quorvel::HmiViewState(Views::PhoneTextMessageNotificationSettings, this);
    textMessageNotification->setHandlesBackEvent(true);
    addPageRequest(this, Events::HmiPhone_requestPhoneTextMessageNotificationSettingsPage,
                   textMessageNotification);

    // Every change of the phonebook status has the phone check it again (through its own intent
    // handler, which posts the check event).
    auto *phoneBookStatusTransition = new Quorvel::GuardedPropertyTransition(
            Mavrosk::PhoneSource::instance(), "phoneBookStatus", this);
    phoneBookStatusTransition->setAllowTransitionDefault(true);
    connect(phoneBookStatusTransition, &QAbstractTransition::triggered, phoneBookStatusTransition,
            Taldris::HmiIntentRequest(IntentAction::PhoneBookStatusCheck, QVariantList(), false,
                                      false, QVariant()));

    setInitialHmiState(m_entryConditionalState);

    auto *disconnected = new Quorvel::GuardedPropertyChangeTransition(
            Mavrosk::BluetoothSource::instance(), "deviceConnected", QVariantList{true}, false,
            m_phoneSettingsViewState);
    QAbstractState *hostInitialState = parent ? parent->initialHmiState() : nullptr;
    if (!hostInitialState)
        qCCritical(hmiphone,
                   "HmiPhoneSettingsState: the host state has no initial state to return to "
                   "when the phone disconnects");
    disconnected->setTargetState(hostInitialState);
}

// With no device, the Bluetooth module off or no phone connected, the Bluetooth screens of other
// modules take over from the phone settings.
void HmiPhoneSettingsState::chooseTargetState()
{
    auto *bluetooth = Mavrosk::BluetoothSource::instance();
    int handOver = 0;
    if (bluetooth->deviceListCount() <= 0)
        handOver = IntentAction::PairPhone;
    else if (bluetooth->moduleStatus() == 0)
        handOver = IntentAction::BluetoothModuleOff;
    else if (!bluetooth->deviceConnected())
        handOver = IntentAction::BluetoothDevices;

    if (!handOver) {
        m_entryConditionalState->setTargetState(m_phoneSettingsViewState);
        return;
    }
    m_entryConditionalState->setTargetState(m_limboState);
    Taldris::HmiIntentManager::instance()->requestAction(handOver);
}

void HmiPhoneSettingsState::choosePhoneSettingsTargetState()
{
    if (Mavrosk::BluetoothSource::instance()->deviceConnected())
        m_backConditionalState->setTargetState(m_phoneSettingsViewState);
    else
        m_backConditionalState->setTargetState(parentState());
}

} // namespace HmiPhone
