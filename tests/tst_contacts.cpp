// The contacts component under a plain parent state of the root hierarchy, entered and left by
// transitions as the phone's root component does.

#include "testsupport.h"

#include <hmiphoneevents.h>
#include <phonebook_cmp.h>

#include <mavrosk/bluetoothsource.h>
#include <mavrosk/bridge.h>
#include <mavrosk/phonesource.h>
#include <quorvel/hmievent.h>
#include <quorvel/hmitransition.h>
#include <quorvel/namedstate.h>
#include <quorvel/statemachine.h>

#include <QtTest>

using namespace HmiPhone;

namespace {

// What the contacts asked of the platform since `since`, one word each: "+Popup" and "-Popup"
// (popup requested and dismissed, without "PHONE.PhoneBook"), "back", and phone commands; only
// the words that `keep` accepts.
QString outputs(
        qint64 since, bool (*keep)(const QString &) = [](const QString &) { return true; })
{
    QStringList words;
    for (const Platform::JournalEntry &entry : Platform::Journal::instance()->entriesSince(since)) {
        const QString id = entry.fields.value(QStringLiteral("id")).toString();
        QString word = id.mid(QStringLiteral("PHONE.PhoneBook").size());
        if (entry.kind == QLatin1String("popup-request"))
            word.prepend(QLatin1Char('+'));
        else if (entry.kind == QLatin1String("popup-dismiss"))
            word.prepend(QLatin1Char('-'));
        else if (entry.kind == QLatin1String("back"))
            word = entry.kind;
        else if (entry.kind == QLatin1String("bridge"))
            word = entry.fields.value(QStringLiteral("call"))
                           .toString()
                           .section(QLatin1Char('.'), 1);
        else
            continue;
        if (keep(word))
            words << word;
    }
    return words.join(QLatin1Char(' '));
}

void post(const QString &event)
{
    Quorvel::StateMachine::instance()->postEvent(new Quorvel::HmiEvent(event));
    TestSupport::processUntilIdle();
}

void setStatus(int status)
{
    Mavrosk::PhoneSource::instance()->setBridgeValue(QStringLiteral("phoneBookStatus"), status);
    TestSupport::processUntilIdle();
}

bool isActive(const char *name)
{
    auto *state = Quorvel::NamedState::stateForName(QLatin1String(name));
    return state && state->isActive();
}

const QString DismissStatusPopups
        = QStringLiteral("-DownloadFailed -DownloadFailedAgain -Downloading "
                         "-WaitingForResponseFromPhone");
const QString Waiting = QStringLiteral("-AutoDownload +WaitingForResponseFromPhone");

} // namespace

class TestContacts : public QObject
{
    Q_OBJECT

private slots:
    void init() { Mavrosk::resetAll(); }
    void cleanup()
    {
        Quorvel::StateMachine::destroyInstance();
        QCOMPARE(TestSupport::FrameworkWarningGuard::take(), QStringList());
    }

    void entry_data();
    void entry();
    void statusChangesWhileShown_data();
    void statusChangesWhileShown();
    void resetOncePerVisit();
    void globalTransitions_data();
    void globalTransitions();

private:
    // A home screen and the phone's root stand-in holding the contacts; returns the journal mark.
    qint64 start(int status, bool autoDownload = true, bool connected = true)
    {
        Mavrosk::BluetoothSource::instance()->setBridgeValue(QStringLiteral("deviceConnected"),
                                                             connected);
        auto *phone = Mavrosk::PhoneSource::instance();
        phone->setBridgeValue(QStringLiteral("automaticContactDownload"), autoDownload);
        phone->setBridgeValue(QStringLiteral("phoneBookStatus"), status);

        auto *machine = Quorvel::StateMachine::instance();
        auto *screens = machine->screensState();
        auto *home = new Quorvel::HmiState(QStringLiteral("Home"), screens);
        auto *root = new Quorvel::HmiState(QStringLiteral("PhoneRoot"), screens);
        root->setInitialHmiState(new Quorvel::HmiState(QStringLiteral("PhoneIdle"), root));
        screens->setInitialHmiState(home);
        m_contacts = new PhoneBook_Cmp(nullptr, QStringLiteral("PhoneBookCmp"), root);
        (new Quorvel::HmiTransition(QStringLiteral("Enter"), screens))->setTargetState(m_contacts);
        (new Quorvel::HmiTransition(QStringLiteral("Leave"), root))->setTargetState(home);
        machine->installRootHierarchy(m_contacts->rootHierarchyTransitions(),
                                      m_contacts->rootHierarchyPopups());
        machine->start();
        TestSupport::processUntilIdle();
        return Platform::Journal::instance()->lastSequence();
    }

