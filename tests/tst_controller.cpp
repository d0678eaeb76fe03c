#include "hmiphonecontroller.h"
#include "hmiphoneintegration.h"
#include "testsupport.h"

#include <mavrosk/bluetoothsource.h>
#include <mavrosk/infinitelistmodel.h>
#include <mavrosk/multidplistmodel.h>
#include <mavrosk/phonesource.h>

#include <QSignalSpy>
#include <QtTest>

#include <functional>
#include <limits>
#include <memory>

using HmiPhone::HmiPhoneController;
using Request = std::function<void(HmiPhoneController &)>;
Q_DECLARE_METATYPE(Request)

namespace {

const char InvalidIntegration[] = "HmiPhoneController: Invalid HmiPhoneIntegration instance!";

// What the controller asked of the platform since `since`, one line per request:
// "phone.dialNumber(555)", "intent 20(a,b)", "event HmiPhone_RoamingMode".
QStringList trace(qint64 since)
{
    return TestSupport::journalLines(
            since, {QStringLiteral("event"), QStringLiteral("intent"), QStringLiteral("bridge")});
}

// The alphabet bar A..E with start rows 0, -1, 10, 25, 40 (or those given) over a contact list
// of 60 rows.
void loadAlphabetBar(QList<int> starts = {})
{
    QVariantList rows;
    if (starts.isEmpty())
        starts = {0, -1, 10, 25, 40};
    for (int i = 0; i < starts.size(); ++i)
        rows.append(QVariantMap{{QStringLiteral("alphabet"), QString(QLatin1Char('A' + i))},
                                {QStringLiteral("letterIndex"), starts[i]}});
    Mavrosk::PhoneSource::instance()->AlphabetIndexModel()->setRows(rows);
    Mavrosk::PhoneSource::instance()->phoneBook()->setListLength(60);
}

// The restricted phonebook window handed to the phone.
QStringList window(int minRow, int maxRow)
{
    return {QStringLiteral("phone.setDriverRestrictedPhonebookModelMinRow(%1)").arg(minRow),
            QStringLiteral("phone.setDriverRestrictedPhonebookModelMaxRow(%1)").arg(maxRow)};
}

QStringList expect(std::initializer_list<const char *> lines)
{
    QStringList list;
    for (const char *line : lines)
        list << QString::fromLatin1(line);
    return list;
}

void setRoaming(bool connected, bool roaming, bool warning)
{
    Mavrosk::BluetoothSource::instance()->setBridgeValue(QStringLiteral("deviceConnected"),
                                                         connected);
    Mavrosk::PhoneSource::instance()->setBridgeValue(QStringLiteral("roaming"), roaming);
    Mavrosk::PhoneSource::instance()->setBridgeValue(QStringLiteral("roamingWarning"), warning);
}

} // namespace

class TestController : public TestSupport::Suite
{
    Q_OBJECT

protected:
    void setUp() override
    {
        for (Mavrosk::DataSource *source : Mavrosk::DataSource::sources())
            source->reset();
        expectMessage(QtCriticalMsg, InvalidIntegration);
        m_controller = std::make_unique<HmiPhoneController>(nullptr);
        m_since = Platform::Journal::instance()->lastSequence();
    }

    void tearDown() override
    {
        m_controller.reset();
        TestSupport::processUntilIdle();
    }

private slots:

