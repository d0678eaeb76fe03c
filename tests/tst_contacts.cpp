// The contacts component under a plain parent state of the root hierarchy, entered and left by
// transitions as the phone's root component does.

#include "screenfixture.h"

#include <hmiphoneevents.h>
#include <phonebook_cmp.h>

#include <QtTest>

using namespace HmiPhone;
using namespace ScreenFixture;

namespace {

// What the contacts asked of the platform since `since`, one word each: "+Popup" and "-Popup"
// (popup requested and dismissed, without "PHONE.PhoneBook"), "back", and phone commands; only
// the words that `keep` accepts.
QString outputs(
        qint64 since, bool (*keep)(const QString &) = [](const QString &) { return true; })
{
    QStringList words;
    for (QString line : TestSupport::journalLines(
                 since,
                 {QStringLiteral("popup-request"), QStringLiteral("popup-dismiss"),
                  QStringLiteral("back"), QStringLiteral("bridge")})) {
        line.replace(QStringLiteral("popup-request PHONE.PhoneBook"), QStringLiteral("+"))
                .replace(QStringLiteral("popup-dismiss PHONE.PhoneBook"), QStringLiteral("-"))
                .replace(QRegularExpression(QStringLiteral("^(back) .*|^phone\\.(\\w+)\\(.*")),
                         QStringLiteral("\\1\\2"));
        if (keep(line))
            words << line;
    }
    return words.join(QLatin1Char(' '));
}

void setStatus(int status)
{
    Mavrosk::PhoneSource::instance()->setBridgeValue(QStringLiteral("phoneBookStatus"), status);
    TestSupport::processUntilIdle();
}

bool isActive(const char *name)
{
    return activeStates().contains(QLatin1String(name));
}

const QString DismissStatusPopups
        = QStringLiteral("-DownloadFailed -DownloadFailedAgain -Downloading "
                         "-WaitingForResponseFromPhone");
const QString Waiting = QStringLiteral("-AutoDownload +WaitingForResponseFromPhone");

} // namespace

class TestContacts : public TestSupport::Suite
{
    Q_OBJECT

protected:
    void tearDown() override { Quorvel::StateMachine::destroyInstance(); }

private slots:

    void entry_data()
    {
        QTest::addColumn<int>("status");
        QTest::addColumn<bool>("autoDownload");
        QTest::addColumn<bool>("connected");
        QTest::addColumn<bool>("list");
        QTest::addColumn<QString>("outputs");

        const QString wait = Waiting + QLatin1Char(' ');
        // clang-format off
        QTest::addRow("downloading") << 2 << true << true << false << "-DownloadFailed -DownloadFailedAgain -AccessNotGranted -AutoDownload -WaitingForResponseFromPhone +Downloading";
        QTest::addRow("downloaded") << 1 << false << true << true << "resetPhoneBook -DownloadFailed -DownloadFailedAgain -AutoDownload -Downloading -AccessNotGranted -WaitingForResponseFromPhone";
        QTest::addRow("status 7, auto download off") << 7 << false << true << true << "resetPhoneBook +AutoDownload";
        QTest::addRow("no list, auto download off") << 0 << false << true << false << "+AutoDownload";
        QTest::addRow("access refused") << 4 << true << true << false << wait + DismissStatusPopups + QStringLiteral(" +AccessNotGranted");
        QTest::addRow("download failed") << 5 << true << true << false << wait + QStringLiteral("-Downloading -WaitingForResponseFromPhone +DownloadFailed");
        QTest::addRow("no device") << 0 << false << false << false << "";
        // clang-format on
    }

    void entry()
    {
        QFETCH(int, status);
        QFETCH(bool, autoDownload);
        QFETCH(bool, connected);
        QFETCH(bool, list);
        QFETCH(QString, outputs);

        const qint64 since = start(status, autoDownload, connected);
        post(QStringLiteral("Enter"));

        QVERIFY(isActive(list ? "PhoneBookListViewState" : "PhoneBookEmptyViewState"));
        QCOMPARE(::outputs(since), outputs);
    }

    void statusChangesWhileShown_data()
    {
        QTest::addColumn<QList<int>>("statuses");
        QTest::addColumn<QString>("requests");
        QTest::addColumn<bool>("list");

        // clang-format off
        QTest::addRow("download finishes") << QList<int>{2, 1} << "+Downloading" << true;
        QTest::addRow("failed twice") << QList<int>{5, 2, 5} << "+DownloadFailed +Downloading +DownloadFailedAgain" << false;
        QTest::addRow("failed after a download") << QList<int>{5, 1, 5} << "+DownloadFailed +DownloadFailedAgain" << false;
        // clang-format on
    }

