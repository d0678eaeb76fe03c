#pragma once

#include <QAbstractTransition>
#include <QEvent>
#include <QJsonObject>
#include <QState>
#include <QStateMachine>
#include <QString>
#include <QVector>

#include <vector>

namespace Bench {

// The bare-Qt floor: what plain QStateMachine code pays for the same tree.

// A named event, as plain Qt code would post it.
class NamedEvent : public QEvent
{
public:
    explicit NamedEvent(const QString &name)
        : QEvent(s_type)
        , name(name)
    { }
    static QEvent::Type s_type;
    QString name;
};

// Fires on the named event.
class NamedTransition : public QAbstractTransition
{
public:
    NamedTransition(const QString &name, QState *source)
        : QAbstractTransition(source)
        , m_name(name)
    { }

protected:
    bool eventTest(QEvent *event) override
    {
        return event->type() == NamedEvent::s_type
                && static_cast<NamedEvent *>(event)->name == m_name;
    }
    void onTransition(QEvent *) override { }

private:
    QString m_name;
};

// The shape of a state tree: its states with their nesting and child mode, and its transitions
// with source, target and trigger. Taken from the project's machine, written to and read from
// JSON, and built as a bare QStateMachine.
struct TreeShape
{
    struct Node
    {
        int parent = -1;
        bool parallel = false;
        int initial = -1;
        QString name;
    };
    struct Transition
    {
        int source = -1;
        int target = -1;
        // A signal transition when `senderClass` is set (found again by class name), else an
        // event transition on `event`.
        QString senderClass;
        QByteArray signal;
        QString event;
    };
    QVector<Node> nodes; // node 0 is the machine
    QVector<Transition> transitions;

    static TreeShape capture(QStateMachine *machine);
    QJsonObject toJson() const;
    static TreeShape fromJson(const QJsonObject &json);
    int indexOf(const QString &name) const;
};

// A floor machine built from a shape.
class FloorMachine
{
public:
    // `senders` resolves a signal transition's sender by class name (null: an event transition
    // takes its place).
    FloorMachine(const TreeShape &shape, const std::function<QObject *(const QString &)> &senders);
    ~FloorMachine();

    QStateMachine *machine() const { return m_machine; }
    QAbstractState *state(int index) const { return m_states.at(index); }
    // Starts the machine and handles what start posts.
    void start();
    // Moves to `target` through a transition from the closest exclusive ancestor it shares with
    // the configuration, as a hand-written back stack would, and handles it.
    void goTo(QAbstractState *target);
    // Back one step through the views entered (a plain vector).
    void back();
    // Views pushed on the back stack when entered.
    void trackViews(const QVector<int> &views);

private:
    QStateMachine *m_machine;
    std::vector<QAbstractState *> m_states;
    std::vector<QAbstractState *> m_backStack;
    QAbstractTransition *m_route = nullptr;
};

} // namespace Bench
