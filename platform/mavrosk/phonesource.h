#pragma once

#include <mavrosk/datasource.h>
#include <mavrosk/infinitelistmodel.h>
#include <mavrosk/multidplistmodel.h>

#include <QVariantList>

namespace Mavrosk {

// The phone: call, contacts, recent calls, text messages, alerts and the phone settings. The whole
// bridge is listed in <mavrosk/bridge.h>.
class PhoneSource : public DataSource
{
    Q_OBJECT
    Q_PROPERTY(int status READ status WRITE setStatus NOTIFY statusChanged)
    Q_PROPERTY(bool incomingCall READ incomingCall WRITE setIncomingCall NOTIFY incomingCallChanged)
    Q_PROPERTY(bool callConnected READ callConnected WRITE setCallConnected NOTIFY
                       callConnectedChanged)
    Q_PROPERTY(bool dialingInProgress READ dialingInProgress WRITE setDialingInProgress NOTIFY
                       dialingInProgressChanged)
    Q_PROPERTY(bool multipleCallsConnected READ multipleCallsConnected WRITE
                       setMultipleCallsConnected NOTIFY multipleCallsConnectedChanged)
    Q_PROPERTY(bool privateMode READ privateMode WRITE setPrivateMode NOTIFY privateModeChanged)
    Q_PROPERTY(bool muted READ muted WRITE setMuted NOTIFY mutedChanged)
    Q_PROPERTY(int emergencyCallStatus READ emergencyCallStatus WRITE setEmergencyCallStatus NOTIFY
                       emergencyCallStatusChanged)
    Q_PROPERTY(bool doNotDisturb READ doNotDisturb WRITE setDoNotDisturb NOTIFY doNotDisturbChanged)
    Q_PROPERTY(bool roaming READ roaming WRITE setRoaming NOTIFY roamingChanged)
    Q_PROPERTY(bool roamingWarning READ roamingWarning WRITE setRoamingWarning NOTIFY
                       roamingWarningChanged)
    Q_PROPERTY(int deviceBatteryLevel READ deviceBatteryLevel WRITE setDeviceBatteryLevel NOTIFY
                       deviceBatteryLevelChanged)
    Q_PROPERTY(bool lowBatteryNotification READ lowBatteryNotification WRITE
                       setLowBatteryNotification NOTIFY lowBatteryNotificationChanged)
    Q_PROPERTY(bool siriSupported READ siriSupported WRITE setSiriSupported NOTIFY
                       siriSupportedChanged)
    Q_PROPERTY(bool siriEnabled READ siriEnabled WRITE setSiriEnabled NOTIFY siriEnabledChanged)
    Q_PROPERTY(bool siriActive READ siriActive WRITE setSiriActive NOTIFY siriActiveChanged)
    Q_PROPERTY(bool phoneVoiceServiceActive READ phoneVoiceServiceActive WRITE
                       setPhoneVoiceServiceActive NOTIFY phoneVoiceServiceActiveChanged)
    Q_PROPERTY(int currentExtendedMode READ currentExtendedMode WRITE setCurrentExtendedMode NOTIFY
                       currentExtendedModeChanged)
    Q_PROPERTY(int extendedModeTimerValue READ extendedModeTimerValue WRITE
                       setExtendedModeTimerValue NOTIFY extendedModeTimerValueChanged)
    Q_PROPERTY(bool phoneCallStandByMode READ phoneCallStandByMode WRITE setPhoneCallStandByMode
                       NOTIFY phoneCallStandByModeChanged)
    Q_PROPERTY(bool muteAudioInPrivacy READ muteAudioInPrivacy WRITE setMuteAudioInPrivacy NOTIFY
                       muteAudioInPrivacyChanged)
    Q_PROPERTY(
            int phoneRingtone READ phoneRingtone WRITE setPhoneRingtone NOTIFY phoneRingtoneChanged)
    Q_PROPERTY(int messageNotification READ messageNotification WRITE setMessageNotification NOTIFY
                       messageNotificationChanged)
    Q_PROPERTY(QString callNumberEntered READ callNumberEntered WRITE setCallNumberEntered NOTIFY
                       callNumberEnteredChanged)
    Q_PROPERTY(QString dtmfNumberEntered READ dtmfNumberEntered WRITE setDTMFNumberEntered NOTIFY
                       dtmfNumberEnteredChanged)
    Q_PROPERTY(bool outboundRoamingCallIsFromRecentList READ outboundRoamingCallIsFromRecentList
                       WRITE setOutboundRoamingCallIsFromRecentList NOTIFY
                               outboundRoamingCallIsFromRecentListChanged)
    Q_PROPERTY(int outboundRoamingRecentCallType READ outboundRoamingRecentCallType WRITE
                       setOutboundRoamingRecentCallType NOTIFY outboundRoamingRecentCallTypeChanged)
    Q_PROPERTY(
            int outboundRoamingRecentCallIndex READ outboundRoamingRecentCallIndex WRITE
                    setOutboundRoamingRecentCallIndex NOTIFY outboundRoamingRecentCallIndexChanged)
    Q_PROPERTY(int phoneBookStatus READ phoneBookStatus WRITE setPhoneBookStatus NOTIFY
                       phoneBookStatusChanged)
    Q_PROPERTY(bool automaticContactDownload READ automaticContactDownload WRITE
                       setAutomaticContactDownload NOTIFY automaticContactDownloadChanged)
    Q_PROPERTY(int contactSortOrder READ contactSortOrder WRITE setContactSortOrder NOTIFY
                       contactSortOrderChanged)
    Q_PROPERTY(int phonebookContactDisplayType READ phonebookContactDisplayType WRITE
                       setPhonebookContactDisplayType NOTIFY phonebookContactDisplayTypeChanged)
    Q_PROPERTY(int driverRestrictedPhonebookModelMinRow READ driverRestrictedPhonebookModelMinRow
                       WRITE setDriverRestrictedPhonebookModelMinRow NOTIFY
                               driverRestrictedPhonebookModelMinRowChanged)
    Q_PROPERTY(int driverRestrictedPhonebookModelMaxRow READ driverRestrictedPhonebookModelMaxRow
                       WRITE setDriverRestrictedPhonebookModelMaxRow NOTIFY
                               driverRestrictedPhonebookModelMaxRowChanged)
    Q_PROPERTY(int recentCallListStatus READ recentCallListStatus WRITE setRecentCallListStatus
                       NOTIFY recentCallListStatusChanged)
    Q_PROPERTY(int currentRecentCallListType READ currentRecentCallListType WRITE
                       setCurrentRecentCallListType NOTIFY currentRecentCallListTypeChanged)
    Q_PROPERTY(int messagesDownloadingStatus READ messagesDownloadingStatus WRITE
                       setMessagesDownloadingStatus NOTIFY messagesDownloadingStatusChanged)
    Q_PROPERTY(bool messagesInboxEmptyStatus READ messagesInboxEmptyStatus WRITE
                       setMessagesInboxEmptyStatus NOTIFY messagesInboxEmptyStatusChanged)
    Q_PROPERTY(bool messagesInMemoryStatus READ messagesInMemoryStatus WRITE
                       setMessagesInMemoryStatus NOTIFY messagesInMemoryStatusChanged)
    Q_PROPERTY(bool messageNotificationEnabled READ messageNotificationEnabled WRITE
                       setMessageNotificationEnabled NOTIFY messageNotificationEnabledChanged)
    Q_PROPERTY(bool messageAccessProfileStatus READ messageAccessProfileStatus WRITE
                       setMessageAccessProfileStatus NOTIFY messageAccessProfileStatusChanged)
    Q_PROPERTY(bool smsMessageAccessProfileAvailable READ smsMessageAccessProfileAvailable WRITE
                       setSmsMessageAccessProfileAvailable NOTIFY
                               smsMessageAccessProfileAvailableChanged)
    Q_PROPERTY(bool smsPhoneDeclinedAccessStatus READ getSmsPhoneDeclinedAccess WRITE
                       setSmsPhoneDeclinedAccessStatus NOTIFY smsPhoneDeclinedAccessStatusChanged)
    Q_PROPERTY(int numOfSmsDownloadAttempts READ numOfSmsDownloadAttempts WRITE
                       setNumOfSmsDownloadAttempts NOTIFY numOfSmsDownloadAttemptsChanged)
    Q_PROPERTY(
            int smsTotalCount READ smsTotalCount WRITE setSmsTotalCount NOTIFY smsTotalCountChanged)
    Q_PROPERTY(int totalUnreadSmsCount READ totalUnreadSmsCount WRITE setTotalUnreadSmsCount NOTIFY
                       totalUnreadSmsCountChanged)
    Q_PROPERTY(QString textMessageBody READ textMessageBody WRITE setTextMessageBody NOTIFY
                       textMessageBodyChanged)
    Q_PROPERTY(QString textMessageSenderName READ textMessageSenderName WRITE
                       setTextMessageSenderName NOTIFY textMessageSenderNameChanged)
    Q_PROPERTY(QString textMessageSenderNumber READ textMessageSenderNumber WRITE
                       setTextMessageSenderNumber NOTIFY textMessageSenderNumberChanged)
    Q_PROPERTY(int listenMessageLineNo READ listenMessageLineNo WRITE setListenMessageLineNo NOTIFY
                       listenMessageLineNoChanged)
    Q_PROPERTY(int replyMessageLineNo READ replyMessageLineNo WRITE setReplyMessageLineNo NOTIFY
                       replyMessageLineNoChanged)
    Q_PROPERTY(QVariantList smsReplyMessages READ smsReplyMessages WRITE setSmsReplyMessages NOTIFY
                       smsReplyMessagesChanged)
    Q_PROPERTY(QString replyTextSelected READ replyTextSelected WRITE setReplyTextSelected NOTIFY
                       replyTextSelectedChanged)
    Q_PROPERTY(bool hearItPressed READ hearItPressed WRITE setHearItPressed NOTIFY
                       hearItPressedChanged)
    Q_PROPERTY(int sendMessageStatus READ sendMessageStatus WRITE setSendMessageStatus NOTIFY
                       sendMessageStatusChanged)
    Q_PROPERTY(bool sendMessagePhoneSendReportStatus READ sendMessagePhoneSendReportStatus WRITE
                       setSendMessagePhoneSendReportStatus NOTIFY
                               sendMessagePhoneSendReportStatusChanged)
public:
    using RecentCallListType = int;
    using ContactSortMethod = int;