    // Each status change while the contacts are shown chooses the view and the popups again,
    // without leaving the contacts (the phone is not told that the driver left them).
    void statusChangesWhileShown()
    {
        QFETCH(QList<int>, statuses);
        QFETCH(QString, requests);
        QFETCH(bool, list);

        start(0);
        post(QStringLiteral("Enter"));
        const qint64 since = mark();
        for (int status : statuses)
            setStatus(status);

        QCOMPARE(outputs(since,
                         [](const QString &word) {
                             return word.startsWith(QLatin1Char('+'))
                                     && !word.startsWith(QLatin1String("+Waiting"));
                         }),
                 requests);
        QVERIFY(isActive(list ? "PhoneBookListViewState" : "PhoneBookEmptyViewState"));
        QVERIFY(!outputs(since).contains(QLatin1String("exitingPhoneBook")));
    }

    // The phone is asked for a fresh phonebook view once per visit, and told when the driver
    // leaves.
    void resetOncePerVisit()
    {
        const qint64 since = start(1);
        auto *phone = Mavrosk::PhoneSource::instance();
        post(QStringLiteral("Enter"));
        post(Events::HmiPhone_ShowContactsSearch);
        QVERIFY(isActive("PhoneBookSearchViewState"));
        emit phone->phonebookSearchReady();
        TestSupport::processUntilIdle();
        QVERIFY(isActive("PhoneBookListViewState"));
        emit phone->phonebookContactDetailsReady();
        TestSupport::processUntilIdle();
        QVERIFY(isActive("ContactDetailsViewState"));
        post(OpenHome);
        post(QStringLiteral("Enter"));

        QCOMPARE(outputs(since, [](const QString &word) { return word.at(0).isLetter(); }),
                 QStringLiteral("resetPhoneBook exitingPhoneBook resetPhoneBook"));
    }

    void globalTransitions_data()
    {
        QTest::addColumn<bool>("shown");
        QTest::addColumn<int>("status");
        QTest::addColumn<QString>("event");
        QTest::addColumn<QString>("outputs");

        // clang-format off
        QTest::addRow("status check, empty") << false << 3 << Events::HmiPhone_PhoneBookStatusCheck << DismissStatusPopups;
        QTest::addRow("status check, other letter case") << false << 3 << "HmiPhone_PhonebookStatusCheck" << "";
        QTest::addRow("cancelled, contacts shown") << true << 2 << Events::HmiPhone_PhoneBookDownloadCanceled << "back exitingPhoneBook";
        QTest::addRow("cancelled elsewhere") << false << 2 << Events::HmiPhone_PhoneBookDownloadCanceled << "exitingPhoneBook";
        QTest::addRow("waiting, contacts shown") << true << 1 << Events::HmiPhone_ShowPhoneBookWaitingForResponseRequest << "+WaitingForResponseFromPhone";
        QTest::addRow("waiting elsewhere") << false << 1 << Events::HmiPhone_ShowPhoneBookWaitingForResponseRequest << "";
        // clang-format on
    }

    void globalTransitions()
    {
        QFETCH(bool, shown);
        QFETCH(int, status);
        QFETCH(QString, event);
        QFETCH(QString, outputs);

        start(status);
        if (shown)
            post(QStringLiteral("Enter"));
        const qint64 since = mark();
        post(event);
        QCOMPARE(::outputs(since), outputs);
    }

private:
    // The contacts under the phone's root stand-in, entered by "Enter"; returns the journal mark.
    qint64 start(int status, bool autoDownload = true, bool connected = true)
    {
        Quorvel::HmiState *parent = buildRoot();
        Mavrosk::BluetoothSource::instance()->setBridgeValue(QStringLiteral("deviceConnected"),
                                                             connected);
        auto *phone = Mavrosk::PhoneSource::instance();
        phone->setBridgeValue(QStringLiteral("automaticContactDownload"), autoDownload);
        phone->setBridgeValue(QStringLiteral("phoneBookStatus"), status);
        parent->setInitialHmiState(new Quorvel::HmiState(QStringLiteral("PhoneIdle"), parent));
        auto *contacts = new PhoneBook_Cmp(nullptr, QStringLiteral("PhoneBookCmp"), parent);
        addOpener(QStringLiteral("Enter"), contacts);
        Quorvel::StateMachine::instance()->installRootHierarchy(
                contacts->rootHierarchyTransitions(), contacts->rootHierarchyPopups());
        ScreenFixture::start();
        return mark();
    }
};

QTEST_GUILESS_MAIN(TestContacts)
#include "tst_contacts.moc"
