// The phone's settings pages inside the host's settings module: the "Phone" entry of the settings
// menu, the entry decision, the pages and their popup, back, the ringtone preview, disconnection
// and the phonebook check, as the HMI shows them.

#include "globalhmi.h"
#include "hmiphoneevents.h"
#include "hmiphoneviews.h"

#include <brisken/hmiaction.h>
#include <mavrosk/projectionsource.h>
#include <taldris/hmihostedsubmodule.h>
#include <taldris/hmiintentmanager.h>
#include <taldris/hmisubmoduleprovider.h>

using namespace HmiPhone;
using TestSupport::journalLines;
using TestSupport::processUntilIdle;

namespace {

const QString Limbo = QStringLiteral("PHONE.PhoneSettingsLimbo");
const QString Menu = QStringLiteral("HOST.Settings");

// The view on screen and the popups shown, without the phone's prefix.
QString screen()
{
    QStringList words{Brisken::ViewController::instance()->activeView()};
    words += Brisken::ViewController::instance()->shownPopups();
    return words.join(QLatin1Char(' ')).remove(QStringLiteral("PHONE."));
}

int count(const QStringList &lines, const QString &line)
{
    return int(lines.count(line));
}

} // namespace

class TestSettings : public QObject
{
    Q_OBJECT

private slots:
    void init()
    {
        m_hmi = std::make_unique<GlobalHmi>();
        Mavrosk::BluetoothSource::instance()->setBridgeValue(QStringLiteral("deviceListCount"), 1);
    }
    void cleanup()
    {
        m_hmi.reset();
        QCOMPARE(TestSupport::FrameworkWarningGuard::take(), QStringList());
    }

    void entry_data();
    void entry();
    void pages_data();
    void pages();
    void ringtonePreviewStops_data();
    void ringtonePreviewStops();
    void disconnection_data();
    void disconnection();
    void phoneBookStatusCheck_data();
    void phoneBookStatusCheck();
    void settingsEntry();

private:
    Host::ModuleHost &host() { return m_hmi->host(); }
    // The driver opens the settings from the menu bar and chooses "Phone".
    void openPhoneSettings()
    {
        host().openSettings();
        processUntilIdle();
        QVERIFY(host().chooseSettingsEntry(QStringLiteral("Phone")));
        processUntilIdle();
    }
    static void setConnected(bool connected)
    {
        Mavrosk::BluetoothSource::instance()->setBridgeValue(QStringLiteral("deviceConnected"),
                                                             connected);
        processUntilIdle();
    }

    std::unique_ptr<GlobalHmi> m_hmi;
    TestSupport::FrameworkWarningGuard m_guard;
};

void TestSettings::entry_data()
{
    QTest::addColumn<int>("devices");
    QTest::addColumn<int>("moduleStatus");
    QTest::addColumn<bool>("connected");
    QTest::addColumn<QString>("state");
    QTest::addColumn<QString>("handOver");

    // clang-format off
    QTest::addRow("paired and connected") << 1 << 1 << true << "PHONE.PhoneSettings" << "";
    QTest::addRow("no device, module off") << 0 << 0 << true << Limbo << "intent 14()";
    QTest::addRow("no device, not connected") << 0 << 1 << false << Limbo << "intent 14()";
    QTest::addRow("negative device count") << -1 << 1 << true << Limbo << "intent 14()";
    QTest::addRow("module off, connected") << 2 << 0 << true << Limbo << "intent 13()";
    QTest::addRow("module off, not connected") << 2 << 0 << false << Limbo << "intent 13()";
    QTest::addRow("not connected") << 2 << 2 << false << Limbo << "intent 15()";
    // clang-format on
}

