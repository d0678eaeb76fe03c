// The phone run as a host runs it: the plug-in file loaded, the integration called in the host's
// order, the root-hierarchy lists installed, the machine started and the phone entered.

#include "testsupport.h"

#include <hmiphoneviews.h>

#include <host/modulehost.h>
#include <mavrosk/bluetoothsource.h>
#include <mavrosk/datasource.h>
#include <mavrosk/phonesource.h>
#include <quorvel/hmilayeredstate.h>
#include <quorvel/popupstate.h>
#include <quorvel/statemachine.h>

#include <QQmlContext>
#include <QQmlEngine>
#include <QSignalSpy>
#include <QtTest>

class TestPhonePlugin : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();
    void screenTree();
    void firstScreen_data();
    void firstScreen();

private:
    bool bringUp();

    TestSupport::FrameworkWarningGuard m_guard;
    Host::ModuleHost *m_host = nullptr;
    QQmlEngine *m_engine = nullptr;
};

// The object names of a state's children in creation order; a layered state's ordinary children
// and the popups of its layer are listed one after the other.
static QStringList childNames(const QState *state)
{
    QStringList names;
    auto *layered = qobject_cast<const Quorvel::HmiLayeredState *>(state);
    for (const QObject *child : (layered ? layered->exclusiveState() : state)->children()) {
        if (qobject_cast<const QAbstractState *>(child))
            names.append(child->objectName());
    }
    if (layered) {
        for (const QObject *child : layered->layerState()->children()) {
            if (qobject_cast<const Quorvel::PopupState *>(child))
                names.append(child->objectName());
        }
    }
    return names;
}

static QState *childState(const QState *state, const QString &name)
{
    return state->findChild<QState *>(name);
}

void TestPhonePlugin::init()
{
    for (Mavrosk::DataSource *source : Mavrosk::DataSource::sources())
        source->reset();
    Platform::Journal::instance()->clear();
    TestSupport::FrameworkWarningGuard::take();
}

void TestPhonePlugin::cleanup()
{
    delete m_host;
    m_host = nullptr;
    delete m_engine;
    m_engine = nullptr;
    QCOMPARE(TestSupport::FrameworkWarningGuard::take(), QStringList());
}

bool TestPhonePlugin::bringUp()
{
    m_host = new Host::ModuleHost;
    m_engine = new QQmlEngine;
    if (!m_host->load(QStringLiteral(HMIPHONE_PLUGIN_FILE))) {
        qWarning() << m_host->errorString();
        return false;
    }
    if (!m_host->setUp(QStringLiteral("HmiPhone"), m_engine))
        return false;
    m_host->start();
    return true;
}

