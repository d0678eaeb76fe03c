// hmiphone-bench: what the state framework and the plug-in cost against the floor of a bare
// QStateMachine that builds the same tree. Every figure is measured twice in one run, through the
// project and through the floor, and printed with their ratio: in instructions under
// `valgrind --tool=callgrind` (the figure to trust on a shared machine), in wall time otherwise.

#include "benchmeter.h"
#include "floortree.h"

#include <host/modulehost.h>
#include <mavrosk/bridge.h>
#include <quorvel/hmievent.h>
#include <quorvel/hmisignaltransition.h>
#include <quorvel/hmistate.h>
#include <quorvel/hmitransition.h>
#include <quorvel/statemachine.h>

#include <QCommandLineParser>
#include <QCoreApplication>
#include <QDir>
#include <QFileInfo>
#include <QJsonDocument>
#include <QLoggingCategory>
#include <QProcess>
#include <QTemporaryFile>

#include <cstdio>
#include <memory>

#ifndef HMIPHONE_PLUGIN_FILE
#define HMIPHONE_PLUGIN_FILE ""
#endif

namespace Bench {

// The sender of the notifications measured.
class Emitter : public QObject
{
    Q_OBJECT
signals:
    void ping();
};

} // namespace Bench

namespace {

using namespace Bench;

const QString ModuleName = QStringLiteral("HmiPhone");
const QString PingEvent = QStringLiteral("Bench_Ping");
constexpr int Regions = 10;

struct Settings
{
    bool quick = false;
    int repetitions = 1000; // notifications per figure
    int noise = 10000; // transitions that do not listen
    int shortRun = 10000; // steps of the short and the long run
    int longRun = 100000;
    QString plugin;
    QString only; // measure only the figures whose name contains this
    bool wanted(const QString &figure) const { return figure.contains(only); }
};

// The floor finds the senders of the module's signal transitions among the bridge's sources (and
// the bench's own emitter); any other becomes an event transition that never fires.
std::function<QObject *(const QString &)> senderResolver(QObject *emitter = nullptr)
{
    QList<QObject *> senders{emitter};
    const QList<Mavrosk::DataSource *> sources = Mavrosk::createAll();
    for (Mavrosk::DataSource *source : sources)
        senders.append(source);
    return [senders](const QString &className) -> QObject * {
        for (QObject *sender : senders) {
            if (sender && QLatin1String(sender->metaObject()->className()) == className)
                return sender;
        }
        return nullptr;
    };
}

void printRow(const QString &figure, double project, double floor)
{
    const double ratio = floor > 0 && project >= 0 ? project / floor : -1;
    std::printf("%-66s %14.0f %14.0f %7.2f\n", figure.toUtf8().constData(), project, floor, ratio);
    std::fflush(stdout);
}

// --- one notification ---

struct Notification
{
    bool signal;
    bool targeted;
    int fanOut;
    int noise;

