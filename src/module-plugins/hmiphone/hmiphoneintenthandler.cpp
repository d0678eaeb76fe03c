#include "hmiphoneintenthandler.h"

#include "hmiphonecontroller.h"
#include "hmiphoneevents.h"
#include "hmiphoneintegration.h"
#include "hmiphonenumbers.h"
#include "hmiphoneviews.h"

#include <brisken/requestview.h>
#include <mavrosk/bluetoothsource.h>
#include <mavrosk/phonesource.h>
#include <quorvel/hmievent.h>
#include <quorvel/statemachine.h>

namespace HmiPhone {

namespace {

using namespace IntentAction;

// The actions that only post an event to the HMI state machine.
QString eventForAction(int action)
{
    switch (action) {
    case AddPhone:
        return Events::HmiPhone_AddPhoneRequest;
    case StatusBarAlerts:
        return Events::HmiPhone_ShowStatusBarAlertsRequest;
    case SiriNotEnabled:
        return Events::HmiPhone_ShowSiriNotEnabledRequest;
    case PhoneRoot:
        return Events::HmiPhone_RootStateRequest;
    case PhoneBookStatusCheck:
        return Events::HmiPhone_PhoneBookStatusCheck;
    default:
        return QString();
    }
}

} // namespace

HmiPhoneIntentHandler::HmiPhoneIntentHandler(HmiPhoneController *controller, QObject *parent)
    : Taldris::HmiIntentHandler(parent)
    , m_controller(controller)
{
    for (int action : {CallNumber, AddPhone, StatusBarAlerts, SiriNotEnabled, PhoneRoot,
                       PhoneBookStatusCheck, PhoneSettings, ManageContactsSettings})
        addAction(action);
    connect(Mavrosk::BluetoothSource::instance(), &Mavrosk::BluetoothSource::deviceConnectedChanged,
            this, &HmiPhoneIntentHandler::bluetoothDeviceConnectionChanged);
}

bool HmiPhoneIntentHandler::performAction(int action, const QVariantList &arguments, bool flag,
                                          const QVariant &extra) const
{
    switch (action) {
    case CallNumber: {
        if (arguments.isEmpty() || !Mavrosk::BluetoothSource::instance()->deviceConnected())
            return false;
        if (!m_controller) {
            qCWarning(hmiphone) << "HmiPhoneIntentHandler: the controller is gone, no call placed";
            return false;
        }
        // A first argument that gives no number (a list, a map, an empty string) would dial
        // nothing while reporting a call as started: refuse it and leave the entered number.
        const QVariant &number = arguments.first();
        if (!number.canConvert<QString>() || number.toString().isEmpty())
            return false;
        m_controller->phoneSource()->setCallNumberEntered(number.toString());
        m_controller->makeCall();
        return true;
    }
    case AddPhone:
    case StatusBarAlerts:
    case SiriNotEnabled:
    case PhoneRoot:
    case PhoneBookStatusCheck:
        Quorvel::StateMachine::instance()->postEvent(new Quorvel::HmiEvent(eventForAction(action)));
        return true;
    case PhoneSettings:
        Brisken::RequestView(Views::PhoneSettingsRoot, QVariant(), flag, extra).run();
        return true;
    case ManageContactsSettings:
        Brisken::RequestView(Views::PhoneManageContactsSettings, QVariant(), flag, extra).run();
        return true;
    default:
        return false;
    }
}

bool HmiPhoneIntentHandler::isActionEnabled(int action) const
{
    return action == CallNumber && Mavrosk::BluetoothSource::instance()->deviceConnected();
}

void HmiPhoneIntentHandler::bluetoothDeviceConnectionChanged(bool connected)
{
    emit actionStatusChanged(CallNumber, connected);
}

} // namespace HmiPhone
