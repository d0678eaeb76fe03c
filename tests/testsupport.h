#pragma once

// Helpers shared by the test suites: run the event loop until the state machine is idle, read the
// platform journal, and fail on framework warnings that a test did not expect.

#include <host/modulehost.h>
#include <journal/journal.h>

#include <QCoreApplication>
#include <QStringList>
#include <QTest>

namespace TestSupport {

// Start and posted events are asynchronous: process until nothing is left to do.
inline void processUntilIdle()
{
    Host::processUntilIdle();
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

// Records the warnings of Qt's state machine and fails the running test in cleanup() unless the
// test declared them with QTest::ignoreMessage.
class FrameworkWarningGuard
{
public:
    FrameworkWarningGuard() { s_previous = qInstallMessageHandler(&FrameworkWarningGuard::handle); }
    ~FrameworkWarningGuard() { qInstallMessageHandler(s_previous); }

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
        if (type == QtWarningMsg
            && (message.contains(QLatin1String("QStateMachine"))
                || message.contains(QLatin1String("QState::"))
                || message.contains(QLatin1String("QSignalTransition"))
                || message.contains(QLatin1String("No such signal"))
                || message.contains(QLatin1String("Missing initial state"))))
            warnings().append(message);
        if (s_previous)
            s_previous(type, context, message);
    }
    static inline QtMessageHandler s_previous = nullptr;
};

} // namespace TestSupport
