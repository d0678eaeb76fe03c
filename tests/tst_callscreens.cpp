// The dial keypad and the call in progress, under a plain parent state of the root hierarchy,
// entered by transitions as the phone's root component enters them.

#include "dialkeypadstate.h"
#include "hmiphoneevents.h"
#include "hmiphoneviews.h"
#include "phonecall_cmp.h"
#include "testsupport.h"

#include <brisken/datastore.h>
#include <brisken/viewmanager.h>
#include <mavrosk/bridge.h>
#include <mavrosk/phonesource.h>
#include <quorvel/hmievent.h>
#include <quorvel/hmitransition.h>
#include <quorvel/statemachine.h>

using namespace HmiPhone;

namespace {

// Test-only events that move between the screens of the fixture.
const QString OpenHome = QStringLiteral("Test_OpenHome");
const QString OpenMenu = QStringLiteral("Test_OpenMenu");
const QString OpenKeypad = QStringLiteral("Test_OpenKeypad");
const QString OpenCall = QStringLiteral("Test_OpenCall");

void post(const QString &name, const QVariant &value = QVariant())
{
    Quorvel::StateMachine::instance()->postEvent(new Quorvel::HmiEvent(name, value));
    TestSupport::processUntilIdle();
}

QStringList activeStates()
{
    QStringList names;
    const auto configuration = Quorvel::StateMachine::instance()->configuration();
    for (const QAbstractState *state : configuration)
        names.append(state->objectName());
    return names;
}

QStringList bridgeCallsSince(qint64 since)
{
    return TestSupport::journalValues(QStringLiteral("bridge"), QStringLiteral("call"), since);
}

// A step of a scenario: an event name and its value.
QVariantList step(const QString &event, const QVariant &value = QVariant())
{
    return {event, value};
}

} // namespace

class TestCallScreens : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void keypadEditsNumber_data();
    void keypadEditsNumber();
    void keypadIgnoresKeysWhenNotShown();

    void callKeypadShowsAndHides();
    void keyTone_data();
    void keyTone();
    void muteAndPrivacy_data();
    void muteAndPrivacy();
    void entryTransient_data();
    void entryTransient();

private:
    Mavrosk::PhoneSource *phone() const { return Mavrosk::PhoneSource::instance(); }
    qint64 mark() const { return Platform::Journal::instance()->lastSequence(); }

    TestSupport::FrameworkWarningGuard m_guard;
};

void TestCallScreens::init()
{
    Quorvel::StateMachine::destroyInstance();
    Mavrosk::resetAll();
    Brisken::DataStore::reset();
    Platform::Journal::instance()->clear();

    Quorvel::StateMachine *machine = Quorvel::StateMachine::instance();
    Quorvel::HmiState *screens = machine->screensState();
    auto *home = new Quorvel::HmiViewState(
            Brisken::ViewManager::viewIdentifier(QStringLiteral("HOST"), QStringLiteral("Home")),
            QStringLiteral("HostHome"), screens);
    auto *parent = new Quorvel::HmiState(QStringLiteral("PhoneParent"), screens);
    auto *menu = new Quorvel::HmiViewState(Views::PhoneMenu, QStringLiteral("PhoneMenuViewState"),
                                           parent);
    auto *keypad
            = new DialKeypadState(Views::DialKeypad, QStringLiteral("DialKeypadViewState"), parent);
    keypad->setHandlesBackEvent(true);
    auto *call = new PhoneCall_Cmp(nullptr, QStringLiteral("PhoneCallCmp"), parent);
    parent->setInitialHmiState(menu);
    screens->setInitialHmiState(home);

    const QList<QPair<QString, QAbstractState *>> targets
            = {{OpenHome, home}, {OpenMenu, menu}, {OpenKeypad, keypad}, {OpenCall, call}};
    for (const auto &target : targets)
        (new Quorvel::HmiTransition(target.first, screens))->setTargetState(target.second);

    machine->start();
    TestSupport::processUntilIdle();
    QVERIFY(activeStates().contains(QStringLiteral("HostHome")));
}

void TestCallScreens::cleanup()
{
    Quorvel::StateMachine::destroyInstance();
    QCOMPARE(TestSupport::FrameworkWarningGuard::take(), QStringList());
}

