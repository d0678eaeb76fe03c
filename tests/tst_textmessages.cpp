#include "phonescreenfixture.h"

#include <hmiphoneevents.h>
#include <hmiphonepopupmanager.h>
#include <hmiphoneviews.h>
#include <phonemenustate.h>
#include <phonesms_cmp.h>

#include <mavrosk/bluetoothsource.h>
#include <mavrosk/phonesource.h>

#include <QtTest>

using namespace HmiPhone;

class TestTextMessages : public QObject
{
    Q_OBJECT

private slots:
    void init()
    {
        m_fixture.reset();
        TestSupport::FrameworkWarningGuard::take();
        Mavrosk::BluetoothSource::instance()->setDeviceConnected(true);
        phone()->setTextMessageBody(QStringLiteral("See you at six"));
    }
    void cleanup() { QCOMPARE(TestSupport::FrameworkWarningGuard::take(), QStringList()); }

    void openOrHear_data();
    void openOrHear();
    void downloadRetries_data();
    void downloadRetries();
    void inboxRequests_data();
    void inboxRequests();

private:
    Mavrosk::PhoneSource *phone() const { return Mavrosk::PhoneSource::instance(); }
    void openMessageList()
    {
        m_fixture.enter(m_fixture.phone()->phoneSmsCompositeState());
        QVERIFY(m_fixture.isActive(QStringLiteral("PhoneSmsListViewState")));
    }

    TestSupport::FrameworkWarningGuard m_guard;
    PhoneScreenFixture m_fixture;
};

// Selections made in the list ("hear:<index>" or "options:<index>", the index possibly missing
// or not a number), then the phone reports the details of the message.
void TestTextMessages::openOrHear_data()
{
    QTest::addColumn<QStringList>("selections");
    QTest::addColumn<QStringList>("calls");
    QTest::addColumn<bool>("messageViewShown");

    const QString details2 = QStringLiteral("phone.requestSelectedTextMessageDetails(2)");
    const QString details3 = QStringLiteral("phone.requestSelectedTextMessageDetails(3)");
    const QString playback = QStringLiteral("phone.textMessagePlayback(See you at six)");

    QTest::addRow("options open the message")
            << QStringList{QStringLiteral("options:3")} << QStringList{details3} << true;
    QTest::addRow("hear reads it aloud, the list stays")
            << QStringList{QStringLiteral("hear:2")} << QStringList{details2, playback} << false;
    QTest::addRow("hear, then options before the details")
            << QStringList{QStringLiteral("hear:2"), QStringLiteral("options:3")}
            << QStringList{details2, details3} << true;
    QTest::addRow("options, then hear before the details")
            << QStringList{QStringLiteral("options:3"), QStringLiteral("hear:2")}
            << QStringList{details3, details2, playback} << false;
    QTest::addRow("options without an index still cancel hearing")
            << QStringList{QStringLiteral("hear:2"), QStringLiteral("options:")}
            << QStringList{details2} << true;
    QTest::addRow("hear with a bad index changes nothing")
            << QStringList{QStringLiteral("options:3"), QStringLiteral("hear:two")}
            << QStringList{details3} << true;
    QTest::addRow("negative index asks nothing")
            << QStringList{QStringLiteral("hear:-1")} << QStringList() << true;
}

void TestTextMessages::openOrHear()
{
    QFETCH(QStringList, selections);
    QFETCH(QStringList, calls);
    QFETCH(bool, messageViewShown);

    phone()->setMessagesInboxEmptyStatus(true);
    m_fixture.build();
    openMessageList();
    m_fixture.mark();

    for (const QString &selection : selections) {
        const QString kind = selection.section(QLatin1Char(':'), 0, 0);
        const QString index = selection.section(QLatin1Char(':'), 1);
        bool isNumber = false;
        const int number = index.toInt(&isNumber);
        const QVariant value = index.isEmpty() ? QVariant()
                : isNumber                     ? QVariant(number)
                                               : QVariant(index);
        m_fixture.post(kind == QLatin1String("hear") ? Events::HmiPhone_HearSelectedTextMessage
                                                     : Events::HmiPhoneSms_ViewTextMessageOptions,
                       value);
    }
    emit phone()->textMessageDetailsReady();
    TestSupport::processUntilIdle();

    QCOMPARE(m_fixture.bridgeCalls(), calls);
    QCOMPARE(m_fixture.isActive(QStringLiteral("PhoneSmsViewState")), messageViewShown);
    QCOMPARE(m_fixture.isActive(QStringLiteral("PhoneSmsListViewState")), !messageViewShown);

    // Details arriving while the message itself is shown belong to no selection of the list.
    if (messageViewShown) {
        m_fixture.mark();
        emit phone()->textMessageDetailsReady();
        TestSupport::processUntilIdle();
        QCOMPARE(m_fixture.bridgeCalls(), QStringList());
    }
}

