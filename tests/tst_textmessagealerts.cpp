// Text messages wherever the driver is in the HMI: new-message alerts over time, sending a reply
// with its outcomes and retries, and the checks that open the message screens. Time is virtual:
// the alerts' 8000 ms pass at once.

#include "globalhmi.h"
#include "hmiphonecontroller.h"
#include "hmiphoneevents.h"

#include <virtualeventdispatcher.h>

using namespace HmiPhone;
using Simulator::VirtualEventDispatcher;

class TestTextMessageAlerts : public QObject
{
    Q_OBJECT

private slots:
    // The reply chosen by voice reports bad line numbers at debug level.
    void initTestCase()
    {
        QLoggingCategory::setFilterRules(QStringLiteral("orvane.hmiphone.debug=true"));
    }
    void init() { m_hmi = std::make_unique<GlobalHmi>(); }
    void cleanup();

    void alerts_data();
    void alerts();
    void sending_data();
    void sending();
    void opening_data();
    void opening();

private:
    static Mavrosk::PhoneSource *phone() { return GlobalHmi::phone(); }
    HmiPhoneController *controller() const
    {
        return m_hmi->host().integration()->findChild<HmiPhoneController *>();
    }
    // The popups on screen, by view name.
    static QStringList shownPopups();

    std::unique_ptr<GlobalHmi> m_hmi;
    TestSupport::FrameworkWarningGuard m_guard;
};

void TestTextMessageAlerts::cleanup()
{
    m_hmi.reset();
    QCOMPARE(TestSupport::FrameworkWarningGuard::take(), QStringList());
}

// "popup-request PHONE.PhoneSmsSendTextMessageProgress" as "Progress", the confirmation
// "PhoneSmsSendTextMessage" as "SendTextMessage".
static QString popupName(const QString &line)
{
    static const QRegularExpression prefix(QStringLiteral("^PhoneSms(SendTextMessage(?=\\w))?"));
    return line.section(QLatin1Char('.'), 1).remove(prefix);
}

QStringList TestTextMessageAlerts::shownPopups()
{
    QStringList names;
    for (const QString &id : Brisken::ViewController::instance()->shownPopups())
        names.append(id.section(QLatin1Char('.'), 1));
    return names;
}