void TestCallScreens::keypadEditsNumber_data()
{
    QTest::addColumn<QString>("leftOver");
    QTest::addColumn<QVariantList>("steps");
    QTest::addColumn<QString>("number");
    QTest::addColumn<int>("changes"); // number changes after the entry's clearing

    const QString key = Events::HmiPhone_DialPadKeyPressed;
    const QString backspace = Events::HmiPhone_DialPadBackSpace;
    const QString longPress = Events::HmiPhone_DialPadBackSpaceLongPress;

    QTest::addRow("entry clears a number left from before")
            << QStringLiteral("0789") << QVariantList() << QString() << 0;
    QTest::addRow("0, * and # in turn")
            << QString()
            << QVariantList{step(key, QStringLiteral("0")), step(key, QStringLiteral("*")),
                            step(key, QStringLiteral("#"))}
            << QStringLiteral("0*#") << 3;
    QTest::addRow("key text appended whole")
            << QString() << QVariantList{step(key, QStringLiteral("12"))} << QStringLiteral("12")
            << 1;
    QTest::addRow("key without a value")
            << QString() << QVariantList{step(key, QStringLiteral("4")), step(key)}
            << QStringLiteral("4") << 1;
    QTest::addRow("key value that is not a string")
            << QString()
            << QVariantList{step(key, QStringLiteral("4")), step(key, QVariantList{1, 2}),
                            step(key, QVariantMap{{QStringLiteral("key"), 5}})}
            << QStringLiteral("4") << 1;
    QTest::addRow("backspace on 12")
            << QString() << QVariantList{step(key, QStringLiteral("12")), step(backspace)}
            << QStringLiteral("1") << 2;
    QTest::addRow("backspace on 1")
            << QString() << QVariantList{step(key, QStringLiteral("1")), step(backspace)}
            << QString() << 2;
    QTest::addRow("backspace on the empty number")
            << QString() << QVariantList{step(backspace)} << QString() << 0;
    QTest::addRow("long press on 0123")
            << QString() << QVariantList{step(key, QStringLiteral("0123")), step(longPress)}
            << QString() << 2;
    QTest::addRow("long press on the empty number")
            << QString() << QVariantList{step(longPress)} << QString() << 0;
}

void TestCallScreens::keypadEditsNumber()
{
    QFETCH(QString, leftOver);
    QFETCH(QVariantList, steps);
    QFETCH(QString, number);
    QFETCH(int, changes);

    phone()->setCallNumberEntered(leftOver);
    post(OpenKeypad);
    QVERIFY(activeStates().contains(QStringLiteral("DialKeypadViewState")));
    QCOMPARE(phone()->callNumberEntered(), QString());

    const qint64 since = mark();
    for (const QVariant &s : steps)
        post(s.toList().at(0).toString(), s.toList().at(1));

    QCOMPARE(phone()->callNumberEntered(), number);
    QCOMPARE(bridgeCallsSince(since).count(QStringLiteral("phone.setCallNumberEntered")), changes);
    QVERIFY(activeStates().contains(QStringLiteral("DialKeypadViewState")));
}

void TestCallScreens::keypadIgnoresKeysWhenNotShown()
{
    post(OpenKeypad);
    post(Events::HmiPhone_DialPadKeyPressed, QStringLiteral("7"));
    post(OpenMenu);

    const qint64 since = mark();
    post(Events::HmiPhone_DialPadKeyPressed, QStringLiteral("8"));
    post(Events::HmiPhone_DialPadBackSpace);
    post(Events::HmiPhone_DialPadBackSpaceLongPress);
    QCOMPARE(phone()->callNumberEntered(), QStringLiteral("7"));
    QCOMPARE(bridgeCallsSince(since), QStringList());
}

void TestCallScreens::callKeypadShowsAndHides()
{
    post(OpenCall);
    QVERIFY(activeStates().contains(QStringLiteral("CallInProgressViewState")));

    post(Events::HmiPhone_ShowCallKeyPadRequest);
    QVERIFY(activeStates().contains(QStringLiteral("KeypadInCallViewState")));
    QVERIFY(!activeStates().contains(QStringLiteral("CallInProgressViewState")));

    post(Events::HmiPhone_HideCallKeyPadRequest);
    QVERIFY(activeStates().contains(QStringLiteral("CallInProgressViewState")));
    QCOMPARE(TestSupport::journalValues(QStringLiteral("view")),
             (QStringList{Brisken::ViewManager::viewIdentifier(QStringLiteral("HOST"),
                                                               QStringLiteral("Home")),
                          Views::CallInProgress, Views::KeypadInCall, Views::CallInProgress}));
}

void TestCallScreens::keyTone_data()
{
    QTest::addColumn<QVariant>("data");
    QTest::addColumn<QStringList>("calls");
    QTest::addColumn<QString>("tones");

    const QString send = QStringLiteral("phone.dialPadKeyTonePressed");
    const QString record = QStringLiteral("phone.setDTMFNumberEntered");
    QTest::addRow("53 and 5") << QVariant(QVariantList{53, QStringLiteral("5")})
                              << QStringList{send, record} << QStringLiteral("95");
    QTest::addRow("no integer, text 5")
            << QVariant(QVariantList{QStringLiteral("x"), QStringLiteral("5")})
            << QStringList{record} << QStringLiteral("95");
    QTest::addRow("integer, no text")
            << QVariant(QVariantList{53, QVariant()}) << QStringList{send} << QStringLiteral("9");
    QTest::addRow("one element") << QVariant(QVariantList{53}) << QStringList()
                                 << QStringLiteral("9");
    QTest::addRow("no list") << QVariant(53) << QStringList() << QStringLiteral("9");
}

