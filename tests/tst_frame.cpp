// The module frame as a host sees it: the plug-in file, the integration's and the settings
// submodule's identity, the QML types and context properties, the identifier tables and the intent
// handler.

#include "testsupport.h"

#include <hmiphonecontroller.h>
#include <hmiphoneintegration.h>
#include <hmiphonesettingshostedsubmodule.h>
#include <hmiphoneviews.h>

#include <brisken/hmiaction.h>
#include <mavrosk/bridge.h>
#include <quorvel/hmitransition.h>
#include <quorvel/hmiviewstate.h>
#include <quorvel/statemachine.h>
#include <taldris/hmiintentmanager.h>
#include <taldris/moduleinterface.h>

#include <QPluginLoader>
#include <QQmlComponent>
#include <QQmlContext>
#include <QQmlEngine>
#include <QSignalSpy>
#include <QTest>

using namespace HmiPhone;

class tst_Frame : public TestSupport::Suite
{
    Q_OBJECT

protected:
    void setUp() override
    {
        Mavrosk::resetAll();
        m_mark = TestSupport::mark();
    }
private slots:

    void pluginFileLoads()
    {
        QPluginLoader loader(QStringLiteral(HMIPHONE_PLUGIN_FILE));
        QCOMPARE(loader.metaData().value(QLatin1String("IID")).toString(),
                 QStringLiteral("com.orvane.ivi.ModuleInterface"));
        QCOMPARE(loader.metaData().value(QLatin1String("className")).toString(),
                 QStringLiteral("HmiPhoneModule"));
        const QJsonObject metaData = loader.metaData().value(QLatin1String("MetaData")).toObject();
        QCOMPARE(metaData.value(QLatin1String("Name")).toString(), QStringLiteral("HmiPhone"));
        QCOMPARE(metaData.value(QLatin1String("Description")).toString(),
                 QStringLiteral("Phone module plugin"));
        QCOMPARE(metaData.value(QLatin1String("Version")).toString(),
                 QStringLiteral(HMIPHONE_VERSION));

        QObject *instance = loader.instance();
        QVERIFY2(instance, qPrintable(loader.errorString()));
        QVERIFY(instance->inherits("HmiPhoneModule"));
        auto *module = qobject_cast<Taldris::ModuleInterface *>(instance);
        QVERIFY(module);

        QObject parent;
        Taldris::HmiModuleIntegration *integration
                = module->createModuleIntegration(QStringLiteral("HmiPhone"), &parent);
        QVERIFY(integration);
        QCOMPARE(integration->parent(), &parent);
        QCOMPARE(integration->moduleName(), QStringLiteral("Phone"));
        QCOMPARE(integration->modulePriority(), 30);
        QCOMPARE(integration->moduleDomain(), 2);
        QCOMPARE(integration->moduleId(), QStringLiteral("PHONE"));
        QCOMPARE(integration->viewDescriptorFile(),
                 QStringLiteral("plugins/hmiphone/view-descriptor.json"));
        QVERIFY(integration->rootStateIdentifier().endsWith(QLatin1String("Root")));
        QCOMPARE(integration->iconUrl().toString(), QStringLiteral("menubar/icon_phone"));
    }

    // What the settings module reads of the phone's settings submodule to list and build it.
    void settingsSubmoduleIdentity()
    {
        HmiPhoneSettingsHostedSubmodule submodule(nullptr, nullptr);
        QCOMPARE(submodule.moduleIdentifier(), "PHONE"_q);
        QCOMPARE(submodule.submoduleName(), "Phone settings submodule."_q);
        QCOMPARE(submodule.viewDescriptorFile(),
                 "plugins/hmiphone/settings-view-descriptor.json"_q);
        const Brisken::HmiAction *entry = submodule.subModuleEntryAction();
        QCOMPARE(entry->name(), "Phone"_q);
        QCOMPARE(entry->iconPath(), "settings/icon_phone"_q);
        QCOMPARE(entry->actionType(), 3);
        QCOMPARE(entry->translationContext(), "HmiPhone::HmiPhoneSettingsHostedSubmodule"_q);
        QCOMPARE(entry->parent(), &submodule);
    }