// Steps at virtual times ("step@ms"): "msg" a new message, "hear", "stop", "hide", "view" and
// "reply" the alert's buttons, "details" the details of the new message arriving, "cluster-hear"
// and "cluster-ignore" the instrument cluster's buttons. The timeline is what the HMI did and when:
// popups shown and hidden, views, commands to the phone and the received-message count.
void TestTextMessageAlerts::alerts_data()
{
    QTest::addColumn<bool>("doNotDisturb");
    QTest::addColumn<QString>("call");
    QTest::addColumn<QString>("steps");
    QTest::addColumn<QStringList>("timeline");

    const auto lines
            = [](const char *text) { return QString::fromLatin1(text).split(QLatin1Char('|')); };
    // clang-format off
    QTest::addRow("one message") << false << "none" << "msg@0 msg@9000" << lines(
        "0 count 1|0 shown NewTextMessageAlert2|8000 hidden NewTextMessageAlert2|"
        "9000 count 2|9000 shown NewTextMessageAlert2|17000 hidden NewTextMessageAlert2");
    QTest::addRow("three in a row, then one more") << false << "none" << "msg@0 msg@2000 msg@5000 msg@14000" << lines(
        "0 count 1|0 shown NewTextMessageAlert2|"
        "2000 count 2|2000 hidden NewTextMessageAlert2|2000 shown MultipleTextMessagesReceived|"
        "5000 count 3|13000 hidden MultipleTextMessagesReceived|13000 count 0|"
        "14000 count 1|14000 shown NewTextMessageAlert2|22000 hidden NewTextMessageAlert2");
    QTest::addRow("during a call") << false << "connected" << "msg@0 msg@1000" << lines(
        "0 shown NewTextMessageAlert1|8000 hidden NewTextMessageAlert1");
    QTest::addRow("while the phone rings") << false << "ringing" << "msg@0" << lines(
        "0 shown NewTextMessageAlert1|8000 hidden NewTextMessageAlert1");
    QTest::addRow("do not disturb") << true << "none" << "msg@0 msg@1000" << QStringList();
    QTest::addRow("hear it keeps the alert up") << false << "none" << "msg@0 hear@3000 details@4000 stop@5000" << lines(
        "0 count 1|0 shown NewTextMessageAlert2|"
        "3000 bridge phone.requestNewTextMessageDetails()|3000 bridge phone.setHearItPressed(true)|"
        "4000 bridge phone.textMessagePlayback(Running late)|5000 bridge phone.stopTextMessagePlayback()|"
        "11000 hidden NewTextMessageAlert2|"
        "11000 bridge phone.requestTextMessagesInbox()|11000 bridge phone.setHearItPressed(false)");
    QTest::addRow("details without hear it are not read") << false << "none" << "msg@0 details@1000" << lines(
        "0 count 1|0 shown NewTextMessageAlert2|8000 hidden NewTextMessageAlert2");
    QTest::addRow("buttons without an alert do nothing") << false << "none" << "hear@0 stop@0 hide@0 view@0 reply@0" << QStringList();
    QTest::addRow("the cluster hears at any time") << false << "none" << "cluster-hear@0 details@1000" << lines(
        "0 bridge phone.requestNewTextMessageDetails()|0 bridge phone.setHearItPressed(true)|"
        "1000 bridge phone.textMessagePlayback(Running late)");
    QTest::addRow("hidden, then a new single alert") << false << "none" << "msg@0 hide@1000 msg@2000" << lines(
        "0 count 1|0 shown NewTextMessageAlert2|1000 hidden NewTextMessageAlert2|"
        "2000 count 2|2000 shown NewTextMessageAlert2|10000 hidden NewTextMessageAlert2");
    QTest::addRow("ignored on the cluster") << false << "none" << "msg@0 cluster-ignore@1000" << lines(
        "0 count 1|0 shown NewTextMessageAlert2|1000 hidden NewTextMessageAlert2");
    QTest::addRow("view opens the message") << false << "none" << "msg@0 view@1000" << lines(
        "0 count 1|0 shown NewTextMessageAlert2|1000 hidden NewTextMessageAlert2|"
        "1000 bridge phone.requestNewTextMessageDetails()|1000 bridge phone.checkPhoneStatus()|1000 view PhoneSmsView");
    QTest::addRow("reply opens the replies") << false << "none" << "msg@0 reply@1000" << lines(
        "0 count 1|0 shown NewTextMessageAlert2|1000 hidden NewTextMessageAlert2|"
        "1000 bridge phone.checkPhoneStatus()|1000 view PhoneSmsReplyView");
    // clang-format on
}