    void eventRequests_data()
    {
        QTest::addColumn<Request>("request");
        QTest::addColumn<QString>("name");
        QTest::addColumn<QVariant>("value");

        const QVariant none;
        // clang-format off
    const QList<std::tuple<const char *, Request, const char *, QVariant>> rows {
        { "viewRecentCalls", [](HmiPhoneController &c) { c.viewRecentCalls(); }, "HmiPhone_ShowRecentCallsRequest", none },
        { "viewContacts", [](HmiPhoneController &c) { c.viewContacts(); }, "HmiPhone_ShowContactsRequest", none },
        { "searchContacts", [](HmiPhoneController &c) { c.searchContacts(); }, "HmiPhone_ShowContactsSearch", none },
        { "showPhoneBookWaitingForResponseFromPhone", [](HmiPhoneController &c) { c.showPhoneBookWaitingForResponseFromPhone(); }, "HmiPhone_ShowPhoneBookWaitingForResponseRequest", none },
        { "viewVoiceMail", [](HmiPhoneController &c) { c.viewVoiceMail(); }, "HmiPhone_ShowVoiceMailRequest", none },
        { "viewiPhone", [](HmiPhoneController &c) { c.viewiPhone(); }, "HmiPhone_ShowiPhoneRequest", none },
        { "viewTextMessages", [](HmiPhoneController &c) { c.viewTextMessages(); }, "HmiPhone_ShowSmsRequest", none },
        { "showTextMessages", [](HmiPhoneController &c) { c.showTextMessages(); }, "HmiPhone_ShowSmsStatus", none },
        { "viewIphoneTextMessages", [](HmiPhoneController &c) { c.viewIphoneTextMessages(); }, "HmiPhone_ShowSmsIphoneRequest", none },
        { "toggleSiri", [](HmiPhoneController &c) { c.toggleSiri(); }, "HmiPhone_SiriRequest", none },
        { "viewStatusBarAlerts", [](HmiPhoneController &c) { c.viewStatusBarAlerts(); }, "HmiPhone_ShowStatusBarAlertsRequest", none },
        { "showDialPad", [](HmiPhoneController &c) { c.showDialPad(); }, "HmiPhone_ShowPhoneKeyPadRequest", none },
        { "showCallKeyPad", [](HmiPhoneController &c) { c.showCallKeyPad(); }, "HmiPhone_ShowCallKeyPadRequest", none },
        { "hideCallKeyPad", [](HmiPhoneController &c) { c.hideCallKeyPad(); }, "HmiPhone_HideCallKeyPadRequest", none },
        { "toggleDoNotDisturb", [](HmiPhoneController &c) { c.toggleDoNotDisturb(); }, "HmiPhone_DoNotDisturbToggleRequest", none },
        { "dialPadButtonPressed", [](HmiPhoneController &c) { c.dialPadButtonPressed(QStringLiteral("7")); }, "HmiPhone_DialPadKeyPressed", QStringLiteral("7") },
        { "dialPadBackSpacePressed", [](HmiPhoneController &c) { c.dialPadBackSpacePressed(); }, "HmiPhone_DialPadBackSpace", none },
        { "dialPadBackSpaceLongPress", [](HmiPhoneController &c) { c.dialPadBackSpaceLongPress(); }, "HmiPhone_DialPadBackSpaceLongPress", none },
        { "dialPadSpeakItPressed", [](HmiPhoneController &c) { c.dialPadSpeakItPressed(); }, "HmiPhone_VoiceInputRequest", none },
        { "dialPadTonePressed star", [](HmiPhoneController &c) { c.dialPadTonePressed(QStringLiteral("*"), QStringLiteral("*")); }, "HmiPhone_DialPadKeyTonePressed", QVariantList { 42, QStringLiteral("*") } },
        { "dialPadTonePressed hash", [](HmiPhoneController &c) { c.dialPadTonePressed(QStringLiteral("#"), QStringLiteral("#")); }, "HmiPhone_DialPadKeyTonePressed", QVariantList { 35, QStringLiteral("#") } },
        { "dialPadTonePressed first char", [](HmiPhoneController &c) { c.dialPadTonePressed(QStringLiteral("12"), QStringLiteral("one")); }, "HmiPhone_DialPadKeyTonePressed", QVariantList { 49, QStringLiteral("one") } },
        { "dialPadTonePressed above 127", [](HmiPhoneController &c) { c.dialPadTonePressed(QString(QChar(0xE9)), QStringLiteral("e")); }, "HmiPhone_DialPadKeyTonePressed", QVariantList { 0xE9 - 256, QStringLiteral("e") } },
        { "makeCall", [](HmiPhoneController &c) { c.makeCall(); }, "HmiPhone_MakeCallRequest", none },
        { "endCall", [](HmiPhoneController &c) { c.endCall(); }, "HmiPhone_EndCallRequest", none },
        { "acceptIncomingCall", [](HmiPhoneController &c) { c.acceptIncomingCall(); }, "HmiPhone_AcceptIncomingCall", none },
        { "rejectIncomingCall", [](HmiPhoneController &c) { c.rejectIncomingCall(); }, "HmiPhone_RejectIncomingCall", none },
        { "acceptWaitingCall", [](HmiPhoneController &c) { c.acceptWaitingCall(); }, "HmiPhone_AcceptWaitingCall", none },
        { "rejectWaitingCall", [](HmiPhoneController &c) { c.rejectWaitingCall(); }, "HmiPhone_RejectWaitingCall", none },
        { "stopAnswering", [](HmiPhoneController &c) { c.stopAnswering(); }, "HmiPhone_StopAnswering", none },
        { "requestMute", [](HmiPhoneController &c) { c.requestMute(); }, "HmiPhone_MuteRequest", none },
        { "requestPrivacy", [](HmiPhoneController &c) { c.requestPrivacy(); }, "HmiPhone_PrivacyRequest", none },
        { "privacyModeOn", [](HmiPhoneController &c) { c.privacyModeOn(); }, "HmiPhone_PrivacyRequestOn", none },
        { "requestPhoneIssueFix", [](HmiPhoneController &c) { c.requestPhoneIssueFix(); }, "HmiPhone_PhoneIssueFixRequest", none },
        { "setDeviceAsPhone", [](HmiPhoneController &c) { c.setDeviceAsPhone(); }, "HmiPhone_SetDeviceAsPhone", none },
        { "setDeviceAsMedia", [](HmiPhoneController &c) { c.setDeviceAsMedia(); }, "HmiPhone_SetDeviceAsMedia", none },
        { "setDeviceAsPhoneAndMedia", [](HmiPhoneController &c) { c.setDeviceAsPhoneAndMedia(); }, "HmiPhone_SetDeviceAsPhoneAndMedia", none },
        { "autoDownloadPhoneBookPositive", [](HmiPhoneController &c) { c.autoDownloadPhoneBookPositive(); }, "HmiPhone_AutoDownloadPhoneBookPositive", none },
        { "autoDownloadPhoneBookNegative", [](HmiPhoneController &c) { c.autoDownloadPhoneBookNegative(); }, "HmiPhone_AutoDownloadPhoneBookNegative", none },
        { "redialRequest", [](HmiPhoneController &c) { c.redialRequest(); }, "HmiPhone_RedialRequest", none },
        { "cancelRedialRequest", [](HmiPhoneController &c) { c.cancelRedialRequest(); }, "HmiPhone_CancelRedialRequest", none },
        { "callEndConfirmed", [](HmiPhoneController &c) { c.callEndConfirmed(); }, "HmiPhone_CallEndConfirmed", none },
        { "confirmRoamingCall", [](HmiPhoneController &c) { c.confirmRoamingCall(); }, "HmiPhone_ConfirmRoamingCall", none },
        { "cancelRoamingCall", [](HmiPhoneController &c) { c.cancelRoamingCall(); }, "HmiPhone_CancelRoamingCall", none },
        { "fixStatusAlert", [](HmiPhoneController &c) { c.fixStatusAlert(51); }, "HmiPhone_FixStatusAlertRequest", 51 },
        { "clearStatusAlert", [](HmiPhoneController &c) { c.clearStatusAlert(52); }, "HmiPhone_ClearStatusAlertRequest", 52 },
        { "clearAlertPermanently", [](HmiPhoneController &c) { c.clearAlertPermanently(54); }, "HmiPhone_ClearAlertPermanentlyRequest", 54 },
        { "clearAlertForThisCycle", [](HmiPhoneController &c) { c.clearAlertForThisCycle(55); }, "HmiPhone_ClearAlertForThisCycleRequest", 55 },
        { "callForFixAlert", [](HmiPhoneController &c) { c.callForFixAlert(56, QStringLiteral("08001234567")); }, "HmiPhone_CallForFixAlertRequest", QVariantMap { { QStringLiteral("alertId"), 56 }, { QStringLiteral("supportPhoneNumber"), QStringLiteral("08001234567") } } },
        { "clearAlert", [](HmiPhoneController &c) { c.clearAlert(57); }, "HmiPhone_ClearAlertRequest", 57 },
        { "retryDownloadContact", [](HmiPhoneController &c) { c.retryDownloadContact(58); }, "HmiPhone_RetryDownloadContactRequest", 58 },
        { "retryAutomaticContactDownload", [](HmiPhoneController &c) { c.retryAutomaticContactDownload(); }, "HmiPhone_RetryAutomaticContactDownloadRequest", none },
        { "retryPhnBookDownloadAccess", [](HmiPhoneController &c) { c.retryPhnBookDownloadAccess(); }, "HmiPhone_RetryPhnBookDownloadAccessRequest", none },
        { "retryAccessTextMessages", [](HmiPhoneController &c) { c.retryAccessTextMessages(59); }, "HmiPhone_RetryAccessTextMessagesRequest", 59 },
        { "hearNewTextMessage", [](HmiPhoneController &c) { c.hearNewTextMessage(); }, "HmiPhone_HearNewTextMessage", none },
        { "stopHearNewTextMessage", [](HmiPhoneController &c) { c.stopHearNewTextMessage(); }, "HmiPhone_StopHearNewTextMessage", none },
        { "viewNewTextMessage", [](HmiPhoneController &c) { c.viewNewTextMessage(); }, "HmiPhone_ViewNewTextMessage", none },
        { "callNewTextMessageNumber", [](HmiPhoneController &c) { c.callNewTextMessageNumber(); }, "HmiPhone_CallNewTextMessageNumber", none },
        { "replyNewTextMessage", [](HmiPhoneController &c) { c.replyNewTextMessage(); }, "HmiPhone_ReplyNewTextMessage", none },
        { "hideNewTextMessageAlert", [](HmiPhoneController &c) { c.hideNewTextMessageAlert(); }, "HmiPhone_HideNewTextMessageAlert", none },
        { "retryMessagesDownloading", [](HmiPhoneController &c) { c.retryMessagesDownloading(); }, "HmiPhoneSms_RetryMessagesDownload", none },
        { "cancelMessagesDownloading", [](HmiPhoneController &c) { c.cancelMessagesDownloading(); }, "HmiPhoneSms_CancelMessagesDownload", none },
        { "viewTextMessageOptions", [](HmiPhoneController &c) { c.viewTextMessageOptions(3); }, "HmiPhoneSms_ViewTextMessageOptions", 3 },
        { "refreshMessages", [](HmiPhoneController &c) { c.refreshMessages(); }, "HmiPhoneSms_RefreshMessages", none },
        { "viewTextMessage", [](HmiPhoneController &c) { c.viewTextMessage(); }, "HmiPhoneSms_ViewTextMessage", none },
        { "replyTextMessage", [](HmiPhoneController &c) { c.replyTextMessage(); }, "HmiPhoneSms_ReplyTextMessage", none },
        { "sendTextMessage", [](HmiPhoneController &c) { c.sendTextMessage(); }, "HmiPhoneSms_SendTextMessage", none },
        { "initiateSendTextMessage", [](HmiPhoneController &c) { c.initiateSendTextMessage(); }, "HmiPhoneSms_InitiateSendTextMessage", none },
        { "retrySendTextMessage", [](HmiPhoneController &c) { c.retrySendTextMessage(); }, "HmiPhoneSms_RetrySendTextMessage", none },
        { "hearTextMessage", [](HmiPhoneController &c) { c.hearTextMessage(); }, "HmiPhoneSms_HearTextMessage", none },
        { "hearSelectedTextMessage", [](HmiPhoneController &c) { c.hearSelectedTextMessage(4); }, "HmiPhone_HearSelectedTextMessage", 4 },
        { "requestMessageProfileAccessRetry", [](HmiPhoneController &c) { c.requestMessageProfileAccessRetry(); }, "HmiPhone_MessageProfileAccessRetry", none },
        { "hearSelectedReplyMessage", [](HmiPhoneController &c) { c.hearSelectedReplyMessage(); }, "HmiPhone_HearSelectedReplyMessage", none },
        { "showConnectToDevice", [](HmiPhoneController &c) { c.showConnectToDevice(); }, "HmiPhone_ShowConnectToDevice", none },
        { "clearExtendedModeTimer", [](HmiPhoneController &c) { c.clearExtendedModeTimer(); }, "HmiPhone_ClearExtendedModeTimer", none },
        { "cancelPhoneBookDownload", [](HmiPhoneController &c) { c.cancelPhoneBookDownload(); }, "HmiPhone_PhoneBookDownloadCanceled", none },
        { "requestPhoneManageContactsSettingsPage", [](HmiPhoneController &c) { c.requestPhoneManageContactsSettingsPage(); }, "HmiPhone_RequestPhoneManageContactsSettingsPage", none },
        { "requestPhoneRingtoneSettingsPage", [](HmiPhoneController &c) { c.requestPhoneRingtoneSettingsPage(); }, "HmiPhone_RequestPhoneRingtoneSettingsPage", none },
        { "requestPhoneTextMessageNotificationSettingsPage", [](HmiPhoneController &c) { c.requestPhoneTextMessageNotificationSettingsPage(); }, "HmiPhone_requestPhoneTextMessageNotificationSettingsPage", none },
        { "requestPhoneDeleteAllContactsPopup", [](HmiPhoneController &c) { c.requestPhoneDeleteAllContactsPopup(); }, "HmiPhone_RequestPhoneDeleteAllContactsPopup", none },
    };
        // clang-format on
        for (const auto &[tag, request, name, value] : rows)
            QTest::newRow(tag) << request << QString::fromLatin1(name) << value;
    }

