#pragma once

#include <QList>
#include <QObject>
#include <QString>
#include <QVariantMap>

#include <cstdio>

namespace Platform {
struct JournalEntry;
}

namespace Simulator {

class VirtualEventDispatcher;

// One thing the module did, stamped with the virtual time at which it happened.
struct Output
{
    qint64 time = 0;
    QString kind; // "view", "popup-request", "bridge", "log", "check", ...
    QVariantMap fields;
};

// Writes the simulator's outputs, one per line, as they happen: the platform journal (views,
// popups, transients, back steps, intents, hard keys, posted events, bridge commands), the
// module's log lines and the simulator's own results (intent answers, failed checks).
//
// Human-readable lines have aligned columns (virtual seconds, kind, details); JSON lines are
// objects with "t" (virtual milliseconds), "out" (the kind) and the kind's fields.
class OutputWriter : public QObject
{
    Q_OBJECT
public:
    enum Format { Human, Json };

    OutputWriter(VirtualEventDispatcher *clock, Format format, FILE *stream = stdout,
                 QObject *parent = nullptr);
    ~OutputWriter() override;

    Format format() const { return m_format; }
    // Silent: outputs are kept for the checks of the last input but written nowhere.
    void setSilent(bool silent) { m_silent = silent; }

    void write(const QString &kind, const QVariantMap &fields = {});
    // A line for people only (scenario comments, the closing line): human format only.
    void note(const QString &text);
    // An input step as it is played: "  1.500  > {...}" for people, a "step" record with its
    // line and text in JSON. Not an output of the step: checks of "out" do not see it.
    void echoStep(int line, const QString &text);
    // A record for tools (the closing summary): JSON only, and no output of any step.
    void record(const QString &kind, const QVariantMap &fields);

    // Starts a new input step: outputs from here on belong to it; those of earlier inputs go.
    void beginInput();
    // The outputs written since the last input step began.
    QList<Output> outputsOfLastInput() const { return m_outputs.mid(m_inputStart); }

    // The next journal entry of kind `kind` is the simulator's own doing (its request of an
    // intent on behalf of another module) and is not written.
    void skipNextJournalEntry(const QString &kind) { m_skipKind = kind; }

    // Writes the module's logging category as "log" outputs; other categories go to stderr.
    // `minimumLevel` (0 debug, 1 info, 2 warning, 3 critical, 4 none) applies to the module's
    // category and the platform's ("orvane.*") alike; QT_LOGGING_RULES still refines it.
    void captureLog(const QString &category, int minimumLevel);

    static QString details(const Output &output);
    static QString toJsonLine(const Output &output);

signals:
    // Every line for people, as the human format writes it (also when writing JSON).
    void written(const QString &line);

private:
    void putLine(const QString &line);
    void onJournalEntry(const Platform::JournalEntry &entry);
    static void messageHandler(QtMsgType type, const QMessageLogContext &context,
                               const QString &message);

    VirtualEventDispatcher *m_clock;
    Format m_format;
    FILE *m_stream;
    QList<Output> m_outputs;
    int m_inputStart = 0;
    bool m_silent = false;
    QString m_skipKind;
    QString m_logCategory;
    int m_logLevel = 0;
    QtMessageHandler m_previousHandler = nullptr;
};

} // namespace Simulator
