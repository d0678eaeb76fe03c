#include "phonerootfixture.h"

#include <hmiphoneevents.h>
#include <hmiphonepopupmanager.h>
#include <hmiphoneviews.h>
#include <phonemenustate.h>
#include <phonesms_cmp.h>

#include <mavrosk/bridge.h>

#include <QtTest>

using namespace HmiPhone;
using namespace PhoneRootFixture;

class TestTextMessages : public TestSupport::Suite
{
    Q_OBJECT

private slots:
    // Selections in the list ("hear:<index>" or "options:<index>"), then the phone reports the
    // details: the last selection decides between reading aloud and opening the message.
    void openOrHear_data()
    {
        QTest::addColumn<QStringList>("selections");
        QTest::addColumn<QStringList>("outputs");
        QTest::addColumn<QString>("screen");

        const QString details2 = QStringLiteral("phone.requestSelectedTextMessageDetails(2)");
        const QString details3 = QStringLiteral("phone.requestSelectedTextMessageDetails(3)");
        const QString playback = QStringLiteral("phone.textMessagePlayback(At_six)");
        const QString list = QStringLiteral("PhoneSmsListViewState");
        const QString message = QStringLiteral("PhoneSmsViewState");
        auto steps = [](const char *text) {
            return QString::fromLatin1(text).split(QLatin1Char(' '));
        };

        // clang-format off
        QTest::addRow("options open the message") << steps("options:3") << QStringList{details3} << message;
        QTest::addRow("hear reads aloud") << steps("hear:2") << QStringList{details2, playback} << list;
        QTest::addRow("hear, then options") << steps("hear:2 options:3") << QStringList{details2, details3} << message;
        QTest::addRow("options, then hear") << steps("options:3 hear:2") << QStringList{details3, details2, playback} << list;
        QTest::addRow("options without index cancel hearing") << steps("hear:2 options:") << QStringList{details2} << message;
        QTest::addRow("hear with a bad index changes nothing") << steps("options:3 hear:two") << QStringList{details3} << message;
        QTest::addRow("a negative index asks nothing") << steps("hear:-1") << QStringList() << message;
        // clang-format on
    }

    void openOrHear()
    {
        QFETCH(QStringList, selections);
        QFETCH(QStringList, outputs);
        QFETCH(QString, screen);

        openMessageList(true);
        qint64 since = ScreenFixture::mark();
        for (const QString &selection : selections) {
            const QString index = selection.section(QLatin1Char(':'), 1);
            bool isNumber = false;
            const int number = index.toInt(&isNumber);
            ScreenFixture::post(selection.startsWith(QLatin1String("hear"))
                                        ? Events::HmiPhone_HearSelectedTextMessage
                                        : Events::HmiPhoneSms_ViewTextMessageOptions,
                                index.isEmpty()    ? QVariant()
                                        : isNumber ? QVariant(number)
                                                   : QVariant(index));
        }
        emit source()->textMessageDetailsReady();
        TestSupport::processUntilIdle();
        // The selections posted are in the journal too: compare what they caused.
        QCOMPARE(PhoneRootFixture::outputs(since).filter(
                         QRegularExpression(QStringLiteral("^(?!event )"))),
                 outputs);
        QVERIFY(ScreenFixture::activeStates().contains(screen));

        // Reading aloud is asked once: details arriving again open the message; details arriving
        // while a message is shown belong to no selection of the list.
        since = ScreenFixture::mark();
        emit source()->textMessageDetailsReady();
        TestSupport::processUntilIdle();
        QCOMPARE(PhoneRootFixture::outputs(since), QStringList());
        QVERIFY(ScreenFixture::activeStates().contains(QStringLiteral("PhoneSmsViewState")));
    }

    // Downloads started from the list that end "fail" or "done"; after each failure the user asks
    // for a retry. Two retries are offered for the manager's whole life, a finished download
    // between failures included.
    void downloadRetries_data()
    {
        QTest::addColumn<QStringList>("outcomes");
        QTest::addColumn<QStringList>("popups");

        const QString failed = Views::PhoneSmsDownloadFailed,
                      final = Views::PhoneSmsRetryDownloadFailed;
        QTest::addRow("two retries, then the final popup")
                << QString::fromLatin1("fail fail fail fail").split(QLatin1Char(' '))
                << QStringList{failed, failed, final, final};
        QTest::addRow("a finished download does not start again")
                << QString::fromLatin1("fail done fail fail fail").split(QLatin1Char(' '))
                << QStringList{failed, failed, final, final};
    }