void TestTextMessageAlerts::alerts()
{
    QFETCH(bool, doNotDisturb);
    QFETCH(QString, call);
    QFETCH(QString, steps);
    QFETCH(QStringList, timeline);

    phone()->setDoNotDisturb(doNotDisturb);
    phone()->setCallConnected(call == QLatin1String("connected"));
    phone()->setStatus(call == QLatin1String("connected") ? 7 : 0);
    phone()->setIncomingCall(call == QLatin1String("ringing"));
    phone()->setTextMessageBody(QStringLiteral("Running late"));
    QVERIFY(m_hmi->run());
    VirtualEventDispatcher *clock = VirtualEventDispatcher::instance();
    const qint64 start = clock->now();

    QStringList seen;
    const auto at = [&] { return QString::number(clock->now() - start) + QLatin1Char(' '); };
    QObject context;
    connect(controller(), &HmiPhoneController::receivedTextMessageCountChanged, &context,
            [&](int count) {
                seen.append(at() + QStringLiteral("count ") + QString::number(count));
            });
    connect(Platform::Journal::instance(), &Platform::Journal::appended, &context,
            [&](const Platform::JournalEntry &entry) {
                const QString id = entry.fields.value(QStringLiteral("id")).toString();
                if (entry.kind == QLatin1String("popup-shown")
                    || entry.kind == QLatin1String("popup-hidden"))
                    seen.append(at() + entry.kind.mid(6) + QLatin1Char(' ')
                                + id.section(QLatin1Char('.'), 1));
                else if (entry.kind == QLatin1String("view") && id.contains(QLatin1String("Sms")))
                    seen.append(at() + QStringLiteral("view ") + id.section(QLatin1Char('.'), 1));
                else if (entry.kind == QLatin1String("bridge"))
                    seen.append(at() + QStringLiteral("bridge ")
                                + TestSupport::journalLines(entry.sequence - 1).constFirst());
            });

    const QHash<QString, QString> buttons{
            {QStringLiteral("hear"), Events::HmiPhone_HearNewTextMessage},
            {QStringLiteral("stop"), Events::HmiPhone_StopHearNewTextMessage},
            {QStringLiteral("hide"), Events::HmiPhone_HideNewTextMessageAlert},
            {QStringLiteral("view"), Events::HmiPhone_ViewNewTextMessage},
            {QStringLiteral("reply"), Events::HmiPhone_ReplyNewTextMessage}};
    for (const QString &step : steps.split(QLatin1Char(' '))) {
        const QString what = step.section(QLatin1Char('@'), 0, 0);
        clock->advance(start + step.section(QLatin1Char('@'), 1).toLongLong() - clock->now());
        if (what == QLatin1String("msg"))
            emit phone()->newTextMessageAlert();
        else if (what == QLatin1String("details"))
            emit phone()->newTextMessageDetailsReady();
        else if (what == QLatin1String("cluster-hear"))
            emit phone()->phoneSmsNewTextClusterHearItRequestReceived();
        else if (what == QLatin1String("cluster-ignore"))
            emit phone()->phoneSmsNewTextClusterIgnoreRequestReceived();
        else
            GlobalHmi::post(buttons.value(what));
        clock->runUntilIdle();
    }
    clock->advance(30000);
    QCOMPARE(seen.join(QLatin1Char('|')), timeline.join(QLatin1Char('|')));
}

