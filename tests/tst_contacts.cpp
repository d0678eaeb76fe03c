// The contacts component under a plain parent state of the root hierarchy, entered and left by
// transitions as the phone's root component does: views, phonebook popups and the phone's
// phonebook commands as the HMI sees them.

#include "testsupport.h"

#include <hmiphoneevents.h>
#include <hmiphoneviews.h>
#include <phonebook_cmp.h>

#include <brisken/viewcontroller.h>
#include <mavrosk/bluetoothsource.h>
#include <mavrosk/bridge.h>
#include <mavrosk/phonesource.h>
#include <quorvel/hmievent.h>
#include <quorvel/hmistate.h>
#include <quorvel/hmitransition.h>
#include <quorvel/namedstate.h>
#include <quorvel/statemachine.h>

#include <QtTest>

using namespace HmiPhone;

namespace {

const QString EnterContacts = QStringLiteral("Test_EnterContacts");
const QString LeaveContacts = QStringLiteral("Test_LeaveContacts");

// The popup requests and dismissals since `since`, as "+view" and "-view" with the module prefix
// removed, in the order made.
QStringList popupCalls(qint64 since)
{
    QStringList calls;
    for (const Platform::JournalEntry &entry : Platform::Journal::instance()->entriesSince(since)) {
        const QString view
                = entry.fields.value(QStringLiteral("id")).toString().section(QLatin1Char('.'), 1);
        if (entry.kind == QLatin1String("popup-request"))
            calls.append(QLatin1Char('+') + view);
        else if (entry.kind == QLatin1String("popup-dismiss"))
            calls.append(QLatin1Char('-') + view);
    }
    return calls;
}

QStringList bridgeCalls(const QString &call, qint64 since = 0)
{
    QStringList calls
            = TestSupport::journalValues(QStringLiteral("bridge"), QStringLiteral("call"), since);
    calls.erase(std::remove_if(calls.begin(), calls.end(),
                               [&call](const QString &c) { return c != call; }),
                calls.end());
    return calls;
}

bool isActive(const QString &name)
{
    auto *state = Quorvel::NamedState::stateForName(name);
    return state && state->isActive();
}

void post(const QString &event)
{
    Quorvel::StateMachine::instance()->postEvent(new Quorvel::HmiEvent(event));
    TestSupport::processUntilIdle();
}

} // namespace

class TestContacts : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void entry_data();
    void entry();
    void statusChangesWhileShown_data();
    void statusChangesWhileShown();
    void resetOncePerVisit();
    void globalTransitions_data();
    void globalTransitions();

private:
    void build();
    void setPhone(int status, bool autoDownload, bool connected = true);

    TestSupport::FrameworkWarningGuard m_warnings;
    PhoneBook_Cmp *m_contacts = nullptr;
};

void TestContacts::init()
{
    Mavrosk::resetAll();
    Platform::Journal::instance()->clear();
}

void TestContacts::cleanup()
{
    Quorvel::StateMachine::destroyInstance();
    m_contacts = nullptr;
    QCOMPARE(TestSupport::FrameworkWarningGuard::take(), QStringList());
}

// The phone's root stand-in with a home screen and the contacts, entered and left by events.
void TestContacts::build()
{
    auto *machine = Quorvel::StateMachine::instance();
    auto *screens = machine->screensState();
    auto *home = new Quorvel::HmiState(QStringLiteral("Home"), screens);
    auto *phone = new Quorvel::HmiState(QStringLiteral("PhoneRoot"), screens);
    auto *phoneIdle = new Quorvel::HmiState(QStringLiteral("PhoneIdle"), phone);
    phone->setInitialHmiState(phoneIdle);
    screens->setInitialHmiState(home);

    m_contacts = new PhoneBook_Cmp(nullptr, QStringLiteral("PhoneBookCmp"), phone);

    auto *enter = new Quorvel::HmiTransition(EnterContacts, screens);
    enter->setTargetState(m_contacts);
    auto *leave = new Quorvel::HmiTransition(LeaveContacts, phone);
    leave->setTargetState(home);

    machine->installRootHierarchy(m_contacts->rootHierarchyTransitions(),
                                  m_contacts->rootHierarchyPopups());
    machine->start();
    TestSupport::processUntilIdle();
}

