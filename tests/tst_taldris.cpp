// The module framework: intents and their request objects, hosted submodules,
// hard-key fall-backs and logging categories.

#include "testsupport.h"

#include <quorvel/hmistate.h>
#include <taldris/hardkeycontroller.h>
#include <taldris/hmihostedsubmodule.h>
#include <taldris/hmiintenthandler.h>
#include <taldris/hmiintentmanager.h>
#include <taldris/hmiintentrequest.h>
#include <taldris/hmisubmoduleprovider.h>
#include <taldris/intentactionrequest.h>
#include <taldris/pellumcategory.h>

#include <QRegularExpression>
#include <QSignalSpy>
#include <QTest>

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

QStringList intents(qint64 since)
{
    return TestSupport::journalLines(since, {QStringLiteral("intent")});
}

} // namespace

class TestTaldris : public TestSupport::Suite
{
    Q_OBJECT
private slots:
    void requestAction_data()
    {
        QTest::addColumn<int>("action");
        QTest::addColumn<bool>("answer");
        QTest::addColumn<bool>("result");
        QTest::addRow("offered, carried out") << 5 << true << true;
        QTest::addRow("offered, refused") << 6 << false << false;
        QTest::addRow("not offered") << 99 << true << false;
    }

    void requestAction()
    {
        QFETCH(int, action);
        QFETCH(bool, answer);
        QFETCH(bool, result);
        RecordingHandler handler({5, 6}, answer);
        auto *manager = Taldris::HmiIntentManager::instance();
        manager->registerIntentHandler(&handler);
        QSignalSpy status(manager, &Taldris::HmiIntentManager::actionStatusChanged);
        const qint64 since = TestSupport::mark();
        const QVariantList args{QStringLiteral("0123"), 7};

        QCOMPARE(manager->requestAction(action, args, true, false, QStringLiteral("extra")),
                 result);
        const QVariantList call{action, args, true, QStringLiteral("extra")};
        QCOMPARE(handler.calls, action == 99 ? QVariantList() : QVariantList{QVariant(call)});
        QCOMPARE(intents(since),
                 QStringList{QStringLiteral("intent %1(0123,7) flag extra=extra").arg(action)});

        // A handler's status change reaches the manager's listeners.
        emit handler.actionStatusChanged(5, false);
        QCOMPARE(status.size(), 1);
        QCOMPARE(status.first(), (QVariantList{5, false}));
        QVERIFY(manager->isActionEnabled(5));
        QVERIFY(!manager->isActionEnabled(12));
    }

    void destroyedHandlerIsNeverCalled()
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

    // Built once, a request object runs each time its signal fires; one whose data provider is gone
    // refuses to run.
    void requestObjects()
    {
        RecordingHandler handler({14, 70}, true);
        Taldris::HmiIntentManager::instance()->registerIntentHandler(&handler);
        auto *provider = new ArgumentProvider;
        const Taldris::IntentActionRequest withProvider(7, provider);
        QObject sender;
        QObject::connect(&sender, &QObject::objectNameChanged,
                         Taldris::HmiIntentRequest(14, {QStringLiteral("PHONE")}, false, true));
        QObject::connect(&sender, &QObject::objectNameChanged, Taldris::IntentActionRequest(70));
        qint64 since = TestSupport::mark();

        sender.setObjectName(QStringLiteral("first"));
        sender.setObjectName(QStringLiteral("second"));
        withProvider();

        const QStringList twice{QStringLiteral("intent 14(PHONE) voice"),
                                QStringLiteral("intent 70()")};
        QCOMPARE(intents(since),
                 twice + twice + QStringList{QStringLiteral("intent 7(from provider)")});
        QCOMPARE(handler.calls.size(), 4);
        QVERIFY(Taldris::HmiIntentRequest(70).run());

        delete provider;
        since = TestSupport::mark();
        expectMessage(QtWarningMsg, "IntentActionRequest: data provider of action 7 is gone");
        QVERIFY(!withProvider.run());
        QVERIFY(intents(since).isEmpty());
    }

    void submoduleProvider_data()
    {
        QTest::addColumn<QString>("steps");
        QTest::addColumn<int>("built");
        // "offer", "request", "drop-host" (the host state is destroyed), "drop-submodule".
        // clang-format off
        QTest::addRow("offered, then requested") << QStringLiteral("offer request") << 1;
        QTest::addRow("requested, then offered") << QStringLiteral("request offer") << 1;
        QTest::addRow("host state gone before the offer") << QStringLiteral("request drop-host offer") << 0;
        QTest::addRow("submodule gone before the request") << QStringLiteral("offer drop-submodule request") << 0;
        // clang-format on
    }

    void submoduleProvider()
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
                expectMessage(QtWarningMsg, QRegularExpression(QStringLiteral("is gone")));
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

    // Keys the module does not handle fall back to the host, each by its own call.
    void hardKeyFallBacks()
    {
        using Keys = Taldris::HardKeyController;
        Keys *keys = Keys::instance();
        for (auto call : {&Keys::processCombinedSeekLeftKey, &Keys::processCombinedSeekRightKey,
                          &Keys::processSWCSeekDownShortPress, &Keys::processSWCSeekUpShortPress,
                          &Keys::processSWCSeekDownLongPress, &Keys::processSWCSeekDownLongRelease,
                          &Keys::processSWCSeekUpLongPress, &Keys::processSWCSeekUpLongRelease})
            (keys->*call)();
        QCOMPARE(TestSupport::journalValues(QStringLiteral("hardkey"), QStringLiteral("call"))
                         .join(QLatin1Char(' ')),
                 QStringLiteral("processCombinedSeekLeftKey processCombinedSeekRightKey "
                                "processSWCSeekDownShortPress processSWCSeekUpShortPress "
                                "processSWCSeekDownLongPress processSWCSeekDownLongRelease "
                                "processSWCSeekUpLongPress processSWCSeekUpLongRelease"));
    }

    void pellumCategoryLevel_data()
    {
        QTest::addColumn<int>("level");
        QTest::addColumn<QString>("enabled"); // debug, info, warning, critical
        QTest::addRow("0 debug") << 0 << "1111";
        QTest::addRow("1 info") << 1 << "0111";
        QTest::addRow("2 warning") << 2 << "0011";
        QTest::addRow("3 critical") << 3 << "0001";
    }

    void pellumCategoryLevel()
    {
        QFETCH(int, level);
        QFETCH(QString, enabled);
        const Taldris::PellumCategory category("orvane.test.pellum", level);
        QCOMPARE(QByteArray(category.categoryName()), QByteArray("orvane.test.pellum"));
        const bool actual[] = {category.isDebugEnabled(), category.isInfoEnabled(),
                               category.isWarningEnabled(), category.isCriticalEnabled()};
        QString flags;
        for (bool on : actual)
            flags += QLatin1Char(on ? '1' : '0');
        QCOMPARE(flags, enabled);
    }
};

QTEST_GUILESS_MAIN(TestTaldris)
#include "tst_taldris.moc"