// Steps: "send" the driver confirms the send, "voice" the voice system asks for it, "s0".."s4"
// the phone reports the send status, "noresp" the phone does not answer, "retry" the driver asks
// for a retry, "reply" the phone asks for the reply list, "line:N" the voice system picks reply
// line N, "confirm" the reply list's send button, "cancel" the voice system cancels, "newmsg" and
// "list" a new message and the message list asked for, "device" the connection changes, "empty"
// the reply list empties, "wait" 5 s pass. The outputs are the popups asked for, the sends and the
// reply texts chosen, in order; then the popups left on screen.
void TestTextMessageAlerts::sending_data()
{
    QTest::addColumn<QString>("steps");
    QTest::addColumn<QString>("outputs");
    QTest::addColumn<QStringList>("left");

    const QStringList none;
    const QString failure = QStringLiteral("PhoneSmsSendTextMessageFailure");
    // clang-format off
    QTest::addRow("status 2, success") << "send s2" << "send Progress Success" << QStringList{QStringLiteral("PhoneSmsSendTextMessageSuccess")};
    QTest::addRow("success, then the messages") << "send s2 wait" << "send Progress Success event:HmiPhone_ShowSmsRequest TextMessagingOff" << QStringList{QStringLiteral("PhoneSmsTextMessagingOff")};
    QTest::addRow("status 1, failure") << "send s1" << "send Progress Failure" << QStringList{failure};
    QTest::addRow("status 0, failure") << "send s0" << "send Progress Failure" << QStringList{failure};
    QTest::addRow("status 3, network failure") << "send s3" << "send Progress NetworkFailure" << QStringList{QStringLiteral("PhoneSmsSendTextMessageNetworkFailure")};
    QTest::addRow("status 4 changes nothing") << "send s4" << "send Progress" << QStringList{QStringLiteral("PhoneSmsSendTextMessageProgress")};
    QTest::addRow("asked by voice") << "voice s2" << "send Progress Success" << QStringList{QStringLiteral("PhoneSmsSendTextMessageSuccess")};
    QTest::addRow("one retry succeeds") << "send s1 retry s2" << "send Progress Failure Progress send Success" << QStringList{QStringLiteral("PhoneSmsSendTextMessageSuccess")};
    QTest::addRow("two retries") << "send s1 retry s0 retry s3" << "send Progress Failure Progress send Failure Progress send NetworkFailure" << QStringList{QStringLiteral("PhoneSmsSendTextMessageNetworkFailure")};
    QTest::addRow("the third retry gives up") << "send s1 retry s1 retry s1 retry s2" << "send Progress Failure Progress send Failure Progress send Failure RetrySendTextMessageFailure" << QStringList{QStringLiteral("PhoneSmsRetrySendTextMessageFailure")};
    QTest::addRow("then retries count again") << "send s1 retry s1 retry s1 retry send s1 retry s2" << "send Progress Failure Progress send Failure Progress send Failure RetrySendTextMessageFailure send Progress Failure Progress send Success" << QStringList{QStringLiteral("PhoneSmsRetrySendTextMessageFailure"), QStringLiteral("PhoneSmsSendTextMessageSuccess")};
    QTest::addRow("no response, late success ignored") << "send noresp s2" << "send Progress NoResponseFromPhone" << QStringList{QStringLiteral("PhoneSmsSendTextMessageNoResponseFromPhone")};
    QTest::addRow("no response after the outcome") << "send s1 noresp" << "send Progress Failure NoResponseFromPhone" << QStringList{failure, QStringLiteral("PhoneSmsSendTextMessageNoResponseFromPhone")};
    QTest::addRow("a retry after no response is heard") << "send noresp s1 retry s2" << "send Progress NoResponseFromPhone Progress send Success" << QStringList{QStringLiteral("PhoneSmsSendTextMessageNoResponseFromPhone"), QStringLiteral("PhoneSmsSendTextMessageSuccess")};
    QTest::addRow("a fresh send after no response is heard") << "send noresp send s2" << "send Progress NoResponseFromPhone send Progress Success" << QStringList{QStringLiteral("PhoneSmsSendTextMessageNoResponseFromPhone"), QStringLiteral("PhoneSmsSendTextMessageSuccess")};
    QTest::addRow("reply line 2 by voice") << "line:2 send s2" << "reply:Running late SendTextMessage send Progress Success" << QStringList{QStringLiteral("PhoneSmsSendTextMessageSuccess")};
    QTest::addRow("reply line 0 is out of range") << "line:0" << "" << none;
    QTest::addRow("reply line 3 is out of range") << "line:3" << "" << none;
    QTest::addRow("no replies") << "empty line:1" << "" << none;
    QTest::addRow("send button in the reply list") << "reply confirm" << "SendTextMessage" << QStringList{QStringLiteral("PhoneSmsSendTextMessage")};
    QTest::addRow("send button outside the reply list") << "confirm" << "" << none;
    QTest::addRow("cancelled by voice") << "reply confirm cancel" << "SendTextMessage" << none;
    QTest::addRow("a new message closes the confirmation") << "reply confirm newmsg" << "SendTextMessage NewTextMessageAlert2" << QStringList{QStringLiteral("NewTextMessageAlert2")};
    QTest::addRow("the list closes the confirmation") << "reply confirm list" << "SendTextMessage" << none;
    QTest::addRow("the connection changes during the send") << "send device s2" << "send Progress" << none;
    // clang-format on
}