void TestContacts::setPhone(int status, bool autoDownload, bool connected)
{
    Mavrosk::BluetoothSource::instance()->setBridgeValue(QStringLiteral("deviceConnected"),
                                                         connected);
    Mavrosk::PhoneSource::instance()->setBridgeValue(QStringLiteral("automaticContactDownload"),
                                                     autoDownload);
    Mavrosk::PhoneSource::instance()->setBridgeValue(QStringLiteral("phoneBookStatus"), status);
}

void TestContacts::entry_data()
{
    QTest::addColumn<int>("status");
    QTest::addColumn<bool>("autoDownload");
    QTest::addColumn<bool>("connected");
    QTest::addColumn<QString>("view");
    QTest::addColumn<QStringList>("popups");
    QTest::addColumn<int>("resets");

    const QStringList dismissAllButDownloading = {
            QStringLiteral("-PhoneBookDownloadFailed"),
            QStringLiteral("-PhoneBookDownloadFailedAgain"),
            QStringLiteral("-PhoneBookAccessNotGranted"), QStringLiteral("-PhoneBookAutoDownload"),
            QStringLiteral("-PhoneBookWaitingForResponseFromPhone")};
    const QStringList dismissAll = {QStringLiteral("-PhoneBookDownloadFailed"),
                                    QStringLiteral("-PhoneBookDownloadFailedAgain"),
                                    QStringLiteral("-PhoneBookAutoDownload"),
                                    QStringLiteral("-PhoneBookDownloading"),
                                    QStringLiteral("-PhoneBookAccessNotGranted"),
                                    QStringLiteral("-PhoneBookWaitingForResponseFromPhone")};
    const QStringList waitThenDismissStatus
            = {QStringLiteral("-PhoneBookAutoDownload"),
               QStringLiteral("+PhoneBookWaitingForResponseFromPhone"),
               QStringLiteral("-PhoneBookDownloadFailed"),
               QStringLiteral("-PhoneBookDownloadFailedAgain"),
               QStringLiteral("-PhoneBookDownloading"),
               QStringLiteral("-PhoneBookWaitingForResponseFromPhone")};

    QTest::addRow("downloading, auto download on")
            << 2 << true << true << "PhoneBookEmptyViewState"
            << (dismissAllButDownloading + QStringList{QStringLiteral("+PhoneBookDownloading")})
            << 0;
    QTest::addRow("downloading, auto download off")
            << 2 << false << true << "PhoneBookEmptyViewState"
            << (dismissAllButDownloading + QStringList{QStringLiteral("+PhoneBookDownloading")})
            << 0;
    QTest::addRow("downloaded") << 1 << true << true << "PhoneBookListViewState" << dismissAll << 1;
    // Only 1 and 2 count as a phonebook for the popups.
    QTest::addRow("status 7, auto download off")
            << 7 << false << true << "PhoneBookListViewState"
            << QStringList{QStringLiteral("+PhoneBookAutoDownload")} << 1;
    QTest::addRow("no list, auto download off")
            << 0 << false << true << "PhoneBookEmptyViewState"
            << QStringList{QStringLiteral("+PhoneBookAutoDownload")} << 0;
    QTest::addRow("access refused, auto download off")
            << 4 << false << true << "PhoneBookEmptyViewState"
            << QStringList{QStringLiteral("+PhoneBookAutoDownload")} << 0;
    QTest::addRow("no list, auto download on")
            << 6 << true << true << "PhoneBookEmptyViewState"
            << QStringList{QStringLiteral("-PhoneBookAutoDownload"),
                           QStringLiteral("+PhoneBookWaitingForResponseFromPhone")}
            << 0;
    QTest::addRow("empty phonebook, auto download on")
            << 3 << true << true << "PhoneBookEmptyViewState" << waitThenDismissStatus << 0;
    QTest::addRow("access refused, auto download on")
            << 4 << true << true << "PhoneBookEmptyViewState"
            << (waitThenDismissStatus + QStringList{QStringLiteral("+PhoneBookAccessNotGranted")})
            << 0;
    QTest::addRow("download failed, auto download on")
            << 5 << true << true << "PhoneBookEmptyViewState"
            << QStringList{QStringLiteral("-PhoneBookAutoDownload"),
                           QStringLiteral("+PhoneBookWaitingForResponseFromPhone"),
                           QStringLiteral("-PhoneBookDownloading"),
                           QStringLiteral("-PhoneBookWaitingForResponseFromPhone"),
                           QStringLiteral("+PhoneBookDownloadFailed")}
            << 0;
    QTest::addRow("no device, downloaded")
            << 1 << true << false << "PhoneBookListViewState" << QStringList() << 1;
    QTest::addRow("no device, auto download off")
            << 0 << false << false << "PhoneBookEmptyViewState" << QStringList() << 0;
}

