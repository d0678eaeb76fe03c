#pragma once

// The data-source bridge as the phone module sees it, in one place.
//
// Every source is a process-wide QObject (Mavrosk::<Source>::instance()), derived from
// Mavrosk::DataSource. Values are Qt properties T name READ name WRITE setName NOTIFY
// nameChanged(T); setters notify only on a real change. Commands are public slots that write
// a platform journal entry of kind "bridge" with call "<short name>.<member>" and the arguments
// as a QVariantList, and change nothing: the phone answers later through property changes and
// signals. Setters marked (m) are the module's own calls: they change the value and are
// journaled the same way, e.g. {call: "phone.setCallNumberEntered", args: ["0123"]}.
//
// The phone's side (tests, simulator):
//   - writes a value with DataSource::setBridgeValue(name, value) (never journaled), or with the
//     plain setter / QMetaProperty::write for the values without (m);
//   - emits a signal directly (Qt signals are public), e.g. emit phone->missedCallsPresent(), or
//     through QMetaMethod::invoke; KeySource::sendKeyEvent(key, kind) emits keyEvent;
//   - fills the list models with setRows(QVariantList of QVariantMap) and setListLength(int);
//   - puts everything back with Mavrosk::resetAll() (or DataSource::reset() on one source).
// Values of a head unit with no phone are the defaults given below (bool false, int 0, strings
// and lists empty, unless another default is shown).
//
// PhoneSource ("phone")
//   call      int status (0 no call, 1 failure, 3-6 dialling, 7 one call, 9/10 two calls,
//             11 refusing a further call, 12 standby); bool incomingCall, callConnected,
//             dialingInProgress, multipleCallsConnected, privateMode, muted, doNotDisturb, roaming;
//             int emergencyCallStatus; int deviceBatteryLevel = -1 (none known);
//             bool siriSupported, siriEnabled, siriActive, phoneVoiceServiceActive;
//             int currentExtendedMode [currentExtendedModeChanged(int)], extendedModeTimerValue
//             (minutes); QString callNumberEntered (m) [callNumberEnteredChanged(const QString&)],
//             dtmfNumberEntered (m, setDTMFNumberEntered); bool outboundRoamingCallIsFromRecentList
//             (m); int outboundRoamingRecentCallType (m), outboundRoamingRecentCallIndex (m);
//             bool phoneCallStandByMode (m); MultiDPListModel *callList() (roles "name",
//             "number", "callState" "incoming"/"waiting"/"dialing"/"active"/"held", "duration" in
//             seconds: the calls the phone has now)
//   settings  bool roamingWarning (m), lowBatteryNotification (m), muteAudioInPrivacy (m),
//             automaticContactDownload (m); int phoneRingtone (m), messageNotification (m),
//             contactSortOrder (m)
//   contacts  int phoneBookStatus (1 done, 2 downloading, 3 empty, 4 no access, 5 failed);
//             int phonebookContactDisplayType (m); int driverRestrictedPhonebookModelMinRow (m)
//             = -1, driverRestrictedPhonebookModelMaxRow (m) = -1;
//             MultiDPListModel *AlphabetIndexModel() (roles "alphabet", "letterIndex");
//             InfiniteListModel *phoneBook() (roles "name", "number")
//   recent    int recentCallListStatus [recentCallListStatusChanged(int)] (1 available for
//             download, 2 downloaded, 3 downloading, 4 failed call, 5 retry error, 0/6 failed);
//             int currentRecentCallListType (m) (0 all, 1 missed, 2 received, 3 dialled);
//             PhoneSource::RecentCallListType is int; MultiDPListModel *recentCallList()
//             (roles "name", "number", "type", "time": the list last downloaded)
//   messages  int messagesDownloadingStatus [messagesDownloadingStatusChanged(int)] (2 running,
//             3 finished, 4 failed); MultiDPListModel *textMessageList() (roles "name",
//             "number", "time", "text", "read": the inbox last downloaded); bool
//             messagesInboxEmptyStatus = true, messagesInMemoryStatus, messageNotificationEnabled,
//             messageAccessProfileStatus, smsMessageAccessProfileAvailable,
//             smsPhoneDeclinedAccessStatus (read getSmsPhoneDeclinedAccess()); int
//             numOfSmsDownloadAttempts, smsTotalCount [smsTotalCountChanged(int)],
//             totalUnreadSmsCount [totalUnreadSmsCountChanged(int)]; QString textMessageBody,
//             textMessageSenderName, textMessageSenderNumber (the message last detailed or
//             alerted); int listenMessageLineNo, replyMessageLineNo
//             [replyMessageLineNoChanged(int)] (both count from 1); QVariantList smsReplyMessages
//             (maps with "text"); QString replyTextSelected (m); bool hearItPressed (m);
//             int sendMessageStatus = -1 [sendMessageStatusChanged(int)] (2 sent, 0/1 failed,
//             3 network failure); bool sendMessagePhoneSendReportStatus (m)
//   signals   missedCallsPresent(), phoneDialingFailed(int), phoneCallAcceptingFailed(),
//             phoneIncomingCallRemoteRejection(), phoneWaitingCallRemoteRejection(),
//             multipartyActiveCallEnded(), phoneRoamingModeReceived(),
//             nonUserDeviceDisconnectReceived(),
//             phoneDriverDoorOpenLinkLossReconnectFailedReceived(), deviceReconnectFailReceived(),
//             unstableDeviceConnectionWithKovaReceived(), dtmfKeyPressNoResponseErrorReceived(),
//             phoneAudioTransferErrorReceived(), phoneAudioHandsfreeErrorReceived(),
//             phoneSiriNoResponseErrorReceived(), phoneAudioInternalErrorReceived(),
//             phoneContactsTooLargeErrorReceived(), phoneSiriSCOchannelNotActiveReceived(),
//             phonebookSearchReady(), phonebookContactDetailsReady(), newTextMessageAlert(),
//             newTextMessageDetailsReady(), textMessageDetailsReady(),
//             phoneSmsNewTextClusterHearItRequestReceived(),
//             phoneSmsNewTextClusterIgnoreRequestReceived(), showMessageListRequested(),
//             listenToMessageRequested(), showReplyMessagesRequested(), sendMessageRequested(),
//             cancelSendMessageRequested(), sendMessageNoResponseFromPhoneAlert(),
//             smsPhoneDeclinedAccess()
//   commands  checkPhoneStatus(), dialNumber(QString), dialRecentCall(int type, int index),
//             acceptIncomingCall(), rejectIncomingCall(), stopAcceptingAttempts(), endCall(),
//             swapCall(), joinCalls(), toggleMuted(), togglePrivacyMode(),
//             dialPadKeyTonePressed(int), cancelRoamingCall(), enableDoNotDisturb(),
//             disableDoNotDisturb(), toggleSiriActivation(bool),
//             togglePhoneVoiceServiceActivation(bool); searchPhoneBook(QString),
//             selectPhoneBookEntry(int), retryPhoneBookDownload(int device),
//             retryPhnBookDownloadAccess(), resetPhoneBook(), exitingPhoneBook(),
//             reDownloadContacts(), deleteAllContacts(); downloadRecentCallsList(),
//             downloadRecentCallsList(int type), cancelRecentCallsDownload();
//             requestTextMessagesInbox(), retrySmsDownload(), retrySmsDownload(int device),
//             retryMessageProfileAccess(), requestSelectedTextMessageDetails(int),
//             requestNewTextMessageDetails(), textMessagePlayback(QString),
//             stopTextMessagePlayback(), contactNamePlayback(QString), initiateSendTextMessage(),
//             sendMessageNotificationEnabled(bool); clearAlertPermanently(int),
//             clearAlertForThisCycle(int), callForFixAlert(int, QString); playRingtone(int),
//             stopPlayRingtone(), playAlert(int)
//   alerts    MultiDPListModel *statusAlertList() (roles "alertId", "supportPhoneNumber": the
//             status alerts not cleared)
// BluetoothSource ("bluetooth")
//             bool deviceConnected [deviceConnectedChanged(bool)]; int phoneDevice = -1
//             [phoneDeviceChanged(int)], selectedDevice = -1, deviceListCount,
//             moduleStatus = 1 (0: Bluetooth off); bool iOSAppleDeviceConnected
// EAPhoneSource ("eaphone")     bool eventsBlocked
// ProjectionSource ("projection")
//             int projectionMode (1: a projection owns the phone); bool isRendering;
//             signals projectionNotActive(bool), projectionDIONotActive(bool)
// SpeechSource ("speech")       int sessionState (0: none); bool ttsSessionActive;
//             signal displayPairingPopup(); command cancelVRSession()
// KeySource ("key")             signal keyEvent(int key, int kind); sendKeyEvent(key, kind)
// NavSource ("nav")             bool routeActive
// GlobalSource ("global")       command sendDisplayOnlyModeBeginShutdownRequest()
// ArdelSource ("ardel")         int ignitionKeyType (2: restricted key); bool doNotDisturbOption

#include <mavrosk/ardelsource.h>
#include <mavrosk/bluetoothsource.h>
#include <mavrosk/eaphonesource.h>
#include <mavrosk/globalsource.h>
#include <mavrosk/keysource.h>
#include <mavrosk/navsource.h>
#include <mavrosk/phonesource.h>
#include <mavrosk/projectionsource.h>
#include <mavrosk/speechsource.h>

namespace Mavrosk {

// Makes every source of the bridge, as a host does before it loads modules, and returns them.
QList<DataSource *> createAll();

// Puts every source and list model back to the values of a head unit with no phone.
void resetAll();

// The list models the sources offer through their invokable getters, named "<source>.<getter>"
// ("phone.phoneBook", "phone.callList", ...), in declaration order.
QList<QPair<QString, MultiDPListModel *>> listModels();
// One of them by name; null for a name that is none.
MultiDPListModel *listModel(const QString &name);

} // namespace Mavrosk
