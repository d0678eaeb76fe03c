// The dial keypad and the call in progress, entered from a plain parent state as the phone's
// root component enters them.

#include "dialkeypadstate.h"
#include "hmiphoneevents.h"
#include "hmiphoneviews.h"
#include "phonecall_cmp.h"
#include "screenfixture.h"

#include <mavrosk/phonesource.h>

using namespace HmiPhone;
using namespace ScreenFixture;

namespace {
const QString OpenMenu = QStringLiteral("Test_OpenMenu");
const QString OpenKeypad = QStringLiteral("Test_OpenKeypad");
const QString OpenCall = QStringLiteral("Test_OpenCall");

// A step of a scenario: an event name and its value.
QVariantList step(const QString &event, const QVariant &value = QVariant())
{
    return {event, value};
}

Mavrosk::PhoneSource *phone()
{
    return Mavrosk::PhoneSource::instance();
}
} // namespace

class TestCallScreens : public TestSupport::Suite
{
    Q_OBJECT

protected:
    void setUp() override
    {
        Quorvel::HmiState *parent = buildRoot();
        auto *menu = new Quorvel::HmiViewState(Views::PhoneMenu,
                                               QStringLiteral("PhoneMenuViewState"), parent);
        auto *keypad = new DialKeypadState(Views::DialKeypad, QStringLiteral("DialKeypadViewState"),
                                           parent);
        auto *call = new PhoneCall_Cmp(nullptr, QStringLiteral("PhoneCallCmp"), parent);
        parent->setInitialHmiState(menu);
        addOpener(OpenMenu, menu);
        addOpener(OpenKeypad, keypad);
        addOpener(OpenCall, call);
        start();
    }

    void tearDown() override { Quorvel::StateMachine::destroyInstance(); }

private slots:

    void keypadEditsNumber_data()
    {
        QTest::addColumn<QString>("leftOver");
        QTest::addColumn<QVariantList>("steps");
        QTest::addColumn<QString>("number");
        QTest::addColumn<int>("changes"); // number changes after the entry's clearing

        const QString key = Events::HmiPhone_DialPadKeyPressed;
        const QString backspace = Events::HmiPhone_DialPadBackSpace;
        const QString longPress = Events::HmiPhone_DialPadBackSpaceLongPress;
        const QString none, one = QStringLiteral("1"), four = QStringLiteral("4");
        // clang-format off
        QTest::addRow("entry clears a number left from before") << QStringLiteral("0789") << QVariantList() << none << 0;
        QTest::addRow("0, * and # in turn") << none << QVariantList{step(key, QStringLiteral("0")), step(key, QStringLiteral("*")), step(key, QStringLiteral("#"))} << QStringLiteral("0*#") << 3;
        QTest::addRow("key without a value or not a string") << none << QVariantList{step(key, four), step(key), step(key, QVariantList{1, 2}), step(key, QVariantMap{{four, 5}})} << four << 1;
        QTest::addRow("backspace on 12") << none << QVariantList{step(key, QStringLiteral("12")), step(backspace)} << one << 2;
        QTest::addRow("backspace on the empty number") << none << QVariantList{step(backspace)} << none << 0;
        QTest::addRow("long press on 0123") << none << QVariantList{step(key, QStringLiteral("0123")), step(longPress)} << none << 2;
        QTest::addRow("long press on the empty number") << none << QVariantList{step(longPress)} << none << 0;
        // clang-format on
    }

    void keypadEditsNumber()
    {
        QFETCH(QString, leftOver);
        QFETCH(QVariantList, steps);
        QFETCH(QString, number);
        QFETCH(int, changes);

        phone()->setCallNumberEntered(leftOver);
        post(OpenKeypad);
        QCOMPARE(phone()->callNumberEntered(), QString());

        const qint64 since = mark();
        for (const QVariant &s : steps)
            post(s.toList().at(0).toString(), s.toList().at(1));
        QCOMPARE(phone()->callNumberEntered(), number);
        QCOMPARE(TestSupport::journalValues(QStringLiteral("bridge"), QStringLiteral("call"), since)
                         .count(QStringLiteral("phone.setCallNumberEntered")),
                 changes);
        QVERIFY(activeStates().contains(QStringLiteral("DialKeypadViewState")));
    }

    void keypadIgnoresKeysWhenNotShown()
    {
        post(OpenKeypad);
        post(Events::HmiPhone_DialPadKeyPressed, QStringLiteral("7"));
        post(OpenMenu);

        const qint64 since = mark();
        post(Events::HmiPhone_DialPadKeyPressed, QStringLiteral("8"));
        post(Events::HmiPhone_DialPadBackSpace);
        post(Events::HmiPhone_DialPadBackSpaceLongPress);
        QCOMPARE(phone()->callNumberEntered(), QStringLiteral("7"));
        QCOMPARE(bridgeCommandsSince(since), QStringList());
    }