    void integrationAnswersOnlyItsName_data()
    {
        QTest::addColumn<QString>("name");
        QTest::addColumn<bool>("answers");
        QTest::newRow("HmiPhone") << QStringLiteral("HmiPhone") << true;
        QTest::newRow("lower case") << QStringLiteral("hmiphone") << false;
        QTest::newRow("module name") << QStringLiteral("Phone") << false;
        QTest::newRow("empty") << QString() << false;
    }

    void integrationAnswersOnlyItsName()
    {
        QFETCH(QString, name);
        QFETCH(bool, answers);
        HmiPhoneModule module;
        QObject parent;
        Taldris::HmiModuleIntegration *first = module.createModuleIntegration(name, &parent);
        Taldris::HmiModuleIntegration *second = module.createModuleIntegration(name, &parent);
        QCOMPARE(first != nullptr, answers);
        if (answers)
            QVERIFY(first != second);
    }

    void qmlTypesAreUncreatable_data()
    {
        QTest::addColumn<QString>("type");
        for (const char *type : {"HmiPhoneIntegration", "HmiPhoneController", "PhoneSource",
                                 "EAPhoneSource", "BluetoothSource", "ProjectionSource"})
            QTest::newRow(type) << QString::fromLatin1(type);
    }

    void qmlTypesAreUncreatable()
    {
        QFETCH(QString, type);
        HmiPhoneIntegration integration;
        integration.registerTypes();
        QQmlEngine engine;
        QQmlComponent component(&engine);
        component.setData(QStringLiteral("import HmiPhone 1.0\n%1 {}\n").arg(type).toUtf8(),
                          QUrl());
        QVERIFY(component.isError());
        QVERIFY2(component.errorString().contains(type + QLatin1String(" is not creatable")),
                 qPrintable(component.errorString()));
    }

    void contextProperties()
    {
        HmiPhoneIntegration integration;
        QQmlEngine engine;
        integration.exportObjects(engine.rootContext());
        QCOMPARE(engine.rootContext()
                         ->contextProperty(QStringLiteral("_hmiphone"))
                         .value<QObject *>(),
                 &integration);
        QObject *controller = engine.rootContext()
                                      ->contextProperty(QStringLiteral("_hmiphoneController"))
                                      .value<QObject *>();
        QVERIFY(qobject_cast<HmiPhoneController *>(controller));
        QCOMPARE(controller->parent(), &integration);
        // Before the host asks for the screens there are no root-hierarchy lists to hand over.
        QVERIFY(integration.moduleRootHierarchyTransitions().isEmpty());
        QVERIFY(integration.moduleRootHierarchyPopupStates().isEmpty());
    }

    void viewIdentifiers()
    {
        HmiPhoneIntegration integration;
        QCOMPARE(integration.createViewIdentifier(QStringLiteral("IncomingCall")),
                 Views::IncomingCall);
        QVERIFY(Views::siriFeatureNotEnabledPopup.endsWith(
                QLatin1String("siriFeatureNotEnabledPopup")));
        QVERIFY(Views::PhoneStatusAlertPopup75.endsWith(QLatin1String("PhoneStatusAlertPopup75")));
    }

    void intentActions_data()
    {
        QTest::addColumn<int>("action");
        QTest::addColumn<QVariantList>("arguments");
        QTest::addColumn<bool>("connected");
        QTest::addColumn<bool>("result");
        // What the HMI sees: an event posted (journaled once, by the controller or straight to
        // the machine), or a view request.
        QTest::addColumn<QString>("kind");
        QTest::addColumn<QString>("what");

        const QString number = QStringLiteral("0123456789");
        const QString none, event = QStringLiteral("event"), view = QStringLiteral("view-request");
        auto row = [](const char *tag, int action, const QVariantList &arguments, bool connected,
                      bool result, const QString &kind, const char *what) {
            QTest::newRow(tag) << action << arguments << connected << result << kind
                               << QString::fromLatin1(what);
        };
        // clang-format off
        row("1: number, second argument ignored", 1, {number, 42}, true, true, event, "HmiPhone_MakeCallRequest");
        row("1: no arguments", 1, {}, true, false, none, "");
        row("1: no phone", 1, {number}, false, false, none, "");
        row("1: empty number", 1, {QString()}, true, false, none, "");
        row("1: a list", 1, {QVariant(QVariantList{1, 2})}, true, false, none, "");
        row("1: a map", 1, {QVariantMap{{QStringLiteral("n"), number}}}, true, false, none, "");
        row("28 add phone", 28, {}, false, true, event, "HmiPhone_AddPhoneRequest");
        row("32 alerts", 32, {}, false, true, event, "HmiPhone_ShowStatusBarAlertsRequest");
        row("47 siri", 47, {}, false, true, event, "HmiPhone_ShowSiriNotEnabledRequest");
        row("56 root", 56, {}, false, true, event, "HmiPhone_RootStateRequest");
        row("67 phonebook", 67, {}, false, true, event, "HmiPhone_PhoneBookStatusCheck");
        row("7 settings", 7, {}, false, true, view, "PhoneSettingsRoot");
        row("68 contacts settings", 68, {}, false, true, view, "PhoneManageContactsSettings");
        row("2 not handled", 2, {}, true, false, none, "");
        row("0 not handled", 0, {}, true, false, none, "");
        // clang-format on
    }

