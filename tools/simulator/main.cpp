// hmiphone-sim: hosts the phone module's plug-in as a head unit's HMI host does, plays the
// phone's side from a scenario and writes what the HMI would show and what the module asks of
// the phone, on a virtual clock.

#include "invariants.h"
#include "ofonophone.h"
#include "outputwriter.h"
#include "randomsoak.h"
#include "scenarioreader.h"
#include "scenariorunner.h"
#include "scenariostep.h"
#include "simulatedphone.h"
#include "virtualeventdispatcher.h"
#ifdef HMIPHONE_WITH_WINDOW
#include "window/headunitwindow.h"
#endif

#include <host/modulehost.h>
#include <mavrosk/bridge.h>

#include <QCommandLineParser>
#include <QCoreApplication>
#include <QDir>
#include <QElapsedTimer>
#include <QFile>
#include <QFileInfo>
#include <QQmlEngine>
#include <QSocketNotifier>
#include <QTemporaryFile>
#include <QTextStream>

#include <algorithm>
#include <cstdio>
#include <cstring>
#include <iostream>
#include <memory>
#include <string>
#include <unistd.h>

#ifndef HMIPHONE_PLUGIN_FILE
#define HMIPHONE_PLUGIN_FILE ""
#endif

namespace {

const QString ModuleName = QStringLiteral("HmiPhone");
const QString ModuleLogCategory = QStringLiteral("orvane.hmiphone");

enum ExitCode { Passed = 0, ChecksFailed = 1, CannotRun = 2 };

// Installed, the plug-in installed with this program, found relative to it (the installed tree
// may have moved); else the one built with it, beside the program's directory when the build tree
// moved.
QString defaultPluginFile()
{
#ifdef HMIPHONE_INSTALLED_PLUGIN
    const QString installed
            = QDir::cleanPath(QDir(QCoreApplication::applicationDirPath())
                                      .filePath(QStringLiteral(HMIPHONE_INSTALLED_PLUGIN)));
    if (QFileInfo::exists(installed))
        return installed;
#endif
    const QString built = QString::fromUtf8(HMIPHONE_PLUGIN_FILE);
    if (!built.isEmpty() && QFileInfo::exists(built))
        return built;
    const QString besides
            = QDir(QCoreApplication::applicationDirPath())
                      .filePath(QStringLiteral("../plugins/") + QFileInfo(built).fileName());
    return QFileInfo::exists(besides) ? besides : built;
}

int logLevel(const QString &name)
{
    const QStringList levels
            = {QStringLiteral("debug"), QStringLiteral("info"), QStringLiteral("warning"),
               QStringLiteral("critical"), QStringLiteral("none")};
    return levels.indexOf(name);
}

enum class Display { None, Window, Screenshots };

// Read before the application exists: a window needs a GUI application, and on screen the
// platform's own event loop.
Display displayOf(int argc, char *argv[])
{
    Display display = Display::None;
    for (int i = 1; i < argc; ++i) {
        if (std::strcmp(argv[i], "--window") == 0)
            display = Display::Window;
        else if (std::strncmp(argv[i], "--screenshots", 13) == 0)
            display = Display::Screenshots;
    }
    return display;
}

// Read before the application exists too: a real phone's events come in real time, so the
// clock follows it.
bool realPhone(int argc, char *argv[])
{
    for (int i = 1; i < argc; ++i) {
        if (std::strcmp(argv[i], "--phone=ofono") == 0
            || (std::strcmp(argv[i], "--phone") == 0 && i + 1 < argc
                && std::strcmp(argv[i + 1], "ofono") == 0))
            return true;
    }
    return false;
}

void printError(const QString &message)
{
    std::fprintf(stderr, "hmiphone-sim: %s\n", message.toLocal8Bit().constData());
}

#ifdef HMIPHONE_WITH_WINDOW
// While the window's application starts: Qt ends the program when no display can be had; the
// simulator says so and exits as one that cannot run.
void windowStartHandler(QtMsgType type, const QMessageLogContext &, const QString &message)
{
    if (type != QtFatalMsg) {
        std::fprintf(stderr, "%s\n", message.toLocal8Bit().constData());
        return;
    }
    printError(QStringLiteral("--window: no display to show the window on (%1); "
                              "--screenshots needs none")
                       .arg(message.section(QLatin1Char('\n'), 0, 0).trimmed()));
    std::_Exit(CannotRun);
}
#endif

// Plays random steps until one violates an invariant; the scenario so far goes to the file
// asked for, or beside the program's working directory when a violation needs it.
int runSoak(Simulator::ScenarioRunner *runner, Host::ModuleHost *host, quint32 seed, qint64 steps,
            const QString &scenarioFile)
{
    QTemporaryFile temporary;
    QFile named(scenarioFile);
    QFile *file = &named;
    if (scenarioFile.isEmpty()) {
        file = &temporary;
        if (!temporary.open()) {
            printError(QStringLiteral("cannot write a temporary file"));
            return CannotRun;
        }
    } else if (!named.open(QIODevice::WriteOnly | QIODevice::Truncate)) {
        printError(QStringLiteral("cannot write %1: %2").arg(scenarioFile, named.errorString()));
        return CannotRun;
    }

    Simulator::Invariants invariants(host);
    Simulator::RandomSoak soak(runner, &invariants, seed);
    soak.setScenarioFile(file);
    QElapsedTimer elapsed;
    elapsed.start();
    const bool held = soak.run(steps);
    file->flush();
    if (held) {
        std::printf("hmiphone-sim: seed %u: %lld steps, every invariant held (%.1f s)\n", seed,
                    soak.stepsPlayed(), double(elapsed.elapsed()) / 1000.0);
        return Passed;
    }

    QString saved = scenarioFile;
    if (saved.isEmpty()) {
        saved = QStringLiteral("hmiphone-soak-%1.jsonl").arg(seed);
        QFile::remove(saved);
        if (!temporary.copy(saved))
            saved = temporary.fileName();
    }
    printError(QStringLiteral("seed %1, step %2: invariant violated: %3")
                       .arg(seed)
                       .arg(soak.stepsPlayed())
                       .arg(soak.violation()));
    printError(QStringLiteral("the last steps:"));
    for (const QString &step : soak.recentSteps())
        std::fprintf(stderr, "  %s\n", step.toUtf8().constData());
    printError(QStringLiteral("the scenario so far: %1 (replay: hmiphone-sim --check-invariants "
                              "%1)")
                       .arg(saved));
    return ChecksFailed;
}

} // namespace

