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

// Checks and comments go with the input step before them.
bool groupsWithPrevious(const ScenarioStep &step)
{
    return step.kind == ScenarioStep::Comment || step.isCheck();
}

} // namespace

ScenarioPlayer::ScenarioPlayer(PlayStep playStep, bool realTime, QObject *parent)
    : QObject(parent)
    , m_playStep(std::move(playStep))
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

void ScenarioPlayer::setSteps(const QList<ScenarioStep> &steps)
{
    m_steps = steps;
    m_next = 0;
    emit linesChanged();
    emit progressChanged();
}

QString ScenarioPlayer::nextText() const
{
    return m_next < m_steps.size() ? m_steps.at(m_next).text : QString();
}

bool ScenarioPlayer::waiting() const
{
    return m_wait->isActive();
}

void ScenarioPlayer::playStep(int index)
{
    const ScenarioStep &step = m_steps.at(index);
    m_playStep(step);
    if (step.kind != ScenarioStep::Comment)
        emit played(step.line);
}

void ScenarioPlayer::playAll()
{
    while (m_next < m_steps.size())
        playStep(m_next++);
    emit progressChanged();
}

void ScenarioPlayer::step()
{
    if (waiting())
        return;
    // Comments, and checks before any input, up to the next input step.
    while (m_next < m_steps.size() && groupsWithPrevious(m_steps.at(m_next)))
        playStep(m_next++);
    if (m_next >= m_steps.size()) {
        m_playing = false;
        emit progressChanged();
        return;
    }
    const ScenarioStep &next = m_steps.at(m_next);
    const qint64 advance
            = next.kind == ScenarioStep::Advance ? qint64(next.value("advance").toDouble()) : 0;
    if (m_realTime && advance > 0) {
        m_wait->start(int(qMin<qint64>(advance, std::numeric_limits<int>::max())));
        emit progressChanged();
        return;
    }
    playNextStep();
}

void ScenarioPlayer::playNextStep()
{
    playStep(m_next++);
    while (m_next < m_steps.size() && groupsWithPrevious(m_steps.at(m_next)))
        playStep(m_next++);
    if (m_next >= m_steps.size())
        m_playing = false;
    emit progressChanged();
    resume();
}

void ScenarioPlayer::resume()
{
    if (m_playing && m_next < m_steps.size())
        m_pace->start();
}

void ScenarioPlayer::play()
{
    if (m_playing || m_next >= m_steps.size())
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
        const QByteArray text = QJsonDocument(value.toObject()).toJson(QJsonDocument::Compact);
        m_playStep(ScenarioStep::parse(text, FirstInputLine + m_inputs++));
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