    static PhoneSource *instance();

    // Alphabet bar of the contact list: roles "alphabet" (QString) and "letterIndex" (int).
    Q_INVOKABLE Mavrosk::MultiDPListModel *AlphabetIndexModel() const;
    // The contact list: roles "name" and "number" (QString).
    Q_INVOKABLE Mavrosk::InfiniteListModel *phoneBook() const;
    // The recent calls of the list type last downloaded, newest first: roles "name" (QString,
    // empty for a number not in the contacts), "number" (QString), "type" (int: 1 missed,
    // 2 received, 3 dialled) and "time" (QString, "yyyy-MM-dd hh:mm").
    Q_INVOKABLE Mavrosk::MultiDPListModel *recentCallList() const;
    // The text messages of the inbox, newest first: roles "name", "number", "time" (as above),
    // "text" (QString) and "read" (bool).
    Q_INVOKABLE Mavrosk::MultiDPListModel *textMessageList() const;
    // The calls the phone has now, in the order they began: roles "name" (QString, empty for a
    // number not in the contacts), "number" (QString, empty for a withheld number), "callState"
    // (QString: "incoming", "waiting", "dialing", "active" or "held") and "duration" (int,
    // seconds since the call was connected; 0 before). Kept by this stand-in for the views.
    Q_INVOKABLE Mavrosk::MultiDPListModel *callList() const;
    // The phone's status alerts the driver has not cleared: roles "alertId" (int, 1001 to 1010)
    // and "supportPhoneNumber" (QString, empty unless the alert offers a number to call). Kept by
    // this stand-in for the views.
    Q_INVOKABLE Mavrosk::MultiDPListModel *statusAlertList() const;