    void eventRequests()
    {
        QFETCH(Request, request);
        QFETCH(QString, name);
        QFETCH(QVariant, value);

        request(*m_controller);

        // Exactly one posted event, and nothing else asked of the platform.
        QCOMPARE(trace(m_since), QStringList{QStringLiteral("event ") + name});
        const QVariant postedValue = Platform::Journal::instance()->entries().last().fields.value(
                QStringLiteral("value"));
        QCOMPARE(postedValue.userType(), value.userType());
        QCOMPARE(postedValue, value);
    }

    void platformRequests_data()
    {
        QTest::addColumn<Request>("request");
        QTest::addColumn<QStringList>("expected");

        // clang-format off
    QTest::newRow("addPhonePressed") << Request([](HmiPhoneController &c) { c.addPhonePressed(); }) << expect({ "intent 28()" });
    QTest::newRow("gotoPhoneSettings") << Request([](HmiPhoneController &c) { c.gotoPhoneSettings(); }) << expect({ "intent 7()" });
    QTest::newRow("viewBluetoothDevices") << Request([](HmiPhoneController &c) { c.viewBluetoothDevices(); }) << expect({ "intent 15()" });
    QTest::newRow("showConnectedDeviceSettings") << Request([](HmiPhoneController &c) { c.showConnectedDeviceSettings(); }) << expect({ "intent 51()" });
    QTest::newRow("showNavPOIByAddress") << Request([](HmiPhoneController &c) { c.showNavPOIByAddress(QStringLiteral("n"), QStringLiteral("s"), QStringLiteral("c"), QStringLiteral("st"), QStringLiteral("co"), QStringLiteral("z")); }) << expect({ "intent 20(n,s,c,st,co,z)" });
    QTest::newRow("swapCall") << Request([](HmiPhoneController &c) { c.swapCall(); }) << expect({ "phone.swapCall()" });
    QTest::newRow("joinCalls") << Request([](HmiPhoneController &c) { c.joinCalls(); }) << expect({ "phone.joinCalls()" });
    QTest::newRow("selectPhoneBookEntry") << Request([](HmiPhoneController &c) { c.selectPhoneBookEntry(7); }) << expect({ "phone.selectPhoneBookEntry(7)" });
    QTest::newRow("requestRecentCallsList") << Request([](HmiPhoneController &c) { c.requestRecentCallsList(2); }) << expect({ "phone.downloadRecentCallsList(2)" });
    QTest::newRow("retryRecentCallsDownload") << Request([](HmiPhoneController &c) { c.retryRecentCallsDownload(); }) << expect({ "phone.downloadRecentCallsList()" });
    QTest::newRow("cancelRecentCallsDownload") << Request([](HmiPhoneController &c) { c.cancelRecentCallsDownload(); }) << expect({ "phone.cancelRecentCallsDownload()" });
    QTest::newRow("sendMessageNotificationEnabled") << Request([](HmiPhoneController &c) { c.sendMessageNotificationEnabled(true); }) << expect({ "phone.sendMessageNotificationEnabled(true)" });
    QTest::newRow("playText") << Request([](HmiPhoneController &c) { c.playText(QStringLiteral("hi")); }) << expect({ "phone.textMessagePlayback(hi)" });
    QTest::newRow("playContactName") << Request([](HmiPhoneController &c) { c.playContactName(QStringLiteral("Ann")); }) << expect({ "phone.contactNamePlayback(Ann)" });
    QTest::newRow("siriCancelPressed") << Request([](HmiPhoneController &c) { c.siriCancelPressed(); }) << expect({ "phone.toggleSiriActivation(false)" });
    QTest::newRow("phoneVoiceServiceCancelPressed") << Request([](HmiPhoneController &c) { c.phoneVoiceServiceCancelPressed(); }) << expect({ "phone.togglePhoneVoiceServiceActivation(false)" });
    QTest::newRow("setPhonebookContactDisplayType ignores its argument") << Request([](HmiPhoneController &c) { c.setPhonebookContactDisplayType(1); }) << expect({ "phone.setPhonebookContactDisplayType(0)" });
    QTest::newRow("setPhoneMuteAudioInPrivacyEnabled") << Request([](HmiPhoneController &c) { c.setPhoneMuteAudioInPrivacyEnabled(true); }) << expect({ "phone.setMuteAudioInPrivacy(true)" });
    QTest::newRow("setRoamingWarningEnabled") << Request([](HmiPhoneController &c) { c.setRoamingWarningEnabled(true); }) << expect({ "phone.setRoamingWarning(true)" });
    QTest::newRow("setLowBatteryNotificationEnabled") << Request([](HmiPhoneController &c) { c.setLowBatteryNotificationEnabled(true); }) << expect({ "phone.setLowBatteryNotification(true)" });
    QTest::newRow("setContactSortOrder") << Request([](HmiPhoneController &c) { c.setContactSortOrder(1); }) << expect({ "phone.setContactSortOrder(1)" });
    QTest::newRow("requestReDownloadContacts") << Request([](HmiPhoneController &c) { c.requestReDownloadContacts(); }) << expect({ "phone.reDownloadContacts()" });
    QTest::newRow("requestDeleteAllContacts") << Request([](HmiPhoneController &c) { c.requestDeleteAllContacts(); }) << expect({ "phone.deleteAllContacts()" });
    QTest::newRow("playRingtone") << Request([](HmiPhoneController &c) { c.playRingtone(3); }) << expect({ "phone.playRingtone(3)" });
    QTest::newRow("stopPlayRingtone") << Request([](HmiPhoneController &c) { c.stopPlayRingtone(); }) << expect({ "phone.stopPlayRingtone()" });
    QTest::newRow("playAlert") << Request([](HmiPhoneController &c) { c.playAlert(4); }) << expect({ "phone.playAlert(4)" });
    QTest::newRow("setRingtone") << Request([](HmiPhoneController &c) { c.setRingtone(5); }) << expect({ "phone.setPhoneRingtone(5)" });
    QTest::newRow("setAlert") << Request([](HmiPhoneController &c) { c.setAlert(6); }) << expect({ "phone.setMessageNotification(6)" });
    QTest::newRow("callKovaSupport") << Request([](HmiPhoneController &c) { c.callKovaSupport(); }) << expect({ "phone.dialNumber(18005550147)" });
    QTest::newRow("automatic download on") << Request([](HmiPhoneController &c) { c.setAutomaticContactDownloadEnabled(true); })
                                           << expect({ "phone.setAutomaticContactDownload(true)" });
    QTest::newRow("automatic download off fetches once") << Request([](HmiPhoneController &c) { c.setAutomaticContactDownloadEnabled(false); })
                                                         << expect({ "phone.setAutomaticContactDownload(false)", "phone.retryPhoneBookDownload(3)" });
    QTest::newRow("automatic download refused by the phone") << Request([](HmiPhoneController &c) {
        QObject context;
        QObject::connect(c.phoneSource(), &Mavrosk::PhoneSource::automaticContactDownloadChanged, &context, [&c] {
            c.phoneSource()->setBridgeValue(QStringLiteral("automaticContactDownload"), false);
        });
        c.setAutomaticContactDownloadEnabled(true);
    }) << expect({ "phone.setAutomaticContactDownload(true)", "phone.retryPhoneBookDownload(3)" });
    QTest::newRow("search for car") << Request([](HmiPhoneController &c) { loadAlphabetBar(); c.searchPhoneBook(QStringLiteral("car")); })
                                    << expect({ "phone.setPhonebookContactDisplayType(1)", "phone.searchPhoneBook(car)",
                                                     "phone.setDriverRestrictedPhonebookModelMinRow(10)", "phone.setDriverRestrictedPhonebookModelMaxRow(24)" });
    // Roaming prompt: a connected device, a roaming phone and the warning on, asked in this order.
    QTest::newRow("call, roaming, warning on") << Request([](HmiPhoneController &c) { setRoaming(true, true, true); c.callNumber(QStringLiteral("555")); })
                                               << expect({ "phone.setCallNumberEntered(555)", "phone.setOutboundRoamingCallIsFromRecentList(false)", "event HmiPhone_RoamingMode" });
    QTest::newRow("call, roaming, warning off") << Request([](HmiPhoneController &c) { setRoaming(true, true, false); c.callNumber(QStringLiteral("555")); })
                                                << expect({ "phone.dialNumber(555)" });
    QTest::newRow("call, not roaming") << Request([](HmiPhoneController &c) { setRoaming(true, false, true); c.callNumber(QStringLiteral("555")); })
                                       << expect({ "phone.dialNumber(555)" });
    QTest::newRow("call, no device, still roaming") << Request([](HmiPhoneController &c) { setRoaming(false, true, true); c.callNumber(QStringLiteral("555")); })
                                                    << expect({ "phone.dialNumber(555)" });
    QTest::newRow("recent call, roaming prompt") << Request([](HmiPhoneController &c) { setRoaming(true, true, true); c.dialRecentCall(2, 5); })
                                                 << expect({ "phone.setOutboundRoamingRecentCallType(2)", "phone.setOutboundRoamingRecentCallIndex(5)",
                                                                  "phone.setOutboundRoamingCallIsFromRecentList(true)", "event HmiPhone_RoamingMode" });
    QTest::newRow("recent call, no prompt") << Request([](HmiPhoneController &c) { setRoaming(true, true, false); c.dialRecentCall(2, 5); })
                                            << expect({ "phone.dialRecentCall(2,5)" });
        // clang-format on
    }

