#include "outputwriter.h"

#include "virtualeventdispatcher.h"

#include <journal/journal.h>

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QJsonValue>
#include <QLoggingCategory>

namespace Simulator {

namespace {

OutputWriter *s_logWriter = nullptr;

QString compactJson(const QVariant &value)
{
    const QJsonValue json = QJsonValue::fromVariant(value);
    if (json.isArray())
        return QString::fromUtf8(QJsonDocument(json.toArray()).toJson(QJsonDocument::Compact));
    if (json.isObject())
        return QString::fromUtf8(QJsonDocument(json.toObject()).toJson(QJsonDocument::Compact));
    // A lone value: wrap it in an array and strip the brackets.
    const QString wrapped
            = QString::fromUtf8(QJsonDocument(QJsonArray{json}).toJson(QJsonDocument::Compact));
    return wrapped.mid(1, wrapped.size() - 2);
}

// "phone.dialNumber("0123")": the arguments as JSON without the brackets.
QString argumentList(const QVariant &args)
{
    const QString list = compactJson(args.toList());
    return list.mid(1, list.size() - 2);
}

int levelOf(QtMsgType type)
{
    switch (type) {
    case QtDebugMsg:
        return 0;
    case QtInfoMsg:
        return 1;
    case QtWarningMsg:
        return 2;
    default:
        return 3;
    }
}

QString levelName(QtMsgType type)
{
    switch (type) {
    case QtDebugMsg:
        return QStringLiteral("debug");
    case QtInfoMsg:
        return QStringLiteral("info");
    case QtWarningMsg:
        return QStringLiteral("warning");
    case QtCriticalMsg:
        return QStringLiteral("critical");
    case QtFatalMsg:
        return QStringLiteral("fatal");
    }
    return QString();
}

} // namespace

OutputWriter::OutputWriter(VirtualEventDispatcher *clock, Format format, FILE *stream,
                           QObject *parent)
    : QObject(parent)
    , m_clock(clock)
    , m_format(format)
    , m_stream(stream)
{
    connect(Platform::Journal::instance(), &Platform::Journal::appended, this,
            &OutputWriter::onJournalEntry);
}

OutputWriter::~OutputWriter()
{
    if (s_logWriter == this) {
        qInstallMessageHandler(m_previousHandler);
        s_logWriter = nullptr;
    }
}

void OutputWriter::onJournalEntry(const Platform::JournalEntry &entry)
{
    if (!m_skipKind.isEmpty() && entry.kind == m_skipKind) {
        m_skipKind.clear();
        return;
    }
    QVariantMap fields = entry.fields;
    if (entry.kind == QLatin1String("intent")) {
        // The module always asks with the plain request content; show the rest only when set.
        if (!fields.value(QStringLiteral("flag")).toBool())
            fields.remove(QStringLiteral("flag"));
        if (!fields.value(QStringLiteral("fromVoice")).toBool())
            fields.remove(QStringLiteral("fromVoice"));
        if (!fields.value(QStringLiteral("extra")).isValid())
            fields.remove(QStringLiteral("extra"));
    }
    write(entry.kind, fields);
}

void OutputWriter::write(const QString &kind, const QVariantMap &fields)
{
    Output output{m_clock ? m_clock->now() : 0, kind, fields};
    m_outputs.append(output);
    if (m_silent)
        return;
    const QString seconds = QString::number(double(output.time) / 1000.0, 'f', 3);
    const QString human
            = QStringLiteral("%1  %2 %3").arg(seconds, 9).arg(kind, -15).arg(details(output));
    const QString line = m_format == Json ? toJsonLine(output) : human;
    putLine(line);
    emit written(human);
}

void OutputWriter::note(const QString &text)
{
    if (m_silent)
        return;
    emit written(text);
    if (m_format != Human)
        return;
    putLine(text);
}

void OutputWriter::echoStep(int line, const QString &text)
{
    const qint64 time = m_clock ? m_clock->now() : 0;
    const QString human = QStringLiteral("%1  > %2")
                                  .arg(QString::number(double(time) / 1000.0, 'f', 3), 9)
                                  .arg(text);
    if (m_format == Human || m_silent) {
        note(human);
        return;
    }
    emit written(human);
    record(QStringLiteral("step"),
           {{QStringLiteral("line"), line}, {QStringLiteral("text"), text}});
}

void OutputWriter::record(const QString &kind, const QVariantMap &fields)
{
    if (m_format != Json || m_silent)
        return;
    putLine(toJsonLine({m_clock ? m_clock->now() : 0, kind, fields}));
}

void OutputWriter::putLine(const QString &line)
{
    std::fputs(line.toUtf8().constData(), m_stream);
    std::fputc('\n', m_stream);
    std::fflush(m_stream);
}

void OutputWriter::beginInput()
{
    m_outputs.clear();
    m_inputStart = 0;
}

QString OutputWriter::details(const Output &output)
{
    const QVariantMap &f = output.fields;
    const QString &kind = output.kind;
    auto field = [&f](const char *name) { return f.value(QLatin1String(name)).toString(); };
    if (kind == QLatin1String("view") || kind == QLatin1String("view-request")
        || kind.startsWith(QLatin1String("popup-")))
        return field("id");
    if (kind == QLatin1String("transient")) {
        const QVariant value = f.value(QStringLiteral("value"));
        return value.isValid() && value.toInt() != 0
                ? QStringLiteral("%1 (%2)").arg(field("name"), value.toString())
                : field("name");
    }
    if (kind == QLatin1String("transient-hide"))
        return field("name");
    if (kind == QLatin1String("back"))
        return field("steps");
    if (kind == QLatin1String("bridge"))
        return QStringLiteral("%1(%2)").arg(field("call"),
                                            argumentList(f.value(QStringLiteral("args"))));
    if (kind == QLatin1String("intent")) {
        const QVariantList args = f.value(QStringLiteral("args")).toList();
        return args.isEmpty()
                ? QStringLiteral("action %1").arg(field("action"))
                : QStringLiteral("action %1 (%2)").arg(field("action"), argumentList(args));
    }
    if (kind == QLatin1String("intent-result"))
        return QStringLiteral("action %1 -> %2")
                .arg(field("action"), compactJson(f.value(QStringLiteral("result"))));
    if (kind == QLatin1String("hardkey"))
        return field("call");
    if (kind == QLatin1String("event")) {
        const QVariant value = f.value(QStringLiteral("value"));
        return value.isValid() ? QStringLiteral("%1 %2").arg(field("name"), compactJson(value))
                               : field("name");
    }
    if (kind == QLatin1String("menu-entry"))
        return QStringLiteral("%1: %2 %3")
                .arg(field("menu"), field("name"),
                     f.value(QStringLiteral("enabled")).toBool() ? QStringLiteral("enabled")
                                                                 : QStringLiteral("disabled"));
    if (kind == QLatin1String("log"))
        return QStringLiteral("[%1] %2").arg(field("level"), field("msg"));
    if (kind == QLatin1String("check"))
        return QStringLiteral("line %1: %2").arg(field("line"), field("msg"));
    return compactJson(f);
}

QString OutputWriter::toJsonLine(const Output &output)
{
    // "t" and "out" lead, the kind's fields follow in name order.
    QString line
            = QStringLiteral("{\"t\":%1,\"out\":%2").arg(output.time).arg(compactJson(output.kind));
    for (auto it = output.fields.constBegin(); it != output.fields.constEnd(); ++it)
        line += QStringLiteral(",%1:%2").arg(compactJson(it.key()), compactJson(it.value()));
    return line + QLatin1Char('}');
}

void OutputWriter::captureLog(const QString &category, int minimumLevel)
{
    m_logCategory = category;
    m_logLevel = minimumLevel;
    // The module's category writes only warnings by default; the simulator shows what was asked,
    // of the module's and the platform's categories alike. Silent, the rest of the chatter goes
    // too; warnings still reach stderr. QT_LOGGING_RULES is applied after these rules.
    QString rules = m_silent ? QStringLiteral("*.debug=false\n*.info=false\n") : QString();
    const char *levels[] = {"debug", "info", "warning", "critical"};
    const QString platform = category.section(QLatin1Char('.'), 0, 0) + QStringLiteral(".*");
    for (const QString &filtered : {platform, category}) {
        for (int level = 0; level < 4; ++level)
            rules += QStringLiteral("%1.%2=%3\n")
                             .arg(filtered, QLatin1String(levels[level]),
                                  level >= minimumLevel ? QLatin1String("true")
                                                        : QLatin1String("false"));
    }
    QLoggingCategory::setFilterRules(rules);
    s_logWriter = this;
    m_previousHandler = qInstallMessageHandler(&OutputWriter::messageHandler);
}

void OutputWriter::messageHandler(QtMsgType type, const QMessageLogContext &context,
                                  const QString &message)
{
    OutputWriter *writer = s_logWriter;
    if (writer && context.category && writer->m_logCategory == QLatin1String(context.category)) {
        if (levelOf(type) >= writer->m_logLevel)
            writer->write(
                    QStringLiteral("log"),
                    {{QStringLiteral("level"), levelName(type)}, {QStringLiteral("msg"), message}});
        return;
    }
    if (writer && writer->m_previousHandler) {
        writer->m_previousHandler(type, context, message);
        return;
    }
    std::fprintf(stderr, "%s\n", qPrintable(qFormatLogMessage(type, context, message)));
}

} // namespace Simulator