// Choosing "Phone" asks for the phone settings; they show only with a paired, connected phone and
// the Bluetooth module up, and otherwise hand over to another module's screen.
void TestSettings::entry()
{
    QFETCH(int, devices);
    QFETCH(int, moduleStatus);
    QFETCH(bool, connected);
    QFETCH(QString, state);
    QFETCH(QString, handOver);
    auto *bluetooth = Mavrosk::BluetoothSource::instance();
    bluetooth->setBridgeValue(QStringLiteral("deviceListCount"), devices);
    bluetooth->setBridgeValue(QStringLiteral("moduleStatus"), moduleStatus);
    bluetooth->setBridgeValue(QStringLiteral("deviceConnected"), connected);
    QVERIFY(m_hmi->run());
    const qint64 since = GlobalHmi::mark();

    openPhoneSettings();

    QVERIFY2(GlobalHmi::isActive(state),
             qPrintable(TestSupport::activeStates().join(QLatin1Char(' '))));
    QStringList intents{QStringLiteral("intent 7()")};
    if (!handOver.isEmpty())
        intents << handOver;
    QCOMPARE(journalLines(since, {QStringLiteral("intent")}), intents);
}

void TestSettings::pages_data()
{
    QTest::addColumn<bool>("inSettings");
    QTest::addColumn<QString>("before"); // an event posted first
    QTest::addColumn<QString>("event");
    QTest::addColumn<QString>("shown");
    QTest::addColumn<QString>("afterBack");

    const QString contacts = Events::HmiPhone_RequestPhoneManageContactsSettingsPage;
    const QString deleteAll = Events::HmiPhone_RequestPhoneDeleteAllContactsPopup;
    const QString ringtone = Events::HmiPhone_RequestPhoneRingtoneSettingsPage;
    const QString messages = Events::HmiPhone_requestPhoneTextMessageNotificationSettingsPage;
    const QString page = QStringLiteral("PhoneSettings");
    // clang-format off
    QTest::addRow("manage contacts") << true << "" << contacts << "PhoneManageContactsSettings" << page;
    QTest::addRow("delete all contacts") << true << contacts << deleteAll << "PhoneManageContactsSettings PhoneDeleteAllContactsPopup" << page;
    QTest::addRow("ringtone") << true << "" << ringtone << "PhoneRingtoneAboutSettings" << page;
    QTest::addRow("message notifications") << true << "" << messages << "PhoneTextMessageNotificationSettings" << page;
    QTest::addRow("ringtone page to message notifications") << true << ringtone << messages << "PhoneTextMessageNotificationSettings" << "PhoneRingtoneAboutSettings";
    QTest::addRow("capital Request: not the page") << true << "" << "HmiPhone_RequestPhoneTextMessageNotificationSettingsPage" << page << Menu;
    QTest::addRow("delete all on the settings page: not shown") << true << "" << deleteAll << page << Menu;
    QTest::addRow("outside: manage contacts") << false << "" << contacts << "HOST.Home" << "";
    QTest::addRow("outside: delete all contacts") << false << "" << deleteAll << "HOST.Home" << "";
    QTest::addRow("outside: ringtone") << false << "" << ringtone << "HOST.Home" << "";
    QTest::addRow("outside: message notifications") << false << "" << messages << "HOST.Home" << "";
    // clang-format on
}

// The page events open their page only while the settings are active; back leaves each page for
// the one before.
void TestSettings::pages()
{
    QFETCH(bool, inSettings);
    QFETCH(QString, before);
    QFETCH(QString, event);
    QFETCH(QString, shown);
    QFETCH(QString, afterBack);
    QVERIFY(m_hmi->run());
    if (inSettings)
        openPhoneSettings();
    if (!before.isEmpty())
        TestSupport::post(before);

    TestSupport::post(event);
    QCOMPARE(screen(), shown);
    if (afterBack.isEmpty())
        return;
    Brisken::ViewController::instance()->back(1);
    processUntilIdle();
    QCOMPARE(screen(), afterBack);
}