    int status() const { return m_status; }
    bool incomingCall() const { return m_incomingCall; }
    bool callConnected() const { return m_callConnected; }
    bool dialingInProgress() const { return m_dialingInProgress; }
    bool multipleCallsConnected() const { return m_multipleCallsConnected; }
    bool privateMode() const { return m_privateMode; }
    bool muted() const { return m_muted; }
    int emergencyCallStatus() const { return m_emergencyCallStatus; }
    bool doNotDisturb() const { return m_doNotDisturb; }
    bool roaming() const { return m_roaming; }
    bool roamingWarning() const { return m_roamingWarning; }
    int deviceBatteryLevel() const { return m_deviceBatteryLevel; }
    bool lowBatteryNotification() const { return m_lowBatteryNotification; }
    bool siriSupported() const { return m_siriSupported; }
    bool siriEnabled() const { return m_siriEnabled; }
    bool siriActive() const { return m_siriActive; }
    bool phoneVoiceServiceActive() const { return m_phoneVoiceServiceActive; }
    int currentExtendedMode() const { return m_currentExtendedMode; }
    int extendedModeTimerValue() const { return m_extendedModeTimerValue; }
    bool phoneCallStandByMode() const { return m_phoneCallStandByMode; }
    bool muteAudioInPrivacy() const { return m_muteAudioInPrivacy; }
    int phoneRingtone() const { return m_phoneRingtone; }
    int messageNotification() const { return m_messageNotification; }
    QString callNumberEntered() const { return m_callNumberEntered; }
    QString dtmfNumberEntered() const { return m_dtmfNumberEntered; }
    bool outboundRoamingCallIsFromRecentList() const
    {
        return m_outboundRoamingCallIsFromRecentList;
    }
    int outboundRoamingRecentCallType() const { return m_outboundRoamingRecentCallType; }
    int outboundRoamingRecentCallIndex() const { return m_outboundRoamingRecentCallIndex; }
    int phoneBookStatus() const { return m_phoneBookStatus; }
    bool automaticContactDownload() const { return m_automaticContactDownload; }
    int contactSortOrder() const { return m_contactSortOrder; }
    int phonebookContactDisplayType() const { return m_phonebookContactDisplayType; }
    int driverRestrictedPhonebookModelMinRow() const
    {
        return m_driverRestrictedPhonebookModelMinRow;
    }
    int driverRestrictedPhonebookModelMaxRow() const
    {
        return m_driverRestrictedPhonebookModelMaxRow;
    }
    int recentCallListStatus() const { return m_recentCallListStatus; }
    int currentRecentCallListType() const { return m_currentRecentCallListType; }
    int messagesDownloadingStatus() const { return m_messagesDownloadingStatus; }
    bool messagesInboxEmptyStatus() const { return m_messagesInboxEmptyStatus; }
    bool messagesInMemoryStatus() const { return m_messagesInMemoryStatus; }
    bool messageNotificationEnabled() const { return m_messageNotificationEnabled; }
    bool messageAccessProfileStatus() const { return m_messageAccessProfileStatus; }
    bool smsMessageAccessProfileAvailable() const { return m_smsMessageAccessProfileAvailable; }
    bool getSmsPhoneDeclinedAccess() const { return m_smsPhoneDeclinedAccessStatus; }
    int numOfSmsDownloadAttempts() const { return m_numOfSmsDownloadAttempts; }
    int smsTotalCount() const { return m_smsTotalCount; }
    int totalUnreadSmsCount() const { return m_totalUnreadSmsCount; }
    QString textMessageBody() const { return m_textMessageBody; }
    QString textMessageSenderName() const { return m_textMessageSenderName; }
    QString textMessageSenderNumber() const { return m_textMessageSenderNumber; }
    int listenMessageLineNo() const { return m_listenMessageLineNo; }
    int replyMessageLineNo() const { return m_replyMessageLineNo; }
    QVariantList smsReplyMessages() const { return m_smsReplyMessages; }
    QString replyTextSelected() const { return m_replyTextSelected; }
    bool hearItPressed() const { return m_hearItPressed; }
    int sendMessageStatus() const { return m_sendMessageStatus; }
    bool sendMessagePhoneSendReportStatus() const { return m_sendMessagePhoneSendReportStatus; }

