#include "scenarioplayer.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QTimer>

#include <limits>

namespace Simulator {

namespace {

constexpr int PlayPace = 700; // ms between two steps while playing
constexpr int FirstInputLine = 10001; // the panels' steps are numbered after any scenario

QJsonObject stepObject(const QString &text)
{
    const QString trimmed = text.trimmed();
    if (trimmed.isEmpty() || trimmed.startsWith(QLatin1Char('#')))
        return QJsonObject();
    return QJsonDocument::fromJson(trimmed.toUtf8()).object();
}

// Checks and comments go with the step before them; everything else gives the module input.
bool isInput(const QString &text)
{
    const QJsonObject object = stepObject(text);
    if (object.isEmpty())
        return !text.trimmed().isEmpty() && !text.trimmed().startsWith(QLatin1Char('#'));
    return !object.contains(QLatin1String("expect"))
            && !object.contains(QLatin1String("expect-not"));
}

} // namespace

ScenarioPlayer::ScenarioPlayer(PlayLine playLine, bool realTime, QObject *parent)
    : QObject(parent)
    , m_playLine(std::move(playLine))
    , m_realTime(realTime)
    , m_pace(new QTimer(this))
    , m_wait(new QTimer(this))
{
    m_pace->setSingleShot(true);
    m_pace->setInterval(PlayPace);
    connect(m_pace, &QTimer::timeout, this, &ScenarioPlayer::step);
    m_wait->setSingleShot(true);
    connect(m_wait, &QTimer::timeout, this, &ScenarioPlayer::playNextStep);
}

ScenarioPlayer::~ScenarioPlayer() = default;

void ScenarioPlayer::setLines(const QStringList &lines)
{
    m_lines = lines;
    m_next = 0;
    emit linesChanged();
    emit progressChanged();
}

QString ScenarioPlayer::nextText() const
{
    return m_lines.value(m_next).trimmed();
}

bool ScenarioPlayer::waiting() const
{
    return m_wait->isActive();
}

void ScenarioPlayer::playLine(int index)
{
    const QString text = m_lines.at(index).trimmed();
    m_playLine(m_lines.at(index), index + 1);
    if (!text.isEmpty() && !text.startsWith(QLatin1Char('#')))
        emit played(index + 1);
}

void ScenarioPlayer::playAll()
{
    while (m_next < m_lines.size())
        playLine(m_next++);
    emit progressChanged();
}

void ScenarioPlayer::step()
{
    if (waiting())
        return;
    // Comments and blank lines up to the next input step are only echoed.
    while (m_next < m_lines.size() && !isInput(m_lines.at(m_next)))
        playLine(m_next++);
    if (m_next >= m_lines.size()) {
        m_playing = false;
        emit progressChanged();
        return;
    }
    const qint64 advance
            = stepObject(m_lines.at(m_next)).value(QLatin1String("advance")).toDouble();
    if (m_realTime && advance > 0) {
        m_wait->start(int(qMin<qint64>(advance, std::numeric_limits<int>::max())));
        emit progressChanged();
        return;
    }
    playNextStep();
}

void ScenarioPlayer::playNextStep()
{
    playLine(m_next++);
    while (m_next < m_lines.size() && !isInput(m_lines.at(m_next)))
        playLine(m_next++);
    if (m_next >= m_lines.size())
        m_playing = false;
    emit progressChanged();
    resume();
}

void ScenarioPlayer::resume()
{
    if (m_playing && m_next < m_lines.size())
        m_pace->start();
}

void ScenarioPlayer::play()
{
    if (m_playing || m_next >= m_lines.size())
        return;
    m_playing = true;
    emit progressChanged();
    if (!waiting())
        step();
}

void ScenarioPlayer::pause()
{
    m_playing = false;
    m_pace->stop();
    emit progressChanged();
}

void ScenarioPlayer::input(const QString &json)
{
    const QJsonDocument document = QJsonDocument::fromJson(json.toUtf8());
    const QJsonArray steps = document.isArray() ? document.array() : QJsonArray{document.object()};
    for (const QJsonValue &value : steps) {
        const QString text
                = QString::fromUtf8(QJsonDocument(value.toObject()).toJson(QJsonDocument::Compact));
        m_playLine(text, FirstInputLine + m_inputs++);
    }
}

void ScenarioPlayer::pressKey(int key, bool longPress)
{
    const QString step = QStringLiteral("{\"key\": %1, \"kind\": %2}");
    QStringList steps{step.arg(key).arg(1)};
    if (longPress)
        steps << step.arg(key).arg(3) << step.arg(key).arg(4);
    else
        steps << step.arg(key).arg(2);
    input(QLatin1Char('[') + steps.join(QLatin1Char(',')) + QLatin1Char(']'));
}

} // namespace Simulator
