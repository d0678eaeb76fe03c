// The simulator as a tester runs it: a scenario file in, the trace, the closing line and the exit
// code out. A scenario is read and checked whole before anything runs.

#include "testsupport.h"

#include <carkeys.h>

#include <QJsonDocument>
#include <QJsonObject>
#include <QProcess>
#include <QTemporaryDir>
#include <QtTest>

#include <iterator>

class SimulatorTest : public TestSupport::Suite
{
    Q_OBJECT
private slots:
    void scenarioFile_data();
    void scenarioFile();
    void carKeysInReadme();

private:
    QTemporaryDir m_dir;
};

void SimulatorTest::scenarioFile_data()
{
    QTest::addColumn<QStringList>("options"); // before the scenario file, if there is one
    QTest::addColumn<QByteArray>("scenario"); // empty: no file
    QTest::addColumn<QByteArray>("input"); // standard input
    QTest::addColumn<int>("exitCode");
    QTest::addColumn<QString>("message"); // stdout or stderr contains it
    QTest::addColumn<QString>("platform"); // Qt's platform plug-in (minimal leaves nothing behind)
    const auto row = [](const char *tag, const QStringList &options, const QByteArray &scenario,
                        const QByteArray &input, int exitCode, const QString &message,
                        const QString &platform = QStringLiteral("minimal")) {
        QTest::newRow(tag) << options << scenario << input << exitCode << message << platform;
    };

    // Refused before anything runs: exit 2, the line named. Line 1 of each scenario is a valid
    // step that would show a view if it ran.
    const QByteArray open = "{\"open\": \"phone\"}\n";
    const struct
    {
        const char *tag;
        QByteArray line;
        const char *message;
    } refused[] = {
            {"not JSON", "{\"open\": ", ":2: not JSON"},
            {"not an object", "[1, 2]", ":2: a step is a JSON object"},
            {"unknown step", "{\"jump\": 1}", ":2: unknown step"},
            {"two steps in one", "{\"back\": 1, \"advance\": 5}", ":2: a step names one thing"},
            {"unknown field", "{\"back\": 1, \"times\": 2}",
             ":2: \"back\" takes no field \"times\""},
            {"back as a string", "{\"back\": \"x\"}", ":2: \"back\" must be a number"},
            {"back of zero", "{\"back\": 0}", ":2: \"back\" must be from 1 to 1000"},
            {"start as a string", "{\"start\": \"yes\"}", ":2: \"start\" must be true or false"},
            {"key not whole", "{\"key\": 7.6, \"kind\": 1}", ":2: \"key\" must be a whole number"},
            {"key without kind", "{\"key\": 12}", ":2: \"key\" needs a \"kind\""},
            {"intent out of range", "{\"intent\": 1e12}", ":2: \"intent\" must be from"},
            {"args not an array", "{\"call\": \"endCall\", \"args\": 1}",
             ":2: \"args\" must be an array"},
            {"advance past a year", "{\"advance\": 9.2e18}",
             ":2: \"advance\" must be from 0 to 31536000000"},
            {"advance of 1e300", "{\"advance\": 1e300}", ":2: \"advance\" must be from 0"},
            {"advance negative", "{\"advance\": -1}", ":2: \"advance\" must be from 0"},
            {"open elsewhere", "{\"open\": \"radio\"}",
             ":2: the menu bar opens phone, home, settings or settings/<entry>"},
            {"NUL byte", QByteArray("{\"back\": 1}\0 {\"back\": 1}", 25),
             ":2: a NUL byte at column 12"},
            {"invalid UTF-8", "{\"post\": \"\xff\xfe\"}", ":2: not UTF-8 text"},
            {"int property given a string", "{\"set\": \"phone.status\", \"value\": \"7\"}",
             ":2: phone.status: must be a whole number"},
            {"int property given a fraction", "{\"set\": \"phone.status\", \"value\": 7.5}",
             ":2: phone.status: must be a whole number"},
            {"int property out of range", "{\"set\": \"phone.status\", \"value\": 2147483648}",
             ":2: phone.status: must be a whole number"},
            {"bool property given a number", "{\"set\": \"phone.incomingCall\", \"value\": 1}",
             ":2: phone.incomingCall: must be true or false"},
            {"unknown source", "{\"set\": \"radio.band\", \"value\": 1}",
             ":2: unknown value radio.band"},
            {"unknown property", "{\"set\": \"phone.colour\", \"value\": 1}",
             ":2: phone has no property colour"},
            {"read-only controller property",
             "{\"set\": \"controller.isEmptyNumber\", \"value\": true}",
             ":2: controller.isEmptyNumber cannot be written"},
            {"unknown host setting", "{\"set\": \"host.volume\", \"value\": 1}",
             ":2: unknown host setting volume"},
            {"status bar chosen late", "{\"set\": \"host.statusBar\", \"value\": false}",
             ":2: host.statusBar is chosen before the module runs"},
            {"unknown signal", "{\"emit\": \"phone.ringing\"}", ":2: phone has no signal ringing"},
            {"signal argument of a wrong type",
             "{\"emit\": \"key.keyEvent\", \"args\": [12, \"short\"]}",
             ":2: argument 2 of key.keyEvent: must be a whole number"},
            {"unknown slot", "{\"call\": \"answer\"}", ":2: the controller has no slot answer"},
            {"slot hidden from QML", "{\"call\": \"deleteLater\"}",
             ":2: QML cannot call deleteLater"},
            {"unknown key", "{\"key\": 13, \"kind\": 2}", ":2: key 13 is none of the car's keys"},
            {"unknown key kind", "{\"key\": 12, \"kind\": 5}",
             ":2: kind 5 is no kind of key event"},
            {"slot with too many arguments", "{\"call\": \"endCall\", \"args\": [1]}",
             ":2: slot endCall takes no 1 argument(s)"},
            {"answer by an unknown slot", "{\"answer\": \"PHONE.BatteryLow\", \"call\": \"ok\"}",
             ":2: the controller has no slot ok"},
            {"unknown model", "{\"model\": \"phone.recentCalls\", \"length\": 3}",
             ":2: unknown list model phone.recentCalls"},
            {"row that is no object", "{\"model\": \"phone.phoneBook\", \"rows\": [1]}",
             ":2: every row of \"rows\" is an object"},
            {"unknown check", "{\"expect\": {\"screen\": \"PhoneMenu\"}}",
             ":2: unknown check \"screen\""},
            {"unknown value checked", "{\"expect\": {\"phone.colour\": 1}}",
             ":2: phone has no property colour"},
            {"empty expectation", "{\"expect\": {}}", ":2: an expectation is a non-empty object"},
    };
    for (const auto &refusal : refused)
        row(refusal.tag, {}, open + refusal.line + "\n", {}, 2, QString::fromUtf8(refusal.message));
    row("every bad line named", {},
        "{\"back\": \"x\"}\n{\"open\": \"phone\"}\n{\"key\": 1.5, \"kind\": 1}\n", {}, 2,
        QStringLiteral("2 of 3 lines cannot run; nothing was run"));

    // Run: the closing line counts checks and failures; in JSON a summary record ends the run.
    row("all checks pass", {}, "{\"expect\": {\"view\": \"HOST.Home\", \"phone.status\": 0}}\n", {},
        0, QStringLiteral(": all 2 checks passed"));
    row("one of three checks fails", {},
        "{\"expect\": {\"view\": \"HOST.Home\", \"phone.status\": 0}}\n"
        "{\"expect\": {\"view\": \"PhoneMenu\"}}\n",
        {}, 1, QStringLiteral(": 1 of 3 checks failed (line 2)"));
    row("summary of a failed run", {QStringLiteral("--json")},
        "{\"open\": \"phone\"}\n{\"expect\": {\"view\": \"PhoneMenu\"}}\n", {}, 1,
        QStringLiteral("\"out\":\"step\",\"line\":1,"));
    row("an answer to a popup that is not open", {}, "{\"answer\": \"PHONE.RoamingWarning\"}\n", {},
        1, QStringLiteral(": 1 step could not be applied (line 1)"));
    row("a year at a time, twice", {},
        "{\"advance\": 31536000000}\n{\"advance\": 31536000000}\n"
        "{\"expect\": {\"view\": \"PhoneMenu\"}}\n",
        {}, 1, QStringLiteral("63072000.000  check"));
    // A call is made as QML makes it: the engine converts the string to the slot's int.
    row("a call converted by QML", {},
        "{\"call\": \"viewTextMessageOptions\", \"args\": [\"2\"]}\n"
        "{\"expect\": {\"out\": \"event\", \"name\": \"HmiPhoneSms_ViewTextMessageOptions\", "
        "\"value\": 2}}\n",
        {}, 0, QStringLiteral("the one check passed"));

    // Invariants hold from the start of the machine on: the set-up before it is not judged.
    const QByteArray setUp = "{\"set\": \"bluetooth.deviceConnected\", \"value\": true}\n"
                             "{\"set\": \"phone.status\", \"value\": 7}\n{\"start\": true}\n"
                             "{\"expect\": {\"phone.status\": 7}}\n";
    const QStringList invariants{QStringLiteral("--check-invariants")};
    row("invariants after the set-up", invariants, setUp, {}, 0,
        QStringLiteral("the one check passed"));
    row("invariants of typed steps", invariants + QStringList{QStringLiteral("--interactive")},
        setUp, "{\"call\": \"endCall\"}\n{\"set\": \"phone.status\", \"value\": 0}\n", 0,
        QStringLiteral("> {\"set\": \"phone.status\", \"value\": 0}"));

    // The command line: 2 for what cannot run, options that would do nothing refused.
    row("unknown option", {QStringLiteral("--frobnicate")}, open, {}, 2,
        QStringLiteral("Unknown option 'frobnicate'"));
    row("version", {QStringLiteral("--version")}, {}, {}, 0,
        QStringLiteral("hmiphone-sim " HMIPHONE_VERSION "\n"));
    row("steps without random", {QStringLiteral("--steps"), QStringLiteral("5")}, open, {}, 2,
        QStringLiteral("--steps goes with --random"));
    row("write-scenario without random", {QStringLiteral("--write-scenario"), QStringLiteral("x")},
        open, {}, 2, QStringLiteral("--write-scenario goes with --random"));
    row("invariants in the window", invariants + QStringList{QStringLiteral("--window")}, open, {},
        2, QStringLiteral("--check-invariants does not check the steps of --window"));
    row("invariants in a soak",
        invariants + QStringList{QStringLiteral("--random"), QStringLiteral("1")}, {}, {}, 2,
        QStringLiteral("--random checks the invariants anyway"));
    row("modem without oFono", {QStringLiteral("--modem"), QStringLiteral("/hfp/phone")}, open, {},
        2, QStringLiteral("--dbus-address and --modem go with --phone ofono"));
    row("oFono in a soak",
        {QStringLiteral("--phone"), QStringLiteral("ofono"), QStringLiteral("--random"),
         QStringLiteral("1")},
        {}, {}, 2, QStringLiteral("--phone ofono runs in real time"));
    // Without a display (no X server, the offscreen platform not chosen) or without the window
    // built in, --window says so and exits 2 instead of aborting.
    row("window without a display", {QStringLiteral("--window")}, {}, {}, 2,
        QStringLiteral("--window"), QStringLiteral("xcb"));
}

