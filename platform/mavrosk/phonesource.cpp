#include "phonesource.h"

namespace Mavrosk {

PhoneSource::PhoneSource()
    : DataSource(QStringLiteral("phone"))
    , m_alphabetIndexModel(new MultiDPListModel(
              {QStringLiteral("alphabet"), QStringLiteral("letterIndex")}, this))
    , m_phoneBook(new InfiniteListModel({QStringLiteral("name"), QStringLiteral("number")}, this))
    , m_recentCallList(new MultiDPListModel({QStringLiteral("name"), QStringLiteral("number"),
                                             QStringLiteral("type"), QStringLiteral("time")},
                                            this))
    , m_textMessageList(new MultiDPListModel({QStringLiteral("name"), QStringLiteral("number"),
                                              QStringLiteral("time"), QStringLiteral("text"),
                                              QStringLiteral("read")},
                                             this))
    , m_callList(new MultiDPListModel({QStringLiteral("name"), QStringLiteral("number"),
                                       QStringLiteral("callState"), QStringLiteral("duration")},
                                      this))
    , m_statusAlertList(new MultiDPListModel(
              {QStringLiteral("alertId"), QStringLiteral("supportPhoneNumber")}, this))
{
    // The views call the two model getters from QML, which needs their return types by name.
    qRegisterMetaType<MultiDPListModel *>();
    qRegisterMetaType<InfiniteListModel *>();
}

PhoneSource *PhoneSource::instance()
{
    static PhoneSource *const source = adopt(new PhoneSource);
    return source;
}

MultiDPListModel *PhoneSource::AlphabetIndexModel() const
{
    return m_alphabetIndexModel;
}

InfiniteListModel *PhoneSource::phoneBook() const
{
    return m_phoneBook;
}

MultiDPListModel *PhoneSource::recentCallList() const
{
    return m_recentCallList;
}

MultiDPListModel *PhoneSource::textMessageList() const
{
    return m_textMessageList;
}

MultiDPListModel *PhoneSource::callList() const
{
    return m_callList;
}

MultiDPListModel *PhoneSource::statusAlertList() const
{
    return m_statusAlertList;
}

void PhoneSource::resetModels()
{
    m_alphabetIndexModel->setRows({});
    m_phoneBook->setRows({});
    m_phoneBook->setListLength(0);
    m_recentCallList->setRows({});
    m_textMessageList->setRows({});
    m_callList->setRows({});
    m_statusAlertList->setRows({});
}

void PhoneSource::setStatus(int value)
{
    update(m_status, value, &PhoneSource::statusChanged);
}

void PhoneSource::setIncomingCall(bool value)
{
    update(m_incomingCall, value, &PhoneSource::incomingCallChanged);
}

void PhoneSource::setCallConnected(bool value)
{
    update(m_callConnected, value, &PhoneSource::callConnectedChanged);
}

void PhoneSource::setDialingInProgress(bool value)
{
    update(m_dialingInProgress, value, &PhoneSource::dialingInProgressChanged);
}

void PhoneSource::setMultipleCallsConnected(bool value)
{
    update(m_multipleCallsConnected, value, &PhoneSource::multipleCallsConnectedChanged);
}

void PhoneSource::setPrivateMode(bool value)
{
    update(m_privateMode, value, &PhoneSource::privateModeChanged);
}

void PhoneSource::setMuted(bool value)
{
    update(m_muted, value, &PhoneSource::mutedChanged);
}

void PhoneSource::setEmergencyCallStatus(int value)
{
    update(m_emergencyCallStatus, value, &PhoneSource::emergencyCallStatusChanged);
}

void PhoneSource::setDoNotDisturb(bool value)
{
    update(m_doNotDisturb, value, &PhoneSource::doNotDisturbChanged);
}

void PhoneSource::setRoaming(bool value)
{
    update(m_roaming, value, &PhoneSource::roamingChanged);
}

void PhoneSource::setRoamingWarning(bool value)
{
    journalSetter(QStringLiteral("setRoamingWarning"), value);
    update(m_roamingWarning, value, &PhoneSource::roamingWarningChanged);
}

void PhoneSource::setDeviceBatteryLevel(int value)
{
    update(m_deviceBatteryLevel, value, &PhoneSource::deviceBatteryLevelChanged);
}

void PhoneSource::setLowBatteryNotification(bool value)
{
    journalSetter(QStringLiteral("setLowBatteryNotification"), value);
    update(m_lowBatteryNotification, value, &PhoneSource::lowBatteryNotificationChanged);
}

void PhoneSource::setSiriSupported(bool value)
{
    update(m_siriSupported, value, &PhoneSource::siriSupportedChanged);
}

void PhoneSource::setSiriEnabled(bool value)
{
    update(m_siriEnabled, value, &PhoneSource::siriEnabledChanged);
}

void PhoneSource::setSiriActive(bool value)
{
    update(m_siriActive, value, &PhoneSource::siriActiveChanged);
}

void PhoneSource::setPhoneVoiceServiceActive(bool value)
{
    update(m_phoneVoiceServiceActive, value, &PhoneSource::phoneVoiceServiceActiveChanged);
}

void PhoneSource::setCurrentExtendedMode(int value)
{
    update(m_currentExtendedMode, value, &PhoneSource::currentExtendedModeChanged);
}

void PhoneSource::setExtendedModeTimerValue(int value)
{
    update(m_extendedModeTimerValue, value, &PhoneSource::extendedModeTimerValueChanged);
}

void PhoneSource::setPhoneCallStandByMode(bool value)
{
    journalSetter(QStringLiteral("setPhoneCallStandByMode"), value);
    update(m_phoneCallStandByMode, value, &PhoneSource::phoneCallStandByModeChanged);
}

void PhoneSource::setMuteAudioInPrivacy(bool value)
{
    journalSetter(QStringLiteral("setMuteAudioInPrivacy"), value);
    update(m_muteAudioInPrivacy, value, &PhoneSource::muteAudioInPrivacyChanged);
}

void PhoneSource::setPhoneRingtone(int value)
{
    journalSetter(QStringLiteral("setPhoneRingtone"), value);
    update(m_phoneRingtone, value, &PhoneSource::phoneRingtoneChanged);
}

void PhoneSource::setMessageNotification(int value)
{
    journalSetter(QStringLiteral("setMessageNotification"), value);
    update(m_messageNotification, value, &PhoneSource::messageNotificationChanged);
}

void PhoneSource::setCallNumberEntered(const QString &value)
{
    journalSetter(QStringLiteral("setCallNumberEntered"), value);
    update(m_callNumberEntered, value, &PhoneSource::callNumberEnteredChanged);
}

void PhoneSource::setDTMFNumberEntered(const QString &value)
{
    journalSetter(QStringLiteral("setDTMFNumberEntered"), value);
    update(m_dtmfNumberEntered, value, &PhoneSource::dtmfNumberEnteredChanged);
}

void PhoneSource::setOutboundRoamingCallIsFromRecentList(bool value)
{
    journalSetter(QStringLiteral("setOutboundRoamingCallIsFromRecentList"), value);
    update(m_outboundRoamingCallIsFromRecentList, value,
           &PhoneSource::outboundRoamingCallIsFromRecentListChanged);
}

void PhoneSource::setOutboundRoamingRecentCallType(int value)
{
    journalSetter(QStringLiteral("setOutboundRoamingRecentCallType"), value);
    update(m_outboundRoamingRecentCallType, value,
           &PhoneSource::outboundRoamingRecentCallTypeChanged);
}

void PhoneSource::setOutboundRoamingRecentCallIndex(int value)
{
    journalSetter(QStringLiteral("setOutboundRoamingRecentCallIndex"), value);
    update(m_outboundRoamingRecentCallIndex, value,
           &PhoneSource::outboundRoamingRecentCallIndexChanged);
}

void PhoneSource::setPhoneBookStatus(int value)
{
    update(m_phoneBookStatus, value, &PhoneSource::phoneBookStatusChanged);
}

void PhoneSource::setAutomaticContactDownload(bool value)
{
    journalSetter(QStringLiteral("setAutomaticContactDownload"), value);
    update(m_automaticContactDownload, value, &PhoneSource::automaticContactDownloadChanged);
}

void PhoneSource::setContactSortOrder(int value)
{
    journalSetter(QStringLiteral("setContactSortOrder"), value);
    update(m_contactSortOrder, value, &PhoneSource::contactSortOrderChanged);
}

void PhoneSource::setPhonebookContactDisplayType(int value)
{
    journalSetter(QStringLiteral("setPhonebookContactDisplayType"), value);
    update(m_phonebookContactDisplayType, value, &PhoneSource::phonebookContactDisplayTypeChanged);
}

void PhoneSource::setDriverRestrictedPhonebookModelMinRow(int value)
{
    journalSetter(QStringLiteral("setDriverRestrictedPhonebookModelMinRow"), value);
    update(m_driverRestrictedPhonebookModelMinRow, value,
           &PhoneSource::driverRestrictedPhonebookModelMinRowChanged);
}

void PhoneSource::setDriverRestrictedPhonebookModelMaxRow(int value)
{
    journalSetter(QStringLiteral("setDriverRestrictedPhonebookModelMaxRow"), value);
    update(m_driverRestrictedPhonebookModelMaxRow, value,
           &PhoneSource::driverRestrictedPhonebookModelMaxRowChanged);
}

void PhoneSource::setRecentCallListStatus(int value)
{
    update(m_recentCallListStatus, value, &PhoneSource::recentCallListStatusChanged);
}

void PhoneSource::setCurrentRecentCallListType(int value)
{
    journalSetter(QStringLiteral("setCurrentRecentCallListType"), value);
    update(m_currentRecentCallListType, value, &PhoneSource::currentRecentCallListTypeChanged);
}

void PhoneSource::setMessagesDownloadingStatus(int value)
{
    update(m_messagesDownloadingStatus, value, &PhoneSource::messagesDownloadingStatusChanged);
}

void PhoneSource::setMessagesInboxEmptyStatus(bool value)
{
    update(m_messagesInboxEmptyStatus, value, &PhoneSource::messagesInboxEmptyStatusChanged);
}

void PhoneSource::setMessagesInMemoryStatus(bool value)
{
    update(m_messagesInMemoryStatus, value, &PhoneSource::messagesInMemoryStatusChanged);
}

void PhoneSource::setMessageNotificationEnabled(bool value)
{
    update(m_messageNotificationEnabled, value, &PhoneSource::messageNotificationEnabledChanged);
}

void PhoneSource::setMessageAccessProfileStatus(bool value)
{
    update(m_messageAccessProfileStatus, value, &PhoneSource::messageAccessProfileStatusChanged);
}

void PhoneSource::setSmsMessageAccessProfileAvailable(bool value)
{
    update(m_smsMessageAccessProfileAvailable, value,
           &PhoneSource::smsMessageAccessProfileAvailableChanged);
}

void PhoneSource::setSmsPhoneDeclinedAccessStatus(bool value)
{
    update(m_smsPhoneDeclinedAccessStatus, value,
           &PhoneSource::smsPhoneDeclinedAccessStatusChanged);
}

void PhoneSource::setNumOfSmsDownloadAttempts(int value)
{
    update(m_numOfSmsDownloadAttempts, value, &PhoneSource::numOfSmsDownloadAttemptsChanged);
}

void PhoneSource::setSmsTotalCount(int value)
{
    update(m_smsTotalCount, value, &PhoneSource::smsTotalCountChanged);
}

void PhoneSource::setTotalUnreadSmsCount(int value)
{
    update(m_totalUnreadSmsCount, value, &PhoneSource::totalUnreadSmsCountChanged);
}

void PhoneSource::setTextMessageBody(const QString &value)
{
    update(m_textMessageBody, value, &PhoneSource::textMessageBodyChanged);
}

void PhoneSource::setTextMessageSenderName(const QString &value)
{
    update(m_textMessageSenderName, value, &PhoneSource::textMessageSenderNameChanged);
}

void PhoneSource::setTextMessageSenderNumber(const QString &value)
{
    update(m_textMessageSenderNumber, value, &PhoneSource::textMessageSenderNumberChanged);
}

void PhoneSource::setListenMessageLineNo(int value)
{
    update(m_listenMessageLineNo, value, &PhoneSource::listenMessageLineNoChanged);
}

void PhoneSource::setReplyMessageLineNo(int value)
{
    update(m_replyMessageLineNo, value, &PhoneSource::replyMessageLineNoChanged);
}

void PhoneSource::setSmsReplyMessages(const QVariantList &value)
{
    update(m_smsReplyMessages, value, &PhoneSource::smsReplyMessagesChanged);
}

void PhoneSource::setReplyTextSelected(const QString &value)
{
    journalSetter(QStringLiteral("setReplyTextSelected"), value);
    update(m_replyTextSelected, value, &PhoneSource::replyTextSelectedChanged);
}

void PhoneSource::setHearItPressed(bool value)
{
    journalSetter(QStringLiteral("setHearItPressed"), value);
    update(m_hearItPressed, value, &PhoneSource::hearItPressedChanged);
}

void PhoneSource::setSendMessageStatus(int value)
{
    update(m_sendMessageStatus, value, &PhoneSource::sendMessageStatusChanged);
}

void PhoneSource::setSendMessagePhoneSendReportStatus(bool value)
{
    journalSetter(QStringLiteral("setSendMessagePhoneSendReportStatus"), value);
    update(m_sendMessagePhoneSendReportStatus, value,
           &PhoneSource::sendMessagePhoneSendReportStatusChanged);
}

void PhoneSource::checkPhoneStatus()
{
    journalCall(QStringLiteral("checkPhoneStatus"));
}

void PhoneSource::dialNumber(const QString &number)
{
    journalCall(QStringLiteral("dialNumber"), {number});
}

void PhoneSource::dialRecentCall(int type, int index)
{
    journalCall(QStringLiteral("dialRecentCall"), {type, index});
}

void PhoneSource::acceptIncomingCall()
{
    journalCall(QStringLiteral("acceptIncomingCall"));
}

void PhoneSource::rejectIncomingCall()
{
    journalCall(QStringLiteral("rejectIncomingCall"));
}

void PhoneSource::stopAcceptingAttempts()
{
    journalCall(QStringLiteral("stopAcceptingAttempts"));
}

void PhoneSource::endCall()
{
    journalCall(QStringLiteral("endCall"));
}

void PhoneSource::swapCall()
{
    journalCall(QStringLiteral("swapCall"));
}

void PhoneSource::joinCalls()
{
    journalCall(QStringLiteral("joinCalls"));
}

void PhoneSource::toggleMuted()
{
    journalCall(QStringLiteral("toggleMuted"));
}

void PhoneSource::togglePrivacyMode()
{
    journalCall(QStringLiteral("togglePrivacyMode"));
}

void PhoneSource::dialPadKeyTonePressed(int tone)
{
    journalCall(QStringLiteral("dialPadKeyTonePressed"), {tone});
}

void PhoneSource::cancelRoamingCall()
{
    journalCall(QStringLiteral("cancelRoamingCall"));
}

void PhoneSource::enableDoNotDisturb()
{
    journalCall(QStringLiteral("enableDoNotDisturb"));
}

void PhoneSource::disableDoNotDisturb()
{
    journalCall(QStringLiteral("disableDoNotDisturb"));
}

void PhoneSource::toggleSiriActivation(bool active)
{
    journalCall(QStringLiteral("toggleSiriActivation"), {active});
}

void PhoneSource::togglePhoneVoiceServiceActivation(bool active)
{
    journalCall(QStringLiteral("togglePhoneVoiceServiceActivation"), {active});
}

void PhoneSource::searchPhoneBook(const QString &searchData)
{
    journalCall(QStringLiteral("searchPhoneBook"), {searchData});
}

void PhoneSource::selectPhoneBookEntry(int index)
{
    journalCall(QStringLiteral("selectPhoneBookEntry"), {index});
}

void PhoneSource::retryPhoneBookDownload(int device)
{
    journalCall(QStringLiteral("retryPhoneBookDownload"), {device});
}

void PhoneSource::retryPhnBookDownloadAccess()
{
    journalCall(QStringLiteral("retryPhnBookDownloadAccess"));
}

void PhoneSource::resetPhoneBook()
{
    journalCall(QStringLiteral("resetPhoneBook"));
}

void PhoneSource::exitingPhoneBook()
{
    journalCall(QStringLiteral("exitingPhoneBook"));
}

void PhoneSource::reDownloadContacts()
{
    journalCall(QStringLiteral("reDownloadContacts"));
}

void PhoneSource::deleteAllContacts()
{
    journalCall(QStringLiteral("deleteAllContacts"));
}

void PhoneSource::downloadRecentCallsList()
{
    journalCall(QStringLiteral("downloadRecentCallsList"));
}

void PhoneSource::downloadRecentCallsList(int type)
{
    journalCall(QStringLiteral("downloadRecentCallsList"), {type});
}

void PhoneSource::cancelRecentCallsDownload()
{
    journalCall(QStringLiteral("cancelRecentCallsDownload"));
}

void PhoneSource::requestTextMessagesInbox()
{
    journalCall(QStringLiteral("requestTextMessagesInbox"));
}

void PhoneSource::retrySmsDownload()
{
    journalCall(QStringLiteral("retrySmsDownload"));
}

void PhoneSource::retrySmsDownload(int device)
{
    journalCall(QStringLiteral("retrySmsDownload"), {device});
}

void PhoneSource::retryMessageProfileAccess()
{
    journalCall(QStringLiteral("retryMessageProfileAccess"));
}

void PhoneSource::requestSelectedTextMessageDetails(int index)
{
    journalCall(QStringLiteral("requestSelectedTextMessageDetails"), {index});
}

void PhoneSource::requestNewTextMessageDetails()
{
    journalCall(QStringLiteral("requestNewTextMessageDetails"));
}

void PhoneSource::textMessagePlayback(const QString &text)
{
    journalCall(QStringLiteral("textMessagePlayback"), {text});
}

void PhoneSource::stopTextMessagePlayback()
{
    journalCall(QStringLiteral("stopTextMessagePlayback"));
}

void PhoneSource::contactNamePlayback(const QString &name)
{
    journalCall(QStringLiteral("contactNamePlayback"), {name});
}

void PhoneSource::initiateSendTextMessage()
{
    journalCall(QStringLiteral("initiateSendTextMessage"));
}

void PhoneSource::sendMessageNotificationEnabled(bool enabled)
{
    journalCall(QStringLiteral("sendMessageNotificationEnabled"), {enabled});
}

void PhoneSource::clearAlertPermanently(int alertId)
{
    journalCall(QStringLiteral("clearAlertPermanently"), {alertId});
}

void PhoneSource::clearAlertForThisCycle(int alertId)
{
    journalCall(QStringLiteral("clearAlertForThisCycle"), {alertId});
}

void PhoneSource::callForFixAlert(int alertId, const QString &supportPhoneNumber)
{
    journalCall(QStringLiteral("callForFixAlert"), {alertId, supportPhoneNumber});
}

void PhoneSource::playRingtone(int ringtone)
{
    journalCall(QStringLiteral("playRingtone"), {ringtone});
}

void PhoneSource::stopPlayRingtone()
{
    journalCall(QStringLiteral("stopPlayRingtone"));
}

void PhoneSource::playAlert(int alert)
{
    journalCall(QStringLiteral("playAlert"), {alert});
}

} // namespace Mavrosk