void TestCallScreens::keyTone()
{
    QFETCH(QVariant, data);
    QFETCH(QStringList, calls);
    QFETCH(QString, tones);

    phone()->setDTMFNumberEntered(QStringLiteral("9")); // a tone sent earlier in this call
    post(OpenCall);
    post(Events::HmiPhone_ShowCallKeyPadRequest);

    const qint64 since = mark();
    post(Events::HmiPhone_DialPadKeyTonePressed, data);
    QCOMPARE(bridgeCallsSince(since), calls);
    QCOMPARE(phone()->dtmfNumberEntered(), tones);
    if (calls.contains(QStringLiteral("phone.dialPadKeyTonePressed"))) {
        const auto entries = Platform::Journal::instance()->entriesSince(since);
        QCOMPARE(entries.first().fields.value(QStringLiteral("args")).toList(), QVariantList{53});
    }
}

void TestCallScreens::muteAndPrivacy_data()
{
    QTest::addColumn<bool>("keypadShown");
    QTest::addColumn<QString>("event");
    QTest::addColumn<QStringList>("calls");

    QTest::addRow("mute on the call view") << false << Events::HmiPhone_MuteRequest
                                           << QStringList{QStringLiteral("phone.toggleMuted")};
    QTest::addRow("privacy on the call view")
            << false << Events::HmiPhone_PrivacyRequest
            << QStringList{QStringLiteral("phone.togglePrivacyMode")};
    QTest::addRow("mute on the in-call keypad")
            << true << Events::HmiPhone_MuteRequest << QStringList();
    QTest::addRow("privacy on the in-call keypad")
            << true << Events::HmiPhone_PrivacyRequest << QStringList();
}

void TestCallScreens::muteAndPrivacy()
{
    QFETCH(bool, keypadShown);
    QFETCH(QString, event);
    QFETCH(QStringList, calls);

    post(OpenCall);
    if (keypadShown)
        post(Events::HmiPhone_ShowCallKeyPadRequest);
    const QStringList before = activeStates();

    const qint64 since = mark();
    post(event);
    QCOMPARE(bridgeCallsSince(since), calls);
    QCOMPARE(activeStates(), before);
}

void TestCallScreens::entryTransient_data()
{
    QTest::addColumn<bool>("dialing");
    QTest::addColumn<bool>("connected");
    QTest::addColumn<QString>("previous"); // the event that opened the screen before the call
    QTest::addColumn<bool>("statusBar");
    QTest::addColumn<QStringList>("transients");

    const QStringList dialing{Transients::PhoneOutgoingDialing};
    const QStringList accepted{Transients::PhoneAcceptedIncomingCall};
    QTest::addRow("dialing, also connected") << true << true << OpenMenu << true << dialing;
    QTest::addRow("dialing from another module") << true << false << OpenHome << true << dialing;
    QTest::addRow("connected after the phone menu")
            << false << true << OpenMenu << true << accepted;
    QTest::addRow("connected after the dial keypad")
            << false << true << OpenKeypad << true << accepted;
    QTest::addRow("connected after another module")
            << false << true << OpenHome << true << QStringList();
    QTest::addRow("neither dialing nor connected")
            << false << false << OpenMenu << true << QStringList();
    QTest::addRow("no status bar") << true << true << OpenMenu << false << QStringList();
}

void TestCallScreens::entryTransient()
{
    QFETCH(bool, dialing);
    QFETCH(bool, connected);
    QFETCH(QString, previous);
    QFETCH(bool, statusBar);
    QFETCH(QStringList, transients);

    if (!statusBar)
        Brisken::DataStore::set(QStringLiteral("StatusBarController"), nullptr);
    phone()->setBridgeValue(QStringLiteral("dialingInProgress"), dialing);
    phone()->setBridgeValue(QStringLiteral("callConnected"), connected);
    post(previous);

    const qint64 since = mark();
    post(OpenCall);
    QVERIFY(activeStates().contains(QStringLiteral("CallInProgressViewState")));
    QCOMPARE(TestSupport::journalValues(QStringLiteral("transient"), QStringLiteral("name"), since),
             transients);
    QCOMPARE(
            TestSupport::journalValues(QStringLiteral("transient"), QStringLiteral("value"), since),
            QStringList(transients.isEmpty() ? QStringList() : QStringList{QStringLiteral("0")}));
}

QTEST_GUILESS_MAIN(TestCallScreens)
#include "tst_callscreens.moc"