void SimulatorTest::scenarioFile()
{
    QFETCH(QStringList, options);
    QFETCH(QByteArray, scenario);
    QFETCH(QByteArray, input);
    QFETCH(int, exitCode);
    QFETCH(QString, message);
    QFETCH(QString, platform);

    QVERIFY(m_dir.isValid());
    QStringList arguments = QStringList{QStringLiteral("--log"), QStringLiteral("none")} + options;
    if (!scenario.isEmpty()) {
        const QString path = m_dir.filePath(QStringLiteral("scenario.jsonl"));
        QFile file(path);
        QVERIFY(file.open(QIODevice::WriteOnly | QIODevice::Truncate));
        file.write(scenario);
        file.close();
        arguments.append(path);
    }

    QProcess simulator;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.remove(QStringLiteral("DISPLAY"));
    environment.remove(QStringLiteral("WAYLAND_DISPLAY"));
    environment.insert(QStringLiteral("QT_QPA_PLATFORM"), platform);
    simulator.setProcessEnvironment(environment);
    simulator.start(QStringLiteral(HMIPHONE_SIM_FILE), arguments);
    QVERIFY(simulator.waitForStarted());
    simulator.write(input);
    simulator.closeWriteChannel();
    QVERIFY(simulator.waitForFinished(30000));
    const QString out = QString::fromUtf8(simulator.readAllStandardOutput());
    const QString err = QString::fromUtf8(simulator.readAllStandardError());
    QVERIFY2(simulator.exitStatus() == QProcess::NormalExit, qPrintable(out + err));
    QVERIFY2(simulator.exitCode() == exitCode, qPrintable(out + err));
    QVERIFY2((out + err).contains(message), qPrintable(out + err));
    if (exitCode == 2)
        QVERIFY2(!out.contains(QLatin1String(" view ")), qPrintable(out));
    // In JSON the last line is the run's summary, with the counts that set the exit code.
    if (options.contains(QLatin1String("--json")) && exitCode != 2) {
        const QJsonObject summary
                = QJsonDocument::fromJson(out.trimmed().section(QLatin1Char('\n'), -1).toUtf8())
                          .object();
        QCOMPARE(summary.value(QLatin1String("out")).toString(), QStringLiteral("summary"));
        QCOMPARE(summary.value(QLatin1String("failures")).toInt() > 0, exitCode == 1);
    }
}

