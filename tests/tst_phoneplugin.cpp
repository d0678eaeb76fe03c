// The phone run as a host runs it: the plug-in file loaded, the integration called in the host's
// order, the root-hierarchy lists installed, the machine started and the phone entered.

#include "testsupport.h"

#include <hmiphoneviews.h>

#include <host/modulehost.h>
#include <mavrosk/bridge.h>
#include <quorvel/hmilayeredstate.h>
#include <quorvel/hmistate.h>
#include <quorvel/popupstate.h>
#include <quorvel/statemachine.h>
#include <taldris/hmiintentmanager.h>
#include <taldris/hmisubmoduleprovider.h>

#include <QLibraryInfo>
#include <QQmlContext>
#include <QQmlEngine>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QtTest>

#include <functional>

Q_DECLARE_METATYPE(std::function<void()>)

using namespace HmiPhone;

// The phone's states by object name, "parent/child" below the listed components; a layered
// state's ordinary children come first, then the popups of its layer.
static QStringList tree(const QState *state, const QStringList &descend, const QString &prefix = {})
{
    QStringList names;
    auto *layered = qobject_cast<const Quorvel::HmiLayeredState *>(state);
    QObjectList children = (layered ? layered->exclusiveState() : state)->children();
    if (layered) // each popup of the layer sits in a slot of its own
        for (const QObject *slot : layered->layerState()->children())
            for (QObject *popup :
                 slot->findChildren<Quorvel::PopupState *>(QString(), Qt::FindDirectChildrenOnly))
                children.append(popup);
    for (const QObject *child : children) {
        auto *childState = qobject_cast<const QState *>(child);
        if (!childState)
            continue;
        names.append(prefix + child->objectName());
        if (descend.contains(child->objectName()))
            names += tree(childState, {}, child->objectName() + QLatin1Char('/'));
    }
    return names;
}

class TestPhonePlugin : public TestSupport::Suite
{
    Q_OBJECT

protected:
    void setUp() override
    {
        Mavrosk::resetAll();
        m_engine.reset(new QQmlEngine);
        m_host.reset(new Host::ModuleHost);
        QVERIFY2(m_host->load(QStringLiteral(HMIPHONE_PLUGIN_FILE)),
                 qPrintable(m_host->errorString()));
        QVERIFY(m_host->setUp(QStringLiteral("HmiPhone"), m_engine.data()));
        m_host->start();
    }

    void tearDown() override
    {
        m_host.reset();
        m_engine.reset();
    }

private slots:
    // A file that is not the phone plug-in is refused with an error that says why; the plug-in
    // itself loads by a path relative to the working directory too.
    void loadErrors_data()
    {
        QTest::addColumn<QString>("file");
        QTest::addColumn<QString>("error"); // empty: it loads
        const QString plugins = QLibraryInfo::location(QLibraryInfo::PluginsPath);
        QTest::addRow("missing file") << "no-such-plugin.so"
                                      << "no such file";
        QTest::addRow("not a plug-in")
                << m_dir.filePath(QStringLiteral("libhmiphone.so.txt")) << "not a Qt plug-in";
        QTest::addRow("another interface")
                << plugins + QStringLiteral("/platforms/libqminimal.so") << "not a module plug-in";
        QTest::addRow("relative path")
                << QDir::current().relativeFilePath(QStringLiteral(HMIPHONE_PLUGIN_FILE)) << "";
    }
    void loadErrors()
    {
        QFETCH(QString, file);
        QFETCH(QString, error);
        QVERIFY(m_dir.isValid());
        QFile text(m_dir.filePath(QStringLiteral("libhmiphone.so.txt")));
        QVERIFY(text.open(QIODevice::WriteOnly) && text.write("not a library") > 0);
        text.close();
        Host::ModuleHost host;
        if (error.isEmpty()) {
            QVERIFY(QFileInfo(file).isRelative());
            QVERIFY2(host.load(file), qPrintable(host.errorString()));
            return;
        }
        QVERIFY(!host.load(file));
        QVERIFY2(host.errorString().contains(error), qPrintable(host.errorString()));
        QVERIFY(host.errorString().contains(file));
        QVERIFY(!host.setUp(QStringLiteral("HmiPhone")));
    }