    void platformRequests()
    {
        QFETCH(Request, request);
        QFETCH(QStringList, expected);
        Mavrosk::BluetoothSource::instance()->setBridgeValue(QStringLiteral("phoneDevice"), 3);

        request(*m_controller);

        QCOMPARE(trace(m_since), expected);
    }

    void jumpToPhoneSection_data()
    {
        QTest::addColumn<bool>("withIntegration");
        QTest::addColumn<bool>("withViewController");

        QTest::newRow("integration and view controller") << true << true;
        QTest::newRow("no view controller") << true << false;
        QTest::newRow("no integration") << false << true;
    }

    void jumpToPhoneSection()
    {
        QFETCH(bool, withIntegration);
        QFETCH(bool, withViewController);
        HmiPhone::HmiPhoneIntegration integration;
        HmiPhoneController *controller = withIntegration
                ? integration.findChild<HmiPhoneController *>()
                : m_controller.get();
        QVERIFY(controller);
        if (!withViewController)
            controller->setViewController(nullptr);
        m_since = Platform::Journal::instance()->lastSequence();

        controller->jumpToPhoneSection();

        const QStringList expected = withIntegration && withViewController
                ? QStringList{integration.rootStateIdentifier()}
                : QStringList();
        QCOMPARE(TestSupport::journalValues(QStringLiteral("view-request"), QStringLiteral("id"),
                                            m_since),
                 expected);
    }

