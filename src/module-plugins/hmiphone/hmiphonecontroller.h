#pragma once

#include <brisken/modulecontroller.h>
#include <mavrosk/bluetoothsource.h>
#include <mavrosk/eaphonesource.h>
#include <mavrosk/phonesource.h>

#include <QObject>
#include <QString>

namespace HmiPhone {

class HmiPhoneIntegration;

// The object the phone's QML views talk to ("_hmiphoneController") and that the module's state
// components and handlers are handed. Every request of a view becomes a posted state-machine
// event, an intent request, a phone-source command or, for jumpToPhoneSection(), a direct view
// request; the states decide what is shown.
class HmiPhoneController : public Brisken::ModuleController
{
    Q_OBJECT
    Q_PROPERTY(Mavrosk::BluetoothSource *bluetoothSource READ bluetoothSource CONSTANT)
    Q_PROPERTY(Mavrosk::PhoneSource *phoneSource READ phoneSource CONSTANT)
    Q_PROPERTY(Mavrosk::EAPhoneSource *eaPhoneSource READ eaPhoneSource CONSTANT)
    Q_PROPERTY(int longPressInterval READ longPressInterval WRITE setLongPressInterval NOTIFY
                       longPressIntervalChanged)
    Q_PROPERTY(int maximumSizeOfNumber READ maximumSizeOfNumber WRITE setMaximumSizeOfNumber NOTIFY
                       maximumSizeOfNumberChanged)
    Q_PROPERTY(int maxKnownBluetoothDevices READ maxKnownBluetoothDevices WRITE
                       setMaxKnownBluetoothDevices NOTIFY maxKnownBluetoothDevicesChanged)
    Q_PROPERTY(int batteryLowLevel READ batteryLowLevel WRITE setBatteryLowLevel NOTIFY
                       batteryLowLevelChanged)
    Q_PROPERTY(int receivedTextMessageCount READ receivedTextMessageCount NOTIFY
                       receivedTextMessageCountChanged)
    Q_PROPERTY(int lastKnownPhonebookIndex READ lastKnownPhonebookIndex WRITE
                       setLastKnownPhonebookIndex NOTIFY lastKnownPhonebookIndexChanged)
    Q_PROPERTY(bool isMaximumSizeOfNumber READ isMaximumSizeOfNumber NOTIFY
                       isMaximumSizeOfNumberChanged)
    Q_PROPERTY(bool isEmptyNumber READ isEmptyNumber NOTIFY isEmptyNumberChanged)
    Q_PROPERTY(bool testMode READ testMode CONSTANT)

public:
    explicit HmiPhoneController(HmiPhoneIntegration *integration);

    Mavrosk::BluetoothSource *bluetoothSource() const { return m_bluetoothSource; }
    Mavrosk::PhoneSource *phoneSource() const { return m_phoneSource; }
    Mavrosk::EAPhoneSource *eaPhoneSource() const;

    int longPressInterval() const { return m_longPressInterval; }
    int maximumSizeOfNumber() const { return m_maximumSizeOfNumber; }
    int maxKnownBluetoothDevices() const { return m_maxKnownBluetoothDevices; }
    int batteryLowLevel() const { return m_batteryLowLevel; }
    int receivedTextMessageCount() const { return m_receivedTextMessageCount; }
    int lastKnownPhonebookIndex() const { return m_lastKnownPhonebookIndex; }
    bool isMaximumSizeOfNumber() const { return m_isMaximumSizeOfNumber; }
    bool isEmptyNumber() const { return m_isEmptyNumber; }
    bool testMode() const { return false; }

    // True once when the phone's battery enters the low range (or on the first valid low
    // reading); false while it stays low. -1 means "no level known" and re-arms the warning.
    bool shouldBatteryWarningBeShown(int level);
    void incrementRecievedTextMessageCount();
    void resetRecievedTextMessageCount();

signals:
    void longPressIntervalChanged(int longPressInterval);
    void maximumSizeOfNumberChanged(int maximumSizeOfNumber);
    void maxKnownBluetoothDevicesChanged(int arg);
    void batteryLowLevelChanged(int arg);
    void receivedTextMessageCountChanged(int arg);
    void lastKnownPhonebookIndexChanged(int arg);
    void isMaximumSizeOfNumberChanged(bool isMaximumSizeOfNumber);
    void isEmptyNumberChanged(bool isEmptyNumber);
    // Relayed from the phone menu state's entered/exited signals by the integration.
    void phoneMenuExited();
    void phoneMenuEntered();

public slots:
    // Requests that become state-machine events.
    void viewRecentCalls();
    void viewContacts();
    void searchContacts();
    void showPhoneBookWaitingForResponseFromPhone();
    void viewVoiceMail();
    void viewiPhone();
    void viewTextMessages();
    void showTextMessages();
    void viewIphoneTextMessages();
    void toggleSiri();
    void viewStatusBarAlerts();
    void showDialPad();
    void showCallKeyPad();
    void hideCallKeyPad();
    void toggleDoNotDisturb();
    void dialPadButtonPressed(const QString &arg);
    void dialPadBackSpacePressed();
    void dialPadBackSpaceLongPress();
    void dialPadSpeakItPressed();
    void dialPadTonePressed(const QString &tone, const QString &textButton);
    void makeCall();
    void endCall();
    void acceptIncomingCall();
    void rejectIncomingCall();
    void acceptWaitingCall();
    void rejectWaitingCall();
    void stopAnswering();
    void requestMute();
    void requestPrivacy();
    void privacyModeOn();
    void requestPhoneIssueFix();
    void setDeviceAsPhone();
    void setDeviceAsMedia();
    void setDeviceAsPhoneAndMedia();
    void autoDownloadPhoneBookPositive();
    void autoDownloadPhoneBookNegative();
    void redialRequest();
    void cancelRedialRequest();
    void callEndConfirmed();
    void confirmRoamingCall();
    void cancelRoamingCall();
    void fixStatusAlert(int alertId);
    void clearStatusAlert(int alertId);
    void clearAlertPermanently(int alertId);
    void clearAlertForThisCycle(int alertId);
    void callForFixAlert(int alertId, const QString &supportPhoneNumber);
    void clearAlert(int alertId);
    void retryDownloadContact(int alertId);
    void retryAutomaticContactDownload();
    void retryPhnBookDownloadAccess();
    void retryAccessTextMessages(int alertId);
    void hearNewTextMessage();
    void stopHearNewTextMessage();
    void viewNewTextMessage();
    void callNewTextMessageNumber();
    void replyNewTextMessage();
    void hideNewTextMessageAlert();
    void retryMessagesDownloading();
    void cancelMessagesDownloading();
    void viewTextMessageOptions(int arg);
    void refreshMessages();
    void viewTextMessage();
    void replyTextMessage();
    void sendTextMessage();
    void initiateSendTextMessage();
    void retrySendTextMessage();
    void hearTextMessage();
    void hearSelectedTextMessage(int arg);
    void requestMessageProfileAccessRetry();
    void hearSelectedReplyMessage();
    void showConnectToDevice();
    void clearExtendedModeTimer();
    void cancelPhoneBookDownload();
    void requestPhoneManageContactsSettingsPage();
    void requestPhoneRingtoneSettingsPage();
    void requestPhoneTextMessageNotificationSettingsPage();
    void requestPhoneDeleteAllContactsPopup();