    void screenTree()
    {
        QState *root = m_host->moduleRoot();
        QVERIFY(root);
        QCOMPARE(root->objectName(), m_host->integration()->rootStateIdentifier());
        QCOMPARE(root->parentState(), m_host->moduleParent());

        const QStringList expected
                = QStringLiteral("PhoneCallCmp PhoneCallCmp/CallInProgressViewState "
                                 "PhoneCallCmp/KeypadInCallViewState "
                                 "PhoneBookCmp PhoneBookCmp/PhoneBookEmptyViewState "
                                 "PhoneBookCmp/PhoneBookListViewState "
                                 "PhoneBookCmp/PhoneBookSearchViewState "
                                 "PhoneBookCmp/ContactDetailsViewState "
                                 "PhoneBookCmp/PhoneBook_CmpConditionalState PhoneEmgcyAsst "
                                 "PhoneStatusAlertsCmp "
                                 "HmiPhone_Limbo PhoneMenuViewState DialKeypadViewState "
                                 "RecentCallsListViewState "
                                 "RecentCallsListViewState/RecentCallsListViewStateView "
                                 "Phone_CmpConditionalState PhoneSmsCmp "
                                 "PhoneSmsCmp/PhoneSmsListViewState "
                                 "PhoneSmsCmp/PhoneSmsReplyListViewState "
                                 "PhoneSmsCmp/PhoneSmsViewState")
                          .split(QLatin1Char(' '));
        const QStringList components{QStringLiteral("PhoneCallCmp"), QStringLiteral("PhoneBookCmp"),
                                     QStringLiteral("RecentCallsListViewState"),
                                     QStringLiteral("PhoneSmsCmp")};
        QCOMPARE(tree(root, components), expected);

        // The layers' popups open in their layered states' regions; closed, they wait outside
        // the tree.
        auto *machine = Quorvel::StateMachine::instance();
        auto layerPopups = [machine](const QString &layered) {
            QStringList ids;
            const QState *region
                    = machine->findChild<Quorvel::HmiLayeredState *>(layered)->layerState();
            for (const Quorvel::PopupState *popup : machine->regionPopups(region))
                ids.append(popup->viewId());
            return ids;
        };
        QStringList rootPopups{Views::PhoneDndActiveArdel,
                               Views::PhoneSmsNotSupported,
                               Views::PhoneSmsWaitingForResponseFromPhone,
                               Views::PhoneSmsAccessNotGranted,
                               Views::PhoneSmsDownloading,
                               Views::PhoneSmsDownloadFailed,
                               Views::PhoneSmsRetryDownloadFailed};
        QStringList recentCallsPopups{
                Views::RecentCallsDownloading, Views::RecentCallsDownloadFailed,
                Views::RecentCallsRetryError, Views::RecentCallsFailedCallKOVA};
        rootPopups.sort();
        recentCallsPopups.sort();
        QCOMPARE(layerPopups(root->objectName()), rootPopups);
        QCOMPARE(layerPopups(QStringLiteral("RecentCallsListViewState")), recentCallsPopups);

        // The contacts popups are handed to the root of the machine, not kept in the phone's tree.
        for (const QString &popup :
             {Views::PhoneBookDownloading, Views::PhoneBookAccessNotGranted}) {
            QVERIFY2(!root->findChild<QState *>(popup), qPrintable(popup));
            QVERIFY2(Quorvel::StateMachine::instance()->popupState(popup), qPrintable(popup));
        }
    }

    // Opened through the host's menu bar with a phone connected, the phone shows its menu; the
    // menu's entry and exit reach QML through the controller's signals.
    void phoneMenu()
    {
        QObject *controller = m_engine->rootContext()
                                      ->contextProperty(QStringLiteral("_hmiphoneController"))
                                      .value<QObject *>();
        QVERIFY(controller);
        QSignalSpy entered(controller, SIGNAL(phoneMenuEntered()));
        QSignalSpy exited(controller, SIGNAL(phoneMenuExited()));

        Mavrosk::BluetoothSource::instance()->setDeviceConnected(true);
        m_host->openModule();
        TestSupport::processUntilIdle();
        QVERIFY(TestSupport::activeStates().contains(QStringLiteral("PhoneMenuViewState")));
        QCOMPARE(entered.count(), 1);
        m_host->openHome();
        TestSupport::processUntilIdle();
        QCOMPARE(exited.count(), 1);
    }