void TestSettings::ringtonePreviewStops_data()
{
    QTest::addColumn<QString>("way");
    QTest::addColumn<QString>("landsOn");
    // clang-format off
    QTest::addRow("back") << "back" << "PhoneSettings";
    QTest::addRow("another page") << "page" << "PhoneTextMessageNotificationSettings";
    QTest::addRow("home from the menu bar") << "home" << "HOST.Home";
    QTest::addRow("the phone from the menu bar") << "phone" << "PhoneMenu";
    QTest::addRow("intent 7 again") << "intent 7" << "PhoneSettings";
    QTest::addRow("intent 68") << "intent 68" << "PhoneManageContactsSettings";
    QTest::addRow("the phone disconnects, then back") << "disconnect" << Menu;
    // clang-format on
}

// Whichever way the ringtone page is left, the preview is stopped once.
void TestSettings::ringtonePreviewStops()
{
    QFETCH(QString, way);
    QFETCH(QString, landsOn);
    QVERIFY(m_hmi->run());
    openPhoneSettings();
    TestSupport::post(Events::HmiPhone_RequestPhoneRingtoneSettingsPage);
    const qint64 since = GlobalHmi::mark();

    auto *manager = Taldris::HmiIntentManager::instance();
    if (way == QLatin1String("page"))
        TestSupport::post(Events::HmiPhone_requestPhoneTextMessageNotificationSettingsPage);
    else if (way == QLatin1String("home"))
        host().openHome();
    else if (way == QLatin1String("phone"))
        host().openModule();
    else if (way == QLatin1String("intent 7"))
        manager->requestAction(7, {});
    else if (way == QLatin1String("intent 68"))
        manager->requestAction(68, {});
    else if (way == QLatin1String("disconnect"))
        setConnected(false);
    if (way == QLatin1String("back") || way == QLatin1String("disconnect")) {
        QCOMPARE(screen(), QStringLiteral("PhoneRingtoneAboutSettings"));
        Brisken::ViewController::instance()->back(1);
    }
    processUntilIdle();

    QCOMPARE(screen(), landsOn);
    QCOMPARE(count(TestSupport::bridgeCommandsSince(since),
                   QStringLiteral("phone.stopPlayRingtone()")),
             1);
}

void TestSettings::disconnection_data()
{
    QTest::addColumn<QString>("page"); // the event that opens it; none for "PhoneSettings"
    QTest::addColumn<QString>("afterDisconnection");
    QTest::addColumn<QString>("afterBack");
    // clang-format off
    QTest::addRow("PhoneSettings") << "" << Menu << "";
    QTest::addRow("ringtone") << Events::HmiPhone_RequestPhoneRingtoneSettingsPage << "PhoneRingtoneAboutSettings" << Menu;
    QTest::addRow("manage contacts") << Events::HmiPhone_RequestPhoneManageContactsSettingsPage << "PhoneManageContactsSettings" << Menu;
    // clang-format on
}

// The phone disconnecting leaves the "PhoneSettings" page for the settings menu; on the other
// pages it changes nothing until back, which then finds no phone settings to return to.
void TestSettings::disconnection()
{
    QFETCH(QString, page);
    QFETCH(QString, afterDisconnection);
    QFETCH(QString, afterBack);
    QVERIFY(m_hmi->run());
    openPhoneSettings();
    if (!page.isEmpty())
        TestSupport::post(page);

    setConnected(false);
    QCOMPARE(screen(), afterDisconnection);
    QCOMPARE(GlobalHmi::isActive(Views::PhoneSettingsRoot), afterDisconnection != Menu);
    if (afterBack.isEmpty())
        return;
    Brisken::ViewController::instance()->back(1);
    processUntilIdle();
    QCOMPARE(screen(), afterBack);
}

void TestSettings::phoneBookStatusCheck_data()
{
    QTest::addColumn<bool>("connected");
    QTest::addColumn<QString>("page");
    QTest::addColumn<int>("checks");
    // clang-format off
    QTest::addRow("PhoneSettings") << true << "" << 3;
    QTest::addRow("manage contacts") << true << Events::HmiPhone_RequestPhoneManageContactsSettingsPage << 3;
    QTest::addRow("ringtone") << true << Events::HmiPhone_RequestPhoneRingtoneSettingsPage << 3;
    QTest::addRow("limbo") << false << "" << 3;
    QTest::addRow("outside the settings") << true << "outside" << 0;
    // clang-format on
}

