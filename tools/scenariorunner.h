#pragma once

#include "scenariostep.h"

#include <QJsonValue>
#include <QObject>
#include <QString>
#include <QVariant>

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
// and checks what is on screen and what the module wrote.
class ScenarioRunner : public QObject
{
    Q_OBJECT
public:
    ScenarioRunner(Host::ModuleHost *host, QQmlEngine *engine, const QString &moduleName,
                   OutputWriter *output, VirtualEventDispatcher *clock, QObject *parent = nullptr);
    ~ScenarioRunner() override;

    // Hold the machine's start until a {"start": true} step (steps before it are applied to a
    // machine that has not started). Without it, the machine starts before the first step.
    void setStartDeferred(bool deferred) { m_startDeferred = deferred; }

    // Plays one line of a scenario; blank lines and comments are only echoed.
    void playLine(const QString &text, int line);
    void play(const ScenarioStep &step);
    // Ends the run: starts the machine if no step did.
    void finish();

    bool started() const { return m_started; }
    int checks() const { return m_checks; }
    int failures() const { return m_failures; }
    QList<int> failedLines() const { return m_failedLines; }
    // Set up failed: the module could not be hosted.
    QString setUpError() const { return m_setUpError; }

signals:
    // The module is hosted and its objects exist (before the machine starts).
    void moduleSetUp();

private:
    bool ensureSetUp();
    void start();
    void apply(const ScenarioStep &step);
    void check(const ScenarioStep &step, bool negated);
    void fail(int line, const QString &message);
    // {"open": "settings/<entry>"}: the settings menu's entry, chosen as the driver would.
    void chooseSettingsEntry(const QString &entry, int line);

    // A value by dotted name ("phone.status", "host.displayContext", "controller.x").
    QObject *objectFor(const QString &prefix) const;
    bool readValue(const QString &name, QVariant *value, QString *error) const;
    bool writeValue(const QString &name, const QVariant &value, QString *error);

    QString checkOne(const QString &key, const QJsonValue &expected, bool negated) const;
    QString checkOutput(const QJsonObject &expected, bool negated) const;

    Host::ModuleHost *m_host;
    QQmlEngine *m_engine;
    QString m_moduleName;
    OutputWriter *m_output;
    VirtualEventDispatcher *m_clock;
    bool m_setUp = false;
    bool m_started = false;
    bool m_startDeferred = false;
    bool m_withoutStatusBar = false;
    int m_checks = 0;
    int m_failures = 0;
    QList<int> m_failedLines;
    QString m_setUpError;
};

} // namespace Simulator
