#pragma once

#include "scenarioreader.h"
#include "scenariostep.h"

#include <QJsonArray>
#include <QList>
#include <QObject>
#include <QPointer>
#include <QString>

class QQmlEngine;

namespace Host {
class ModuleHost;
}

namespace Simulator {

class OutputWriter;
class VirtualEventDispatcher;

// Plays a scenario's steps against the hosted module: sets the phone's values and emits its
// signals, presses keys, calls the controller as a view would, requests intents and posts events
// as other modules would, opens screens as the host's menu bar would, moves the virtual clock,
// and has the expectations judged.
//
// Use: prepare() with the whole scenario (it sets the module up and says which lines cannot
// run; nothing runs), then play() each step in turn (a front end may pause between steps and
// read the outputs of the last input from the OutputWriter), then finish().
class ScenarioRunner : public QObject
{
    Q_OBJECT
public:
    ScenarioRunner(Host::ModuleHost *host, QQmlEngine *engine, const QString &moduleName,
                   OutputWriter *output, VirtualEventDispatcher *clock, QObject *parent = nullptr);
    ~ScenarioRunner() override;

    // Sets the module up for `steps` (the host settings they choose before set-up, a start held
    // until their {"start": true}) and returns every line that cannot run, read and checked
    // against the hosted module. Empty: the scenario can be played. Runs no step.
    QList<ScenarioError> prepare(const QList<ScenarioStep> &steps);

    // With a real phone and no window: an advance step waits that long in real time, events
    // coming in meanwhile.
    void setWaitsInRealTime(bool waits) { m_waitsInRealTime = waits; }

    // Plays one step that prepare() or ScenarioReader::check() accepted. A comment is echoed.
    void play(const ScenarioStep &step);
    // Ends the run: starts the machine if no step did.
    void finish();

    // The controller as QML sees it ("_hmiphoneController"); null before set-up or once the
    // module deleted it.
    QObject *controller() const;
    bool started() const { return m_started; }
    // Expectation checks judged, and how many of them failed.
    int checks() const { return m_checks; }
    int failures() const { return m_failures; }
    // Steps that were accepted but could not be applied to the running module.
    int stepErrors() const { return m_stepErrors; }
    QList<int> failedLines() const { return m_failedLines; }
    // Set up failed: the module could not be hosted.
    QString setUpError() const { return m_setUpError; }

signals:
    // The module is hosted and its objects exist (before the machine starts).
    void moduleSetUp();
    // A step was played and the events it caused were handled.
    void stepPlayed(const Simulator::ScenarioStep &step);

private:
    bool ensureSetUp();
    void start();
    // Applies an input step; empty or why it could not be applied.
    QString apply(const ScenarioStep &step);
    QString writeValue(const QString &name, const QJsonValue &value);
    // Calls a slot of the controller through the QML engine, as a view does; empty or why the
    // call failed.
    QString callAsQml(const QString &slot, const QJsonArray &args);
    void report(int line, const QString &message);
    // {"open": "settings/<entry>"}: the settings menu's entry, chosen as the driver would; empty
    // or why it could not be.
    QString chooseSettingsEntry(const QString &entry);
    QString answer(const ScenarioStep &step);

    Host::ModuleHost *m_host;
    QQmlEngine *m_engine;
    QString m_moduleName;
    OutputWriter *m_output;
    VirtualEventDispatcher *m_clock;
    bool m_setUp = false;
    bool m_started = false;
    bool m_startDeferred = false;
    bool m_withoutStatusBar = false;
    bool m_waitsInRealTime = false;
    int m_checks = 0;
    int m_failures = 0;
    int m_stepErrors = 0;
    QList<int> m_failedLines;
    QString m_setUpError;
    QPointer<QObject> m_controller;
};

} // namespace Simulator