    void emptyToneIsRefused()
    {
        expectMessage(QtCriticalMsg,
                      "Hmi Phone Controller: tone string empty, cannot extract tone char");
        m_controller->dialPadTonePressed(QString(), QStringLiteral("1"));
        QVERIFY(trace(m_since).isEmpty());
    }

    void numberFlags_data()
    {
        QTest::addColumn<QStringList>("numbers"); // entered numbers in turn; the last is checked
        QTest::addColumn<int>("fullChanges");
        QTest::addColumn<int>("emptyChanges");
        QTest::addColumn<bool>("full");
        QTest::addColumn<bool>("empty");

        const QString full = QString(22, QLatin1Char('1'));
        // clang-format off
        QTest::newRow("nothing entered yet") << QStringList() << 0 << 0 << false << true;
        QTest::newRow("empty to one digit") << QStringList{QStringLiteral("1")} << 0 << 1 << false << false;
        QTest::newRow("one digit to two") << QStringList{QStringLiteral("1"), QStringLiteral("12")} << 0 << 1 << false << false;
        QTest::newRow("22 characters are full") << QStringList{full} << 1 << 1 << true << false;
        QTest::newRow("23 characters are not") << QStringList{full, full + QLatin1Char('1')} << 2 << 1 << false << false;
        QTest::newRow("cleared again") << QStringList{QStringLiteral("1"), QString()} << 0 << 2 << false << true;
        // clang-format on
    }