void TestTextMessageAlerts::sending()
{
    QFETCH(QString, steps);
    QFETCH(QString, outputs);
    QFETCH(QStringList, left);

    phone()->setSmsReplyMessages(
            {QVariantMap{{QStringLiteral("text"), QStringLiteral("Yes")}},
             QVariantMap{{QStringLiteral("text"), QStringLiteral("Running late")}}});
    QVERIFY(m_hmi->run());
    const qint64 since = GlobalHmi::mark();
    for (const QString &step : steps.split(QLatin1Char(' '))) {
        if (step == QLatin1String("send"))
            GlobalHmi::post(Events::HmiPhoneSms_InitiateSendTextMessage);
        else if (step == QLatin1String("voice"))
            emit phone()->sendMessageRequested();
        else if (step.startsWith(QLatin1Char('s')) && step.size() == 2)
            emit phone()->sendMessageStatusChanged(step.at(1).digitValue());
        else if (step == QLatin1String("noresp"))
            emit phone()->sendMessageNoResponseFromPhoneAlert();
        else if (step == QLatin1String("retry"))
            GlobalHmi::post(Events::HmiPhoneSms_RetrySendTextMessage);
        else if (step == QLatin1String("reply"))
            emit phone()->showReplyMessagesRequested();
        else if (step == QLatin1String("confirm"))
            GlobalHmi::post(Events::HmiPhoneSms_SendTextMessage);
        else if (step == QLatin1String("cancel"))
            emit phone()->cancelSendMessageRequested();
        else if (step == QLatin1String("newmsg"))
            emit phone()->newTextMessageAlert();
        else if (step == QLatin1String("list"))
            emit phone()->showMessageListRequested();
        else if (step == QLatin1String("device"))
            emit Mavrosk::BluetoothSource::instance()->deviceConnectedChanged(true);
        else if (step == QLatin1String("empty"))
            phone()->setSmsReplyMessages({});
        else if (step == QLatin1String("wait"))
            VirtualEventDispatcher::instance()->advance(5000);
        else if (step.startsWith(QLatin1String("line:"))) {
            const int line = step.mid(5).toInt();
            if (phone()->smsReplyMessages().isEmpty())
                QTest::ignoreMessage(QtDebugMsg, "Reply Message List Empty ");
            else if (line < 1 || line > phone()->smsReplyMessages().size())
                QTest::ignoreMessage(QtDebugMsg, "Reply Message Line No Index Out of Range ");
            // The voice system tells the line even when it is the same as before.
            if (phone()->replyMessageLineNo() == line)
                emit phone()->replyMessageLineNoChanged(line);
            else
                phone()->setReplyMessageLineNo(line);
        }
        TestSupport::processUntilIdle();
    }

    QStringList seen;
    for (const QString &line :
         TestSupport::journalLines(since,
                                   {QStringLiteral("popup-request"), QStringLiteral("bridge"),
                                    QStringLiteral("event")})) {
        if (line.startsWith(QLatin1String("popup-request PHONE.")))
            seen.append(popupName(line));
        else if (line == QLatin1String("phone.initiateSendTextMessage()"))
            seen.append(QStringLiteral("send"));
        else if (line.startsWith(QLatin1String("phone.setReplyTextSelected(")))
            seen.append(QStringLiteral("reply:") + line.section(QLatin1Char('('), 1).chopped(1));
        else if (line.startsWith(QLatin1String("event ")))
            seen.append(QStringLiteral("event:") + line.mid(6));
    }
    QCOMPARE(seen.join(QLatin1Char(' ')), outputs);
    QCOMPARE(shownPopups(), left);
}

// "HmiPhone_ShowSmsRequest" from the phone menu ("view text messages"), or the message list asked
// for by voice, with the phone's message settings and state: the popup asked for, the events posted
// and the message screen reached.
void TestTextMessageAlerts::opening_data()
{
    QTest::addColumn<bool>("byVoice");
    QTest::addColumn<bool>("notificationEnabled");
    QTest::addColumn<bool>("accessProfile");
    QTest::addColumn<bool>("declinedAccess");
    QTest::addColumn<bool>("inMemory");
    QTest::addColumn<bool>("apple");
    QTest::addColumn<bool>("accessStatus");
    QTest::addColumn<int>("downloadStatus");
    QTest::addColumn<bool>("inboxEmpty");
    QTest::addColumn<QString>("outputs");
    QTest::addColumn<bool>("opens");

    // clang-format off
    QTest::addRow("notification off") << false << false << true << true << true << false << true << 3 << false << "TextMessagingOff" << false;
    QTest::addRow("no message access profile") << false << true << false << true << true << false << true << 3 << false << "NotSupported" << false;
    QTest::addRow("waiting for the phone") << false << true << true << false << true << false << true << 3 << false << "WaitingForResponseFromPhone" << false;
    QTest::addRow("messages in memory") << false << true << true << true << true << false << true << 0 << false << "event:HmiPhone_ShowSmsStatus" << true;
    QTest::addRow("Apple phone with access") << false << true << true << true << false << true << true << 4 << false << "event:HmiPhone_ShowSmsStatus event:HmiPhone_ShowSmsIphoneRequest" << true;
    QTest::addRow("Apple phone without access") << false << true << true << true << false << true << false << 3 << true << "event:HmiPhone_ShowSmsStatus AccessNotGranted" << false;
    QTest::addRow("access not granted") << false << true << true << true << false << false << false << 3 << true << "event:HmiPhone_ShowSmsStatus AccessNotGranted" << false;
    QTest::addRow("download running") << false << true << true << true << false << false << true << 2 << false << "event:HmiPhone_ShowSmsStatus Downloading" << false;
    QTest::addRow("not started, empty inbox") << false << true << true << true << false << false << true << 0 << true << "event:HmiPhone_ShowSmsStatus Downloading" << false;
    QTest::addRow("finished with messages") << false << true << true << true << false << false << true << 3 << false << "event:HmiPhone_ShowSmsStatus Downloading" << false;
    QTest::addRow("finished, empty inbox") << false << true << true << true << false << false << true << 3 << true << "event:HmiPhone_ShowSmsStatus event:HmiPhone_ShowSmsIphoneRequest" << true;
    QTest::addRow("download failed") << false << true << true << true << false << false << true << 4 << false << "event:HmiPhone_ShowSmsStatus DownloadFailed" << false;
    QTest::addRow("unknown download status") << false << true << true << true << false << false << true << 5 << false << "event:HmiPhone_ShowSmsStatus" << false;
    QTest::addRow("asked by voice") << true << false << false << false << false << false << false << 4 << false << "" << true;
    // clang-format on
}

