#pragma once

#include <quorvel/statelevel.h>

#include <QHash>
#include <QList>
#include <QObject>
#include <QPair>
#include <QPointer>

class QAbstractTransition;
class QEvent;
class QTimer;

namespace Quorvel {
class PopupState;
class HmiTransition;
class GuardedSignalTransition;
class GuardedPropertyTransition;
class KeySignalTransition;
} // namespace Quorvel

namespace Brisken {
class ViewController;
class ViewManager;
} // namespace Brisken

namespace Mavrosk {
class BluetoothSource;
class PhoneSource;
class SpeechSource;
class KeySource;
class NavSource;
class ProjectionSource;
} // namespace Mavrosk

namespace Taldris {
class HardKeyController;
} // namespace Taldris

namespace HmiPhone {

class GlobalChart;
class HmiPhoneController;
class HmiPhonePopupManager;
class Phone_Cmp;

// The phone's always-armed part of the HMI state machine: the global popup states (incoming and
// waiting call, call ended, missed call, errors, text-message alerts, ...) and the transitions
// that react to calls, keys, device and message events whatever screen is shown. They are built
// once by produceGlobalStateAndTransitions() and handed to the framework's root hierarchy through
// the two lists; the handler then only reacts through its slots.
class HmiPhoneGlobalStateHandler : public QObject
{
    Q_OBJECT
public:
    using TransitionList = QList<QPair<Quorvel::StateLevel, QAbstractTransition *>>;
    using PopupList = QList<QPair<Quorvel::StateLevel, Quorvel::PopupState *>>;

    HmiPhoneGlobalStateHandler(HmiPhoneController *controller, QObject *parent);

    void produceGlobalStateAndTransitions(HmiPhone::Phone_Cmp *phoneCmp);

    TransitionList rootHierarchyTransitions() const;
    PopupList rootHierarchyPopups() const;

signals:
    void transitionFromPhoneManageContactsSettingsStatusChanged(bool);

private slots:
    // Call reactions
    void incomingCall();
    void incomingCallOutbound();
    void rejectRingingCallOnDoNotDisturb();
    void acceptIncomingCall();
    void rejectIncomingCall();
    void endCall();
    void stopAnswering();
    void showCallEnded();
    void callEndConfirmed();
    void redialRequest();
    void cancelRedialRequest();
    void handleRoamingWarning();
    void roamingCallConfirmed();
    void roamingCallCancelled();
    void handleDialingFailure();
    void hideDialingFailed();
    void hideCallKeyPad();
    void onMissedCallPopupExited();
    void addPhoneRequested();

    // Transient messages of the status bar
    void showPhoneAcceptedCallTransientMessage();
    void showPhoneRejectedCallTransientMessage();
    void showPhoneCallEndedTransientMessage();
    void showPhoneConnectedOutgoingCallTransientMessage();
    void showPhoneDialingTransientMessage();
    void hidePhoneDialingTransientMessage();
    void showPhonebookDownloadInitiatedTransientMessage();
    void hidePhonePhonebookDownloadInitiatedTransientMessage();
    void showPhonebookDownloadCompleteTransientMessage();

    // Text messages: new-message alerts and their bookkeeping, reading aloud, replying and
    // sending, and the checks before the message screens open
    void processNewTextMessageAlert();
    void enableSingleMessageState();
    void resetAlertStateOnSingleMessageTimeout();
    void enableMultipleMessagesState();
    void resetAlertStateOnMultipleMessagesTimeout();
    void hearNewTextMessageAlert();
    void stopHearNewTextMessageAlert();
    void hideNewTextMessageAlert();
    void viewNewTextMessageAlert();
    void handleSmsNewTextHearitRequest();
    void handleListenMessageRequest();
    void handleRequestedMessageDetailsReady();
    void handleVRSendReplyMessage();
    void handleSendTextMessageRequest();
    void handleRetrySendTextMessage();
    void handleSendTextMessageSuccess();
    void handleSendTextMessageFailure();
    void handleSendTextMessageNetworkFailure();
    void handleSendMessageNoResponseFromPhone();
    void smsCheckPrerequisites();
    void smsCheckStatus();
    void checkSmsStatus();

    // Link loss and reconnection
    void handleLinklossReconnectSuccessTransition();
    void showPhoneAttemptingReconnectTransient();
    void showPhoneConnectSuccessTransient();

    // Extended mode: the minute countdown while "PhoneCallStandByModePopup" is concerned
    void handleExtendedModeChangeRequest();
    void clearExtendedModeTimer();
    void extendedModeTimerMinuteElapsed();

    // Contacts download and its retries
    void handlePhonebookDownloadCompleteDisplay();
    void handleRetryPhnBookDownloadContactAccess();
    void handleRetryPhnBookAutomaticContactDownload();

    // Not connected by the module; reachable through the meta-object
    void retryPhoneBookDownload();
    void retrySmsDownload();
    void phoneFixHintTimeout();

    // Phone keys: what each key does in the current call situation
    void processAcceptOrSeek();
    void processRejectOrSeek();
    void processPhoneSendAcceptKey();
    void processPhoneEndRejectKey();
    void processRejectKeyPhone();
    void processMultipartySinglePressPhone();
    void processSWCAcceptOrSeek();
    void processSWCRejectOrSeek();
    void processSWCAcceptOrSeekLongPress();
    void processSWCAcceptOrSeekLongRelease();
    void processSWCRejectOrSeekLongPress();
    void processSWCRejectOrSeekLongRelease();