    void numberFlags()
    {
        QFETCH(QStringList, numbers);
        QFETCH(int, fullChanges);
        QFETCH(int, emptyChanges);
        QFETCH(bool, full);
        QFETCH(bool, empty);

        // A number the phone held before the controller existed does not count.
        Mavrosk::PhoneSource *phone = Mavrosk::PhoneSource::instance();
        phone->setBridgeValue(QStringLiteral("callNumberEntered"), QStringLiteral("999"));
        m_controller.reset();
        expectMessage(QtCriticalMsg, InvalidIntegration);
        m_controller = std::make_unique<HmiPhoneController>(nullptr);
        QCOMPARE(m_controller->property("isEmptyNumber").toBool(), true);
        phone->setBridgeValue(QStringLiteral("callNumberEntered"), QString());

        QSignalSpy fullSpy(m_controller.get(), &HmiPhoneController::isMaximumSizeOfNumberChanged);
        QSignalSpy emptySpy(m_controller.get(), &HmiPhoneController::isEmptyNumberChanged);
        for (const QString &number : numbers)
            phone->setBridgeValue(QStringLiteral("callNumberEntered"), number);

        QCOMPARE(fullSpy.count(), fullChanges);
        QCOMPARE(emptySpy.count(), emptyChanges);
        QCOMPARE(m_controller->property("isMaximumSizeOfNumber").toBool(), full);
        QCOMPARE(m_controller->property("isEmptyNumber").toBool(), empty);
    }

