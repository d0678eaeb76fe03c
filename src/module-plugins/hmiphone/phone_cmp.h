#pragma once

#include <quorvel/hmilayeredstate.h>
#include <quorvel/statelevel.h>

#include <QList>
#include <QPair>

class QAbstractTransition;

namespace Quorvel {
class GuardedPropertyTransition;
class HmiConditionalState;
class HmiState;
class HmiTransition;
class HmiViewState;
class PopupState;
} // namespace Quorvel

namespace Mavrosk {
class BluetoothSource;
class PhoneSource;
class SpeechSource;
} // namespace Mavrosk

namespace HmiPhone {

class DialKeypadState;
class HmiPhoneController;
class HmiPhoneIntegration;
class HmiPhoneSmsManager;
class PhoneBook_Cmp;
class PhoneCall_Cmp;
class PhoneMenuState;
class PhoneSms_Cmp;
class PhoneStatusAlerts;
class RecentCallsViewState;

// The root of the phone's own screens. It owns every phone screen as a child state, chooses the
// first screen from the live phone data whenever the phone is entered, and carries the phone-wide
// transitions that belong to no single screen (keypad, recent calls, Siri, do-not-disturb, call
// ended, reconnection failed, message notification switched on).
class Phone_Cmp : public Quorvel::HmiLayeredState
{
    Q_OBJECT
public:
    using TransitionList = QList<QPair<Quorvel::StateLevel, QAbstractTransition *>>;
    using PopupList = QList<QPair<Quorvel::StateLevel, Quorvel::PopupState *>>;

    Phone_Cmp(HmiPhoneIntegration *integration, HmiPhoneController *controller, const QString &name,
              Quorvel::HmiState *parent);
    ~Phone_Cmp() override;

    Quorvel::HmiState *phoneEmergencyAssist() const { return m_phoneEmergencyAssist; }
    Quorvel::HmiViewState *addPhoneState() const { return m_addPhoneState; }
    PhoneMenuState *phoneIdleState() const { return m_phoneMenuState; }
    DialKeypadState *dialKeypadState() const { return m_dialKeypadState; }
    PhoneStatusAlerts *phoneStatusAlerts() const { return m_phoneStatusAlerts; }
    PhoneCall_Cmp *phoneCallCompositeState() const { return m_phoneCallCmp; }
    PhoneBook_Cmp *phoneBookCompositeState() const { return m_phoneBookCmp; }
    Quorvel::HmiConditionalState *rootConditionalState() const { return m_rootConditionalState; }

    // The text-message states belong to the text-message manager.
    Quorvel::HmiViewState *phoneSmsViewState() const;
    Quorvel::HmiViewState *phoneSmsReplyViewState() const;
    PhoneSms_Cmp *phoneSmsCompositeState() const;

    TransitionList rootHierarchyTransitions() const { return m_rootHierarchyTransitions; }
    PopupList rootHierarchyPopups() const { return m_rootHierarchyPopups; }

public slots:
    void chooseTargetState();
    void makeCall();

private slots:
    void closeCallInProgressIfNeeded(QEvent *event);
    void back();
    void siriActivationRequestTest(QEvent *event);
    void siriActivationRequestFailTest(QEvent *event);
    void siriActivationRequest();
    void siriActivationRequestFailed();
    void doNotDisturbToggled();

protected:
    void onEntry(QEvent *event) override;

private:
    Mavrosk::BluetoothSource *m_bluetoothSource = nullptr;
    Mavrosk::PhoneSource *m_phoneSource = nullptr;
    Mavrosk::SpeechSource *m_speechSource = nullptr;
    HmiPhoneSmsManager *m_smsManager = nullptr;
    Quorvel::HmiConditionalState *m_rootConditionalState = nullptr;
    Quorvel::HmiState *m_phoneEmergencyAssist = nullptr;
    Quorvel::HmiViewState *m_addPhoneState = nullptr;
    PhoneMenuState *m_phoneMenuState = nullptr;
    DialKeypadState *m_dialKeypadState = nullptr;
    RecentCallsViewState *m_recentCallsViewState = nullptr;
    PhoneStatusAlerts *m_phoneStatusAlerts = nullptr;
    PhoneCall_Cmp *m_phoneCallCmp = nullptr;
    PhoneBook_Cmp *m_phoneBookCmp = nullptr;
    Quorvel::GuardedPropertyTransition *m_callEndedTransition = nullptr;
    Quorvel::HmiTransition *m_siriRequestTransition = nullptr;
    Quorvel::HmiTransition *m_siriRequestFailedTransition = nullptr;
    Quorvel::HmiTransition *m_doNotDisturbToggleTransition = nullptr;
    TransitionList m_rootHierarchyTransitions;
    PopupList m_rootHierarchyPopups;
};

} // namespace HmiPhone