// Every change of the phonebook status while the settings are active asks for the phonebook
// check (intent action 67), whatever the new value; an unchanged value asks nothing.
void TestSettings::phoneBookStatusCheck()
{
    QFETCH(bool, connected);
    QFETCH(QString, page);
    QFETCH(int, checks);
    Mavrosk::BluetoothSource::instance()->setBridgeValue(QStringLiteral("deviceConnected"),
                                                         connected);
    QVERIFY(m_hmi->run());
    if (page != QLatin1String("outside"))
        openPhoneSettings();
    if (!page.isEmpty() && page != QLatin1String("outside"))
        TestSupport::post(page);
    const qint64 since = GlobalHmi::mark();

    for (int status : {1, 3, 3, 0}) {
        GlobalHmi::phone()->setBridgeValue(QStringLiteral("phoneBookStatus"), status);
        processUntilIdle();
    }
    QCOMPARE(count(journalLines(since, {QStringLiteral("intent")}), QStringLiteral("intent 67()")),
             checks);
}

// The phone offers its settings as hosted submodule 3 once its screens are built; the settings
// menu lists its "Phone" entry, enabled while no projection holds the display.
void TestSettings::settingsEntry()
{
    auto *provider = Taldris::HmiSubmoduleProvider::instance();
    QVERIFY(!provider->hostedSubmodule(3));
    QVERIFY(m_hmi->run());
    Taldris::HmiHostedSubmodule *submodule = provider->hostedSubmodule(3);
    QVERIFY(submodule);
    QCOMPARE(submodule->moduleIdentifier(), QStringLiteral("PHONE"));
    QCOMPARE(submodule->submoduleName(), QStringLiteral("Phone settings submodule."));
    QCOMPARE(submodule->viewDescriptorFile(),
             QStringLiteral("plugins/hmiphone/settings-view-descriptor.json"));

    const QList<Brisken::HmiAction *> entries = host().settingsEntries();
    QCOMPARE(entries.size(), 1);
    Brisken::HmiAction *entry = entries.first();
    QCOMPARE(entry->text(), QStringLiteral("Phone"));
    QCOMPARE(entry->iconPath(), QStringLiteral("settings/icon_phone"));
    QCOMPARE(entry->actionType(), 3);
    QCOMPARE(entry->translationContext(),
             QStringLiteral("HmiPhone::HmiPhoneSettingsHostedSubmodule"));
    QCOMPARE(entry->parent(), submodule);

    // The menu is listed when offered and again on every change of the entry's enabled state.
    QCOMPARE(TestSupport::journalValues(QStringLiteral("menu-entry"), QStringLiteral("enabled")),
             QStringList{QStringLiteral("true")});
    auto *projection = Mavrosk::ProjectionSource::instance();
    const qint64 since = GlobalHmi::mark();
    emit projection->projectionDIONotActive(false);
    QVERIFY(host().chooseSettingsEntry(QStringLiteral("Phone")));
    processUntilIdle();
    emit projection->projectionDIONotActive(true);
    QVERIFY(host().chooseSettingsEntry(QStringLiteral("Phone")));
    processUntilIdle();
    QCOMPARE(TestSupport::journalValues(QStringLiteral("menu-entry"), QStringLiteral("enabled"),
                                        since),
             (QStringList{QStringLiteral("false"), QStringLiteral("true")}));
    QCOMPARE(journalLines(since, {QStringLiteral("intent")}),
             QStringList{QStringLiteral("intent 7()")});
    QVERIFY(!host().chooseSettingsEntry(QStringLiteral("Media")));
    // Every call makes a new entry.
    QVERIFY(submodule->subModuleEntryAction() != entry);
}

QTEST_GUILESS_MAIN(TestSettings)
#include "tst_settings.moc"
