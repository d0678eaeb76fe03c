// The popup manager: every slot makes one framework request or dismissal for its own view, and
// the single instance lives with the application.

#include "hmiphonepopupmanager.h"
#include "testsupport.h"

#include <brisken/viewmanager.h>
#include <quorvel/statemachine.h>

#include <QMetaMethod>

using HmiPhone::HmiPhonePopupManager;

namespace {

struct SlotRow
{
    const char *slot;
    const char *kind; // journal kind of the framework call
    const char *view;
};

// Every slot in its meta-object order, with the call it makes and the view it names.
// clang-format off
const SlotRow slotTable[] = {
    {"showNoCellularSignal", "popup-request", "NoCellularSignal"},
    {"showDialingFailure", "popup-request", "DialingFailed"},
    {"hideDialingFailure", "popup-dismiss", "DialingFailed"},
    {"showDialing3rdFailure", "popup-request", "Dialing3rdFailure"},
    {"showIncomingCall", "popup-request", "IncomingCall"},
    {"dismissIncomingCall", "popup-dismiss", "IncomingCall"},
    {"showWaitingCall", "popup-request", "WaitingCall"},
    {"dismissWaitingCall", "popup-dismiss", "WaitingCall"},
    {"showCallAcceptanceFailure", "popup-request", "CallAnswerNotResponding"},
    {"showDeviceIssueFixHint", "popup-request", "DeviceIssueFixHint"},
    {"showCallEnded", "popup-request", "CallEnded"},
    {"showMissedCall", "popup-request", "MissedCallPopup"},
    {"showRoamingWarning", "popup-request", "RoamingWarning"},
    {"showBatteryLow", "popup-request", "BatteryLow"},
    {"showPhoneConnectionUnstablePopup", "popup-request", "PhoneConnectionUnstable"},
    {"showPhoneConnectionLost", "popup-request", "PhoneConnectionLost"},
    {"hidePhoneConnectionLost", "popup-dismiss", "PhoneConnectionLost"},
    {"showUnableToConnect", "popup-request", "UnableToConnect"},
    {"hideUnableToConnect", "popup-dismiss", "UnableToConnect"},
    {"showHandsFreeError", "popup-request", "HandsFreeError"},
    {"showRedial", "popup-request", "Redial"},
    {"showTransferToPhone", "popup-request", "PhoneCallStandByModePopup"},
    {"hideTransferToPhone", "popup-dismiss", "PhoneCallStandByModePopup"},
    {"showPhoneBookDownloadFailedRetryAvailable", "popup-request", "PhoneBookDownloadFailedRetryAvailable"},
    {"showPhoneBookDownloadFailed", "popup-request", "PhoneBookDownloadFailed"},
    {"showSmsDownloadFailedRetryAvailable", "popup-request", "SmsDownloadFailedRetryAvailable"},
    {"showSmsDownloadFailed", "popup-request", "SmsDownloadFailedFinal"},
    {"newTextMessageAlert1Show", "popup-request", "NewTextMessageAlert1"},
    {"newTextMessageAlert2Show", "popup-request", "NewTextMessageAlert2"},
    {"newTextMessageAlert2Hide", "popup-dismiss", "NewTextMessageAlert2"},
    {"showTextMessagingOff", "popup-request", "PhoneSmsTextMessagingOff"},
    {"hideTextMessagingOff", "popup-dismiss", "PhoneSmsTextMessagingOff"},
    {"showMessageAccessProfileNotSupported", "popup-request", "PhoneSmsNotSupported"},
    {"showMessageAccessNotGranted", "popup-request", "PhoneSmsAccessNotGranted"},
    {"showMessageWaitingForResponseFromPhone", "popup-request", "PhoneSmsWaitingForResponseFromPhone"},
    {"hideMessageWaitingForResponseFromPhone", "popup-dismiss", "PhoneSmsWaitingForResponseFromPhone"},
    {"showMessagesDownloading", "popup-request", "PhoneSmsDownloading"},
    {"hideMessagesDownloading", "popup-dismiss", "PhoneSmsDownloading"},
    {"showMessagesDownloadFailed", "popup-request", "PhoneSmsDownloadFailed"},
    {"showMessagesRetryDownloadFailed", "popup-request", "PhoneSmsRetryDownloadFailed"},
    {"hideMessagesDownloadFailed", "popup-dismiss", "PhoneSmsDownloadFailed"},
    {"showSendTextMessage", "popup-request", "PhoneSmsSendTextMessage"},
    {"hideSendTextMessage", "popup-dismiss", "PhoneSmsSendTextMessage"},
    {"showSendTextMessageProgress", "popup-request", "PhoneSmsSendTextMessageProgress"},
    {"hideSendTextMessageProgress", "popup-dismiss", "PhoneSmsSendTextMessageProgress"},
    {"showSendTextMessageSuccess", "popup-request", "PhoneSmsSendTextMessageSuccess"},
    {"showSendTextMessageNoResponseFromPhone", "popup-request", "PhoneSmsSendTextMessageNoResponseFromPhone"},
    {"showSendTextMessageFailure", "popup-request", "PhoneSmsSendTextMessageFailure"},
    {"hideSendTextMessageFailure", "popup-dismiss", "PhoneSmsSendTextMessageFailure"},
    {"showPhoneBookDownloadCompletePopup", "popup-request", "PhoneBookDownloadComplete"},
    {"hidePhoneBookDownloadCompletePopup", "popup-dismiss", "PhoneBookDownloadComplete"},
    {"showRetrySendMessageFailure", "popup-request", "PhoneSmsRetrySendTextMessageFailure"},
    {"showSendMessageNetworkFailure", "popup-request", "PhoneSmsSendTextMessageNetworkFailure"},
    {"showMultipleTextMessagePopup", "popup-request", "MultipleTextMessagesReceived"},
    {"hideMultipleTextMessagePopup", "popup-dismiss", "MultipleTextMessagesReceived"},
    {"showDTMFKeyPressNoResponseErrorPopup", "popup-request", "DTMFKeyPressNoResponseErrorPopup"},
    {"hideDTMFKeyPressNoResponseErrorPopup", "popup-dismiss", "DTMFKeyPressNoResponseErrorPopup"},
    {"showPhoneAudioTransferErrorPopup", "popup-request", "PhoneAudioTransferErrorPopup"},
    {"hidePhoneAudioTransferErrorPopup", "popup-dismiss", "PhoneAudioTransferErrorPopup"},
    {"showPhoneCallStandByModePopup", "popup-request", "PhoneCallStandByModePopup"},
    {"hidePhoneCallStandByModePopup", "popup-dismiss", "PhoneCallStandByModePopup"},
    {"showUnstableConnectionWithKovaPopup", "popup-request", "UnstableDeviceConnectionWithKovaPopup"},
    {"hideUnstableConnectionWithKovaPopup", "popup-dismiss", "UnstableDeviceConnectionWithKovaPopup"},
    {"showPhoneSiriNoResponseErrorPopup", "popup-request", "SiriConnectionNotRespondingPopup"},
    {"hidePhoneSiriNoResponseErrorPopup", "popup-dismiss", "SiriConnectionNotRespondingPopup"},
    {"showPhoneContactsTooLargeErrorPopup", "popup-request", "ContactsListTooLargePopup"},
    {"hidePhoneContactsTooLargeErrorPopup", "popup-dismiss", "ContactsListTooLargePopup"},
    {"showSiriNotEnabledErrorPopup", "popup-request", "siriFeatureNotEnabledPopup"},
    {"hideSiriNotEnabledErrorPopup", "popup-dismiss", "siriFeatureNotEnabledPopup"},
    {"showPhoneDndActiveArdel", "popup-request", "PhoneDndActiveArdel"},
    {"hidePhoneDndActiveArdel", "popup-dismiss", "PhoneDndActiveArdel"},
};
// clang-format on

QString phoneView(const char *view)
{
    return Brisken::ViewManager::viewIdentifier(QStringLiteral("PHONE"), QLatin1String(view));
}

} // namespace

