#include "randomsoak.h"

#include "carkeys.h"
#include "invariants.h"
#include "scenarioreader.h"
#include "scenariorunner.h"
#include "scenariostep.h"

#include <journal/journal.h>
#include <mavrosk/datasource.h>
#include <quorvel/guardedtransition.h>
#include <quorvel/statemachine.h>

#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QMetaMethod>
#include <QMetaProperty>

#include <algorithm>
#include <climits>
#include <iterator>

namespace Simulator {

namespace {

// Steps kept for the report of a violation.
constexpr int RecentSteps = 30;

// The actions the module knows, tried more often than any other number (the car's keys too).
constexpr int Actions[] = {1, 7, 28, 32, 47, 56, 67, 68};
constexpr int OddInts[]
        = {INT_MIN, INT_MIN + 1, -1000, -2, 13, 20, 99, 1000, 1000000, INT_MAX - 1, INT_MAX};

// The bridge values most of the module's global transitions wait on: set more often than the
// others, so that their combinations (a popup open while the next value comes) turn up.
const char *const HotProperties[] = {
        "phone.status",
        "phone.incomingCall",
        "phone.callConnected",
        "phone.multipleCallsConnected",
        "phone.currentExtendedMode",
        "phone.extendedModeTimerValue",
        "phone.phoneCallStandByMode",
        "bluetooth.deviceConnected",
        "phone.phoneBookStatus",
        "phone.messagesDownloadingStatus",
        "phone.sendMessageStatus",
        "phone.privateMode",
        "phone.dialingInProgress",
        "phone.emergencyCallStatus",
        "phone.recentCallListStatus",
};

QString line(const QJsonObject &step)
{
    return QString::fromUtf8(QJsonDocument(step).toJson(QJsonDocument::Compact));
}

QList<int> parameterTypes(const QMetaMethod &method)
{
    QList<int> types;
    for (int i = 0; i < method.parameterCount(); ++i)
        types.append(method.parameterType(i));
    return types;
}

} // namespace

RandomSoak::RandomSoak(ScenarioRunner *runner, Invariants *invariants, quint32 seed)
    : m_runner(runner)
    , m_invariants(invariants)
    , m_random(seed)
    , m_seed(seed)
{
    const int ownProperties = Mavrosk::DataSource::staticMetaObject.propertyCount();
    for (Mavrosk::DataSource *source : Mavrosk::DataSource::sources()) {
        const QMetaObject *meta = source->metaObject();
        QSet<int> notifiers;
        for (int i = ownProperties; i < meta->propertyCount(); ++i) {
            const QMetaProperty property = meta->property(i);
            if (property.hasNotifySignal())
                notifiers.insert(property.notifySignalIndex());
            if (property.isWritable())
                m_properties.append({source->shortName() + QLatin1Char('.')
                                             + QString::fromLatin1(property.name()),
                                     {property.userType()}});
        }
        // Signals of the bridge's own; a property's notification comes with its change.
        for (int i = Mavrosk::DataSource::staticMetaObject.methodCount(); i < meta->methodCount();
             ++i) {
            const QMetaMethod method = meta->method(i);
            if (method.methodType() == QMetaMethod::Signal && !notifiers.contains(i))
                m_signals.append({source->shortName() + QLatin1Char('.')
                                          + QString::fromLatin1(method.name()),
                                  parameterTypes(method)});
        }
    }

    for (const Member &property : qAsConst(m_properties)) {
        for (const char *hot : HotProperties) {
            if (property.name == QLatin1String(hot))
                m_hotProperties.append(property);
        }
    }

    if (QObject *controller = m_runner->controller()) {
        const QMetaObject *meta = controller->metaObject();
        for (int i = QObject::staticMetaObject.methodCount(); i < meta->methodCount(); ++i) {
            const QMetaMethod method = meta->method(i);
            if (method.access() == QMetaMethod::Public
                && (method.methodType() == QMetaMethod::Slot
                    || method.methodType() == QMetaMethod::Method))
                m_slots.append({QString::fromLatin1(method.name()), parameterTypes(method)});
        }
        for (int i = QObject::staticMetaObject.propertyCount(); i < meta->propertyCount(); ++i) {
            const QMetaProperty property = meta->property(i);
            if (property.isWritable())
                m_controllerProperties.append(
                        {QStringLiteral("controller.") + QString::fromLatin1(property.name()),
                         {property.userType()}});
        }
    }

    // The events the module's transitions wait for, in a fixed order for the seed's sake.
    QSet<QString> events;
    for (auto *transition :
         Quorvel::StateMachine::instance()->findChildren<Quorvel::GuardedTransition *>())
        events.insert(transition->eventName());
    events.remove(QString());
    m_events = events.values();
    std::sort(m_events.begin(), m_events.end());
}

RandomSoak::~RandomSoak() = default;

QJsonValue RandomSoak::intValue()
{
    if (chance(75))
        return pick(14) - 1; // -1 to 12: the values the module tells apart
    if (chance(50))
        return OddInts[pick(int(sizeof(OddInts) / sizeof(OddInts[0])))];
    return int(m_random.bounded(-100000, 100000));
}

QJsonValue RandomSoak::stringValue()
{
    static const char *const strings[] = {"",
                                          "0123456789",
                                          "+441234567",
                                          "*#06#",
                                          "5",
                                          "a",
                                          "Carla",
                                          "zed",
                                          "\xc3\xa9l\xc3\xa8ve",
                                          "\xd0\x96",
                                          "012345678901234567890123456789"};
    return QString::fromUtf8(strings[pick(int(sizeof(strings) / sizeof(strings[0])))]);
}

QJsonValue RandomSoak::wrongValue()
{
    switch (pick(7)) {
    case 0:
        return QJsonValue::Null;
    case 1:
        return QStringLiteral("x");
    case 2:
        return QJsonArray{1, 2};
    case 3:
        return QJsonObject{{QStringLiteral("a"), 1}};
    case 4:
        return chance(50);
    case 5:
        return 1.5;
    default:
        return 1e20;
    }
}

// A value for a parameter or property of meta-type `type`; `wrong`: any JSON value instead.
QJsonValue RandomSoak::valueOf(int type, bool wrong)
{
    if (wrong)
        return wrongValue();
    switch (type) {
    case QMetaType::Int:
        return intValue();
    case QMetaType::Bool:
        return chance(50);
    case QMetaType::QString:
        return stringValue();
    case QMetaType::QVariantList:
        return chance(50) ? QJsonArray() : QJsonArray{QStringLiteral("Yes"), QStringLiteral("No")};
    default:
        return wrongValue();
    }
}

QString RandomSoak::setBridgeValue()
{
    const int which = pick(100);
    const Member &property = which < 3 && !m_controllerProperties.isEmpty()
            ? m_controllerProperties.at(pick(m_controllerProperties.size()))
            : which < 45 && !m_hotProperties.isEmpty()
            ? m_hotProperties.at(pick(m_hotProperties.size()))
            : m_properties.at(pick(m_properties.size()));
    return line({{QStringLiteral("set"), property.name},
                 {QStringLiteral("value"), valueOf(property.types.first(), false)}});
}

QString RandomSoak::emitSignal()
{
    const Member &signal = m_signals.at(pick(m_signals.size()));
    QJsonArray args;
    for (int type : signal.types)
        args.append(valueOf(type, false));
    return line({{QStringLiteral("emit"), signal.name}, {QStringLiteral("args"), args}});
}

QJsonObject RandomSoak::slotCall()
{
    const Member &slot = m_slots.at(pick(m_slots.size()));
    const bool wrong = chance(10);
    QJsonArray args;
    for (int type : slot.types)
        args.append(valueOf(type, wrong && chance(50)));
    return {{QStringLiteral("call"), slot.name}, {QStringLiteral("args"), args}};
}

// The driver answers one of the popups open (on top or covered) with a button's call, or with
// its plain close button.
QString RandomSoak::answerPopup()
{
    const QStringList open = Quorvel::StateMachine::instance()->openPopups();
    if (open.isEmpty())
        return line(slotCall());
    QJsonObject step = chance(70) ? slotCall() : QJsonObject();
    step.insert(QStringLiteral("answer"), open.at(pick(open.size())));
    return line(step);
}

QString RandomSoak::modelStep()
{
    if (chance(50))
        return line({{QStringLiteral("model"), QStringLiteral("phone.phoneBook")},
                     {QStringLiteral("length"),
                      chance(90) ? pick(300) : int(m_random.bounded(0, INT_MAX))}});
    // An alphabet bar: letters in order, start rows mostly rising, some without contacts and a
    // few that no phone should send.
    QJsonArray rows;
    int start = 0;
    for (char letter = 'A'; letter <= 'Z'; ++letter) {
        if (chance(40))
            continue;
        int index = -1;
        if (chance(80)) {
            start += pick(15);
            index = start;
        } else if (chance(20)) {
            index = intValue().toInt();
        }
        rows.append(QJsonObject{{QStringLiteral("alphabet"), QString(QLatin1Char(letter))},
                                {QStringLiteral("letterIndex"), index}});
    }
    return line({{QStringLiteral("model"), QStringLiteral("phone.AlphabetIndexModel")},
                 {QStringLiteral("rows"), rows}});
}

QString RandomSoak::nextStep()
{
    const int roll = pick(100);
    if (roll < 30)
        return setBridgeValue();
    if (roll < 38 && !m_signals.isEmpty())
        return emitSignal();
    if (roll < 48) {
        const int key
                = chance(85) ? CarKeys[pick(int(std::size(CarKeys)))].code : intValue().toInt();
        const int kind = chance(85) ? 1 + pick(int(std::size(KeyKinds))) : intValue().toInt();
        // A key step takes the car's keys only; other numbers reach the module as the key
        // source's signal.
        if (carKeyError(key, kind).isEmpty())
            return line({{QStringLiteral("key"), key}, {QStringLiteral("kind"), kind}});
        return line({{QStringLiteral("emit"), QStringLiteral("key.keyEvent")},
                     {QStringLiteral("args"), QJsonArray{key, kind}}});
    }
    if (roll < 70 && !m_slots.isEmpty())
        return chance(15) ? answerPopup() : line(slotCall());
    if (roll < 74) {
        const int action = chance(80) ? Actions[pick(8)] : intValue().toInt();
        QJsonArray args;
        const int shape = pick(10);
        if (shape >= 2)
            args.append(shape < 7           ? QJsonValue(QStringLiteral("0123456789"))
                                : shape < 9 ? stringValue()
                                            : wrongValue());
        return line({{QStringLiteral("intent"), action}, {QStringLiteral("args"), args}});
    }
    if (roll < 82 && !m_events.isEmpty()) {
        QJsonObject step{{QStringLiteral("post"),
                          chance(95) ? m_events.at(pick(m_events.size()))
                                     : QStringLiteral("HmiPhone_Unheard")}};
        if (chance(20))
            step.insert(QStringLiteral("value"), chance(50) ? intValue() : stringValue());
        return line(step);
    }
    if (roll < 87) {
        static const char *const places[]
                = {"phone", "phone", "home", "home", "settings", "settings/Phone"};
        return line({{QStringLiteral("open"), QString::fromLatin1(places[pick(6)])}});
    }
    if (roll < 91)
        return line({{QStringLiteral("back"), chance(90) ? 1 : 2 + pick(2)}});
    if (roll < 93)
        return modelStep();
    if (roll < 94) {
        if (chance(50))
            return line({{QStringLiteral("set"), QStringLiteral("host.statusBarVisible")},
                         {QStringLiteral("value"), chance(50)}});
        static const int contexts[] = {0, 1, 2, 5, 6, 3, -1};
        return line({{QStringLiteral("set"), QStringLiteral("host.displayContext")},
                     {QStringLiteral("value"), contexts[pick(7)]}});
    }
    // Virtual time: mostly seconds, now and then the minutes of the module's longer timers.
    qint64 milliseconds = pick(1000);
    const int span = pick(100);
    if (span >= 40)
        milliseconds = pick(10000);
    if (span >= 80)
        milliseconds = pick(70000);
    if (span >= 97)
        milliseconds = pick(600000);
    return line({{QStringLiteral("advance"), double(milliseconds)}});
}

bool RandomSoak::run(qint64 steps)
{
    if (m_scenario)
        m_scenario->write(QStringLiteral("# hmiphone-sim --random %1 --steps %2\n")
                                  .arg(m_seed)
                                  .arg(steps)
                                  .toUtf8());
    for (qint64 i = 0; i < steps; ++i) {
        const QString text = nextStep();
        // Line 1 of the scenario written is the comment naming the seed.
        const ScenarioStep step
                = ScenarioStep::parse(text.toUtf8(), int(qMin<qint64>(i + 2, INT_MAX)));
        ++m_played;
        m_recent.append(text);
        if (m_recent.size() > RecentSteps)
            m_recent.removeFirst();
        if (m_scenario)
            m_scenario->write(text.toUtf8() + '\n');
        const QString refused = ScenarioReader::check(step, m_runner->controller());
        if (!refused.isEmpty()) {
            m_violation
                    = QStringLiteral("the soak made a step the reader refuses: %1").arg(refused);
            return false;
        }
        m_runner->play(step);
        m_violation = m_invariants->check(m_runner->controller());
        if (!m_violation.isEmpty())
            return false;
        // Nothing reads the journal of earlier steps: a long soak keeps none of it.
        Platform::Journal::instance()->clear();
    }
    return true;
}

} // namespace Simulator