    // Setters notify only on a real change. Those marked "module" are the module's own calls:
    // they are also journaled (not when written through setBridgeValue()).
    void setStatus(int value);
    void setIncomingCall(bool value);
    void setCallConnected(bool value);
    void setDialingInProgress(bool value);
    void setMultipleCallsConnected(bool value);
    void setPrivateMode(bool value);
    void setMuted(bool value);
    void setEmergencyCallStatus(int value);
    void setDoNotDisturb(bool value);
    void setRoaming(bool value);
    void setRoamingWarning(bool value); // module
    void setDeviceBatteryLevel(int value);
    void setLowBatteryNotification(bool value); // module
    void setSiriSupported(bool value);
    void setSiriEnabled(bool value);
    void setSiriActive(bool value);
    void setPhoneVoiceServiceActive(bool value);
    void setCurrentExtendedMode(int value);
    void setExtendedModeTimerValue(int value);
    void setPhoneCallStandByMode(bool value); // module
    void setMuteAudioInPrivacy(bool value); // module
    void setPhoneRingtone(int value); // module
    void setMessageNotification(int value); // module
    void setCallNumberEntered(const QString &value); // module
    void setDTMFNumberEntered(const QString &value); // module
    void setOutboundRoamingCallIsFromRecentList(bool value); // module
    void setOutboundRoamingRecentCallType(int value); // module
    void setOutboundRoamingRecentCallIndex(int value); // module
    void setPhoneBookStatus(int value);
    void setAutomaticContactDownload(bool value); // module
    void setContactSortOrder(int value); // module
    void setPhonebookContactDisplayType(int value); // module
    void setDriverRestrictedPhonebookModelMinRow(int value); // module
    void setDriverRestrictedPhonebookModelMaxRow(int value); // module
    void setRecentCallListStatus(int value);
    void setCurrentRecentCallListType(int value); // module
    void setMessagesDownloadingStatus(int value);
    void setMessagesInboxEmptyStatus(bool value);
    void setMessagesInMemoryStatus(bool value);
    void setMessageNotificationEnabled(bool value);
    void setMessageAccessProfileStatus(bool value);
    void setSmsMessageAccessProfileAvailable(bool value);
    void setSmsPhoneDeclinedAccessStatus(bool value);
    void setNumOfSmsDownloadAttempts(int value);
    void setSmsTotalCount(int value);
    void setTotalUnreadSmsCount(int value);
    void setTextMessageBody(const QString &value);
    void setTextMessageSenderName(const QString &value);
    void setTextMessageSenderNumber(const QString &value);
    void setListenMessageLineNo(int value);
    void setReplyMessageLineNo(int value);
    void setSmsReplyMessages(const QVariantList &value);
    void setReplyTextSelected(const QString &value); // module
    void setHearItPressed(bool value); // module
    void setSendMessageStatus(int value);
    void setSendMessagePhoneSendReportStatus(bool value); // module