void TestContacts::entry()
{
    QFETCH(int, status);
    QFETCH(bool, autoDownload);
    QFETCH(bool, connected);
    QFETCH(QString, view);
    QFETCH(QStringList, popups);
    QFETCH(int, resets);

    setPhone(status, autoDownload, connected);
    build();
    const qint64 since = Platform::Journal::instance()->lastSequence();
    post(EnterContacts);

    QVERIFY(isActive(view));
    QCOMPARE(popupCalls(since), popups);
    QCOMPARE(bridgeCalls(QStringLiteral("phone.resetPhoneBook"), since).size(), resets);
}

void TestContacts::statusChangesWhileShown_data()
{
    QTest::addColumn<QList<int>>("statuses");
    QTest::addColumn<QStringList>("requests");
    QTest::addColumn<QString>("view");

    const QString waiting = QStringLiteral("PhoneBookWaitingForResponseFromPhone");
    QTest::addRow("download finishes")
            << QList<int>{2, 1} << QStringList{QStringLiteral("PhoneBookDownloading")}
            << "PhoneBookListViewState";
    QTest::addRow("failed twice") << QList<int>{5, 2, 5}
                                  << QStringList{waiting, QStringLiteral("PhoneBookDownloadFailed"),
                                                 QStringLiteral("PhoneBookDownloading"), waiting,
                                                 QStringLiteral("PhoneBookDownloadFailedAgain")}
                                  << "PhoneBookEmptyViewState";
    QTest::addRow("failed again after a download")
            << QList<int>{5, 1, 5}
            << QStringList{waiting, QStringLiteral("PhoneBookDownloadFailed"), waiting,
                           QStringLiteral("PhoneBookDownloadFailedAgain")}
            << "PhoneBookEmptyViewState";
    QTest::addRow("downloaded list emptied")
            << QList<int>{1, 3} << QStringList{waiting} << "PhoneBookEmptyViewState";
}

// While the contacts are shown, each status change chooses the view and the popups again; the
// driver stays in the contacts.
void TestContacts::statusChangesWhileShown()
{
    QFETCH(QList<int>, statuses);
    QFETCH(QStringList, requests);
    QFETCH(QString, view);

    setPhone(0, true);
    build();
    post(EnterContacts);
    const qint64 since = Platform::Journal::instance()->lastSequence();

    for (int status : statuses) {
        Mavrosk::PhoneSource::instance()->setBridgeValue(QStringLiteral("phoneBookStatus"), status);
        TestSupport::processUntilIdle();
    }

    QStringList requested;
    for (const QString &call : popupCalls(since)) {
        if (call.startsWith(QLatin1Char('+')))
            requested.append(call.mid(1));
    }
    QCOMPARE(requested, requests);
    QVERIFY(isActive(view));
    QCOMPARE(bridgeCalls(QStringLiteral("phone.exitingPhoneBook"), since), QStringList());
}

