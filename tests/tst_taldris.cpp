// The module framework: module identity, intents and their request objects, hosted submodules,
// hard-key fall-backs and logging categories.

#include "testsupport.h"

#include <quorvel/hmistate.h>
#include <taldris/hardkeycontroller.h>
#include <taldris/hmihostedsubmodule.h>
#include <taldris/hmiintenthandler.h>
#include <taldris/hmiintentmanager.h>
#include <taldris/hmiintentrequest.h>
#include <taldris/hmimoduleintegration.h>
#include <taldris/hmisubmoduleprovider.h>
#include <taldris/intentactionrequest.h>
#include <taldris/moduleinterface.h>
#include <taldris/pellumcategory.h>

#include <QRegularExpression>
#include <QSignalSpy>
#include <QTest>

using Platform::Journal;

namespace {

class RecordingHandler : public Taldris::HmiIntentHandler
{
public:
    RecordingHandler(const QList<int> &actions, bool answer)
        : m_answer(answer)
    {
        for (int action : actions)
            addAction(action);
    }
    bool performAction(int action, const QVariantList &arguments, bool flag,
                       const QVariant &extra) const override
    {
        calls.append(QVariant(QVariantList{action, arguments, flag, extra}));
        return m_answer;
    }
    using Taldris::HmiIntentHandler::actionStatusChanged;

    mutable QVariantList calls;

private:
    bool m_answer;
};

class ArgumentProvider : public Taldris::IntentDataProvider
{
public:
    QVariantList intentArguments() const override { return {QStringLiteral("from provider")}; }
};

class Integration : public Taldris::HmiModuleIntegration
{
public:
    using Taldris::HmiModuleIntegration::HmiModuleIntegration;
    QString moduleName() const override { return QStringLiteral("Test"); }
    Quorvel::HmiState *createScreenStateSubTree(Quorvel::HmiState *) override { return nullptr; }
};

class Submodule : public Taldris::HmiHostedSubmodule
{
public:
    Brisken::HmiAction *subModuleEntryAction() override { return nullptr; }
    QString moduleIdentifier() const override { return QStringLiteral("TEST"); }
    QString submoduleName() const override { return QStringLiteral("Test submodule."); }
    QString viewDescriptorFile() const override { return QString(); }
    Quorvel::HmiState *createStateHierarchy(Quorvel::HmiState *parent) override
    {
        return new Quorvel::HmiState(QStringLiteral("Hosted%1").arg(++built), parent);
    }
    int built = 0;
};

class Plugin : public QObject, public Taldris::ModuleInterface
{
    Q_OBJECT
    Q_INTERFACES(Taldris::ModuleInterface)
public:
    Taldris::HmiModuleIntegration *createModuleIntegration(const QString &, QObject *) override
    {
        return nullptr;
    }
};

// The intents journaled since `since`, as (action, args) pairs.
QVariantList intents(qint64 since)
{
    QVariantList result;
    for (const Platform::JournalEntry &entry : Journal::instance()->entriesSince(since)) {
        if (entry.kind == QLatin1String("intent"))
            result.append(QVariant(QVariantList{entry.fields.value(QStringLiteral("action")),
                                                entry.fields.value(QStringLiteral("args"))}));
    }
    return result;
}

QVariant intent(int action, const QVariantList &args = {})
{
    return QVariant(QVariantList{action, args});
}

} // namespace

using HardKeyCall = void (Taldris::HardKeyController::*)();
Q_DECLARE_METATYPE(HardKeyCall)

class TestTaldris : public QObject
{
    Q_OBJECT
private slots:
    void moduleIdentity_data();
    void moduleIdentity();
    void pluginInterface();
    void requestAction_data();
    void requestAction();
    void destroyedHandlerIsNeverCalled();
    void actionStatus();
    void requestObjectsRunEachTime();
    void intentActionRequestProvider();
    void submoduleProvider_data();
    void submoduleProvider();
    void hardKeyFallBacks_data();
    void hardKeyFallBacks();
    void pellumCategoryLevel_data();
    void pellumCategoryLevel();
};

void TestTaldris::moduleIdentity_data()
{
    QTest::addColumn<int>("type");
    QTest::addColumn<QString>("id");
    QTest::addColumn<QString>("root");
    QTest::addRow("type 1") << 1 << QStringLiteral("PHONE") << QStringLiteral("PHONE.Root");
    QTest::addRow("unknown type") << 77 << QString() << QStringLiteral(".Root");
}

void TestTaldris::moduleIdentity()
{
    QFETCH(int, type);
    Integration integration(type);
    QCOMPARE(integration.moduleType(), type);
    QFETCH(QString, id);
    QCOMPARE(integration.moduleId(), id);
    QFETCH(QString, root);
    QCOMPARE(integration.rootStateIdentifier(), root);
    QVERIFY(integration.moduleRootHierarchyTransitions().isEmpty());
    QVERIFY(integration.moduleRootHierarchyPopupStates().isEmpty());
}

