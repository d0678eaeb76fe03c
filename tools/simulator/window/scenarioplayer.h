#pragma once

#include "scenariostep.h"

#include <QList>
#include <QObject>
#include <QString>

#include <functional>

class QTimer;

namespace Simulator {

// Plays a scenario line by line for the window: play, pause and step, one input step at a time
// together with the checks that follow it. The driver's and the phone's actions of the window's
// panels are played as steps too, so that the trace shows them like a scenario's.
//
// In real time (the window), an {"advance": N} step waits N milliseconds before it is played,
// so that the module's timers fall due as in the car; on the virtual clock it is played at once.
class ScenarioPlayer : public QObject
{
    Q_OBJECT
    Q_PROPERTY(int count READ count NOTIFY linesChanged)
    Q_PROPERTY(int next READ next NOTIFY progressChanged)
    Q_PROPERTY(QString nextText READ nextText NOTIFY progressChanged)
    Q_PROPERTY(bool playing READ playing NOTIFY progressChanged)
    Q_PROPERTY(bool waiting READ waiting NOTIFY progressChanged)

public:
    // Plays one step (of the scenario, or of the panels: those are not checked yet).
    using PlayStep = std::function<void(const ScenarioStep &step)>;

    ScenarioPlayer(PlayStep playStep, bool realTime, QObject *parent = nullptr);
    ~ScenarioPlayer() override;

    void setSteps(const QList<ScenarioStep> &steps);

    int count() const { return m_steps.size(); }
    int next() const { return m_next; } // index of the next step to play
    QString nextText() const;
    bool playing() const { return m_playing; }
    bool waiting() const;

    // Plays every step left at once, on the virtual clock; `played(line)` follows each one.
    void playAll();

public slots:
    void play();
    void pause();
    // Plays the next input step and the checks after it.
    void step();
    // A step (a JSON object) or several (an array of them) of the window's panels.
    void input(const QString &json);
    // A key of the car as the key source sends it: press then short press, or press, long press
    // and release.
    void pressKey(int key, bool longPress);

signals:
    void linesChanged();
    void progressChanged();
    void played(int line);

private:
    void playStep(int index);
    void playNextStep();
    void resume();

    PlayStep m_playStep;
    bool m_realTime;
    QList<ScenarioStep> m_steps;
    int m_next = 0;
    int m_inputs = 0;
    bool m_playing = false;
    QTimer *m_pace; // between steps while playing
    QTimer *m_wait; // an advance step in real time
};

} // namespace Simulator