// Each failure of a download shown with the downloading popup; the user retries from the
// download-failed popup. A finished download starts the count again.
void TestTextMessages::downloadRetries_data()
{
    QTest::addColumn<QStringList>("outcomes");
    QTest::addColumn<QStringList>("failurePopups");

    const QString failed = Views::PhoneSmsDownloadFailed;
    const QString final = Views::PhoneSmsRetryDownloadFailed;
    QTest::addRow("two retries, then the final popup")
            << QStringList{QStringLiteral("fail"), QStringLiteral("fail"), QStringLiteral("fail"),
                           QStringLiteral("fail")}
            << QStringList{failed, failed, final, final};
    QTest::addRow("a finished download starts again")
            << QStringList{QStringLiteral("fail"), QStringLiteral("fail"), QStringLiteral("fail"),
                           QStringLiteral("done"), QStringLiteral("fail")}
            << QStringList{failed, failed, final, failed};
}

void TestTextMessages::downloadRetries()
{
    QFETCH(QStringList, outcomes);
    QFETCH(QStringList, failurePopups);

    m_fixture.build();
    openMessageList();

    QStringList shown;
    for (const QString &outcome : outcomes) {
        phone()->setMessagesDownloadingStatus(0);
        m_fixture.post(Events::HmiPhoneSms_RefreshMessages);
        phone()->setMessagesDownloadingStatus(2);
        TestSupport::processUntilIdle();
        QCOMPARE(Quorvel::StateMachine::instance()->shownPopups(),
                 QStringList{Views::PhoneSmsDownloading});
        m_fixture.mark();

        phone()->setMessagesDownloadingStatus(outcome == QLatin1String("done") ? 3 : 4);
        TestSupport::processUntilIdle();
        if (outcome == QLatin1String("done")) {
            QCOMPARE(m_fixture.journal(QStringLiteral("popup-dismiss")),
                     QStringList{Views::PhoneSmsDownloading});
            QVERIFY(m_fixture.isActive(QStringLiteral("PhoneSmsListViewState")));
            continue;
        }
        const QStringList requested = m_fixture.journal(QStringLiteral("popup-request"));
        QCOMPARE(requested.size(), 1);
        shown.append(requested.first());
        QCOMPARE(Quorvel::StateMachine::instance()->shownPopups(), requested);

        // Retry from the download-failed popup (the final one offers none).
        m_fixture.mark();
        m_fixture.post(Events::HmiPhoneSms_RetryMessagesDownload);
        if (requested.first() == Views::PhoneSmsDownloadFailed)
            QCOMPARE(m_fixture.bridgeCalls(),
                     QStringList{QStringLiteral("phone.retrySmsDownload()")});
        else
            QCOMPARE(m_fixture.bridgeCalls(), QStringList());
        HmiPhonePopupManager::instance()->hideMessagesDownloadFailed();
        Quorvel::StateMachine::instance()->dismissPopup(Views::PhoneSmsRetryDownloadFailed);
        TestSupport::processUntilIdle();
    }
    QCOMPARE(shown, failurePopups);
}

// Steps: "enter" opens the message list (coming from the phone menu), "count" changes the
// message count, "running"/"finished" start and end a download, "new" is a new message,
// "filled" makes the empty inbox non-empty.
void TestTextMessages::inboxRequests_data()
{
    QTest::addColumn<bool>("inboxEmpty");
    QTest::addColumn<QStringList>("steps");
    QTest::addColumn<int>("requests");

    auto steps = [](const char *text) { return QString::fromLatin1(text).split(QLatin1Char(' ')); };
    QTest::addRow("two entries, no change") << false << steps("enter enter") << 1;
    QTest::addRow("a count change between entries") << false << steps("enter count enter") << 2;
    QTest::addRow("a device change between entries") << false << steps("enter device enter") << 2;
    QTest::addRow("a change during a download is fetched after it")
            << false << steps("enter running count enter finished enter enter") << 2;
    QTest::addRow("a new message forces a request") << false << steps("enter new") << 2;
    QTest::addRow("no forced request during a download")
            << false << steps("enter running new") << 1;
    QTest::addRow("an empty inbox asks nothing") << true << steps("enter enter") << 0;
    QTest::addRow("the inbox fills while shown") << true << steps("enter filled") << 1;
}

void TestTextMessages::inboxRequests()
{
    QFETCH(bool, inboxEmpty);
    QFETCH(QStringList, steps);
    QFETCH(int, requests);

    phone()->setMessagesInboxEmptyStatus(inboxEmpty);
    m_fixture.build();
    m_fixture.enter(m_fixture.phone());
    m_fixture.mark();

    int device = 1;
    for (const QString &step : steps) {
        if (step == QLatin1String("enter")) {
            m_fixture.enter(m_fixture.phone()->phoneIdleState());
            openMessageList();
        } else if (step == QLatin1String("count")) {
            phone()->setSmsTotalCount(phone()->smsTotalCount() + 1);
        } else if (step == QLatin1String("device")) {
            Mavrosk::BluetoothSource::instance()->setPhoneDevice(device++);
        } else if (step == QLatin1String("running")) {
            phone()->setMessagesDownloadingStatus(2);
        } else if (step == QLatin1String("finished")) {
            phone()->setMessagesDownloadingStatus(3);
        } else if (step == QLatin1String("new")) {
            emit phone()->newTextMessageAlert();
        } else if (step == QLatin1String("filled")) {
            phone()->setMessagesInboxEmptyStatus(false);
        }
        TestSupport::processUntilIdle();
    }
    QCOMPARE(m_fixture.bridgeCalls().count(QStringLiteral("phone.requestTextMessagesInbox()")),
             requests);
}

QTEST_GUILESS_MAIN(TestTextMessages)
#include "tst_textmessages.moc"
