// The phone's settings pages inside the host's settings module, as the HMI shows them: the
// "Phone" entry of the settings menu, the entry decision, the pages and their popup, back, the
// ringtone preview, disconnection and the phonebook check.

#include "globalhmi.h"
#include "hmiphonecontroller.h"

#include <mavrosk/projectionsource.h>
#include <taldris/hmiintentmanager.h>

using namespace HmiPhone;

namespace {

const QString Limbo = QStringLiteral("PHONE.PhoneSettingsLimbo");

// The view on screen (or the limbo state) and the popups shown, without the phone's prefix.
QString screen()
{
    QStringList words{GlobalHmi::isActive(Limbo)
                              ? QStringLiteral("limbo")
                              : Brisken::ViewController::instance()->activeView()};
    words += Brisken::ViewController::instance()->shownPopups();
    return words.join(QLatin1Char(' ')).remove(QStringLiteral("PHONE."));
}

} // namespace

class TestSettings : public GlobalSuite
{
    Q_OBJECT

protected:
    void setUp() override
    {
        GlobalSuite::setUp();
        Mavrosk::BluetoothSource::instance()->setBridgeValue(QStringLiteral("deviceListCount"), 1);
    }

private slots:
    void settings_data();
    void settings();

private:
    void play(const QString &step);
};

// One step of a row: "x=v" (a Bluetooth value) before the start; "choose" (the settings menu's
// "Phone"), "goto" (the phone's own request), "back", "home", "phone", "intent:N", "status:N" (the
// phonebook status), "dio:0|1" (the projection's display), "disconnect", or an event name to post.
void TestSettings::play(const QString &step)
{
    Host::ModuleHost &host = m_hmi->host();
    const QString value = step.section(QLatin1Char(':'), 1);
    if (step == QLatin1String("choose")) {
        host.openSettings();
        TestSupport::processUntilIdle();
        host.chooseSettingsEntry(QStringLiteral("Phone"));
    } else if (step == QLatin1String("goto")) {
        host.integration()->findChild<HmiPhoneController *>()->gotoPhoneSettings();
    } else if (step == QLatin1String("back")) {
        Brisken::ViewController::instance()->back(1);
    } else if (step == QLatin1String("home")) {
        host.openHome();
    } else if (step == QLatin1String("phone")) {
        host.openModule();
    } else if (step.startsWith(QLatin1String("intent:"))) {
        Taldris::HmiIntentManager::instance()->requestAction(value.toInt(), {});
    } else if (step.startsWith(QLatin1String("status:"))) {
        TestSupport::setBridgeValue(QStringLiteral("phone.phoneBookStatus=") + value);
    } else if (step.startsWith(QLatin1String("dio:"))) {
        emit Mavrosk::ProjectionSource::instance()->projectionDIONotActive(value.toInt());
    } else if (step == QLatin1String("disconnect")) {
        TestSupport::setBridgeValue(QStringLiteral("bluetooth.deviceConnected=false"));
    } else {
        // The settings pages' events by short names; any other word is an event name itself.
        static const QHash<QString, QString> pageEvents{
                {QStringLiteral("contacts"),
                 QStringLiteral("HmiPhone_RequestPhoneManageContactsSettingsPage")},
                {QStringLiteral("delete-all"),
                 QStringLiteral("HmiPhone_RequestPhoneDeleteAllContactsPopup")},
                {QStringLiteral("ringtone"),
                 QStringLiteral("HmiPhone_RequestPhoneRingtoneSettingsPage")},
                {QStringLiteral("messages"),
                 QStringLiteral("HmiPhone_requestPhoneTextMessageNotificationSettingsPage")}};
        Quorvel::StateMachine::instance()->postEvent(
                new Quorvel::HmiEvent(pageEvents.value(step, step)));
    }
    TestSupport::processUntilIdle();
}

