// The GUI framework's services: view identifiers, the data store, the status bar, the request
// objects that modules connect to their transitions, the module controller and menu actions.

#include "testsupport.h"

#include <brisken/conditionalshowtransientorpopuprequest.h>
#include <brisken/datastore.h>
#include <brisken/hidetransientrequest.h>
#include <brisken/hmiaction.h>
#include <brisken/showtransientorpopuprequest.h>
#include <brisken/statusbarcontroller.h>
#include <brisken/viewmanager.h>

#include <QRegularExpression>
#include <QSignalSpy>
#include <QTest>

using Brisken::DataStore;
using Brisken::StatusBarController;
using Brisken::ViewManager;
using Platform::Journal;

namespace {

// Made while the library loads, before any application object exists.
const QString loadTimeIdentifier
        = ViewManager::viewIdentifier(QStringLiteral("PHONE"), QStringLiteral("PhoneMenu"));

StatusBarController *sharedStatusBar()
{
    return DataStore::get<StatusBarController>(QStringLiteral("StatusBarController"));
}

// The journal since `since`, as "kind:name-or-id" lines.
QStringList outputs(qint64 since)
{
    QStringList lines;
    for (const Platform::JournalEntry &entry : Journal::instance()->entriesSince(since)) {
        const QVariant what = entry.fields.contains(QStringLiteral("name"))
                ? entry.fields.value(QStringLiteral("name"))
                : entry.fields.value(QStringLiteral("id"));
        lines.append(entry.kind + QLatin1Char(':') + what.toString());
    }
    return lines;
}

} // namespace

class TestBriskenServices : public QObject
{
    Q_OBJECT
private slots:
    void cleanup() { DataStore::reset(); }

    void viewIdentifier();
    void dataStore();
    void statusBar();
    void transientRequests_data();
    void transientRequests();
    void actionEnabledBinding();
};

void TestBriskenServices::viewIdentifier()
{
    QCOMPARE(loadTimeIdentifier, QStringLiteral("PHONE.PhoneMenu"));
    QCOMPARE(ViewManager::viewIdentifier(QStringLiteral("PHONE"), QStringLiteral("PhoneMenu")),
             loadTimeIdentifier);
}

void TestBriskenServices::dataStore()
{
    auto *viewManager = DataStore::get<ViewManager>(QStringLiteral("ViewManager"));
    QVERIFY(viewManager);
    QVERIFY(sharedStatusBar());
    QVERIFY(!DataStore::get(QStringLiteral("NoSuchService")));

    QSignalSpy contextSpy(viewManager, &ViewManager::displayContextChanged);
    viewManager->setDisplayContext(5);
    viewManager->setDisplayContext(5);
    QCOMPARE(viewManager->displayContext(), 5);
    QCOMPARE(contextSpy.size(), 1);

    DataStore::remove(QStringLiteral("StatusBarController"));
    QVERIFY(!sharedStatusBar());
    {
        StatusBarController hostStatusBar;
        DataStore::set(QStringLiteral("StatusBarController"), &hostStatusBar);
        QCOMPARE(sharedStatusBar(), &hostStatusBar);
    }
    // The store does not keep an object the host destroyed.
    QVERIFY(!sharedStatusBar());

    DataStore::reset();
    QCOMPARE(DataStore::get<ViewManager>(QStringLiteral("ViewManager")), viewManager);
    QCOMPARE(viewManager->displayContext(), 0);
    QVERIFY(sharedStatusBar());
}

void TestBriskenServices::statusBar()
{
    StatusBarController *bar = sharedStatusBar();
    QSignalSpy visibleSpy(bar, &StatusBarController::statusBarVisibleChanged);
    QVERIFY(bar->statusBarVisible());
    bar->setStatusBarVisible(true);
    bar->setStatusBarVisible(false);
    QCOMPARE(visibleSpy.size(), 1);
    QCOMPARE(visibleSpy.first().first().toBool(), false);

    const qint64 since = Journal::instance()->lastSequence();
    bar->requestTransientWidget(QStringLiteral("First"), 0);
    bar->requestTransientWidget(QStringLiteral("Second"), 3);
    bar->hideTransientWidget(QStringLiteral("First"));
    QCOMPARE(outputs(since),
             (QStringList{QStringLiteral("transient:First"), QStringLiteral("transient:Second"),
                          QStringLiteral("transient-hide:First")}));
    QCOMPARE(
            TestSupport::journalValues(QStringLiteral("transient"), QStringLiteral("value"), since),
            (QStringList{QStringLiteral("0"), QStringLiteral("3")}));
    QCOMPARE(bar->transientWidgets(), QStringList{QStringLiteral("Second")});
}

void TestBriskenServices::transientRequests_data()
{
    QTest::addColumn<bool>("barVisible");
    QTest::addColumn<bool>("siriActive");
    QTest::addColumn<QStringList>("shown");
    const QStringList transient{QStringLiteral("transient:Activated")};
    QTest::addRow("bar visible, condition met") << true << true << (transient + transient);
    QTest::addRow("bar visible, condition not met") << true << false << transient;
}

void TestBriskenServices::transientRequests()
{
    QFETCH(bool, barVisible);
    QFETCH(bool, siriActive);
    QFETCH(QStringList, shown);
    StatusBarController *bar = sharedStatusBar();
    bar->setStatusBarVisible(barVisible);
    QObject source;
    source.setProperty("siriActive", siriActive);
    QObject trigger;
    const QString transient = QStringLiteral("Activated");
    const QString popup = QStringLiteral("PHONE.ActivatedPopup");
    QObject::connect(&trigger, &QObject::objectNameChanged,
                     Brisken::ShowTransientOrPopupRequest(bar, transient, popup));
    QObject::connect(&trigger, &QObject::objectNameChanged,
                     Brisken::ConditionalShowTransientOrPopupRequest(bar, transient, popup, &source,
                                                                     "siriActive", true));
    const qint64 since = Journal::instance()->lastSequence();

    trigger.setObjectName(QStringLiteral("fire"));
    Brisken::HideTransientRequest(bar, transient)();

    QCOMPARE(outputs(since), shown << QStringLiteral("transient-hide:Activated"));
}

void TestBriskenServices::actionEnabledBinding()
{
    Brisken::HmiAction action(hmiActionNameTr("Phone"), QStringLiteral("settings/icon_phone"), 3);
    action.setTranslationContext(QStringLiteral("Some::Context"));
    QCOMPARE(action.text(), QStringLiteral("Phone"));
    StatusBarController sender;
    QVERIFY(action.enabledBinding(&sender, SIGNAL(statusBarVisibleChanged(bool))));
    QSignalSpy triggered(&action, &Brisken::HmiAction::triggered);

    emit sender.statusBarVisibleChanged(false);
    action.trigger();
    QVERIFY(!action.isEnabled());
    emit sender.statusBarVisibleChanged(true);
    action.trigger();
    QVERIFY(action.isEnabled());
    QCOMPARE(triggered.size(), 1);

    QTest::ignoreMessage(QtWarningMsg, QRegularExpression(QStringLiteral("No such signal")));
    QTest::ignoreMessage(QtCriticalMsg, QRegularExpression(QStringLiteral("cannot bind")));
    QVERIFY(!action.enabledBinding(&sender, SIGNAL(noSuchSignal(bool))));
}

QTEST_GUILESS_MAIN(TestBriskenServices)
#include "tst_brisken_services.moc"