// The README lists the keys that the reader accepts and the window shows: the same table.
void SimulatorTest::carKeysInReadme()
{
    QFile readme(QStringLiteral(HMIPHONE_README_FILE));
    QVERIFY(readme.open(QIODevice::ReadOnly | QIODevice::Text));
    const QString text = QString::fromUtf8(readme.readAll());
    const QString table = text.section(QStringLiteral("<!-- car-keys -->\n"), 1)
                                  .section(QStringLiteral("\n\n"), 0, 0);
    QStringList listed;
    const QStringList lines = table.split(QLatin1Char('\n')).mid(2);
    for (const QString &line : lines)
        listed.append(line.section(QLatin1Char('|'), 1, 2).simplified());
    QStringList known;
    for (const Simulator::CarKey &key : Simulator::CarKeys)
        known.append(QStringLiteral("%1 | %2").arg(key.code).arg(QLatin1String(key.meaning)));
    QCOMPARE(listed, known);

    QStringList kinds;
    for (int i = 0; i < int(std::size(Simulator::KeyKinds)); ++i)
        kinds.append(QStringLiteral("%1 %2").arg(i + 1).arg(QLatin1String(Simulator::KeyKinds[i])));
    QVERIFY(text.contains(QStringLiteral("Kinds: %1.").arg(kinds.join(QStringLiteral(", ")))));
}

QTEST_GUILESS_MAIN(SimulatorTest)
#include "tst_simulator.moc"