    void batteryWarning_data()
    {
        QTest::addColumn<QList<int>>("levels"); // -100 stands for "the phone device changed"
        QTest::addColumn<QList<bool>>("answers");

        // clang-format off
        QTest::newRow("enter, stay, leave, re-enter") << QList<int>{3, 1, 1, 0, 2, 1} << QList<bool>{false, true, false, false, false, true};
        QTest::newRow("first reading already low") << QList<int>{1} << QList<bool>{true};
        QTest::newRow("unknown level re-arms") << QList<int>{1, -1, 0} << QList<bool>{true, false, true};
        QTest::newRow("new phone warns again") << QList<int>{0, -100, 0} << QList<bool>{true, false, true};
        // clang-format on
    }

    void batteryWarning()
    {
        QFETCH(QList<int>, levels);
        QFETCH(QList<bool>, answers);

        QList<bool> actual;
        for (int level : levels) {
            if (level == -100) {
                Mavrosk::BluetoothSource *bluetooth = Mavrosk::BluetoothSource::instance();
                bluetooth->setBridgeValue(QStringLiteral("phoneDevice"),
                                          bluetooth->phoneDevice() + 1);
                actual << false;
                continue;
            }
            actual << m_controller->shouldBatteryWarningBeShown(level);
        }
        QCOMPARE(actual, answers);
    }

    void setters_data()
    {
        QTest::addColumn<QByteArray>("property");
        QTest::addColumn<int>("value");
        QTest::addColumn<int>("stored");

        QTest::newRow("long press negative is clamped")
                << QByteArray("longPressInterval") << -5 << 0;
        QTest::newRow("long press") << QByteArray("longPressInterval") << 1500 << 1500;
        QTest::newRow("battery low level") << QByteArray("batteryLowLevel") << 2 << 2;
    }

    void setters()
    {
        QFETCH(QByteArray, property);
        QFETCH(int, value);
        QFETCH(int, stored);

        const QMetaProperty meta = m_controller->metaObject()->property(
                m_controller->metaObject()->indexOfProperty(property));
        QSignalSpy spy(m_controller.get(), meta.notifySignal());

        // The announced value is the stored one, and the same request twice is one change.
        QVERIFY(m_controller->setProperty(property, value));
        QVERIFY(m_controller->setProperty(property, value));
        QCOMPARE(m_controller->property(property).toInt(), stored);
        QCOMPARE(spy.count(), 1);
        QCOMPARE(spy.first().first().toInt(), stored);
    }

    void windowForVisibleRows_data()
    {
        QTest::addColumn<int>("top");
        QTest::addColumn<int>("bottom");
        QTest::addColumn<int>("perPage");
        QTest::addColumn<int>("listLength");
        QTest::addColumn<int>("minRow");
        QTest::addColumn<int>("maxRow");

        QTest::addColumn<QList<int>>("starts"); // of A..E; empty for 0, -1, 10, 25, 40

        const QList<int> ae;
        const int intMin = std::numeric_limits<int>::min();
        const int intMax = std::numeric_limits<int>::max();
        // clang-format off
        QTest::newRow("whole C section") << 12 << 15 << 4 << 60 << 10 << 24 << ae;
        QTest::newRow("top of the list") << 0 << 3 << 4 << 60 << 0 << 9 << ae;
        QTest::newRow("E section to the end") << 45 << 48 << 4 << 60 << 40 << 59 << ae;
        QTest::newRow("five rows limit") << 12 << 15 << 1 << 60 << 10 << 14 << ae;
        QTest::newRow("bottom row equals letter count") << 0 << 4 << 4 << 60 << 0 << 9 << ae;
        QTest::newRow("top row below, bottom equals count") << 2 << 4 << 4 << 60 << 0 << 9 << ae;
        QTest::newRow("whole short list on screen") << 0 << 29 << 10 << 30 << 0 << 29 << ae;
        QTest::newRow("whole list, five pages at most") << 0 << 59 << 4 << 60 << 0 << 19 << ae;
        // Arguments no view should pass, and starts no phone should send: the window stays
        // inside the list and within five pages, without overflow.
        QTest::newRow("five pages of a huge page size") << 0 << 5 << 1000000000 << 60 << 0 << 9 << ae;
        QTest::newRow("page size 0 counts as 1") << 12 << 15 << 0 << 60 << 10 << 14 << ae;
        QTest::newRow("largest rows, negative page size") << intMax << intMax << -1 << 60 << 55 << 59 << ae;
        QTest::newRow("smallest bottom row") << 1 << intMin << 1 << 60 << 0 << 4 << ae;
        QTest::newRow("bottom above top") << 15 << 12 << 4 << 60 << 10 << 24 << ae;
        QTest::newRow("rows beyond the list") << 100 << 200 << 4 << 60 << 40 << 59 << ae;
        QTest::newRow("empty list") << 0 << 0 << 4 << 0 << -1 << -1 << ae;
        QTest::newRow("smallest start from the bridge") << 5 << 5 << 1 << 60 << 0 << 4 << QList<int>{intMin, -1, 10, 25, 40};
        QTest::newRow("starts past the list") << 12 << 15 << 4 << 20 << 10 << 19 << QList<int>{0, -1, 10, intMax, 40};
        QTest::newRow("starts that decrease") << 12 << 15 << 4 << 60 << 0 << 19 << QList<int>{40, -1, 25, 10, 0};
        // clang-format on
    }