void TestTaldris::pluginInterface()
{
    Plugin plugin;
    QCOMPARE(qobject_interface_iid<Taldris::ModuleInterface *>(), "com.orvane.ivi.ModuleInterface");
    auto *viaIid = static_cast<Taldris::ModuleInterface *>(
            plugin.qt_metacast("com.orvane.ivi.ModuleInterface"));
    QCOMPARE(viaIid, static_cast<Taldris::ModuleInterface *>(&plugin));
    QCOMPARE(qobject_cast<Taldris::ModuleInterface *>(&plugin), viaIid);
}

void TestTaldris::requestAction_data()
{
    QTest::addColumn<int>("action");
    QTest::addColumn<bool>("answer");
    QTest::addColumn<bool>("result");
    QTest::addColumn<int>("calls");
    QTest::addRow("offered, carried out") << 5 << true << true << 1;
    QTest::addRow("offered, refused") << 6 << false << false << 1;
    QTest::addRow("not offered") << 99 << true << false << 0;
}

void TestTaldris::requestAction()
{
    QFETCH(int, action);
    QFETCH(bool, answer);
    RecordingHandler handler({5, 6}, answer);
    Taldris::HmiIntentManager::instance()->registerIntentHandler(&handler);
    const qint64 since = Journal::instance()->lastSequence();
    const QVariantList args{QStringLiteral("0123"), 7};

    QFETCH(bool, result);
    QFETCH(int, calls);

    QCOMPARE(Taldris::HmiIntentManager::instance()->requestAction(action, args, true, false,
                                                                  QStringLiteral("extra")),
             result);
    QCOMPARE(handler.calls.size(), calls);
    if (!handler.calls.isEmpty())
        QCOMPARE(handler.calls.first(),
                 QVariant(QVariantList{action, args, true, QStringLiteral("extra")}));
    QCOMPARE(intents(since), QVariantList{intent(action, args)});
}

void TestTaldris::destroyedHandlerIsNeverCalled()
{
    auto *manager = Taldris::HmiIntentManager::instance();
    RecordingHandler survivor({8}, false);
    {
        RecordingHandler first({8}, true);
        manager->registerIntentHandler(&first);
        manager->registerIntentHandler(&survivor);
        QVERIFY(manager->requestAction(8));
        QVERIFY(survivor.calls.isEmpty());
    }
    // The first handler is gone: the action falls to the one still alive.
    QVERIFY(!manager->requestAction(8));
    QCOMPARE(survivor.calls.size(), 1);
}

void TestTaldris::actionStatus()
{
    auto *manager = Taldris::HmiIntentManager::instance();
    RecordingHandler handler({11}, true);
    manager->registerIntentHandler(&handler);
    QSignalSpy spy(manager, &Taldris::HmiIntentManager::actionStatusChanged);

    emit handler.actionStatusChanged(11, false);

    QCOMPARE(spy.size(), 1);
    QCOMPARE(spy.first(), (QVariantList{11, false}));
    QVERIFY(manager->isActionEnabled(11));
    QVERIFY(!manager->isActionEnabled(12));
}

void TestTaldris::requestObjectsRunEachTime()
{
    RecordingHandler handler({14, 70}, true);
    Taldris::HmiIntentManager::instance()->registerIntentHandler(&handler);
    QObject sender;
    QObject::connect(&sender, &QObject::objectNameChanged,
                     Taldris::HmiIntentRequest(14, {QStringLiteral("PHONE")}, false, true));
    QObject::connect(&sender, &QObject::objectNameChanged, Taldris::IntentActionRequest(70));
    const qint64 since = Journal::instance()->lastSequence();

    sender.setObjectName(QStringLiteral("first"));
    sender.setObjectName(QStringLiteral("second"));

    const QVariant voiceRequest = intent(14, {QStringLiteral("PHONE")});
    QCOMPARE(intents(since), (QVariantList{voiceRequest, intent(70), voiceRequest, intent(70)}));
    QCOMPARE(handler.calls.size(), 4);
    QVERIFY(Taldris::HmiIntentRequest(70).run());
}

void TestTaldris::intentActionRequestProvider()
{
    auto *provider = new ArgumentProvider;
    const Taldris::IntentActionRequest request(7, provider);
    qint64 since = Journal::instance()->lastSequence();
    request();
    QCOMPARE(intents(since), QVariantList{intent(7, {QStringLiteral("from provider")})});

    delete provider;
    since = Journal::instance()->lastSequence();
    QTest::ignoreMessage(QtWarningMsg, "IntentActionRequest: data provider of action 7 is gone");
    QVERIFY(!request.run());
    QVERIFY(intents(since).isEmpty());
}

