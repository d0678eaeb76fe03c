// Text messages wherever the driver is in the HMI, over virtual time: new-message alerts and their
// buttons, reading aloud, replying and sending with outcomes and retries, and the checks that open
// the message screens.

#include "globalhmi.h"
#include "hmiphonecontroller.h"

#include <virtualeventdispatcher.h>

#include <QRegularExpression>

#include <utility>

using Simulator::VirtualEventDispatcher;

class TestTextMessageAlerts : public TestSupport::Suite
{
    Q_OBJECT

private slots:
    void initTestCase()
    {
        QLoggingCategory::setFilterRules(QStringLiteral("orvane.hmiphone.debug=true"));
    }
    void textMessages_data();
    void textMessages();
};

// Each row: bridge values before start, then steps: "@ms" lets time pass up to that moment,
// "source.property=value" is the phone's side writing a value, "source.signal[:argument]" is the
// phone's side emitting a signal, anything else is an event posted to the machine. The
// outputs are what the HMI did, in order: "@ms" when time has passed, "+popup"/"-popup" opened
// and closed (a popup covered by another stays open), "[view]", bridge commands, "!event" posted,
// "count=n" of received messages.
void TestTextMessageAlerts::textMessages_data()
{
    QTest::addColumn<QString>("values");
    QTest::addColumn<QString>("steps");
    QTest::addColumn<QString>("outputs");
    QTest::addColumn<QString>("debugLine");

    // clang-format off
    QTest::addRow("alert: single, again after it closed") << ""_q << "phone!newTextMessageAlert @9000 phone!newTextMessageAlert @30000"_q << "count=1 +NewTextMessageAlert2 @8000 -NewTextMessageAlert2 @9000 count=2 +NewTextMessageAlert2 @17000 -NewTextMessageAlert2"_q << ""_q;
    QTest::addRow("alert: three in a row, then one more") << ""_q << "phone!newTextMessageAlert @2000 phone!newTextMessageAlert @5000 phone!newTextMessageAlert @14000 phone!newTextMessageAlert @30000"_q << "count=1 +NewTextMessageAlert2 @2000 count=2 +MultipleTextMessagesReceived -NewTextMessageAlert2 @5000 count=3 @13000 -MultipleTextMessagesReceived count=0 @14000 count=1 +NewTextMessageAlert2 @22000 -NewTextMessageAlert2"_q << ""_q;
    QTest::addRow("alert: during a call") << "phone.callConnected=true phone.status=7"_q << "phone!newTextMessageAlert @1000 phone!newTextMessageAlert @30000"_q << "+NewTextMessageAlert1 @8000 -NewTextMessageAlert1"_q << ""_q;
    QTest::addRow("alert: while ringing") << "phone.incomingCall=true"_q << "phone!newTextMessageAlert @30000"_q << "+NewTextMessageAlert1 @8000 -NewTextMessageAlert1"_q << ""_q;
    QTest::addRow("alert: do not disturb") << "phone.doNotDisturb=true"_q << "phone!newTextMessageAlert @30000"_q << ""_q << ""_q;
    QTest::addRow("alert: hear it keeps it up") << ""_q << "phone!newTextMessageAlert @3000 HmiPhone_HearNewTextMessage phone!newTextMessageDetailsReady HmiPhone_StopHearNewTextMessage @30000"_q << "count=1 +NewTextMessageAlert2 @3000 requestNewTextMessageDetails() setHearItPressed(true) textMessagePlayback(Late) stopTextMessagePlayback() @11000 -NewTextMessageAlert2 requestTextMessagesInbox() setHearItPressed(false)"_q << ""_q;
    QTest::addRow("alert: the multiple alert closes the in-call one") << ""_q << "phone!newTextMessageAlert phone.callConnected=true phone!newTextMessageAlert phone.callConnected=false phone!newTextMessageAlert"_q << "count=1 +NewTextMessageAlert2 +NewTextMessageAlert1 count=2 +MultipleTextMessagesReceived -NewTextMessageAlert2 -NewTextMessageAlert1"_q << ""_q;
    QTest::addRow("alert: the replies close it") << ""_q << "phone!newTextMessageAlert phone!showReplyMessagesRequested"_q << "count=1 +NewTextMessageAlert2 checkPhoneStatus() [PhoneSmsReplyView] -NewTextMessageAlert2"_q << ""_q;
    QTest::addRow("alert: buttons need the alert") << ""_q << "HmiPhone_HearNewTextMessage HmiPhone_HideNewTextMessageAlert HmiPhone_ViewNewTextMessage phone!newTextMessageDetailsReady @30000"_q << ""_q << ""_q;
    QTest::addRow("alert: the cluster hears at any time") << ""_q << "phone!phoneSmsNewTextClusterHearItRequestReceived phone!newTextMessageDetailsReady @30000"_q << "requestNewTextMessageDetails() setHearItPressed(true) textMessagePlayback(Late)"_q << ""_q;
    QTest::addRow("alert: hidden, then a new one") << ""_q << "phone!newTextMessageAlert HmiPhone_HideNewTextMessageAlert phone!newTextMessageAlert phone!phoneSmsNewTextClusterIgnoreRequestReceived @30000"_q << "count=1 +NewTextMessageAlert2 -NewTextMessageAlert2 count=2 +NewTextMessageAlert2 -NewTextMessageAlert2"_q << ""_q;
    QTest::addRow("alert: view") << ""_q << "phone!newTextMessageAlert HmiPhone_ViewNewTextMessage @30000"_q << "count=1 +NewTextMessageAlert2 -NewTextMessageAlert2 requestNewTextMessageDetails() checkPhoneStatus() [PhoneSmsView]"_q << ""_q;
    QTest::addRow("alert: reply") << ""_q << "phone!newTextMessageAlert HmiPhone_ReplyNewTextMessage @30000"_q << "count=1 +NewTextMessageAlert2 -NewTextMessageAlert2 checkPhoneStatus() [PhoneSmsReplyView]"_q << ""_q;
    QTest::addRow("listen from the list") << "phone.listenMessageLineNo=3"_q << "phone!textMessageDetailsReady phone!listenToMessageRequested phone!textMessageDetailsReady phone!textMessageDetailsReady"_q << "requestSelectedTextMessageDetails(2) textMessagePlayback(Late)"_q << ""_q;
    QTest::addRow("listen: line 0") << "phone.listenMessageLineNo=0"_q << "phone!listenToMessageRequested phone!textMessageDetailsReady"_q << ""_q << "Listen Message Line No Index Out of Range "_q;
    QTest::addRow("listen: the smallest line number") << "phone.listenMessageLineNo=-2147483648"_q << "phone!listenToMessageRequested phone!textMessageDetailsReady"_q << ""_q << "Listen Message Line No Index Out of Range "_q;

    QTest::addRow("send: status 2, then the messages") << ""_q << "HmiPhoneSms_InitiateSendTextMessage phone!sendMessageStatusChanged(2) @5000"_q << "send noResponse(false) +Progress -Progress +Success @5000 -Success !HmiPhone_ShowSmsRequest +TextMessagingOff"_q << ""_q;
    QTest::addRow("send: status 0") << ""_q << "HmiPhoneSms_InitiateSendTextMessage phone!sendMessageStatusChanged(0)"_q << "send noResponse(false) +Progress -Progress +Failure"_q << ""_q;
    QTest::addRow("send: status 3") << ""_q << "HmiPhoneSms_InitiateSendTextMessage phone!sendMessageStatusChanged(3)"_q << "send noResponse(false) +Progress -Progress +NetworkFailure"_q << ""_q;
    QTest::addRow("send: status 4 is no outcome") << ""_q << "phone!sendMessageRequested phone!sendMessageStatusChanged(4)"_q << "send noResponse(false) +Progress"_q << ""_q;
    QTest::addRow("send: two retries, then the final failure") << ""_q << "HmiPhoneSms_InitiateSendTextMessage phone!sendMessageStatusChanged(1) HmiPhoneSms_RetrySendTextMessage phone!sendMessageStatusChanged(1) HmiPhoneSms_RetrySendTextMessage phone!sendMessageStatusChanged(1) HmiPhoneSms_RetrySendTextMessage HmiPhoneSms_InitiateSendTextMessage phone!sendMessageStatusChanged(1) HmiPhoneSms_RetrySendTextMessage phone!sendMessageStatusChanged(2)"_q << "send noResponse(false) +Progress -Progress +Failure send noResponse(false) -Failure +Progress -Progress +Failure send noResponse(false) -Failure +Progress -Progress +Failure -Failure +RetrySendTextMessageFailure send noResponse(false) -RetrySendTextMessageFailure +Progress -Progress +Failure send noResponse(false) -Failure +Progress -Progress +Success"_q << ""_q;
    QTest::addRow("send: the next message retries afresh") << ""_q << "HmiPhoneSms_InitiateSendTextMessage phone!sendMessageStatusChanged(1) HmiPhoneSms_RetrySendTextMessage phone!sendMessageStatusChanged(1) HmiPhoneSms_RetrySendTextMessage phone!sendMessageStatusChanged(2) HmiPhoneSms_InitiateSendTextMessage phone!sendMessageStatusChanged(1) HmiPhoneSms_RetrySendTextMessage"_q << "send noResponse(false) +Progress -Progress +Failure send noResponse(false) -Failure +Progress -Progress +Failure send noResponse(false) -Failure +Progress -Progress +Success send noResponse(false) +Progress -Progress +Failure send noResponse(false) -Failure +Progress"_q << ""_q;
    QTest::addRow("send: a new send closes the failures") << ""_q << "HmiPhoneSms_InitiateSendTextMessage phone!sendMessageStatusChanged(3) phone!sendMessageNoResponseFromPhoneAlert phone!sendMessageRequested phone!sendMessageNoResponseFromPhoneAlert HmiPhoneSms_InitiateSendTextMessage"_q << "send noResponse(false) +Progress -Progress +NetworkFailure noResponse(true) +NoResponseFromPhone send noResponse(false) -NetworkFailure -NoResponseFromPhone +Progress noResponse(true) -Progress +NoResponseFromPhone send noResponse(false) -NoResponseFromPhone +Progress"_q << ""_q;
    QTest::addRow("send: a retry closes the failures") << ""_q << "HmiPhoneSms_InitiateSendTextMessage phone!sendMessageStatusChanged(3) HmiPhoneSms_RetrySendTextMessage phone!sendMessageNoResponseFromPhoneAlert HmiPhoneSms_RetrySendTextMessage"_q << "send noResponse(false) +Progress -Progress +NetworkFailure send noResponse(false) -NetworkFailure +Progress noResponse(true) -Progress +NoResponseFromPhone send noResponse(false) -NoResponseFromPhone +Progress"_q << ""_q;
    QTest::addRow("send: no response, late outcome ignored") << ""_q << "HmiPhoneSms_InitiateSendTextMessage phone!sendMessageNoResponseFromPhoneAlert phone!sendMessageStatusChanged(2)"_q << "send noResponse(false) +Progress noResponse(true) -Progress +NoResponseFromPhone"_q << ""_q;
    QTest::addRow("send: no response after the outcome") << ""_q << "HmiPhoneSms_InitiateSendTextMessage phone!sendMessageStatusChanged(1) phone!sendMessageNoResponseFromPhoneAlert"_q << "send noResponse(false) +Progress -Progress +Failure noResponse(true) +NoResponseFromPhone"_q << ""_q;
    QTest::addRow("send: a retry after no response is heard") << ""_q << "HmiPhoneSms_InitiateSendTextMessage phone!sendMessageNoResponseFromPhoneAlert HmiPhoneSms_RetrySendTextMessage phone!sendMessageStatusChanged(2)"_q << "send noResponse(false) +Progress noResponse(true) -Progress +NoResponseFromPhone send noResponse(false) -NoResponseFromPhone +Progress -Progress +Success"_q << ""_q;
    QTest::addRow("send: covered by an alert, then its view") << ""_q << "HmiPhoneSms_InitiateSendTextMessage phone!newTextMessageAlert phone!sendMessageStatusChanged(2) HmiPhone_ViewNewTextMessage"_q << "send noResponse(false) +Progress count=1 +NewTextMessageAlert2 -Progress +Success -NewTextMessageAlert2 requestNewTextMessageDetails() checkPhoneStatus() [PhoneSmsView]"_q << ""_q;
    QTest::addRow("send: the connection changes") << ""_q << "HmiPhoneSms_InitiateSendTextMessage bluetooth!deviceConnectedChanged(true) phone!sendMessageStatusChanged(2)"_q << "send noResponse(false) +Progress -Progress"_q << ""_q;
    QTest::addRow("reply: line 2 by voice, confirmed") << ""_q << "phone.replyMessageLineNo=2 HmiPhoneSms_InitiateSendTextMessage"_q << "setReplyTextSelected(Late) +SendTextMessage send noResponse(false) -SendTextMessage +Progress"_q << ""_q;
    QTest::addRow("reply: line 0") << ""_q << "phone!replyMessageLineNoChanged(0)"_q << ""_q << "Reply Message Line No Index Out of Range "_q;
    QTest::addRow("reply: line 3 of 2") << ""_q << "phone.replyMessageLineNo=3"_q << ""_q << "Reply Message Line No Index Out of Range "_q;
    QTest::addRow("reply: no replies") << "phone.smsReplyMessages=[]"_q << "phone.replyMessageLineNo=1"_q << ""_q << "Reply Message List Empty "_q;
    QTest::addRow("reply: confirmation cancelled") << ""_q << "phone!showReplyMessagesRequested HmiPhoneSms_SendTextMessage phone!cancelSendMessageRequested HmiPhoneSms_SendTextMessage phone!newTextMessageAlert"_q << "checkPhoneStatus() [PhoneSmsReplyView] +SendTextMessage -SendTextMessage +SendTextMessage count=1 -SendTextMessage +NewTextMessageAlert2"_q << ""_q;
    QTest::addRow("reply: the list closes the confirmation") << ""_q << "phone.replyMessageLineNo=1 phone!showMessageListRequested"_q << "setReplyTextSelected(Yes) +SendTextMessage checkPhoneStatus() [PhoneSmsList] -SendTextMessage"_q << ""_q;

    const QString ready = QStringLiteral("phone.messageNotificationEnabled=true phone.smsMessageAccessProfileAvailable=true phone.smsPhoneDeclinedAccessStatus=true phone.messageAccessProfileStatus=true phone.messagesInboxEmptyStatus=false ");
    QTest::addRow("open: messaging off, then on") << ""_q << "HmiPhone_RootStateRequest HmiPhone_ShowSmsRequest phone.messageNotificationEnabled=true"_q << "checkPhoneStatus() +TextMessagingOff !HmiPhone_ShowSmsRequest -TextMessagingOff +NotSupported"_q << ""_q;
    QTest::addRow("open: no access profile") << "phone.messageNotificationEnabled=true"_q << "HmiPhone_RootStateRequest HmiPhone_ShowSmsRequest"_q << "checkPhoneStatus() +NotSupported"_q << ""_q;
    QTest::addRow("open: waiting for the phone") << "phone.messageNotificationEnabled=true phone.smsMessageAccessProfileAvailable=true"_q << "HmiPhone_RootStateRequest HmiPhone_ShowSmsRequest"_q << "checkPhoneStatus() +WaitingForResponseFromPhone"_q << ""_q;
    QTest::addRow("open: in memory") << ready + "phone.messagesInMemoryStatus=true"_q << "HmiPhone_RootStateRequest HmiPhone_ShowSmsRequest"_q << "checkPhoneStatus() !HmiPhone_ShowSmsStatus [PhoneSmsList] requestTextMessagesInbox()"_q << ""_q;
    QTest::addRow("open: Apple phone") << ready + "bluetooth.iOSAppleDeviceConnected=true phone.messagesDownloadingStatus=4"_q << "HmiPhone_RootStateRequest HmiPhone_ShowSmsRequest"_q << "checkPhoneStatus() !HmiPhone_ShowSmsStatus !HmiPhone_ShowSmsIphoneRequest [PhoneSmsList] requestTextMessagesInbox()"_q << ""_q;
    QTest::addRow("open: Apple phone, no access") << ready + "bluetooth.iOSAppleDeviceConnected=true phone.messageAccessProfileStatus=false"_q << "HmiPhone_RootStateRequest HmiPhone_ShowSmsStatus"_q << "checkPhoneStatus() +AccessNotGranted"_q << ""_q;
    QTest::addRow("open: no access") << ready + "phone.messageAccessProfileStatus=false"_q << "HmiPhone_RootStateRequest HmiPhone_ShowSmsStatus"_q << "checkPhoneStatus() +AccessNotGranted"_q << ""_q;
    QTest::addRow("open: download running") << ready + "phone.messagesDownloadingStatus=2 phone.messagesInboxEmptyStatus=true"_q << "HmiPhone_RootStateRequest HmiPhone_ShowSmsStatus"_q << "checkPhoneStatus() +Downloading"_q << ""_q;
    QTest::addRow("open: downloaded") << ready + "phone.messagesDownloadingStatus=3"_q << "HmiPhone_RootStateRequest HmiPhone_ShowSmsStatus"_q << "checkPhoneStatus() +Downloading"_q << ""_q;
    QTest::addRow("open: downloaded, empty inbox") << ready + "phone.messagesDownloadingStatus=3 phone.messagesInboxEmptyStatus=true"_q << "HmiPhone_RootStateRequest HmiPhone_ShowSmsStatus"_q << "checkPhoneStatus() !HmiPhone_ShowSmsIphoneRequest [PhoneSmsList]"_q << ""_q;
    QTest::addRow("open: download failed") << ready + "phone.messagesDownloadingStatus=4"_q << "HmiPhone_RootStateRequest HmiPhone_ShowSmsStatus"_q << "checkPhoneStatus() +DownloadFailed"_q << ""_q;
    QTest::addRow("open: unknown download status") << ready + "phone.messagesDownloadingStatus=5"_q << "HmiPhone_RootStateRequest HmiPhone_ShowSmsStatus"_q << "checkPhoneStatus()"_q << ""_q;
    // clang-format on
}