    void callKeypadShowsAndHides()
    {
        const qint64 since = mark();
        post(OpenCall);
        post(Events::HmiPhone_ShowCallKeyPadRequest);
        QVERIFY(activeStates().contains(QStringLiteral("KeypadInCallViewState")));
        post(Events::HmiPhone_HideCallKeyPadRequest);
        QVERIFY(activeStates().contains(QStringLiteral("CallInProgressViewState")));
        QCOMPARE(TestSupport::journalValues(QStringLiteral("view"), QStringLiteral("id"), since),
                 (QStringList{Views::CallInProgress, Views::KeypadInCall, Views::CallInProgress}));
    }

    // Requests on the call screens: key tones carry [tone code, text] and go on the in-call
    // keypad; mute and privacy act on the call view only. The screen stays as it was.
    void callRequests_data()
    {
        QTest::addColumn<bool>("keypadShown");
        QTest::addColumn<QString>("event");
        QTest::addColumn<QVariant>("data");
        QTest::addColumn<QStringList>("commands");

        const QString tone = Events::HmiPhone_DialPadKeyTonePressed;
        const QString mute = Events::HmiPhone_MuteRequest;
        const QString privacy = Events::HmiPhone_PrivacyRequest;
        const QString send = QStringLiteral("phone.dialPadKeyTonePressed(53)");
        const QString record = QStringLiteral("phone.setDTMFNumberEntered(95)");
        const QString five = QStringLiteral("5");
        const QVariant none;
        // clang-format off
        QTest::addRow("tone 53 and 5") << true << tone << QVariant(QVariantList{53, five}) << QStringList{send, record};
        QTest::addRow("tone without an integer") << true << tone << QVariant(QVariantList{QStringLiteral("x"), five}) << QStringList{record};
        QTest::addRow("tone without a text") << true << tone << QVariant(QVariantList{53, none}) << QStringList{send};
        QTest::addRow("tone of one element") << true << tone << QVariant(QVariantList{53}) << QStringList();
        QTest::addRow("mute on the call view") << false << mute << none << QStringList{QStringLiteral("phone.toggleMuted()")};
        QTest::addRow("privacy on the call view") << false << privacy << none << QStringList{QStringLiteral("phone.togglePrivacyMode()")};
        QTest::addRow("mute on the in-call keypad") << true << mute << none << QStringList();
        QTest::addRow("privacy on the in-call keypad") << true << privacy << none << QStringList();
        // clang-format on
    }

    void callRequests()
    {
        QFETCH(bool, keypadShown);
        QFETCH(QString, event);
        QFETCH(QVariant, data);
        QFETCH(QStringList, commands);

        phone()->setDTMFNumberEntered(QStringLiteral("9")); // a tone sent earlier in this call
        post(OpenCall);
        if (keypadShown)
            post(Events::HmiPhone_ShowCallKeyPadRequest);
        const QStringList before = activeStates();
        const qint64 since = mark();
        post(event, data);
        QCOMPARE(bridgeCommandsSince(since), commands);
        QCOMPARE(activeStates(), before);
    }

    void entryTransient_data()
    {
        QTest::addColumn<bool>("dialing");
        QTest::addColumn<bool>("connected");
        QTest::addColumn<QString>("previous"); // the event that opened the screen before
        QTest::addColumn<bool>("statusBar");
        QTest::addColumn<QStringList>("transients");

        const QStringList dialing{Transients::PhoneOutgoingDialing};
        const QStringList accepted{Transients::PhoneAcceptedIncomingCall};
        // clang-format off
        QTest::addRow("dialing, also connected") << true << true << OpenMenu << true << dialing;
        QTest::addRow("connected after the phone menu") << false << true << OpenMenu << true << accepted;
        QTest::addRow("connected after the dial keypad") << false << true << OpenKeypad << true << accepted;
        QTest::addRow("connected after another module") << false << true << OpenHome << true << QStringList();
        QTest::addRow("no status bar") << true << true << OpenMenu << false << QStringList();
        // clang-format on
    }

    void entryTransient()
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
        QCOMPARE(TestSupport::journalValues(QStringLiteral("transient"), QStringLiteral("name"),
                                            since),
                 transients);
        if (!transients.isEmpty())
            QCOMPARE(TestSupport::journalValues(QStringLiteral("transient"),
                                                QStringLiteral("value"), since),
                     QStringList{QStringLiteral("0")});
    }

private:
};

QTEST_GUILESS_MAIN(TestCallScreens)
#include "tst_callscreens.moc"