    // Guard tests: each allows or blocks the transition that asks
    void incomingCallTransitionEventTest(QEvent *event);
    void incomingCallKeySignalTransitionEventTest(QEvent *event);
    void missedCallPresentTransitionEventTest(QEvent *event);
    void incomingCallonPrjDisconnectTransitionEventTest(QEvent *event);
    void missedCallTransitionEventTest(QEvent *event);
    void callConnectedTransitionEventTest(QEvent *event);
    void redialKeyTransitionEventTest(QEvent *event);
    void phoneKeyTransitionEventTest(QEvent *event);
    void phoneMultipartySwitchKeyTransitionEventTest(QEvent *event);
    void phoneEndCallKeyTransitionEventTest(QEvent *event);
    void isProjectionNotActive();
    void batteryLevelTransitionEventTest(QEvent *event);
    void standbyTransitionEventTest(QEvent *event);
    void showPhoneConnectionLostTest(QEvent *event);
    void showPhoneAttemptingReconnectTest(QEvent *event);
    void showPhoneDoorOpenLinklossTest(QEvent *event);
    void showPhoneDoorNoCallOpenLinklossTest(QEvent *event);
    void newTextMessageTest(QEvent *event);
    void multipleNewTextMessagesTest(QEvent *event);
    void requestedMessageDetailsReadyTest(QEvent *event);
    void smsNewTextHearitEventTest(QEvent *event);
    void dtmfKeyPressNoResponseErrorEventTest(QEvent *event);
    void phoneAudioTransferErrorEventTest(QEvent *event);
    void phoneAudioHandsfreeErrorEventTest(QEvent *event);
    void phoneAudioInternalErrorEventTest(QEvent *event);
    void smsMessagesInMemoryTest(QEvent *event);
    void smsMessagesNotInMemoryTest(QEvent *event);
    void smsMessageNotificationEnabledTest(QEvent *event);
    void smsMessageNotificationNotEnabledTest(QEvent *event);

private:
    void createPopupStates();
    void buildTransitionChart(GlobalChart &chart, Phone_Cmp *phoneCmp);
    Quorvel::PopupState *popup(const QString &view) const;

    void handleNewTextMessagesReceived();
    bool projectionOwnsCall() const;
    void hideSendFailures();

    void requestTransient(const QString &name);
    void hideTransient(const QString &name);
    void postEvent(const QString &name);

    QPointer<HmiPhoneController> m_controller; // QML can delete it (deleteLater())
    HmiPhonePopupManager *m_popupManager;
    Brisken::ViewController *m_viewController;
    Brisken::ViewManager *m_viewManager;
    Mavrosk::BluetoothSource *m_bluetoothSource;
    Mavrosk::PhoneSource *m_phoneSource;
    Mavrosk::SpeechSource *m_speechSource;
    Mavrosk::KeySource *m_keySource;
    Mavrosk::NavSource *m_navSource;
    Mavrosk::ProjectionSource *m_projectionSource;
    Taldris::HardKeyController *m_hardKeyController;
    TransitionList m_rootHierarchyTransitions;
    PopupList m_rootHierarchyPopups;
    Quorvel::PopupState *m_incomingCallPopup;
    Quorvel::PopupState *m_waitingCallPopup;
    Quorvel::GuardedPropertyTransition *m_incomingCallTransition;
    Quorvel::GuardedPropertyTransition *m_missedCallTransition;
    Quorvel::GuardedPropertyTransition *m_callConnectedTransition;
    Quorvel::GuardedPropertyTransition *m_batteryLevelTransition;
    Quorvel::GuardedPropertyTransition *m_standbyTransition;
    Quorvel::GuardedSignalTransition *m_connectionLostTransition;
    Quorvel::GuardedSignalTransition *m_attemptingReconnectTransition;
    Quorvel::GuardedSignalTransition *m_doorOpenLinklossTransition;
    Quorvel::GuardedSignalTransition *m_doorNoCallOpenLinklossTransition;
    Quorvel::GuardedSignalTransition *m_newTextMessageTransition;
    Quorvel::GuardedSignalTransition *m_requestedMessageDetailsReadyTransition;
    Quorvel::GuardedSignalTransition *m_multipleNewTextMessagesTransition;
    Quorvel::GuardedSignalTransition *m_dtmfNoResponseErrorTransition;
    Quorvel::GuardedSignalTransition *m_audioTransferErrorTransition;
    Quorvel::GuardedSignalTransition *m_audioHandsfreeErrorTransition;
    Quorvel::GuardedSignalTransition *m_audioInternalErrorTransition;
    Quorvel::GuardedSignalTransition *m_smsNewTextHearItTransition;
    Quorvel::HmiTransition *m_smsInMemoryTransition;
    Quorvel::HmiTransition *m_smsNotInMemoryTransition;
    Quorvel::HmiTransition *m_smsIphoneTransition;
    Quorvel::GuardedSignalTransition *m_incomingCallOnProjectionDisconnectTransition;
    Quorvel::KeySignalTransition *m_phoneKeyTransition;
    Quorvel::KeySignalTransition *m_phoneEndCallKeyTransition;
    Quorvel::KeySignalTransition *m_multipartySwitchKeyTransition;
    Quorvel::PopupState *m_newTextMessageAlertPopup;
    Quorvel::PopupState *m_multipleTextMessagesPopup;
    bool m_listenMessageRequested;
    int m_textMessageAlertState;
    int m_sendMessageRetryCount;
    int m_dialingFailureCount;
    QTimer *m_extendedModeTimer;
    int m_extendedModeMinutesElapsed;
    Quorvel::HmiTransition *m_smsNotificationDisabledTransition;
    Quorvel::HmiTransition *m_smsNotificationEnabledTransition;

    // The global popup states by view identifier, for the wiring made while building.
    QHash<QString, Quorvel::PopupState *> m_popupsByView;
};

} // namespace HmiPhone
