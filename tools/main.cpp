// hmiphone-sim: hosts the phone module's plug-in as a head unit's HMI host does, plays the
// phone's side from a scenario and writes what the HMI would show and what the module asks of
// the phone, on a virtual clock.

#include "outputwriter.h"
#include "scenarioreader.h"
#include "scenariorunner.h"
#include "scenariostep.h"
#include "simulatedphone.h"
#include "virtualeventdispatcher.h"

#include <host/modulehost.h>
#include <mavrosk/bridge.h>

#include <QCommandLineParser>
#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QQmlEngine>
#include <QTextStream>

#include <cstdio>
#include <iostream>
#include <string>

#ifndef HMIPHONE_PLUGIN_FILE
#define HMIPHONE_PLUGIN_FILE ""
#endif

namespace {

const QString ModuleName = QStringLiteral("HmiPhone");
const QString ModuleLogCategory = QStringLiteral("orvane.hmiphone");

enum ExitCode { Passed = 0, ChecksFailed = 1, CannotRun = 2 };

// The plug-in built with this program; beside the program's directory when the build tree moved.
QString defaultPluginFile()
{
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

// Makes every source of the data bridge, so that steps find them by their short names.
void createBridge()
{
    Mavrosk::PhoneSource::instance();
    Mavrosk::EAPhoneSource::instance();
    Mavrosk::BluetoothSource::instance();
    Mavrosk::ProjectionSource::instance();
    Mavrosk::SpeechSource::instance();
    Mavrosk::KeySource::instance();
    Mavrosk::NavSource::instance();
    Mavrosk::GlobalSource::instance();
    Mavrosk::ArdelSource::instance();
}

void printError(const QString &message)
{
    std::fprintf(stderr, "hmiphone-sim: %s\n", message.toLocal8Bit().constData());
}

} // namespace

int main(int argc, char *argv[])
{
    auto *clock = new Simulator::VirtualEventDispatcher;
    QCoreApplication::setEventDispatcher(clock);
    QCoreApplication app(argc, argv);
    QCoreApplication::setApplicationName(QStringLiteral("hmiphone-sim"));

    QCommandLineParser parser;
    parser.setApplicationDescription(QStringLiteral(
            "Runs the phone module's plug-in in a simulated HMI host and plays a scenario (JSON "
            "Lines) against it on a virtual clock. Writes, one per line, what the HMI would show "
            "and what the module asks of the phone; exits 1 when an expectation fails."));
    parser.addHelpOption();
    parser.addPositionalArgument(QStringLiteral("scenario"),
                                 QStringLiteral("Scenario file (.jsonl); \"-\" reads stdin."));
    const QCommandLineOption jsonOption(QStringLiteral("json"),
                                        QStringLiteral("Write outputs as JSON Lines."));
    const QCommandLineOption pluginOption(
            QStringLiteral("plugin"),
            QStringLiteral("The module's plug-in file (default: %1).").arg(defaultPluginFile()),
            QStringLiteral("path"), defaultPluginFile());
    const QCommandLineOption phoneOption(
            QStringLiteral("phone"),
            QStringLiteral("Who plays the phone: \"scripted\" (the scenario alone, the default) "
                           "or \"simulated\" (a connected phone that answers the module's "
                           "commands)."),
            QStringLiteral("mode"), QStringLiteral("scripted"));
    const QCommandLineOption interactiveOption(
            QStringLiteral("interactive"),
            QStringLiteral("Read steps from standard input, one per line, and write outputs as "
                           "they happen."));
    const QCommandLineOption logOption(
            QStringLiteral("log"),
            QStringLiteral("Lowest level of the module's log lines written: debug, info, warning, "
                           "critical or none (default: debug)."),
            QStringLiteral("level"), QStringLiteral("debug"));
    parser.addOptions({jsonOption, pluginOption, phoneOption, interactiveOption, logOption});
    parser.process(app);

    const bool interactive = parser.isSet(interactiveOption);
    const QStringList positional = parser.positionalArguments();
    if (positional.size() > 1 || (positional.isEmpty() && !interactive)) {
        printError(QStringLiteral("give one scenario file, or --interactive"));
        return CannotRun;
    }
    const QString phoneMode = parser.value(phoneOption);
    if (phoneMode != QLatin1String("scripted") && phoneMode != QLatin1String("simulated")) {
        printError(QStringLiteral("--phone is scripted or simulated"));
        return CannotRun;
    }
    const int level = logLevel(parser.value(logOption));
    if (level < 0) {
        printError(QStringLiteral("--log is debug, info, warning, critical or none"));
        return CannotRun;
    }

    QByteArray text;
    QString scenarioName = QStringLiteral("stdin");
    if (!positional.isEmpty() && positional.first() != QLatin1String("-")) {
        scenarioName = positional.first();
        QFile file(scenarioName);
        if (!file.open(QIODevice::ReadOnly)) {
            printError(QStringLiteral("cannot read %1: %2").arg(scenarioName, file.errorString()));
            return CannotRun;
        }
        text = file.readAll();
    } else if (!interactive) {
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
    output.captureLog(ModuleLogCategory, level);
    createBridge();

    Host::ModuleHost host;
    const QString pluginFile = parser.value(pluginOption);
    if (!host.load(pluginFile)) {
        printError(QStringLiteral("cannot load %1: %2").arg(pluginFile, host.errorString()));
        return CannotRun;
    }
    QQmlEngine engine;

    Simulator::SimulatedPhone *phone = nullptr;
    if (phoneMode == QLatin1String("simulated")) {
        phone = new Simulator::SimulatedPhone(&app);
        phone->connectPhone();
    }

    // The whole scenario is read and checked against the hosted module before any step runs.
    Simulator::ScenarioRunner runner(&host, &engine, ModuleName, &output, clock);
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

    for (const Simulator::ScenarioStep &step : steps)
        runner.play(step);
    int refused = 0;
    if (interactive) {
        // Typed steps cannot be checked ahead: each is checked as it comes, and one that cannot
        // run is refused on its own.
        std::string typed;
        for (int line = 1; std::getline(std::cin, typed); ++line) {
            Simulator::ScenarioStep step
                    = Simulator::ScenarioStep::parse(QByteArray::fromStdString(typed), line);
            const QString error = Simulator::ScenarioReader::check(step, runner.controller());
            if (!error.isEmpty()) {
                printError(QStringLiteral("stdin:%1: %2").arg(line).arg(error));
                ++refused;
                continue;
            }
            runner.play(step);
        }
    }
    runner.finish();
    if (!runner.setUpError().isEmpty()) {
        printError(QStringLiteral("cannot host the module: %1").arg(runner.setUpError()));
        return CannotRun;
    }

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
    if (refused > 0)
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