void TestPhonePlugin::screenTree()
{
    QVERIFY(bringUp());
    QState *root = m_host->moduleRoot();
    QVERIFY(root);
    QCOMPARE(root->objectName(), m_host->integration()->rootStateIdentifier());
    QCOMPARE(root->parentState(), m_host->moduleParent());

    const QStringList phoneChildren{
            QStringLiteral("PhoneCallCmp"),
            QStringLiteral("PhoneBookCmp"),
            QStringLiteral("PhoneEmgcyAsst"),
            QStringLiteral("PhoneStatusAlertsCmp"),
            QStringLiteral("HmiPhone_Limbo"),
            QStringLiteral("PhoneMenuViewState"),
            QStringLiteral("DialKeypadViewState"),
            QStringLiteral("RecentCallsListViewState"),
            QStringLiteral("Phone_CmpConditionalState"),
            QStringLiteral("PhoneSmsCmp"),
            HmiPhone::Views::PhoneDndActiveArdel,
            HmiPhone::Views::PhoneSmsNotSupported,
            HmiPhone::Views::PhoneSmsWaitingForResponseFromPhone,
            HmiPhone::Views::PhoneSmsAccessNotGranted,
            HmiPhone::Views::PhoneSmsDownloading,
            HmiPhone::Views::PhoneSmsDownloadFailed,
            HmiPhone::Views::PhoneSmsRetryDownloadFailed,
    };
    QCOMPARE(childNames(root), phoneChildren);

    QCOMPARE(childNames(childState(root, QStringLiteral("PhoneCallCmp"))),
             (QStringList{QStringLiteral("CallInProgressViewState"),
                          QStringLiteral("KeypadInCallViewState")}));
    QStringList contacts = childNames(childState(root, QStringLiteral("PhoneBookCmp")));
    std::sort(contacts.begin(), contacts.end());
    QCOMPARE(contacts,
             (QStringList{QStringLiteral("ContactDetailsViewState"),
                          QStringLiteral("PhoneBookEmptyViewState"),
                          QStringLiteral("PhoneBookListViewState"),
                          QStringLiteral("PhoneBookSearchViewState"),
                          QStringLiteral("PhoneBook_CmpConditionalState")}));
    QCOMPARE(childNames(childState(root, QStringLiteral("RecentCallsListViewState"))),
             (QStringList{QStringLiteral("RecentCallsListViewStateView"),
                          HmiPhone::Views::RecentCallsDownloading,
                          HmiPhone::Views::RecentCallsDownloadFailed,
                          HmiPhone::Views::RecentCallsRetryError,
                          HmiPhone::Views::RecentCallsFailedCallKOVA}));
    QCOMPARE(childNames(childState(root, QStringLiteral("PhoneSmsCmp"))),
             (QStringList{QStringLiteral("PhoneSmsListViewState"),
                          QStringLiteral("PhoneSmsReplyListViewState"),
                          QStringLiteral("PhoneSmsViewState")}));

    // The contacts popups are handed to the root of the machine, not kept in the phone's tree.
    for (const QString &popup :
         {HmiPhone::Views::PhoneBookDownloading, HmiPhone::Views::PhoneBookAccessNotGranted}) {
        QVERIFY2(!root->findChild<QState *>(popup), qPrintable(popup));
        QVERIFY2(Quorvel::StateMachine::instance()->popupState(popup), qPrintable(popup));
    }
}

void TestPhonePlugin::firstScreen_data()
{
    QTest::addColumn<bool>("connected");
    QTest::addColumn<int>("status");
    QTest::addColumn<int>("emergency");
    QTest::addColumn<QString>("expected");
    QTest::addColumn<int>("menuEntries");

    QTest::addRow("no phone") << false << 0 << 0 << QStringLiteral("HmiPhone_Limbo") << 0;
    QTest::addRow("call") << true << 4 << 0 << QStringLiteral("CallInProgressViewState") << 0;
    QTest::addRow("emergency") << true << 0 << 1 << QStringLiteral("PhoneEmgcyAsst") << 0;
    QTest::addRow("phone menu") << true << 0 << 0 << QStringLiteral("PhoneMenuViewState") << 1;
}

void TestPhonePlugin::firstScreen()
{
    QFETCH(bool, connected);
    QFETCH(int, status);
    QFETCH(int, emergency);
    QFETCH(QString, expected);
    QFETCH(int, menuEntries);

    QVERIFY(bringUp());
    // The phone menu's entry and exit reach QML through the controller's signals.
    auto *controller = m_engine->rootContext()
                               ->contextProperty(QStringLiteral("_hmiphoneController"))
                               .value<QObject *>();
    QVERIFY(controller);
    QSignalSpy entered(controller, SIGNAL(phoneMenuEntered()));
    QSignalSpy exited(controller, SIGNAL(phoneMenuExited()));

    Mavrosk::BluetoothSource::instance()->setDeviceConnected(connected);
    Mavrosk::PhoneSource::instance()->setStatus(status);
    Mavrosk::PhoneSource::instance()->setEmergencyCallStatus(emergency);
    TestSupport::processUntilIdle();
    m_host->openModule();
    TestSupport::processUntilIdle();

    QStringList active;
    for (const QAbstractState *state : Quorvel::StateMachine::instance()->configuration())
        active.append(state->objectName());
    QVERIFY2(active.contains(expected), qPrintable(active.join(QLatin1Char(' '))));
    QCOMPARE(entered.count(), menuEntries);

    m_host->openHome();
    TestSupport::processUntilIdle();
    QCOMPARE(exited.count(), menuEntries);
}

QTEST_GUILESS_MAIN(TestPhonePlugin)
#include "tst_phoneplugin.moc"
