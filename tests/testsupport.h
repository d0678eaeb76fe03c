#pragma once

// Helpers shared by the test suites: run the event loop until the state machine is idle, read the
// platform journal, post events, and fail on framework warnings that a test did not expect.

#include <host/modulehost.h>
#include <journal/journal.h>
#include <mavrosk/datasource.h>
#include <quorvel/hmievent.h>
#include <quorvel/statemachine.h>

#include <QCoreApplication>
#include <QJsonDocument>
#include <QRegularExpression>
#include <QStringList>
#include <QTest>

#include <utility>

// Test data written as plain literals.
inline QString operator""_q(const char *text, size_t size)
{
    return QString::fromUtf8(text, int(size));
}

namespace TestSupport {

// Start and posted events are asynchronous: process until nothing is left to do. A machine that
// never settles fails the test.
inline void processUntilIdle()
{
    QTest::qVerify(Host::processUntilIdle(), "Host::processUntilIdle()", "the machine settles",
                   __FILE__, __LINE__);
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

// Writes a bridge value as the phone's side would, given as "source.property=value" (a JSON list
// when the value starts with '['). False when no source has that short name or the property.
inline bool setBridgeValue(const QString &assignment)
{
    const QString key = assignment.section(QLatin1Char('='), 0, 0);
    const QString value = assignment.section(QLatin1Char('='), 1);
    for (Mavrosk::DataSource *source : Mavrosk::DataSource::sources()) {
        if (source->shortName() == key.section(QLatin1Char('.'), 0, 0))
            return source->setBridgeValue(
                    key.section(QLatin1Char('.'), 1),
                    value.startsWith(QLatin1Char('['))
                            ? QJsonDocument::fromJson(value.toUtf8()).toVariant()
                            : QVariant(value));
    }
    return false;
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

// An intent request's flags and extra value, only those set: " flag", " voice", " extra=x".
inline QString intentFlags(const QVariantMap &fields)
{
    QString flags;
    if (fields.value(QStringLiteral("flag")).toBool())
        flags += QStringLiteral(" flag");
    if (fields.value(QStringLiteral("fromVoice")).toBool())
        flags += QStringLiteral(" voice");
    if (fields.value(QStringLiteral("extra")).isValid())
        flags += QStringLiteral(" extra=") + fields.value(QStringLiteral("extra")).toString();
    return flags;
}

// The journal since `since` in order, one line per entry of the `kinds` given (all when empty):
// bridge commands as "phone.dialNumber(555)", intents as "intent 20(a,b)" with their flags, the
// others as "kind name-or-id-or-steps", e.g. "event HmiPhone_RoamingMode", "popup-request
// PHONE.Redial".
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
                         + argList + intentFlags(f));
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

// The same lines in brief: views and popups by view name ("popup-request IncomingCall") and
// bridge commands as "bridge phone.endCall", without their arguments.
inline QStringList briefJournalLines(qint64 since, const QStringList &kinds)
{
    static const QRegularExpression module(QStringLiteral("^(view\\S*|popup-\\w+) \\w+\\."));
    static const QRegularExpression command(QStringLiteral("^(\\w+\\.\\w+)\\(.*\\)$"));
    return journalLines(since, kinds)
            .replaceInStrings(module, QStringLiteral("\\1 "))
            .replaceInStrings(command, QStringLiteral("bridge \\1"));
}

inline QStringList bridgeCommandsSince(qint64 since)
{
    return journalLines(since, {QStringLiteral("bridge")});
}

// Fails the running test on an unexpected framework or Qt warning: the warnings and critical
// messages of the platform's own categories ("orvane.*" but the module's), and Qt's warnings about
// state machines, transitions and connections. Installed in front of QtTest's handler (to which
// it passes every message on) by the Suite fixture before each test.
class FrameworkWarningGuard
{
public:
    static void install()
    {
        const QtMessageHandler previous = qInstallMessageHandler(&handle);
        if (previous != &handle)
            s_previous = previous;
        take();
        s_expected.clear();
    }
    // A watched message the test expects: it is not recorded (once per call).
    static void expect(QtMsgType type, const QRegularExpression &pattern)
    {
        s_expected.append({type, pattern});
    }
    // Returns the recorded warnings and forgets them.
    static QStringList take() { return std::exchange(s_warnings, {}); }

private:
    struct Expected
    {
        QtMsgType type;
        QRegularExpression pattern;
    };
    static inline QStringList s_warnings;
    static inline QList<Expected> s_expected;
    static bool watched(QtMsgType type, const QMessageLogContext &context, const QString &message)
    {
        if (type != QtWarningMsg && type != QtCriticalMsg)
            return false;
        const QLatin1String category(context.category ? context.category : "");
        if (category.startsWith(QLatin1String("orvane."))
            && category != QLatin1String("orvane.hmiphone"))
            return true;
        static const char *const qtWarnings[] = {"QStateMachine",         "QState::",
                                                 "QSignalTransition",     "No such signal",
                                                 "Missing initial state", "QObject::connect:",
                                                 "without its transition"};
        for (const char *text : qtWarnings) {
            if (message.contains(QLatin1String(text)))
                return true;
        }
        return false;
    }
    static void handle(QtMsgType type, const QMessageLogContext &context, const QString &message)
    {
        if (watched(type, context, message)) {
            int index = 0;
            while (index < s_expected.size()
                   && (s_expected.at(index).type != type
                       || !s_expected.at(index).pattern.match(message).hasMatch()))
                ++index;
            if (index < s_expected.size())
                s_expected.removeAt(index);
            else
                s_warnings.append(message);
        }
        if (s_previous)
            s_previous(type, context, message);
    }
    static inline QtMessageHandler s_previous = nullptr;
};

// The fixture of every suite: a test class derives from it and puts its own preparation and
// tidying in setUp() and tearDown() (init() and cleanup() belong to the fixture). From the first
// statement of each test the warning guard is in front of QtTest's handler; after the test's
// tearDown() the guard's record must be empty.
class Suite : public QObject
{
    Q_OBJECT
protected:
    virtual void setUp() { }
    virtual void tearDown() { }
    // A message the test expects: QtTest does not print it and the guard does not count it.
    static void expectMessage(QtMsgType type, const QRegularExpression &pattern)
    {
        QTest::ignoreMessage(type, pattern);
        FrameworkWarningGuard::expect(type, pattern);
    }
    static void expectMessage(QtMsgType type, const char *message)
    {
        expectMessage(type,
                      QRegularExpression(QLatin1Char('^')
                                         + QRegularExpression::escape(QLatin1String(message))
                                         + QLatin1Char('$')));
    }

private slots:
    void init()
    {
        FrameworkWarningGuard::install();
        setUp();
    }
    void cleanup()
    {
        tearDown();
        QCOMPARE(FrameworkWarningGuard::take(), QStringList());
    }
};

} // namespace TestSupport