void TestTaldris::submoduleProvider_data()
{
    QTest::addColumn<QString>("steps");
    QTest::addColumn<int>("built");
    // "offer", "request", "drop-host" (the host state is destroyed), "drop-submodule".
    QTest::addRow("offered, then requested") << QStringLiteral("offer request") << 1;
    QTest::addRow("requested, then offered") << QStringLiteral("request offer") << 1;
    QTest::addRow("host state gone before the offer")
            << QStringLiteral("request drop-host offer") << 0;
    QTest::addRow("submodule gone before the request")
            << QStringLiteral("offer drop-submodule request") << 0;
}

void TestTaldris::submoduleProvider()
{
    QFETCH(QString, steps);
    QFETCH(int, built);
    static int id = 100; // a fresh id per row: the provider is process-wide
    ++id;
    auto *provider = Taldris::HmiSubmoduleProvider::instance();
    QSignalSpy created(provider, &Taldris::HmiSubmoduleProvider::submoduleCreated);
    auto host = std::make_unique<Quorvel::HmiState>(QStringLiteral("Host"));
    auto submodule = std::make_unique<Submodule>();
    Submodule *offered = submodule.get();
    for (const QString &step : steps.split(QLatin1Char(' '))) {
        if (step == QLatin1String("offer")) {
            provider->registerHostedSubmodule(id, submodule.get());
        } else if (step == QLatin1String("request")) {
            provider->requestSubmodule(id, host.get(), QStringLiteral("TEST"), 2);
        } else if (step == QLatin1String("drop-host")) {
            host.reset();
            QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("is gone")));
        } else {
            submodule.reset();
        }
    }
    QCOMPARE(created.size(), built);
    if (built) {
        QCOMPARE(offered->built, built);
        QVERIFY(host->findChild<Quorvel::HmiState *>(QStringLiteral("Hosted1")));
        QCOMPARE(created.first().at(2).toString(), QStringLiteral("TEST"));
    }
}

void TestTaldris::hardKeyFallBacks_data()
{
    using Call = HardKeyCall;
    QTest::addColumn<Call>("call");
    QTest::addColumn<QString>("name");
    const QList<QPair<Call, const char *>> calls{
            {&Taldris::HardKeyController::processCombinedSeekLeftKey, "processCombinedSeekLeftKey"},
            {&Taldris::HardKeyController::processCombinedSeekRightKey,
             "processCombinedSeekRightKey"},
            {&Taldris::HardKeyController::processSWCSeekDownShortPress,
             "processSWCSeekDownShortPress"},
            {&Taldris::HardKeyController::processSWCSeekUpShortPress, "processSWCSeekUpShortPress"},
            {&Taldris::HardKeyController::processSWCSeekDownLongPress,
             "processSWCSeekDownLongPress"},
            {&Taldris::HardKeyController::processSWCSeekDownLongRelease,
             "processSWCSeekDownLongRelease"},
            {&Taldris::HardKeyController::processSWCSeekUpLongPress, "processSWCSeekUpLongPress"},
            {&Taldris::HardKeyController::processSWCSeekUpLongRelease,
             "processSWCSeekUpLongRelease"}};
    for (const auto &call : calls)
        QTest::newRow(call.second) << call.first << QString::fromLatin1(call.second);
}

void TestTaldris::hardKeyFallBacks()
{
    QFETCH(HardKeyCall, call);
    QFETCH(QString, name);
    const qint64 since = Journal::instance()->lastSequence();
    (Taldris::HardKeyController::instance()->*call)();
    QCOMPARE(TestSupport::journalValues(QStringLiteral("hardkey"), QStringLiteral("call"), since),
             QStringList{name});
}

void TestTaldris::pellumCategoryLevel_data()
{
    QTest::addColumn<int>("level");
    QTest::addColumn<bool>("debug");
    QTest::addColumn<bool>("info");
    QTest::addColumn<bool>("warning");
    QTest::addColumn<bool>("critical");
    QTest::addRow("0 debug") << 0 << true << true << true << true;
    QTest::addRow("1 info") << 1 << false << true << true << true;
    QTest::addRow("2 warning") << 2 << false << false << true << true;
    QTest::addRow("3 critical") << 3 << false << false << false << true;
}

void TestTaldris::pellumCategoryLevel()
{
    QFETCH(int, level);
    const Taldris::PellumCategory category("orvane.test.pellum", level);
    QCOMPARE(QByteArray(category.categoryName()), QByteArray("orvane.test.pellum"));
    QFETCH(bool, debug);
    QCOMPARE(category.isDebugEnabled(), debug);
    QFETCH(bool, info);
    QCOMPARE(category.isInfoEnabled(), info);
    QFETCH(bool, warning);
    QCOMPARE(category.isWarningEnabled(), warning);
    QFETCH(bool, critical);
    QCOMPARE(category.isCriticalEnabled(), critical);
}

QTEST_GUILESS_MAIN(TestTaldris)
#include "tst_taldris.moc"