void TestTextMessageAlerts::textMessages()
{
    QFETCH(QString, values);
    QFETCH(QString, steps);
    QFETCH(QString, outputs);
    QFETCH(QString, debugLine);

    GlobalHmi hmi;
    bool testPosting = false; // the journal's next event is the test's own step, not an output
    const auto apply = [&](const QString &step) {
        testPosting = !step.contains(QRegularExpression(QStringLiteral("[.!]")));
        hmi.apply(step);
    };
    GlobalHmi::phone()->setSmsReplyMessages(
            {QVariantMap{{QStringLiteral("text"), QStringLiteral("Yes")}},
             QVariantMap{{QStringLiteral("text"), QStringLiteral("Late")}}});
    GlobalHmi::phone()->setTextMessageBody(QStringLiteral("Late"));
    for (const QString &value : values.split(QLatin1Char(' '), Qt::SkipEmptyParts))
        apply(value);
    QVERIFY(hmi.run());
    auto *controller = hmi.host().integration()->findChild<HmiPhone::HmiPhoneController *>();

    VirtualEventDispatcher *clock = VirtualEventDispatcher::instance();
    const qint64 start = clock->now();
    qint64 marked = start;
    QStringList seen;
    const auto note = [&](const QString &what) {
        if (clock->now() != marked)
            seen.append(QLatin1Char('@') + QString::number((marked = clock->now()) - start));
        seen.append(what);
    };
    static const QRegularExpression popupPrefix(
            QStringLiteral("^PhoneSms(SendTextMessage(?=\\w))?"));
    // Popups by what is open, on top or covered: covering one is no change, closing one is.
    QStringList open;
    const auto noteOpen = [&] {
        const QStringList now = Brisken::ViewController::instance()->openPopups();
        for (const QString &id : qAsConst(open))
            if (!now.contains(id))
                note(QLatin1Char('-') + id.section(QLatin1Char('.'), 1).remove(popupPrefix));
        for (const QString &id : now)
            if (!open.contains(id))
                note(QLatin1Char('+') + id.section(QLatin1Char('.'), 1).remove(popupPrefix));
        open = now;
    };
    QObject context;
    connect(controller, &HmiPhone::HmiPhoneController::receivedTextMessageCountChanged, &context,
            [&](int count) { note(QStringLiteral("count=") + QString::number(count)); });
    connect(Platform::Journal::instance(), &Platform::Journal::appended, &context,
            [&](const Platform::JournalEntry &entry) {
                const QString id = entry.fields.value(QStringLiteral("id"))
                                           .toString()
                                           .section(QLatin1Char('.'), 1);
                const QString line = TestSupport::journalLines(entry.sequence - 1).value(0);
                if (entry.kind.startsWith(QLatin1String("popup-"))
                    && !entry.kind.endsWith(QLatin1String("request"))
                    && !entry.kind.endsWith(QLatin1String("dismiss")))
                    noteOpen();
                else if (entry.kind == QLatin1String("view")
                         && id.startsWith(QLatin1String("PhoneSms")))
                    note(QLatin1Char('[') + id + QLatin1Char(']'));
                else if (entry.kind == QLatin1String("bridge"))
                    note(line.mid(line.indexOf(QLatin1Char('.')) + 1)
                                 .replace(QStringLiteral("initiateSendTextMessage()"),
                                          QStringLiteral("send"))
                                 .replace(QStringLiteral("setSendMessagePhoneSendReportStatus"),
                                          QStringLiteral("noResponse")));
                else if (entry.kind == QLatin1String("event") && !std::exchange(testPosting, false))
                    note(QLatin1Char('!') + line.section(QLatin1Char(' '), 1));
            });

    if (!debugLine.isEmpty())
        expectMessage(QtDebugMsg, qPrintable(debugLine));
    for (const QString &step : steps.split(QLatin1Char(' '), Qt::SkipEmptyParts)) {
        if (step.startsWith(QLatin1Char('@')))
            clock->advance(start + step.mid(1).toLongLong() - clock->now());
        else
            apply(step);
        TestSupport::processUntilIdle();
        noteOpen();
    }
    QCOMPARE(seen.join(QLatin1Char(' ')), outputs.trimmed());
}

int main(int argc, char *argv[])
{
    QCoreApplication::setEventDispatcher(new VirtualEventDispatcher);
    QCoreApplication app(argc, argv);
    TestTextMessageAlerts test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_textmessagealerts.moc"