    void intentActions()
    {
        QFETCH(int, action);
        QFETCH(QVariantList, arguments);
        QFETCH(bool, connected);
        QFETCH(bool, result);
        QFETCH(QString, kind);
        QFETCH(QString, what);

        HmiPhoneModule module;
        Host::ModuleHost host;
        host.use(&module);
        QVERIFY(host.setUp(QStringLiteral("HmiPhone")));
        host.start();
        // Another part of the HMI listening to the events that the phone posts to the machine (on a
        // state that stays active when the phone opens one of its screens).
        QSignalSpy heard(
                new Quorvel::HmiTransition(
                        what, Quorvel::StateMachine::instance()->levelState(Quorvel::StateLevel1)),
                &QAbstractTransition::triggered);
        Mavrosk::BluetoothSource::instance()->setBridgeValue(QStringLiteral("deviceConnected"),
                                                             connected);
        Mavrosk::PhoneSource::instance()->setBridgeValue(QStringLiteral("callNumberEntered"),
                                                         QStringLiteral("555"));

        QCOMPARE(Taldris::HmiIntentManager::instance()->requestAction(action, arguments), result);
        TestSupport::processUntilIdle();

        const QString entered = Mavrosk::PhoneSource::instance()->callNumberEntered();
        QCOMPARE(entered,
                 action == 1 && result ? arguments.first().toString() : QStringLiteral("555"));
        // Events reach the machine whether the controller or the handler posted them.
        const bool posted = kind == QLatin1String("event");
        QCOMPARE(heard.count(), posted ? 1 : 0);
        if (kind == QLatin1String("event")) {
            QCOMPARE(TestSupport::journalValues(kind, QStringLiteral("name"), m_mark),
                     QStringList{what});
        } else if (kind == QLatin1String("view-request")) {
            const QStringList views
                    = TestSupport::journalValues(kind, QStringLiteral("id"), m_mark);
            QCOMPARE(views.size(), 1);
            QVERIFY(views.first().endsWith(what));
        }
        if (!result) {
            QVERIFY(TestSupport::journalValues(QStringLiteral("event"), QStringLiteral("name"),
                                               m_mark)
                            .isEmpty());
        }
    }

    void callActionFollowsConnection()
    {
        HmiPhoneIntegration integration;
        auto *manager = Taldris::HmiIntentManager::instance();
        QSignalSpy status(manager, &Taldris::HmiIntentManager::actionStatusChanged);
        QVERIFY(!manager->isActionEnabled(1));
        QVERIFY(!manager->isActionEnabled(28));

        Mavrosk::BluetoothSource::instance()->setBridgeValue(QStringLiteral("deviceConnected"),
                                                             true);
        QVERIFY(manager->isActionEnabled(1));
        QVERIFY(!manager->isActionEnabled(28));
        Mavrosk::BluetoothSource::instance()->setBridgeValue(QStringLiteral("deviceConnected"),
                                                             false);
        QVERIFY(!manager->isActionEnabled(1));

        QCOMPARE(status.count(), 2);
        QCOMPARE(status.at(0), (QVariantList{1, true}));
        QCOMPARE(status.at(1), (QVariantList{1, false}));
    }

private:
    qint64 m_mark = 0;
};

QTEST_GUILESS_MAIN(tst_Frame)
#include "tst_frame.moc"
