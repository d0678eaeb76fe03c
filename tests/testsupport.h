#pragma once

// Helpers shared by the test suites: run the event loop until the state machine is idle, read the
// platform journal, post events, and fail on framework warnings that a test did not expect.

#include <host/modulehost.h>
#include <journal/journal.h>
#include <quorvel/hmievent.h>
#include <quorvel/statemachine.h>

#include <QCoreApplication>
#include <QStringList>
#include <QTest>
#include <QTimer>

namespace TestSupport {

// Start and posted events are asynchronous: process until nothing is left to do.
inline void processUntilIdle()
{
    Host::processUntilIdle();
}

inline qint64 mark()
{
    return Platform::Journal::instance()->lastSequence();
}

// Posts the event and lets the machine settle. Returns the journal's mark just after the event's
// own entry, so that a test can read what the event caused.
inline qint64 post(const QString &name, const QVariant &value = QVariant())
{
    Quorvel::StateMachine::instance()->postEvent(new Quorvel::HmiEvent(name, value));
    const qint64 posted = mark();
    processUntilIdle();
    return posted;
}

inline QStringList activeStates()
{
    QStringList names;
    const auto configuration = Quorvel::StateMachine::instance()->configuration();
    for (const QAbstractState *state : configuration)
        names.append(state->objectName());
    return names;
}

// The journal entries of one kind since a sequence number, as the value of one field
// (for example the ids of the popups requested).
inline QStringList journalValues(const QString &kind, const QString &field = QStringLiteral("id"),
                                 qint64 since = 0)
{
    QStringList values;
    for (const Platform::JournalEntry &entry : Platform::Journal::instance()->entriesSince(since)) {
        if (entry.kind == kind)
            values.append(entry.fields.value(field).toString());
    }
    return values;
}

// The journal since `since` in order, one line per entry of the `kinds` given (all when empty):
// bridge commands as "phone.dialNumber(555)", intents as "intent 20(a,b)", the others as
// "kind name-or-id-or-steps", e.g. "event HmiPhone_RoamingMode", "popup-request PHONE.Redial".
inline QStringList journalLines(qint64 since, const QStringList &kinds = {})
{
    QStringList lines;
    for (const Platform::JournalEntry &entry : Platform::Journal::instance()->entriesSince(since)) {
        if (!kinds.isEmpty() && !kinds.contains(entry.kind))
            continue;
        const QVariantMap &f = entry.fields;
        QStringList args;
        for (const QVariant &arg : f.value(QStringLiteral("args")).toList())
            args.append(arg.toString());
        const QString argList = QLatin1Char('(') + args.join(QLatin1Char(',')) + QLatin1Char(')');
        if (entry.kind == QLatin1String("bridge"))
            lines.append(f.value(QStringLiteral("call")).toString() + argList);
        else if (entry.kind == QLatin1String("intent"))
            lines.append(QStringLiteral("intent ") + f.value(QStringLiteral("action")).toString()
                         + argList);
        else
            for (const char *field : {"name", "id", "steps", "call"})
                if (f.contains(QLatin1String(field))) {
                    lines.append(entry.kind + QLatin1Char(' ')
                                 + f.value(QLatin1String(field)).toString());
                    break;
                }
    }
    return lines;
}

inline QStringList bridgeCommandsSince(qint64 since)
{
    return journalLines(since, {QStringLiteral("bridge")});
}

// Records the warnings of Qt's state machine and fails the running test in cleanup(); a test that
// expects one takes it with take() itself.
class FrameworkWarningGuard
{
public:
    FrameworkWarningGuard()
    {
        s_original = s_previous = qInstallMessageHandler(&FrameworkWarningGuard::handle);
        // QtTest puts its own handler in front when the run starts and passes nothing on: take
        // the front place again once the run has begun (before any posted event is handled).
        QTimer::singleShot(0, [] { s_previous = qInstallMessageHandler(&handle); });
    }
    ~FrameworkWarningGuard() { qInstallMessageHandler(s_original); }

    // Returns the recorded warnings and forgets them.
    static QStringList take()
    {
        QStringList taken = warnings();
        warnings().clear();
        return taken;
    }

private:
    static QStringList &warnings()
    {
        static QStringList list;
        return list;
    }
    static void handle(QtMsgType type, const QMessageLogContext &context, const QString &message)
    {
        static bool forwarding = false;
        if (forwarding) { // QtTest, after its run, hands the message back to the handler it
                          // replaced
            if (s_original)
                s_original(type, context, message);
            return;
        }
        static const char *const watched[] = {"QStateMachine",         "QState::",
                                              "QSignalTransition",     "No such signal",
                                              "Missing initial state", "without its transition"};
        if (type == QtWarningMsg)
            for (const char *text : watched)
                if (message.contains(QLatin1String(text))) {
                    warnings().append(message);
                    break;
                }
        forwarding = true;
        if (s_previous)
            s_previous(type, context, message);
        forwarding = false;
    }
    static inline QtMessageHandler s_previous = nullptr;
    static inline QtMessageHandler s_original = nullptr;
};
} // namespace TestSupport