    void downloadRetries()
    {
        QFETCH(QStringList, outcomes);
        QFETCH(QStringList, popups);

        openMessageList(false);
        QStringList shown;
        for (const QString &outcome : outcomes) {
            source()->setMessagesDownloadingStatus(0);
            ScreenFixture::post(Events::HmiPhoneSms_RefreshMessages);
            source()->setMessagesDownloadingStatus(2);
            TestSupport::processUntilIdle();
            QCOMPARE(Quorvel::StateMachine::instance()->shownPopups(),
                     QStringList{Views::PhoneSmsDownloading});

            source()->setMessagesDownloadingStatus(outcome == QLatin1String("done") ? 3 : 4);
            TestSupport::processUntilIdle();
            const QStringList now = Quorvel::StateMachine::instance()->shownPopups();
            QVERIFY(ScreenFixture::activeStates().contains(
                    QStringLiteral("PhoneSmsListViewState")));
            if (outcome == QLatin1String("done")) {
                QCOMPARE(now, QStringList());
                continue;
            }
            QCOMPARE(now.size(), 1);
            shown.append(now.first());

            // A retry is offered by the download-failed popup only.
            const qint64 since = ScreenFixture::mark();
            ScreenFixture::post(Events::HmiPhoneSms_RetryMessagesDownload);
            QCOMPARE(PhoneRootFixture::outputs(since).contains(
                             QStringLiteral("phone.retrySmsDownload()")),
                     now.first() == Views::PhoneSmsDownloadFailed);
            Quorvel::StateMachine::instance()->dismissPopup(now.first());
            TestSupport::processUntilIdle();
        }
        QCOMPARE(shown, popups);
    }

    // Steps: "enter" opens the list from the phone menu, "count" and "device" change the message
    // count and the phone device, "running"/"finished" a download, "new" is a new message, "filled"
    // makes the empty inbox non-empty.
    void inboxRequests_data()
    {
        QTest::addColumn<bool>("inboxEmpty");
        QTest::addColumn<QString>("steps");
        QTest::addColumn<int>("requests");

        // clang-format off
        QTest::addRow("two entries, no change") << false << QStringLiteral("enter") << 1;
        QTest::addRow("count changed between entries") << false << QStringLiteral("count enter") << 2;
        QTest::addRow("device changed between entries") << false << QStringLiteral("device enter") << 2;
        QTest::addRow("a change during a download counts as handled") << false << QStringLiteral("running count enter finished enter count enter") << 2;
        QTest::addRow("a new message forces a request") << false << QStringLiteral("new") << 2;
        QTest::addRow("no forced request during a download") << false << QStringLiteral("running new") << 1;
        QTest::addRow("an empty inbox asks nothing") << true << QStringLiteral("enter") << 0;
        QTest::addRow("the inbox fills while shown") << true << QStringLiteral("filled") << 1;
        // clang-format on
    }

    void inboxRequests()
    {
        QFETCH(bool, inboxEmpty);
        QFETCH(QString, steps);
        QFETCH(int, requests);

        Phone_Cmp *phone = openMessageList(inboxEmpty);
        for (const QString &step : steps.split(QLatin1Char(' '))) {
            if (step == QLatin1String("enter")) {
                enter(phone->phoneIdleState());
                enter(phone->phoneSmsCompositeState());
            } else if (step == QLatin1String("count")) {
                source()->setSmsTotalCount(source()->smsTotalCount() + 1);
            } else if (step == QLatin1String("device")) {
                Mavrosk::BluetoothSource::instance()->setPhoneDevice(7);
            } else if (step == QLatin1String("running") || step == QLatin1String("finished")) {
                source()->setMessagesDownloadingStatus(step == QLatin1String("running") ? 2 : 3);
            } else if (step == QLatin1String("new")) {
                emit source()->newTextMessageAlert();
            } else if (step == QLatin1String("filled")) {
                source()->setMessagesInboxEmptyStatus(false);
            }
            TestSupport::processUntilIdle();
        }
        QCOMPARE(PhoneRootFixture::outputs(0).count(
                         QStringLiteral("phone.requestTextMessagesInbox()")),
                 requests);
    }

private:
    Phone_Cmp *openMessageList(bool inboxEmpty)
    {
        Phone_Cmp *phone = build(
                QStringLiteral("bluetooth.deviceConnected=true phone.textMessageBody=At_six "
                               "phone.messagesInboxEmptyStatus=")
                + QLatin1String(inboxEmpty ? "true" : "false"));
        enter(phone->phoneIdleState());
        enter(phone->phoneSmsCompositeState());
        return phone;
    }
    static Mavrosk::PhoneSource *source() { return Mavrosk::PhoneSource::instance(); }
};

QTEST_GUILESS_MAIN(TestTextMessages)
#include "tst_textmessages.moc"