// The phone is asked for a fresh phonebook view once per visit, and told when the driver leaves.
void TestContacts::resetOncePerVisit()
{
    setPhone(1, true);
    build();
    auto *phone = Mavrosk::PhoneSource::instance();

    post(EnterContacts);
    post(Events::HmiPhone_ShowContactsSearch);
    QVERIFY(isActive(QStringLiteral("PhoneBookSearchViewState")));
    emit phone->phonebookSearchReady();
    TestSupport::processUntilIdle();
    QVERIFY(isActive(QStringLiteral("PhoneBookListViewState")));
    emit phone->phonebookContactDetailsReady();
    TestSupport::processUntilIdle();
    QVERIFY(isActive(QStringLiteral("ContactDetailsViewState")));
    QCOMPARE(bridgeCalls(QStringLiteral("phone.resetPhoneBook")).size(), 1);
    QCOMPARE(TestSupport::journalValues(QStringLiteral("view")),
             QStringList({Views::PhoneBookList, Views::PhoneBookSearch, Views::PhoneBookList,
                          Views::ContactDetails}));

    post(LeaveContacts);
    QVERIFY(!m_contacts->isActive());
    QCOMPARE(bridgeCalls(QStringLiteral("phone.exitingPhoneBook")).size(), 1);

    post(EnterContacts);
    QCOMPARE(bridgeCalls(QStringLiteral("phone.resetPhoneBook")).size(), 2);
}

void TestContacts::globalTransitions_data()
{
    QTest::addColumn<bool>("shown");
    QTest::addColumn<int>("status");
    QTest::addColumn<QString>("event");
    QTest::addColumn<QStringList>("popups");
    QTest::addColumn<QStringList>("outputs");

    const QStringList noOutput;
    QTest::addRow("status check, empty phonebook")
            << false << 3 << Events::HmiPhone_PhoneBookStatusCheck
            << QStringList{QStringLiteral("-PhoneBookDownloadFailed"),
                           QStringLiteral("-PhoneBookDownloadFailedAgain"),
                           QStringLiteral("-PhoneBookDownloading"),
                           QStringLiteral("-PhoneBookWaitingForResponseFromPhone")}
            << noOutput;
    QTest::addRow("status check, downloading")
            << false << 2 << Events::HmiPhone_PhoneBookStatusCheck
            << QStringList{QStringLiteral("-PhoneBookDownloadFailed"),
                           QStringLiteral("-PhoneBookDownloadFailedAgain"),
                           QStringLiteral("-PhoneBookAccessNotGranted"),
                           QStringLiteral("-PhoneBookAutoDownload"),
                           QStringLiteral("-PhoneBookWaitingForResponseFromPhone"),
                           QStringLiteral("+PhoneBookDownloading")}
            << noOutput;
    QTest::addRow("download cancelled, contacts shown")
            << true << 2 << Events::HmiPhone_PhoneBookDownloadCanceled << QStringList()
            << QStringList{QStringLiteral("back")};
    QTest::addRow("download cancelled elsewhere")
            << false << 2 << Events::HmiPhone_PhoneBookDownloadCanceled << QStringList()
            << QStringList{QStringLiteral("phone.exitingPhoneBook")};
    QTest::addRow("waiting for the phone, contacts shown")
            << true << 1 << Events::HmiPhone_ShowPhoneBookWaitingForResponseRequest
            << QStringList{QStringLiteral("+PhoneBookWaitingForResponseFromPhone")} << noOutput;
    QTest::addRow("waiting for the phone elsewhere")
            << false << 1 << Events::HmiPhone_ShowPhoneBookWaitingForResponseRequest
            << QStringList() << noOutput;
    QTest::addRow("event name in other letter case")
            << false << 3 << QStringLiteral("HmiPhone_PhonebookStatusCheck") << QStringList()
            << noOutput;
}

void TestContacts::globalTransitions()
{
    QFETCH(bool, shown);
    QFETCH(int, status);
    QFETCH(QString, event);
    QFETCH(QStringList, popups);
    QFETCH(QStringList, outputs);

    setPhone(status, true);
    build();
    if (shown)
        post(EnterContacts);
    const qint64 since = Platform::Journal::instance()->lastSequence();

    post(event);

    QCOMPARE(popupCalls(since), popups);
    QStringList seen;
    for (const Platform::JournalEntry &entry : Platform::Journal::instance()->entriesSince(since)) {
        if (entry.kind == QLatin1String("back"))
            seen.append(entry.kind);
        else if (entry.kind == QLatin1String("bridge"))
            seen.append(entry.fields.value(QStringLiteral("call")).toString());
    }
    QCOMPARE(seen, outputs);
}

QTEST_GUILESS_MAIN(TestContacts)
#include "tst_contacts.moc"