    // Commands: journaled as bridge {call, args}; their outcome arrives later as changes.
public slots:
    // Call control
    void checkPhoneStatus();
    void dialNumber(const QString &number);
    void dialRecentCall(int type, int index);
    void acceptIncomingCall();
    void rejectIncomingCall();
    void stopAcceptingAttempts();
    void endCall();
    void swapCall();
    void joinCalls();
    void toggleMuted();
    void togglePrivacyMode();
    void dialPadKeyTonePressed(int tone);
    void cancelRoamingCall();
    void enableDoNotDisturb();
    void disableDoNotDisturb();
    void toggleSiriActivation(bool active);
    void togglePhoneVoiceServiceActivation(bool active);
    // Contacts
    void searchPhoneBook(const QString &searchData);
    void selectPhoneBookEntry(int index);
    void retryPhoneBookDownload(int device);
    void retryPhnBookDownloadAccess();
    void resetPhoneBook();
    void exitingPhoneBook();
    void reDownloadContacts();
    void deleteAllContacts();
    // Recent calls
    void downloadRecentCallsList();
    void downloadRecentCallsList(int type);
    void cancelRecentCallsDownload();
    // Text messages
    void requestTextMessagesInbox();
    void retrySmsDownload();
    void retrySmsDownload(int device);
    void retryMessageProfileAccess();
    void requestSelectedTextMessageDetails(int index);
    void requestNewTextMessageDetails();
    void textMessagePlayback(const QString &text);
    void stopTextMessagePlayback();
    void contactNamePlayback(const QString &name);
    void initiateSendTextMessage();
    void sendMessageNotificationEnabled(bool enabled);
    // Status alerts
    void clearAlertPermanently(int alertId);
    void clearAlertForThisCycle(int alertId);
    void callForFixAlert(int alertId, const QString &supportPhoneNumber);
    // Ringtones and alert tones
    void playRingtone(int ringtone);
    void stopPlayRingtone();
    void playAlert(int alert);

signals:
    void statusChanged(int value);
    void incomingCallChanged(bool value);
    void callConnectedChanged(bool value);
    void dialingInProgressChanged(bool value);
    void multipleCallsConnectedChanged(bool value);
    void privateModeChanged(bool value);
    void mutedChanged(bool value);
    void emergencyCallStatusChanged(int value);
    void doNotDisturbChanged(bool value);
    void roamingChanged(bool value);
    void roamingWarningChanged(bool value);
    void deviceBatteryLevelChanged(int value);
    void lowBatteryNotificationChanged(bool value);
    void siriSupportedChanged(bool value);
    void siriEnabledChanged(bool value);
    void siriActiveChanged(bool value);
    void phoneVoiceServiceActiveChanged(bool value);
    void currentExtendedModeChanged(int value);
    void extendedModeTimerValueChanged(int value);
    void phoneCallStandByModeChanged(bool value);
    void muteAudioInPrivacyChanged(bool value);
    void phoneRingtoneChanged(int value);
    void messageNotificationChanged(int value);
    void callNumberEnteredChanged(const QString &value);
    void dtmfNumberEnteredChanged(const QString &value);
    void outboundRoamingCallIsFromRecentListChanged(bool value);
    void outboundRoamingRecentCallTypeChanged(int value);
    void outboundRoamingRecentCallIndexChanged(int value);
    void phoneBookStatusChanged(int value);
    void automaticContactDownloadChanged(bool value);
    void contactSortOrderChanged(int value);
    void phonebookContactDisplayTypeChanged(int value);
    void driverRestrictedPhonebookModelMinRowChanged(int value);
    void driverRestrictedPhonebookModelMaxRowChanged(int value);
    void recentCallListStatusChanged(int value);
    void currentRecentCallListTypeChanged(int value);
    void messagesDownloadingStatusChanged(int value);
    void messagesInboxEmptyStatusChanged(bool value);
    void messagesInMemoryStatusChanged(bool value);
    void messageNotificationEnabledChanged(bool value);
    void messageAccessProfileStatusChanged(bool value);
    void smsMessageAccessProfileAvailableChanged(bool value);
    void smsPhoneDeclinedAccessStatusChanged(bool value);
    void numOfSmsDownloadAttemptsChanged(int value);
    void smsTotalCountChanged(int value);
    void totalUnreadSmsCountChanged(int value);
    void textMessageBodyChanged(const QString &value);
    void textMessageSenderNameChanged(const QString &value);
    void textMessageSenderNumberChanged(const QString &value);
    void listenMessageLineNoChanged(int value);
    void replyMessageLineNoChanged(int value);
    void smsReplyMessagesChanged(const QVariantList &value);
    void replyTextSelectedChanged(const QString &value);
    void hearItPressedChanged(bool value);
    void sendMessageStatusChanged(int value);
    void sendMessagePhoneSendReportStatusChanged(bool value);