    void windowForVisibleRows()
    {
        QFETCH(int, top);
        QFETCH(int, bottom);
        QFETCH(int, perPage);
        QFETCH(int, listLength);
        QFETCH(int, minRow);
        QFETCH(int, maxRow);
        QFETCH(QList<int>, starts);
        loadAlphabetBar(starts);
        Mavrosk::PhoneSource::instance()->phoneBook()->setListLength(listLength);

        m_controller->calculateDriverRestrictedPhonebookMinMaxRows(top, bottom, perPage);

        QCOMPARE(trace(m_since), window(minRow, maxRow));
    }

    void windowForLetter_data()
    {
        QTest::addColumn<QVariantList>("bar"); // alphabet, letterIndex, ...; empty for the A..E bar
        QTest::addColumn<QString>("letter");
        QTest::addColumn<QList<int>>("rows"); // min, max; empty when nothing is set

        const QVariantList ae;
        // clang-format off
        QTest::newRow("c") << ae << QStringLiteral("c") << QList<int>{10, 24};
        QTest::newRow("E runs to the end") << ae << QStringLiteral("E") << QList<int>{40, 59};
        QTest::newRow("A section of 10 rows") << ae << QStringLiteral("a") << QList<int>{0, 9};
        QTest::newRow("B has no contacts") << ae << QStringLiteral("B") << QList<int>{-1, -1};
        QTest::newRow("Z not in the bar") << ae << QStringLiteral("Z") << QList<int>{-1, -1};
        QTest::newRow("empty letter") << ae << QString() << QList<int>();
        QTest::newRow("long section gives 20 rows") << QVariantList{QStringLiteral("A"), 0, QStringLiteral("B"), 45} << QStringLiteral("A") << QList<int>{0, 19};
        QTest::newRow("Greek letters stay apart") << QVariantList{QString(QChar(0x391)), 0, QString(QChar(0x392)), 5} << QString(QChar(0x3B1)) << QList<int>{0, 4};
        QTest::newRow("Cyrillic does not match an empty entry") << QVariantList{QString(), 0, QStringLiteral("A"), 5} << QString(QChar(0x416)) << QList<int>{-1, -1};
        QTest::newRow("smallest start from the bridge") << QVariantList{QStringLiteral("A"), std::numeric_limits<int>::min(), QStringLiteral("B"), 5} << QStringLiteral("A") << QList<int>{-1, -1};
        QTest::newRow("next start before the letter's") << QVariantList{QStringLiteral("A"), 30, QStringLiteral("B"), 10} << QStringLiteral("A") << QList<int>{30, 30};
        QTest::newRow("CJK letter") << QVariantList{QString(QChar(0x4E00)), 0, QString(QChar(0x4E8C)), 8} << QString(QChar(0x4E00)) << QList<int>{0, 7};
        // clang-format on
    }

    void windowForLetter()
    {
        QFETCH(QVariantList, bar);
        QFETCH(QString, letter);
        QFETCH(QList<int>, rows);
        loadAlphabetBar();
        if (!bar.isEmpty()) {
            QVariantList entries;
            for (int i = 0; i < bar.size(); i += 2)
                entries.append(QVariantMap{{QStringLiteral("alphabet"), bar.at(i)},
                                           {QStringLiteral("letterIndex"), bar.at(i + 1)}});
            Mavrosk::PhoneSource::instance()->AlphabetIndexModel()->setRows(entries);
        }

        m_controller->driverRestrictedPhonebookFilterByAlpha(letter);

        QCOMPARE(trace(m_since), rows.isEmpty() ? QStringList() : window(rows.at(0), rows.at(1)));
    }

private:
    std::unique_ptr<HmiPhoneController> m_controller;
    qint64 m_since = 0;
};

QTEST_GUILESS_MAIN(TestController)
#include "tst_controller.moc"