void TestTextMessageAlerts::opening()
{
    QFETCH(bool, byVoice);
    QFETCH(bool, notificationEnabled);
    QFETCH(bool, accessProfile);
    QFETCH(bool, declinedAccess);
    QFETCH(bool, inMemory);
    QFETCH(bool, apple);
    QFETCH(bool, accessStatus);
    QFETCH(int, downloadStatus);
    QFETCH(bool, inboxEmpty);
    QFETCH(QString, outputs);
    QFETCH(bool, opens);

    phone()->setMessageNotificationEnabled(notificationEnabled);
    phone()->setSmsMessageAccessProfileAvailable(accessProfile);
    phone()->setSmsPhoneDeclinedAccessStatus(declinedAccess);
    phone()->setMessagesInMemoryStatus(inMemory);
    Mavrosk::BluetoothSource::instance()->setIOSAppleDeviceConnected(apple);
    phone()->setMessageAccessProfileStatus(accessStatus);
    phone()->setMessagesDownloadingStatus(downloadStatus);
    phone()->setMessagesInboxEmptyStatus(inboxEmpty);
    QVERIFY(m_hmi->run());
    m_hmi->host().openModule();
    TestSupport::processUntilIdle();
    QVERIFY(GlobalHmi::isActive(QStringLiteral("PhoneMenuViewState")));

    const qint64 since = GlobalHmi::mark();
    if (byVoice)
        emit phone()->showMessageListRequested();
    else
        controller()->viewTextMessages();
    TestSupport::processUntilIdle();

    QStringList seen;
    for (const QString &line : TestSupport::journalLines(
                 since, {QStringLiteral("popup-request"), QStringLiteral("event")})) {
        if (line.startsWith(QLatin1String("popup-request PHONE.")))
            seen.append(popupName(line));
        else if (line != QLatin1String("event HmiPhone_ShowSmsRequest"))
            seen.append(QStringLiteral("event:") + line.mid(6));
    }
    QCOMPARE(seen.join(QLatin1Char(' ')), outputs);
    QCOMPARE(GlobalHmi::isActive(QStringLiteral("PhoneSmsListViewState")), opens);

    // The messaging-off notice closes itself once messaging is turned on.
    phone()->setMessageNotificationEnabled(true);
    TestSupport::processUntilIdle();
    QVERIFY(!shownPopups().contains(QStringLiteral("PhoneSmsTextMessagingOff")));
}

int main(int argc, char *argv[])
{
    QCoreApplication::setEventDispatcher(new VirtualEventDispatcher);
    QCoreApplication app(argc, argv);
    TestTextMessageAlerts test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_textmessagealerts.moc"