    QString name() const
    {
        QString text
                = QStringLiteral("%1 %2, fan-out %3")
                          .arg(signal ? QStringLiteral("signal") : QStringLiteral("event"),
                               targeted ? QStringLiteral("targeted") : QStringLiteral("targetless"))
                          .arg(fanOut);
        if (noise)
            text += QStringLiteral(", %1 not listening").arg(noise);
        return text;
    }
};

// The project's tree for one notification: under the screens, a parallel state of ten regions,
// each with two states A and B; the first `fanOut` regions listen (A to B and back when
// targeted); the others' transitions listen to other events.
double measureProject(Meter &meter, const Notification &n, int repetitions, TreeShape &shape,
                      Emitter &emitter)
{
    auto *machine = Quorvel::StateMachine::instance();
    Quorvel::HmiState *screens = machine->screensState();
    auto *fan = new QState(QState::ParallelStates, screens);
    fan->setObjectName(QStringLiteral("Fan"));
    screens->setInitialHmiState(fan);
    QVector<QState *> regions;
    for (int i = 0; i < Regions; ++i) {
        auto *region = new QState(fan);
        region->setObjectName(QStringLiteral("Region%1").arg(i));
        auto *a = new Quorvel::HmiState(QStringLiteral("A%1").arg(i), region);
        auto *b = new Quorvel::HmiState(QStringLiteral("B%1").arg(i), region);
        region->setInitialState(a);
        regions.append(region);
        if (i >= n.fanOut)
            continue;
        auto make = [&](QState *source) -> QAbstractTransition * {
            if (n.signal)
                return new Quorvel::HmiSignalTransition(&emitter, SIGNAL(ping()), source);
            return new Quorvel::HmiTransition(PingEvent, source);
        };
        QAbstractTransition *forth = make(a);
        if (n.targeted) {
            forth->setTargetState(b);
            make(b)->setTargetState(a);
        }
    }
    for (int k = 0; k < n.noise; ++k)
        new Quorvel::HmiTransition(QStringLiteral("Bench_Other%1").arg(k), regions.at(k % Regions));
    machine->start();
    Host::processUntilIdle();
    shape = TreeShape::capture(machine);
    const double cost = meter.measure(QStringLiteral("project: ") + n.name(), repetitions, [&] {
        if (n.signal)
            emit emitter.ping();
        else
            machine->postEvent(new Quorvel::HmiEvent(PingEvent));
        QCoreApplication::sendPostedEvents(machine, 0);
    });
    Quorvel::StateMachine::destroyInstance();
    return cost;
}

double measureFloor(Meter &meter, const Notification &n, int repetitions, const TreeShape &shape,
                    Emitter &emitter)
{
    FloorMachine floor(shape, senderResolver(&emitter));
    floor.start();
    QStateMachine *machine = floor.machine();
    return meter.measure(QStringLiteral("floor: ") + n.name(), repetitions, [&] {
        if (n.signal)
            emit emitter.ping();
        else
            machine->postEvent(new NamedEvent(PingEvent));
        QCoreApplication::sendPostedEvents(machine, 0);
    });
}

void notifications(Meter &meter, const Settings &settings)
{
    Emitter emitter;
    for (int noise : {0, settings.noise}) {
        for (int fanOut : {1, Regions}) {
            for (bool targeted : {false, true}) {
                for (bool signal : {true, false}) {
                    const Notification n{signal, targeted, fanOut, noise};
                    if (!settings.wanted(QStringLiteral("one notification, ") + n.name()))
                        continue;
                    // A selection over the silent transitions dominates: fewer turns suffice.
                    const int repetitions
                            = noise ? qMax(1, settings.repetitions / 10) : settings.repetitions;
                    TreeShape shape;
                    const double project = measureProject(meter, n, repetitions, shape, emitter);
                    const double floor = measureFloor(meter, n, repetitions, shape, emitter);
                    printRow(QStringLiteral("one notification, ") + n.name(), project, floor);
                }
            }
        }
    }
}

// --- start-up and a long run through the module ---

std::unique_ptr<Host::ModuleHost> setUpModule(const QString &plugin)
{
    auto host = std::make_unique<Host::ModuleHost>();
    if (!host->load(plugin) || !host->setUp(ModuleName)) {
        std::fprintf(stderr, "hmiphone-bench: %s\n", host->errorString().toLocal8Bit().constData());
        std::exit(2);
    }
    host->start();
    return host;
}

// Cold start-up, in a process of its own: the plug-in is loaded (or the floor built) for the
// first time. Prints the cost on the standard output.
int coldChild(const QString &side, const Settings &settings, const QString &treeFile)
{
    Meter meter;
    Mavrosk::createAll();
    double cost = -1;
    if (side == QLatin1String("project")) {
        std::unique_ptr<Host::ModuleHost> host;
        cost = meter.measure(QStringLiteral("cold: project"), 1,
                             [&] { host = setUpModule(settings.plugin); });
    } else {
        QFile file(treeFile);
        if (!file.open(QIODevice::ReadOnly))
            return 2;
        const TreeShape shape
                = TreeShape::fromJson(QJsonDocument::fromJson(file.readAll()).object());
        std::unique_ptr<FloorMachine> floor;
        cost = meter.measure(QStringLiteral("cold: floor"), 1, [&] {
            floor = std::make_unique<FloorMachine>(shape, senderResolver());
            floor->start();
        });
    }
    std::printf("%.0f\n", cost);
    return 0;
}

double runColdChild(const QString &side, const Settings &settings, const QString &treeFile)
{
    QProcess child;
    child.setProcessChannelMode(QProcess::ForwardedErrorChannel);
    child.start(QCoreApplication::applicationFilePath(),
                {QStringLiteral("--cold-child"), side, QStringLiteral("--plugin"), settings.plugin,
                 QStringLiteral("--tree"), treeFile});
    if (!child.waitForFinished(600000) || child.exitCode() != 0)
        return -1;
    return child.readAllStandardOutput().trimmed().toDouble();
}

// One step of a long run: the module, home, the module again, back; every view entered goes on
// the back stack.
void projectStep(Host::ModuleHost &host, int step)
{
    auto *machine = Quorvel::StateMachine::instance();
    switch (step % 4) {
    case 1:
        host.openHome();
        break;
    case 3:
        machine->back();
        break;
    default:
        host.openModule();
        break;
    }
    QCoreApplication::sendPostedEvents();
}

void startUpAndRuns(Meter &meter, const Settings &settings)
{
    Mavrosk::createAll();
    // First set-up (cold caches aside): its tree is the floor's.
    std::unique_ptr<Host::ModuleHost> host = setUpModule(settings.plugin);
    const TreeShape shape = TreeShape::capture(Quorvel::StateMachine::instance());
    host.reset();

    QTemporaryFile treeFile(QDir::temp().filePath(QStringLiteral("hmiphone-bench-XXXXXX.json")));
    treeFile.open();
    treeFile.write(QJsonDocument(shape.toJson()).toJson(QJsonDocument::Compact));
    treeFile.flush();
    const double coldProject
            = runColdChild(QStringLiteral("project"), settings, treeFile.fileName());
    const double coldFloor = runColdChild(QStringLiteral("floor"), settings, treeFile.fileName());
    printRow(QStringLiteral("start-up, cold: plug-in load to the first view"), coldProject,
             coldFloor);

    const double warmProject = meter.measure(QStringLiteral("warm: project"), 1,
                                             [&] { host = setUpModule(settings.plugin); });
    std::unique_ptr<FloorMachine> floor(new FloorMachine(shape, senderResolver()));
    floor->start();
    const double warmFloor = meter.measure(QStringLiteral("warm: floor"), 1, [&] {
        floor = std::make_unique<FloorMachine>(shape, senderResolver());
        floor->start();
    });
    printRow(QStringLiteral("start-up, warm: second set-up to the first view"), warmProject,
             warmFloor);
    // What every event pays for: Qt sorts the active states on each transition selection.
    printRow(QStringLiteral("states active after start-up"),
             Quorvel::StateMachine::instance()->configuration().size(),
             floor->machine()->configuration().size());

    const int home = shape.indexOf(QStringLiteral("HOST.Home"));
    // The module's root component, the one state under the host's module state.
    const int moduleParent = shape.indexOf(QStringLiteral("HOST.Module"));
    int module = -1;
    for (int i = 0; i < shape.nodes.size() && module < 0; ++i) {
        if (shape.nodes.at(i).parent == moduleParent)
            module = i;
    }
    double perStep[2][2] = {};
    const int lengths[2] = {settings.shortRun, settings.longRun};
    for (int run = 0; run < 2; ++run) {
        if (!host)
            host = setUpModule(settings.plugin);
        int step = 0;
        perStep[run][0] = meter.measure(QStringLiteral("run %1: project").arg(lengths[run]),
                                        lengths[run], [&] { projectStep(*host, step++); });
        host.reset();

        floor = std::make_unique<FloorMachine>(shape, senderResolver());
        floor->trackViews({home, module});
        floor->start();
        step = 0;
        perStep[run][1] = meter.measure(
                QStringLiteral("run %1: floor").arg(lengths[run]), lengths[run], [&] {
                    const int kind = step++ % 4;
                    if (kind == 3)
                        floor->back();
                    else
                        floor->goTo(floor->state(kind == 1 ? home : module));
                });
        floor.reset();
        printRow(QStringLiteral("long run, per step, %1 steps").arg(lengths[run]), perStep[run][0],
                 perStep[run][1]);
    }
    std::printf("%-66s %14.2f %14.2f\n",
                QStringLiteral("long run, per-step growth, %1 / %2 steps")
                        .arg(lengths[1])
                        .arg(lengths[0])
                        .toUtf8()
                        .constData(),
                perStep[1][0] / perStep[0][0], perStep[1][1] / perStep[0][1]);
}

QString defaultPluginFile()
{
    const QString built = QString::fromUtf8(HMIPHONE_PLUGIN_FILE);
    if (!built.isEmpty() && QFileInfo::exists(built))
        return built;
    return QDir(QCoreApplication::applicationDirPath())
            .filePath(QStringLiteral("../plugins/") + QFileInfo(built).fileName());
}

} // namespace