    // Requests of other modules' actions (and of the phone's own intent handler).
    void addPhonePressed();
    void gotoPhoneSettings();
    void viewBluetoothDevices();
    void showConnectedDeviceSettings();
    void showNavPOIByAddress(const QString &name, const QString &street, const QString &city,
                             const QString &state, const QString &country, const QString &zip);

    // Commands to the phone source.
    void swapCall();
    void joinCalls();
    void selectPhoneBookEntry(int index);
    void requestRecentCallsList(int callType);
    void retryRecentCallsDownload();
    void cancelRecentCallsDownload();
    void sendMessageNotificationEnabled(bool enabled);
    void playText(const QString &text);
    void playContactName(const QString &name);
    void siriCancelPressed();
    void phoneVoiceServiceCancelPressed();
    void setPhonebookContactDisplayType(int);
    void setPhoneMuteAudioInPrivacyEnabled(bool enabled);
    void setRoamingWarningEnabled(bool enabled);
    void setLowBatteryNotificationEnabled(bool enabled);
    void setContactSortOrder(int sortOrder);
    void requestReDownloadContacts();
    void requestDeleteAllContacts();
    void playRingtone(int);
    void stopPlayRingtone();
    void playAlert(int);
    void setRingtone(int);
    void setAlert(int);

    // Requests that decide between the above first.
    void callNumber(const QString &phoneNumber);
    void dialRecentCall(int type, int index);
    void callKovaSupport();
    void setAutomaticContactDownloadEnabled(bool enabled);
    void jumpToPhoneSection();

    // The driver-restricted phonebook window: the rows between a min and a max row that the
    // phone shows while driving. The rows set are always inside the contact list (-1 and -1 for
    // an empty list, an absent letter or one without contacts) and never more than five pages
    // (visible rows) or 20 rows (a letter). Arguments are taken as the nearest sensible value:
    // a page size below 1 counts as 1, rows outside the list as its nearest end, a bottom row
    // above the top row as the top row. Letter starts that are not rows of the list count as a
    // letter without contacts.
    void calculateDriverRestrictedPhonebookMinMaxRows(int topItemIndex, int bottomItemIndex,
                                                      int itemsPerPage);
    void driverRestrictedPhonebookFilterByAlpha(const QString &character);
    void searchPhoneBook(const QString &searchData);

    // Property setters.
    void setLongPressInterval(int longPressInterval);
    void setMaximumSizeOfNumber(int maximumSizeOfNumber);
    void setMaxKnownBluetoothDevices(int arg);
    void setBatteryLowLevel(int arg);
    void setLastKnownPhonebookIndex(int index);

private slots:
    void checkSizeOfNumber(const QString &number);
    void phoneDeviceChanged();

private:
    void postHmiEvent(const QString &name, const QVariant &value = QVariant());
    void requestIntent(int action, const QVariantList &arguments = QVariantList());
    bool roamingPromptNeeded() const;
    void setDriverRestrictedRows(int minRow, int maxRow);

    HmiPhoneIntegration *m_integration = nullptr;
    Mavrosk::BluetoothSource *m_bluetoothSource = nullptr;
    Mavrosk::PhoneSource *m_phoneSource = nullptr;
    int m_longPressInterval;
    int m_maximumSizeOfNumber;
    int m_maxKnownBluetoothDevices;
    int m_batteryLowLevel;
    int m_lastBatteryLevel = -1;
    int m_receivedTextMessageCount = 0;
    int m_lastKnownPhonebookIndex = -1;
    bool m_isMaximumSizeOfNumber = false;
    bool m_isEmptyNumber = true;
};

} // namespace HmiPhone