int main(int argc, char *argv[])
{
    // The same steps give the same run: no hash order may differ between two runs.
    qSetGlobalQHashSeed(0);
    const Display display = displayOf(argc, argv);
    const bool realTime = display == Display::Window || realPhone(argc, argv);
    auto *clock = new Simulator::VirtualEventDispatcher;
    std::unique_ptr<Simulator::VirtualEventDispatcher> realTimeClock;
    if (realTime) {
        // A window on screen runs the platform's event loop, and a real phone's events come when
        // they come: the module's timers run in real time and the clock follows it.
        realTimeClock.reset(clock);
        clock->followRealTime();
    } else {
        QCoreApplication::setEventDispatcher(clock);
    }
#ifdef HMIPHONE_WITH_WINDOW
    const QtMessageHandler handler
            = display == Display::Window ? qInstallMessageHandler(windowStartHandler) : nullptr;
    std::unique_ptr<QCoreApplication> application(
            display == Display::None
                    ? new QCoreApplication(argc, argv)
                    : Simulator::HeadUnitWindow::createApplication(
                            argc, argv,
                            display == Display::Window ? Simulator::HeadUnitWindow::OnScreen
                                                       : Simulator::HeadUnitWindow::OffScreen));
    if (display == Display::Window)
        qInstallMessageHandler(handler);
#else
    std::unique_ptr<QCoreApplication> application(new QCoreApplication(argc, argv));
#endif
    QCoreApplication &app = *application;
    QCoreApplication::setApplicationName(QStringLiteral("hmiphone-sim"));
    QCoreApplication::setApplicationVersion(QStringLiteral(HMIPHONE_VERSION));

    QCommandLineParser parser;
    parser.setApplicationDescription(QStringLiteral(
            "Runs the phone module's plug-in in a simulated HMI host and plays a scenario (JSON "
            "Lines) against it on a virtual clock. Writes, one per line, what the HMI would show "
            "and what the module asks of the phone. Exits 0 when every expectation holds, 1 when "
            "one fails, 2 when it cannot run."));
    const QCommandLineOption helpOption = parser.addHelpOption();
    const QCommandLineOption versionOption = parser.addVersionOption();
    parser.addPositionalArgument(QStringLiteral("scenario"),
                                 QStringLiteral("Scenario file (.jsonl); \"-\" reads stdin."));
    const QCommandLineOption jsonOption(
            QStringLiteral("json"),
            QStringLiteral("Write JSON Lines: each input step, each output, and a closing "
                           "summary."));
    const QCommandLineOption pluginOption(
            QStringLiteral("plugin"),
            QStringLiteral("The module's plug-in file (default: %1).").arg(defaultPluginFile()),
            QStringLiteral("path"), defaultPluginFile());
    const QCommandLineOption phoneOption(
            QStringLiteral("phone"),
            QStringLiteral("Who plays the phone: \"scripted\" (the scenario alone, the default), "
                           "\"simulated\" (a connected phone that answers the module's "
                           "commands and keeps contacts, recent calls and messages) or "
                           "\"ofono\" (a real phone's calls and texts through oFono on D-Bus, "
                           "the simulated phone's lists; time is real)."),
            QStringLiteral("mode"), QStringLiteral("scripted"));
    const QCommandLineOption dbusAddressOption(
            QStringLiteral("dbus-address"),
            QStringLiteral("With --phone ofono: the D-Bus where oFono is (default: the system "
                           "bus)."),
            QStringLiteral("address"));
    const QCommandLineOption modemOption(
            QStringLiteral("modem"),
            QStringLiteral("With --phone ofono: the oFono modem to follow (default: the first "
                           "one powered and online)."),
            QStringLiteral("path"));
    const QCommandLineOption ofonoMappingOption(
            QStringLiteral("ofono-mapping"),
            QStringLiteral("Write the mapping between oFono and the data bridge (Markdown, as "
                           "the README has it) and exit."));
    const QCommandLineOption interactiveOption(
            QStringLiteral("interactive"),
            QStringLiteral("Read steps from standard input, one per line, and write outputs as "
                           "they happen."));
    const QCommandLineOption logOption(
            QStringLiteral("log"),
            QStringLiteral("Lowest level of the log lines written, the module's and the "
                           "platform's: debug, info, warning, critical or none (default: "
                           "debug)."),
            QStringLiteral("level"), QStringLiteral("debug"));
    const QCommandLineOption windowOption(
            QStringLiteral("window"),
            QStringLiteral("Show the head unit in a window: its display, the car's keys and the "
                           "phone's side to press, the trace; play, pause and step through the "
                           "scenario, if one is given. Time runs in real time."));
    const QCommandLineOption screenshotsOption(
            QStringLiteral("screenshots"),
            QStringLiteral("Play the scenario off screen (no display needed) and write a picture "
                           "of the display to the directory after each step that changes it, "
                           "named by the step's line."),
            QStringLiteral("directory"));
    const QCommandLineOption qmlOption(
            QStringLiteral("qml"),
            QStringLiteral("With --window or --screenshots: read the window's QML from this "
                           "folder (a copy of tools/simulator/window/qml, or that folder itself) "
                           "instead of the built-in files; the window (not --screenshots) draws "
                           "itself again whenever a file in it changes."),
            QStringLiteral("folder"));
    const QCommandLineOption langOption(
            QStringLiteral("lang"),
            QStringLiteral("With --window or --screenshots: the language of the window's texts, "
                           "en or de (default: the system's language if the window has it, else "
                           "en)."),
            QStringLiteral("language"));
    const QCommandLineOption randomOption(
            QStringLiteral("random"),
            QStringLiteral("Play random steps from this seed instead of a scenario, checking the "
                           "invariants after every step; exits 1 on the first violation."),
            QStringLiteral("seed"));
    const QCommandLineOption stepsOption(
            QStringLiteral("steps"),
            QStringLiteral("With --random: the number of random steps (default: 10000)."),
            QStringLiteral("count"), QStringLiteral("10000"));
    const QCommandLineOption writeScenarioOption(
            QStringLiteral("write-scenario"),
            QStringLiteral("With --random: write the steps played to this scenario file."),
            QStringLiteral("file"));
    const QCommandLineOption invariantsOption(
            QStringLiteral("check-invariants"),
            QStringLiteral("Check the soak's invariants after every input step once the machine "
                           "runs (scenario, typed and --screenshots steps); exits 1 on the first "
                           "violation."));
    parser.addOptions({jsonOption, pluginOption, phoneOption, dbusAddressOption, modemOption,
                       ofonoMappingOption, interactiveOption, logOption, windowOption,
                       screenshotsOption, qmlOption, langOption, randomOption, stepsOption,
                       writeScenarioOption, invariantsOption});
    // A command line the simulator cannot run exits 2, like any other reason it cannot run.
    if (!parser.parse(QCoreApplication::arguments())) {
        printError(parser.errorText() + QStringLiteral(" (see --help)"));
        return CannotRun;
    }
    // Help and version: Qt's own texts, exit 0.
    if (parser.isSet(helpOption) || parser.isSet(QStringLiteral("help-all"))
        || parser.isSet(versionOption))
        parser.process(app);
    if (parser.isSet(ofonoMappingOption)) {
        std::fputs(Simulator::OfonoPhone::mappingMarkdown().toUtf8().constData(), stdout);
        return Passed;
    }

    const bool interactive = parser.isSet(interactiveOption);
    const bool random = parser.isSet(randomOption);
    const QString phoneMode = parser.value(phoneOption);
    const bool ofono = phoneMode == QLatin1String("ofono");
    const QStringList positional = parser.positionalArguments();
    // Options that would do nothing in the mode chosen are refused, not ignored.
    const QString refused = !random && parser.isSet(stepsOption)
            ? QStringLiteral("--steps goes with --random")
            : !random && parser.isSet(writeScenarioOption)
            ? QStringLiteral("--write-scenario goes with --random")
            : parser.isSet(invariantsOption) && display == Display::Window
            ? QStringLiteral("--check-invariants does not check the steps of --window; "
                             "--screenshots plays a scenario with them")
            : parser.isSet(invariantsOption) && random
            ? QStringLiteral("--random checks the invariants anyway; no --check-invariants")
            : parser.isSet(windowOption) && parser.isSet(screenshotsOption)
            ? QStringLiteral("either --window or --screenshots")
            : parser.isSet(qmlOption) && display == Display::None
            ? QStringLiteral("--qml goes with --window or --screenshots")
            : parser.isSet(langOption) && display == Display::None
            ? QStringLiteral("--lang goes with --window or --screenshots")
            : !ofono && (parser.isSet(dbusAddressOption) || parser.isSet(modemOption))
            ? QStringLiteral("--dbus-address and --modem go with --phone ofono")
            : ofono && (random || display == Display::Screenshots)
            ? QStringLiteral("--phone ofono runs in real time: no --random, no --screenshots")
            : QString();
    if (!refused.isEmpty()) {
        printError(refused);
        return CannotRun;
    }
#ifndef HMIPHONE_WITH_WINDOW
    if (display != Display::None) {
        printError(QStringLiteral("this hmiphone-sim was built without its window "
                                  "(HMIPHONE_BUILD_WINDOW=OFF): no --window, no --screenshots"));
        return CannotRun;
    }
#endif
    if (random ? !positional.isEmpty() || interactive || display != Display::None
               : positional.size() > 1
                        || (positional.isEmpty() && !interactive && display != Display::Window)) {
        printError(QStringLiteral("give one scenario file, or --interactive, or --random SEED"));
        return CannotRun;
    }
    bool seedOk = false;
    bool stepsOk = false;
    const quint32 seed = parser.value(randomOption).toUInt(&seedOk);
    const qint64 randomSteps = parser.value(stepsOption).toLongLong(&stepsOk);
    if (random && (!seedOk || !stepsOk || randomSteps < 0)) {
        printError(QStringLiteral("--random takes a seed from 0 to 4294967295, --steps a count"));
        return CannotRun;
    }
    if (display != Display::None && (interactive || positional.value(0) == QLatin1String("-"))) {
        printError(QStringLiteral("--window and --screenshots read no steps from stdin"));
        return CannotRun;
    }
    const QString qmlFolder = parser.value(qmlOption);
    if (parser.isSet(qmlOption)
        && !QFileInfo::exists(QDir(qmlFolder).filePath(QStringLiteral("Main.qml")))) {
        printError(QStringLiteral("--qml: %1 has no Main.qml").arg(qmlFolder));
        return CannotRun;
    }
#ifdef HMIPHONE_WITH_WINDOW
    if (display != Display::None) {
        QString error;
        if (!Simulator::HeadUnitWindow::installTranslation(parser.value(langOption), &error)) {
            printError(QStringLiteral("--lang: %1").arg(error));
            return CannotRun;
        }
    }
#endif
    if (phoneMode != QLatin1String("scripted") && phoneMode != QLatin1String("simulated")
        && !ofono) {
        printError(QStringLiteral("--phone is scripted, simulated or ofono"));
        return CannotRun;
    }
    // A soak writes only what went wrong: the log lines are not even formatted.
    const int level = logLevel(random && !parser.isSet(logOption) ? QStringLiteral("none")
                                                                  : parser.value(logOption));
    if (level < 0) {
        printError(QStringLiteral("--log is debug, info, warning, critical or none"));
        return CannotRun;
    }

    QByteArray text;
    QString scenarioName
            = display == Display::Window ? QStringLiteral("window") : QStringLiteral("stdin");
    if (!positional.isEmpty() && positional.first() != QLatin1String("-")) {
        scenarioName = positional.first();
        QFile file(scenarioName);
        if (!file.open(QIODevice::ReadOnly)) {
            printError(QStringLiteral("cannot read %1: %2").arg(scenarioName, file.errorString()));
            return CannotRun;
        }
        text = file.readAll();
    } else if (!interactive && !random && display == Display::None) {
        QFile input;
        if (!input.open(stdin, QIODevice::ReadOnly)) {
            printError(QStringLiteral("cannot read stdin"));
            return CannotRun;
        }
        text = input.readAll();
    }
    const QList<Simulator::ScenarioStep> steps = Simulator::ScenarioReader::read(text);

    Simulator::OutputWriter output(clock,
                                   parser.isSet(jsonOption) ? Simulator::OutputWriter::Json
                                                            : Simulator::OutputWriter::Human);
    output.setSilent(random);
    output.captureLog(ModuleLogCategory, level);
    Mavrosk::createAll(); // steps find the sources by their short names

    Host::ModuleHost host;
    const QString pluginFile = parser.value(pluginOption);
    if (!host.load(pluginFile)) {
        printError(host.errorString());
        return CannotRun;
    }
    QQmlEngine engine;

    Simulator::SimulatedPhone *phone = nullptr;
    if (phoneMode == QLatin1String("simulated")) {
        phone = new Simulator::SimulatedPhone(clock, &app);
        phone->connectPhone();
    } else if (ofono) {
        // The simulated phone's lists, a real phone's calls and texts.
        phone = new Simulator::SimulatedPhone(clock, &app,
                                              Simulator::SimulatedPhone::RealPhoneCalls);
        phone->connectPhone();
        auto *realPhone = new Simulator::OfonoPhone(parser.value(dbusAddressOption), phone, &app);
        realPhone->setModem(parser.value(modemOption));
        QObject::connect(realPhone, &Simulator::OfonoPhone::connectionChanged, &output,
                         [&output](bool connected, const QString &what) {
                             output.write(QStringLiteral("phone"),
                                          {{QStringLiteral("connected"), connected},
                                           {QStringLiteral("what"), what}});
                         });
        realPhone->start();
    }

    // The whole scenario is read and checked against the hosted module before any step runs.
    Simulator::ScenarioRunner runner(&host, &engine, ModuleName, &output, clock);
    runner.setWaitsInRealTime(ofono && display == Display::None);
    const QList<Simulator::ScenarioError> errors = runner.prepare(steps);
    if (!runner.setUpError().isEmpty()) {
        printError(QStringLiteral("cannot host the module: %1").arg(runner.setUpError()));
        return CannotRun;
    }
    if (!errors.isEmpty()) {
        for (const Simulator::ScenarioError &error : errors)
            printError(QStringLiteral("%1:%2: %3")
                               .arg(scenarioName)
                               .arg(error.line)
                               .arg(error.message));
        printError(QStringLiteral("%1: %2 of %3 lines cannot run; nothing was run")
                           .arg(scenarioName)
                           .arg(errors.size())
                           .arg(steps.size()));
        return CannotRun;
    }

    if (random)
        return runSoak(&runner, &host, seed, randomSteps, parser.value(writeScenarioOption));

    // Every input step once the machine runs is checked against the invariants, wherever it
    // comes from; after the first violation nothing more is played.
    std::unique_ptr<Simulator::Invariants> invariants;
    if (parser.isSet(invariantsOption))
        invariants = std::make_unique<Simulator::Invariants>(&host);
    QString violation;
    auto play = [&](const Simulator::ScenarioStep &step, const QString &source) {
        if (!violation.isEmpty())
            return false;
        runner.play(step);
        if (invariants && step.isInput() && runner.started())
            violation = invariants->check(runner.controller());
        if (violation.isEmpty())
            return true;
        printError(QStringLiteral("%1:%2: invariant violated: %3")
                           .arg(source)
                           .arg(step.line)
                           .arg(violation));
        return false;
    };

    int pictures = 0;
    if (display != Display::None) {
#ifdef HMIPHONE_WITH_WINDOW
        // Steps of the window's panels are checked as they come, like typed ones.
        auto playChecked = [&](const Simulator::ScenarioStep &step) {
            const QString error = Simulator::ScenarioReader::check(step, runner.controller());
            if (error.isEmpty())
                play(step, scenarioName);
            else
                output.note(QStringLiteral("# %1 cannot run: %2").arg(step.text, error));
        };
        // The window draws the module's screens from the start, unless the scenario starts it.
        if (std::none_of(steps.begin(), steps.end(), [](const Simulator::ScenarioStep &step) {
                return step.kind == Simulator::ScenarioStep::Start;
            }))
            runner.finish();
        Simulator::HeadUnitWindow window(&engine, &output, clock, playChecked,
                                         display == Display::Window
                                                 ? Simulator::HeadUnitWindow::OnScreen
                                                 : Simulator::HeadUnitWindow::OffScreen,
                                         qmlFolder);
        window.setScenario(steps);
        if (display == Display::Window) {
            // A designer edits the folder while the window is up; pictures are taken of it as it
            // is.
            window.watchQmlFolder();
            window.show();
            app.exec();
        } else {
            QString error;
            pictures = window.writeScreenshots(parser.value(screenshotsOption), &error);
            if (pictures < 0) {
                printError(error);
                return CannotRun;
            }
            output.note(QStringLiteral("# %1 pictures in %2")
                                .arg(pictures)
                                .arg(parser.value(screenshotsOption)));
        }
#endif
    } else {
        for (const Simulator::ScenarioStep &step : steps) {
            if (!play(step, scenarioName))
                break;
        }
    }
    int refusedSteps = 0;
    // Typed steps cannot be checked ahead: each is checked as it comes, and one that cannot run is
    // refused on its own. False once nothing more is played.
    auto playTyped = [&](const QByteArray &typed, int line) {
        Simulator::ScenarioStep step = Simulator::ScenarioStep::parse(typed, line);
        const QString error = Simulator::ScenarioReader::check(step, runner.controller());
        if (!error.isEmpty()) {
            printError(QStringLiteral("stdin:%1: %2").arg(line).arg(error));
            ++refusedSteps;
            return true;
        }
        return play(step, QStringLiteral("stdin"));
    };
    if (interactive && violation.isEmpty() && realTime) {
        // A real phone's events come while the tester types: the HMI runs, and the lines are read
        // as they come, in the event loop, up to the end of the input.
        runner.finish();
        QSocketNotifier input(STDIN_FILENO, QSocketNotifier::Read);
        QByteArray pending;
        int line = 0;
        QObject::connect(&input, &QSocketNotifier::activated, &app, [&] {
            // Not read again while a line plays (an advance waits in an event loop of its own).
            input.setEnabled(false);
            char buffer[4096];
            const ssize_t got = ::read(STDIN_FILENO, buffer, sizeof buffer);
            if (got > 0)
                pending.append(buffer, int(got));
            bool more = got > 0;
            for (int end = pending.indexOf('\n'); end >= 0 || (!more && !pending.isEmpty());
                 end = pending.indexOf('\n')) {
                const QByteArray typed = end >= 0 ? pending.left(end) : pending;
                pending.remove(0, end >= 0 ? end + 1 : pending.size());
                if (!playTyped(typed, ++line)) {
                    more = false;
                    break;
                }
            }
            if (more)
                input.setEnabled(true);
            else
                app.quit();
        });
        app.exec();
    } else if (interactive && violation.isEmpty()) {
        std::string typed;
        for (int line = 1; std::getline(std::cin, typed); ++line) {
            if (!playTyped(QByteArray::fromStdString(typed), line))
                break;
        }
    }
    if (violation.isEmpty())
        runner.finish();
    if (!runner.setUpError().isEmpty()) {
        printError(QStringLiteral("cannot host the module: %1").arg(runner.setUpError()));
        return CannotRun;
    }

    // What tools read last: the counts of the run.
    output.record(QStringLiteral("summary"),
                  {{QStringLiteral("checks"), runner.checks()},
                   {QStringLiteral("failures"), runner.failures()},
                   {QStringLiteral("errors"), runner.stepErrors()},
                   {QStringLiteral("refused"), refusedSteps},
                   {QStringLiteral("violations"), violation.isEmpty() ? 0 : 1},
                   {QStringLiteral("pictures"), pictures}});
    if (!violation.isEmpty())
        return ChecksFailed;
    if (runner.failures() > 0 || runner.stepErrors() > 0) {
        QStringList failedLines;
        for (int line : runner.failedLines())
            failedLines.append(QString::number(line));
        QStringList counts;
        if (runner.failures() > 0)
            counts.append(QStringLiteral("%1 of %2 checks failed")
                                  .arg(runner.failures())
                                  .arg(runner.checks()));
        if (runner.stepErrors() > 0)
            counts.append(QStringLiteral("%1 %2 could not be applied")
                                  .arg(runner.stepErrors())
                                  .arg(runner.stepErrors() == 1 ? QStringLiteral("step")
                                                                : QStringLiteral("steps")));
        printError(QStringLiteral("%1: %2 (%3 %4)")
                           .arg(scenarioName, counts.join(QStringLiteral(", ")),
                                failedLines.size() == 1 ? QStringLiteral("line")
                                                        : QStringLiteral("lines"),
                                failedLines.join(QStringLiteral(", "))));
        return ChecksFailed;
    }
    if (refusedSteps > 0)
        return CannotRun;
    output.note(
            QStringLiteral("# %1: %2")
                    .arg(scenarioName,
                         runner.checks() == 0 ? QStringLiteral("no checks")
                                 : runner.checks() == 1
                                 ? QStringLiteral("the one check passed")
                                 : QStringLiteral("all %1 checks passed").arg(runner.checks())));
    return Passed;
}