int main(int argc, char *argv[])
{
    QCoreApplication app(argc, argv);
    QCoreApplication::setApplicationName(QStringLiteral("hmiphone-bench"));
    QCoreApplication::setApplicationVersion(QStringLiteral(HMIPHONE_VERSION));
    // The module's and the framework's messages are not part of the cost.
    QLoggingCategory::setFilterRules(QStringLiteral("*.debug=false\n*.info=false"));

    QCommandLineParser parser;
    parser.setApplicationDescription(QStringLiteral(
            "Measures the state framework and the plug-in against a bare QStateMachine with the "
            "same tree: instructions under valgrind --tool=callgrind --trace-children=yes, wall "
            "time otherwise."));
    parser.addHelpOption();
    parser.addVersionOption();
    const QCommandLineOption quick(QStringLiteral("quick"),
                                   QStringLiteral("A few turns of each figure (a smoke test)."));
    const QCommandLineOption plugin(QStringLiteral("plugin"), QStringLiteral("The plug-in file."),
                                    QStringLiteral("file"));
    const QCommandLineOption coldChild(QStringLiteral("cold-child"),
                                       QStringLiteral("(internal) a cold start-up of one side."),
                                       QStringLiteral("side"));
    const QCommandLineOption tree(QStringLiteral("tree"),
                                  QStringLiteral("(internal) the floor's tree."),
                                  QStringLiteral("file"));
    const QCommandLineOption only(QStringLiteral("only"),
                                  QStringLiteral("Measure only the figures whose name contains "
                                                 "the text (\"start-up\" for start-up and the "
                                                 "long run)."),
                                  QStringLiteral("text"));
    const QCommandLineOption runs(QStringLiteral("runs"),
                                  QStringLiteral("The steps of the short and the long run "
                                                 "(default 10000,100000)."),
                                  QStringLiteral("short,long"));
    parser.addOptions({quick, plugin, coldChild, tree, runs, only});
    parser.process(app);

    Settings settings;
    settings.plugin = parser.isSet(plugin) ? parser.value(plugin) : defaultPluginFile();
    if (parser.isSet(coldChild))
        return ::coldChild(parser.value(coldChild), settings, parser.value(tree));
    Meter meter;
    if (parser.isSet(quick)) {
        settings.quick = true;
        settings.repetitions = 3;
        settings.noise = 1000;
        settings.shortRun = 100;
        settings.longRun = 1000;
    } else if (meter.instructions()) {
        // Instruction counts vary little from turn to turn.
        settings.repetitions = 100;
    }
    if (parser.isSet(runs)) {
        const QStringList lengths = parser.value(runs).split(QLatin1Char(','));
        settings.shortRun = qMax(1, lengths.value(0).toInt());
        settings.longRun = qMax(1, lengths.value(1).toInt());
    }

    std::printf("hmiphone-bench: cost of one turn in %s (%s)%s\n",
                meter.unit().toUtf8().constData(),
                meter.instructions() ? "instructions, callgrind" : "nanoseconds, wall time",
                settings.quick ? ", quick mode: figures not meaningful" : "");
    std::printf("%-66s %14s %14s %7s\n", "figure", "project", "floor", "ratio");
    settings.only = parser.value(only);
    notifications(meter, settings);
    if (settings.wanted(QStringLiteral("start-up")))
        startUpAndRuns(meter, settings);
    return 0;
}

#include "hmiphonebench.moc"