    TestSupport::FrameworkWarningGuard m_warnings;
    PhoneBook_Cmp *m_contacts = nullptr;
};

void TestContacts::entry_data()
{
    QTest::addColumn<int>("status");
    QTest::addColumn<bool>("autoDownload");
    QTest::addColumn<bool>("connected");
    QTest::addColumn<bool>("list");
    QTest::addColumn<QString>("outputs");

    QTest::addRow("downloading") << 2 << true << true << false
                                 << "-DownloadFailed -DownloadFailedAgain -AccessNotGranted "
                                    "-AutoDownload -WaitingForResponseFromPhone +Downloading";
    QTest::addRow("downloaded") << 1 << false << true << true
                                << "resetPhoneBook -DownloadFailed -DownloadFailedAgain "
                                   "-AutoDownload -Downloading -AccessNotGranted "
                                   "-WaitingForResponseFromPhone";
    QTest::addRow("status 7, auto download off")
            << 7 << false << true << true << "resetPhoneBook +AutoDownload";
    QTest::addRow("no list, auto download off") << 0 << false << true << false << "+AutoDownload";
    QTest::addRow("access refused") << 4 << true << true << false
                                    << Waiting + QLatin1Char(' ') + DismissStatusPopups
                    + QStringLiteral(" +AccessNotGranted");
    QTest::addRow("download failed") << 5 << true << true << false
                                     << Waiting
                    + QStringLiteral(" -Downloading -WaitingForResponseFromPhone +DownloadFailed");
    QTest::addRow("no device") << 0 << false << false << false << "";
}

void TestContacts::entry()
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

void TestContacts::statusChangesWhileShown_data()
{
    QTest::addColumn<QList<int>>("statuses");
    QTest::addColumn<QString>("requests");
    QTest::addColumn<bool>("list");

    QTest::addRow("download finishes") << QList<int>{2, 1} << "+Downloading" << true;
    QTest::addRow("failed twice") << QList<int>{5, 2, 5}
                                  << "+DownloadFailed +Downloading +DownloadFailedAgain" << false;
    QTest::addRow("failed after a download")
            << QList<int>{5, 1, 5} << "+DownloadFailed +DownloadFailedAgain" << false;
}

// Each status change while the contacts are shown chooses the view and the popups again, without
// leaving the contacts (the phone is not told that the driver left them).
void TestContacts::statusChangesWhileShown()
{
    QFETCH(QList<int>, statuses);
    QFETCH(QString, requests);
    QFETCH(bool, list);

    start(0);
    post(QStringLiteral("Enter"));
    const qint64 since = Platform::Journal::instance()->lastSequence();
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

// The phone is asked for a fresh phonebook view once per visit, and told when the driver leaves.
void TestContacts::resetOncePerVisit()
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
    post(QStringLiteral("Leave"));
    post(QStringLiteral("Enter"));

    QCOMPARE(outputs(since, [](const QString &word) { return word.at(0).isLetter(); }),
             QStringLiteral("resetPhoneBook exitingPhoneBook resetPhoneBook"));
}

void TestContacts::globalTransitions_data()
{
    QTest::addColumn<bool>("shown");
    QTest::addColumn<int>("status");
    QTest::addColumn<QString>("event");
    QTest::addColumn<QString>("outputs");

    QTest::addRow("status check, empty")
            << false << 3 << Events::HmiPhone_PhoneBookStatusCheck << DismissStatusPopups;
    QTest::addRow("status check, other letter case")
            << false << 3 << "HmiPhone_PhonebookStatusCheck"
            << "";
    QTest::addRow("cancelled, contacts shown")
            << true << 2 << Events::HmiPhone_PhoneBookDownloadCanceled << "back";
    QTest::addRow("cancelled elsewhere")
            << false << 2 << Events::HmiPhone_PhoneBookDownloadCanceled << "exitingPhoneBook";
    QTest::addRow("waiting, contacts shown")
            << true << 1 << Events::HmiPhone_ShowPhoneBookWaitingForResponseRequest
            << "+WaitingForResponseFromPhone";
    QTest::addRow("waiting elsewhere")
            << false << 1 << Events::HmiPhone_ShowPhoneBookWaitingForResponseRequest << "";
}

void TestContacts::globalTransitions()
{
    QFETCH(bool, shown);
    QFETCH(int, status);
    QFETCH(QString, event);
    QFETCH(QString, outputs);

    start(status);
    if (shown)
        post(QStringLiteral("Enter"));
    const qint64 since = Platform::Journal::instance()->lastSequence();
    post(event);
    QCOMPARE(::outputs(since), outputs);
}

QTEST_GUILESS_MAIN(TestContacts)
#include "tst_contacts.moc"