    void missedCallsPresent();
    void phoneDialingFailed(int kind);
    void phoneCallAcceptingFailed();
    void phoneIncomingCallRemoteRejection();
    void phoneWaitingCallRemoteRejection();
    void multipartyActiveCallEnded();
    void phoneRoamingModeReceived();
    void nonUserDeviceDisconnectReceived();
    void phoneDriverDoorOpenLinkLossReconnectFailedReceived();
    void deviceReconnectFailReceived();
    void unstableDeviceConnectionWithKovaReceived();
    void dtmfKeyPressNoResponseErrorReceived();
    void phoneAudioTransferErrorReceived();
    void phoneAudioHandsfreeErrorReceived();
    void phoneSiriNoResponseErrorReceived();
    void phoneAudioInternalErrorReceived();
    void phoneContactsTooLargeErrorReceived();
    void phoneSiriSCOchannelNotActiveReceived();
    void phonebookSearchReady();
    void phonebookContactDetailsReady();
    void newTextMessageAlert();
    void newTextMessageDetailsReady();
    void textMessageDetailsReady();
    void phoneSmsNewTextClusterHearItRequestReceived();
    void phoneSmsNewTextClusterIgnoreRequestReceived();
    void showMessageListRequested();
    void listenToMessageRequested();
    void showReplyMessagesRequested();
    void sendMessageRequested();
    void cancelSendMessageRequested();
    void sendMessageNoResponseFromPhoneAlert();
    void smsPhoneDeclinedAccess();

private:
    PhoneSource();
    void resetModels() override;