    // QML can call the controller's inherited deleteLater(). Whatever then reaches the module
    // for the controller is refused with a warning, not sent to a deleted object; what does not
    // need the controller still works.
    void controllerDeletedFromQml_data()
    {
        QTest::addColumn<std::function<void()>>("request");
        QTest::addColumn<QString>("warning"); // empty: refused quietly

        QTest::newRow("intent 1 calls a number") << std::function<void()>([] {
            QVERIFY(!Taldris::HmiIntentManager::instance()->requestAction(
                    1, {QStringLiteral("0123")}));
        }) << QStringLiteral("HmiPhoneIntentHandler: the controller is gone, no call placed");
        QTest::newRow("settings pages built again")
                << std::function<void()>([] {
                       Quorvel::HmiState settings(QStringLiteral("SETTINGS"));
                       settings.setInitialHmiState(
                               new Quorvel::HmiState(QStringLiteral("MENU"), &settings));
                       QVERIFY(Taldris::HmiSubmoduleProvider::instance()->requestSubmodule(
                               3, &settings, QStringLiteral("SETTINGS"), 0));
                   })
                << QStringLiteral("HmiPhoneSettingsHostedSubmodule: the controller is gone, the "
                                  "settings pages cannot stop a ringtone sample");
        const auto ringingKey = [](int key) {
            return std::function<void()>([key] {
                Mavrosk::PhoneSource::instance()->setBridgeValue(QStringLiteral("incomingCall"),
                                                                 true);
                TestSupport::processUntilIdle();
                Mavrosk::KeySource::instance()->sendKeyEvent(key, 1);
            });
        };
        QTest::newRow("accept key while ringing")
                << ringingKey(77)
                << QStringLiteral("HmiPhoneGlobalStateHandler: the controller is gone, the call "
                                  "is not answered");
        QTest::newRow("reject key while ringing")
                << ringingKey(78)
                << QStringLiteral("HmiPhoneGlobalStateHandler: the controller is gone, the call "
                                  "is not answered");
        QTest::newRow("end key opens no phone") << std::function<void()>([] {
            Mavrosk::KeySource::instance()->sendKeyEvent(50, 1);
        }) << QString();
        // The module's own events go to the machine, not through the controller.
        const auto posts = [](const char *event, std::function<void()> cause) {
            return std::function<void()>([event, cause] {
                const qint64 since = TestSupport::mark();
                cause();
                TestSupport::processUntilIdle();
                QCOMPARE(TestSupport::journalValues(QStringLiteral("event"), QStringLiteral("name"),
                                                    since),
                         QStringList{QLatin1String(event)});
            });
        };
        QTest::newRow("private mode closes the in-call keypad")
                << posts("HmiPhone_HideCallKeyPadRequest",
                         [] { Mavrosk::PhoneSource::instance()->setPrivateMode(true); })
                << QString();
        QTest::newRow("missed call popup asks for the calls") << posts(
                "HmiPhone_RequestRecentCallList", [] {
                    emit Mavrosk::PhoneSource::instance()->missedCallsPresent();
                    TestSupport::processUntilIdle();
                    Quorvel::StateMachine::instance()->dismissPopup(Views::MissedCallPopup);
                }) << QString();
        QTest::newRow("low battery guard") << std::function<void()>([] {
            Mavrosk::PhoneSource::instance()->setBridgeValue(
                    QStringLiteral("lowBatteryNotification"), true);
            Mavrosk::PhoneSource::instance()->setBridgeValue(QStringLiteral("deviceBatteryLevel"),
                                                             1);
        }) << QString();
    }

    void controllerDeletedFromQml()
    {
        QFETCH(std::function<void()>, request);
        QFETCH(QString, warning);
        Mavrosk::BluetoothSource::instance()->setDeviceConnected(true);
        TestSupport::processUntilIdle();
        QObject *controller = m_engine->rootContext()
                                      ->contextProperty(QStringLiteral("_hmiphoneController"))
                                      .value<QObject *>();
        QVERIFY(QMetaObject::invokeMethod(controller, "deleteLater"));
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);

        if (!warning.isEmpty())
            expectMessage(QtWarningMsg, qPrintable(warning));
        request();
        TestSupport::processUntilIdle();
    }

private:
    QScopedPointer<QQmlEngine> m_engine;
    QScopedPointer<Host::ModuleHost> m_host;
    QTemporaryDir m_dir; // files that are not plug-ins, away from the build's plug-in folder
};

QTEST_GUILESS_MAIN(TestPhonePlugin)
#include "tst_phoneplugin.moc"