void TestSettings::settings_data()
{
    QTest::addColumn<QString>("steps");
    QTest::addColumn<QString>("screen");
    // Intents requested, ringtone previews stopped ("stop"), the phonebook check event posted
    // ("check") and settings-menu entry changes.
    QTest::addColumn<QString>("outputs");
    auto row = [](const char *tag, const char *steps, const char *screen, const char *outputs) {
        QTest::addRow("%s", tag) << QString::fromLatin1(steps) << QString::fromLatin1(screen)
                                 << QString::fromLatin1(outputs);
    };
    // clang-format off
    // Entering: the settings page only with a paired, connected phone and the Bluetooth module up.
    row("paired and connected", "choose", "PhoneSettings", "intent 7()");
    row("no device, module off", "deviceListCount=0 moduleStatus=0 choose", "limbo", "intent 7() intent 14()");
    row("negative device count", "deviceListCount=-1 choose", "limbo", "intent 7() intent 14()");
    row("module off", "deviceListCount=2 moduleStatus=0 deviceConnected=false choose", "limbo", "intent 7() intent 13()");
    row("not connected", "moduleStatus=2 deviceConnected=false choose", "limbo", "intent 7() intent 15()");
    row("the phone's own request", "goto", "PhoneSettings", "intent 7()");
    row("the phone's own request, not connected", "deviceConnected=false goto", "limbo", "intent 7() intent 15()");
    row("entry disabled by a projection", "dio:0 choose", "HOST.Settings", "menu-entry false");
    row("entry enabled again", "dio:0 dio:1 choose", "PhoneSettings", "menu-entry false menu-entry true intent 7()");
    // The pages open only while the settings are active; back returns to the page before.
    row("manage contacts, back", "choose contacts back", "PhoneSettings", "intent 7()");
    row("delete all contacts", "choose contacts delete-all", "PhoneManageContactsSettings PhoneDeleteAllContactsPopup", "intent 7()");
    row("delete all on the settings page: over it", "choose delete-all", "PhoneSettings PhoneDeleteAllContactsPopup", "intent 7()");
    row("message notifications, back", "choose messages back", "PhoneSettings", "intent 7()");
    row("capital Request: no page", "choose HmiPhone_RequestPhoneTextMessageNotificationSettingsPage", "PhoneSettings", "intent 7()");
    row("outside: manage contacts", "contacts", "HOST.Home", "");
    row("outside: delete all", "delete-all", "HOST.Home", "");
    row("outside: ringtone", "ringtone", "HOST.Home", "");
    row("outside: message notifications", "messages", "HOST.Home", "");
    // Whichever way the ringtone page is left, the preview is stopped once.
    row("ringtone: back", "choose ringtone back", "PhoneSettings", "intent 7() stop");
    row("ringtone: another page, back", "choose ringtone messages back", "PhoneRingtoneAboutSettings", "intent 7() stop");
    row("ringtone: home", "choose ringtone home", "HOST.Home", "intent 7() stop");
    row("ringtone: the phone", "choose ringtone phone", "PhoneMenu", "intent 7() stop");
    row("ringtone: intent 7 again", "choose ringtone intent:7", "PhoneSettings", "intent 7() intent 7() stop");
    row("ringtone: intent 68", "choose ringtone intent:68", "PhoneManageContactsSettings", "intent 7() intent 68() stop");
    // Disconnection leaves only the settings page; on another page, back finds no settings page.
    row("disconnected on the settings page", "choose disconnect", "HOST.Settings", "intent 7()");
    row("disconnected on the ringtone page", "choose ringtone disconnect", "PhoneRingtoneAboutSettings", "intent 7()");
    row("disconnected on the ringtone page, back", "choose ringtone disconnect back", "HOST.Settings", "intent 7() stop");
    row("disconnected on manage contacts, back", "choose contacts disconnect back", "HOST.Settings", "intent 7()");
    // Every change of the phonebook status while the settings are active has the phone check it
    // (with no contacts yet and automatic download off, the check asks the driver to download).
    row("phonebook status on the settings page", "choose status:4 status:3 status:3 status:5", "PhoneSettings PhoneBookAutoDownload", "intent 7() intent 67() check intent 67() check intent 67() check");
    row("phonebook status on manage contacts", "choose contacts status:3", "PhoneManageContactsSettings", "intent 7() intent 67() check");
    row("phonebook status in the limbo", "deviceConnected=false choose status:3", "limbo", "intent 7() intent 15() intent 67() check");
    row("phonebook status outside", "status:1 status:3", "HOST.Home", "");
    // clang-format on
}

void TestSettings::settings()
{
    QFETCH(QString, steps);
    QFETCH(QString, screen);
    QFETCH(QString, outputs);
    QStringList played = steps.split(QLatin1Char(' '), Qt::SkipEmptyParts);
    while (!played.isEmpty() && played.first().contains(QLatin1Char('='))) {
        const QString value = played.takeFirst();
        QVERIFY(TestSupport::setBridgeValue(QStringLiteral("bluetooth.") + value));
    }
    QVERIFY(m_hmi->run());
    const qint64 since = GlobalHmi::mark();
    for (const QString &step : qAsConst(played))
        play(step);

    QCOMPARE(::screen(), screen);
    QStringList lines;
    for (const Platform::JournalEntry &entry : Platform::Journal::instance()->entriesSince(since)) {
        const QString call = entry.fields.value(QStringLiteral("call")).toString();
        if (entry.kind == QLatin1String("intent"))
            lines << TestSupport::journalLines(entry.sequence - 1).value(0);
        else if (entry.kind == QLatin1String("menu-entry"))
            lines << QStringLiteral("menu-entry ")
                            + entry.fields.value(QStringLiteral("enabled")).toString();
        else if (call == QLatin1String("phone.stopPlayRingtone"))
            lines << QStringLiteral("stop");
        else if (entry.fields.value(QStringLiteral("name"))
                 == QLatin1String("HmiPhone_PhoneBookStatusCheck"))
            lines << QStringLiteral("check");
    }
    QCOMPARE(lines.join(QLatin1Char(' ')), outputs);
}

QTEST_GUILESS_MAIN(TestSettings)
#include "tst_settings.moc"
