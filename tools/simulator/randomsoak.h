#pragma once

#include <QJsonObject>
#include <QList>
#include <QRandomGenerator>
#include <QString>
#include <QStringList>

class QFile;
class QJsonValue;
class QMetaMethod;
class QObject;

namespace Simulator {

class Invariants;
class ScenarioRunner;

// A seeded random soak of the hosted module: random steps over the module's whole surface (every
// bridge property and signal, keys, every controller slot with right and wrong arguments, intents,
// the events the module's transitions wait for, the menu bar, back, virtual time, the host's
// settings), each written as a scenario line and played through the runner, with the invariants
// checked after every step. The same seed gives the same steps, and the scenario written replays
// them.
class RandomSoak
{
public:
    RandomSoak(ScenarioRunner *runner, Invariants *invariants, quint32 seed);
    ~RandomSoak();

    // Writes each step played to `file` as a scenario line (after a comment naming the seed).
    void setScenarioFile(QFile *file) { m_scenario = file; }

    // Plays `steps` random steps; false when an invariant was violated (see violation()).
    bool run(qint64 steps);

    qint64 stepsPlayed() const { return m_played; }
    QString violation() const { return m_violation; }
    // The last steps played, oldest first.
    QStringList recentSteps() const { return m_recent; }

private:
    QString nextStep();
    QJsonValue intValue();
    QJsonValue stringValue();
    QJsonValue wrongValue();
    QJsonValue valueOf(int type, bool wrong);
    QString setBridgeValue();
    QString emitSignal();
    QJsonObject slotCall();
    QString answerPopup();
    QString modelStep();
    int pick(int count) { return int(m_random.bounded(quint32(count))); }
    bool chance(int percent) { return pick(100) < percent; }

    struct Member
    {
        QString name;
        QList<int> types;
    };

    ScenarioRunner *m_runner;
    Invariants *m_invariants;
    QRandomGenerator m_random;
    quint32 m_seed;
    QFile *m_scenario = nullptr;
    QList<Member> m_properties; // "phone.status" and the type it takes
    QList<Member> m_signals; // "phone.phoneDialingFailed" and its parameter types
    QList<Member> m_slots; // "acceptIncomingCall" and its parameter types
    QList<Member> m_controllerProperties;
    QList<Member> m_hotProperties; // set more often
    QStringList m_events;
    qint64 m_played = 0;
    QString m_violation;
    QStringList m_recent;
};

} // namespace Simulator