    MultiDPListModel *m_alphabetIndexModel;
    InfiniteListModel *m_phoneBook;
    MultiDPListModel *m_recentCallList;
    MultiDPListModel *m_textMessageList;
    MultiDPListModel *m_callList;
    MultiDPListModel *m_statusAlertList;
    int m_status = 0;
    bool m_incomingCall = false;
    bool m_callConnected = false;
    bool m_dialingInProgress = false;
    bool m_multipleCallsConnected = false;
    bool m_privateMode = false;
    bool m_muted = false;
    int m_emergencyCallStatus = 0;
    bool m_doNotDisturb = false;
    bool m_roaming = false;
    bool m_roamingWarning = false;
    int m_deviceBatteryLevel = -1;
    bool m_lowBatteryNotification = false;
    bool m_siriSupported = false;
    bool m_siriEnabled = false;
    bool m_siriActive = false;
    bool m_phoneVoiceServiceActive = false;
    int m_currentExtendedMode = 0;
    int m_extendedModeTimerValue = 0;
    bool m_phoneCallStandByMode = false;
    bool m_muteAudioInPrivacy = false;
    int m_phoneRingtone = 0;
    int m_messageNotification = 0;
    QString m_callNumberEntered;
    QString m_dtmfNumberEntered;
    bool m_outboundRoamingCallIsFromRecentList = false;
    int m_outboundRoamingRecentCallType = 0;
    int m_outboundRoamingRecentCallIndex = 0;
    int m_phoneBookStatus = 0;
    bool m_automaticContactDownload = false;
    int m_contactSortOrder = 0;
    int m_phonebookContactDisplayType = 0;
    int m_driverRestrictedPhonebookModelMinRow = -1;
    int m_driverRestrictedPhonebookModelMaxRow = -1;
    int m_recentCallListStatus = 0;
    int m_currentRecentCallListType = 0;
    int m_messagesDownloadingStatus = 0;
    bool m_messagesInboxEmptyStatus = true;
    bool m_messagesInMemoryStatus = false;
    bool m_messageNotificationEnabled = false;
    bool m_messageAccessProfileStatus = false;
    bool m_smsMessageAccessProfileAvailable = false;
    bool m_smsPhoneDeclinedAccessStatus = false;
    int m_numOfSmsDownloadAttempts = 0;
    int m_smsTotalCount = 0;
    int m_totalUnreadSmsCount = 0;
    QString m_textMessageBody;
    QString m_textMessageSenderName;
    QString m_textMessageSenderNumber;
    int m_listenMessageLineNo = 0;
    int m_replyMessageLineNo = 0;
    QVariantList m_smsReplyMessages;
    QString m_replyTextSelected;
    bool m_hearItPressed = false;
    int m_sendMessageStatus = -1;
    bool m_sendMessagePhoneSendReportStatus = false;
};

} // namespace Mavrosk