class TestPopupManager : public TestSupport::Suite
{
    Q_OBJECT

protected:
    void setUp() override
    {
        Quorvel::StateMachine::destroyInstance();
        Platform::Journal::instance()->clear();
    }

    void tearDown() override { Quorvel::StateMachine::destroyInstance(); }

private slots:

    void singleInstance()
    {
        HmiPhonePopupManager *first = HmiPhonePopupManager::instance();
        QVERIFY(first);
        QCOMPARE(HmiPhonePopupManager::instance(), first);
        QCOMPARE(first->parent(), QCoreApplication::instance());

        // Once its owner has deleted it, the next caller gets a working instance again.
        delete first;
        // No popup is installed here: requests are dropped, with a word.
        expectMessage(QtWarningMsg, QRegularExpression(QStringLiteral("dropped")));
        HmiPhonePopupManager::instance()->showBatteryLow();
        QCOMPARE(TestSupport::journalValues(QStringLiteral("popup-request")),
                 QStringList{phoneView("BatteryLow")});
    }

    void slotsInTableOrder()
    {
        const QMetaObject *meta = &HmiPhonePopupManager::staticMetaObject;
        QStringList declared;
        for (int i = meta->methodOffset(); i < meta->methodCount(); ++i) {
            if (meta->method(i).methodType() == QMetaMethod::Slot)
                declared.append(QLatin1String(meta->method(i).name()));
        }
        QStringList expected;
        for (const SlotRow &row : slotTable)
            expected.append(QLatin1String(row.slot));
        QCOMPARE(expected.size(), 71);
        QCOMPARE(declared, expected);
    }

    void slotMakesOneCall_data()
    {
        QTest::addColumn<QString>("slot");
        QTest::addColumn<QString>("kind");
        QTest::addColumn<QString>("viewId");
        for (const SlotRow &row : slotTable)
            QTest::addRow("%s", row.slot) << QString::fromLatin1(row.slot)
                                          << QString::fromLatin1(row.kind) << phoneView(row.view);
    }

    void slotMakesOneCall()
    {
        QFETCH(QString, slot);
        QFETCH(QString, kind);
        QFETCH(QString, viewId);

        if (kind == QLatin1String("popup-request"))
            expectMessage(QtWarningMsg, QRegularExpression(QStringLiteral("dropped")));
        QVERIFY(QMetaObject::invokeMethod(HmiPhonePopupManager::instance(),
                                          slot.toLatin1().constData()));

        QList<Platform::JournalEntry> entries = Platform::Journal::instance()->entries();
        entries.erase(std::remove_if(entries.begin(), entries.end(),
                                     [](const Platform::JournalEntry &entry) {
                                         return entry.kind == QLatin1String("popup-dropped");
                                     }),
                      entries.end());
        QCOMPARE(entries.size(), 1);
        QCOMPARE(entries.first().kind, kind);
        QCOMPARE(entries.first().fields.value(QStringLiteral("id")).toString(), viewId);
    }

private:
};

QTEST_GUILESS_MAIN(TestPopupManager)
#include "tst_popupmanager.moc"
