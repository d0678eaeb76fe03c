#include "invariants.h"

#include "virtualeventdispatcher.h"

#include <brisken/viewcontroller.h>
#include <host/modulehost.h>
#include <journal/journal.h>
#include <mavrosk/bridge.h>
#include <mavrosk/infinitelistmodel.h>
#include <quorvel/hmiviewstate.h>
#include <quorvel/statemachine.h>
#include <taldris/hmimoduleintegration.h>

#include <QTimer>

namespace Simulator {

namespace {

const QString MinRowCall = QStringLiteral("phone.setDriverRestrictedPhonebookModelMinRow");
const QString MaxRowCall = QStringLiteral("phone.setDriverRestrictedPhonebookModelMaxRow");

bool isCallPopup(const QString &id)
{
    return id.endsWith(QLatin1String(".IncomingCall")) || id.endsWith(QLatin1String(".WaitingCall"))
            || id == QLatin1String("IncomingCall") || id == QLatin1String("WaitingCall");
}

// The view states on screen: active ones with no active view state inside them.
QStringList innermostActiveViews()
{
    QStringList views;
    const QSet<QAbstractState *> configuration = Quorvel::StateMachine::instance()->configuration();
    for (QAbstractState *state : configuration) {
        auto *view = qobject_cast<Quorvel::HmiViewState *>(state);
        if (!view)
            continue;
        bool inner = false;
        for (auto *child : view->findChildren<Quorvel::HmiViewState *>())
            inner = inner || configuration.contains(child);
        if (!inner)
            views.append(view->objectName());
    }
    return views;
}

// Whether the innermost active state of the screens region is a plain state, not a view state
// nor inside one.
bool otherModulesScreen()
{
    auto *machine = Quorvel::StateMachine::instance();
    const QSet<QAbstractState *> configuration = machine->configuration();
    QAbstractState *innermost = machine->screensState();
    for (bool deeper = true; deeper;) {
        deeper = false;
        for (auto *child :
             innermost->findChildren<QAbstractState *>(QString(), Qt::FindDirectChildrenOnly)) {
            if (configuration.contains(child)) {
                if (qobject_cast<Quorvel::HmiViewState *>(child))
                    return false;
                innermost = child;
                deeper = true;
                break;
            }
        }
    }
    return innermost != machine->screensState();
}

// The active states with no active state inside them.
QString activeLeaves()
{
    QStringList leaves;
    const QSet<QAbstractState *> configuration = Quorvel::StateMachine::instance()->configuration();
    for (QAbstractState *state : configuration) {
        bool inner = false;
        for (auto *child :
             state->findChildren<QAbstractState *>(QString(), Qt::FindDirectChildrenOnly))
            inner = inner || configuration.contains(child);
        if (!inner)
            leaves.append(state->objectName());
    }
    leaves.sort();
    return leaves.join(QStringLiteral(", "));
}

QString sorted(const QSet<QString> &set)
{
    QStringList list = set.values();
    list.sort();
    return list.isEmpty() ? QStringLiteral("none") : list.join(QStringLiteral(", "));
}

} // namespace

Invariants::Invariants(Host::ModuleHost *host, QObject *parent)
    : QObject(parent)
    , m_host(host)
{
    connect(Platform::Journal::instance(), &Platform::Journal::appended, this,
            &Invariants::onJournalEntry);
    connect(Mavrosk::PhoneSource::instance(), &Mavrosk::PhoneSource::extendedModeTimerValueChanged,
            this, [this] {
                if (auto *clock = VirtualEventDispatcher::instance())
                    m_countdownChanged = clock->now();
            });
}

Invariants::~Invariants() = default;

void Invariants::onJournalEntry(const Platform::JournalEntry &entry)
{
    const QString id = entry.fields.value(QStringLiteral("id")).toString();
    if (entry.kind == QLatin1String("popup-shown")) {
        m_shownPopups.insert(id);
    } else if (entry.kind == QLatin1String("popup-hidden")) {
        m_shownPopups.remove(id);
    } else if (entry.kind == QLatin1String("bridge")) {
        // The window is set as min, then max: judged as a pair against the list of that moment.
        const QString call = entry.fields.value(QStringLiteral("call")).toString();
        const int row = entry.fields.value(QStringLiteral("args")).toList().value(0).toInt();
        if (call == MinRowCall) {
            m_pendingMinRow = row;
            m_minRowSet = true;
        } else if (call == MaxRowCall) {
            const int length = Mavrosk::PhoneSource::instance()->phoneBook()->listLength();
            const int minRow = m_minRowSet ? m_pendingMinRow : -2;
            const bool none = minRow == -1 && row == -1;
            const bool inside = minRow >= 0 && minRow <= row && row < length;
            if (!none && !inside)
                m_windowErrors.append(
                        QStringLiteral("driver-restricted window %1..%2 set for a list of %3 rows")
                                .arg(minRow)
                                .arg(row)
                                .arg(length));
            m_minRowSet = false;
        }
    }
}

QString Invariants::check(QObject *controller)
{
    auto *machine = Quorvel::StateMachine::existingInstance();
    if (!machine || !machine->isRunning())
        return QStringLiteral("the state machine is not running");

    // A plain state as the innermost screen stands for a screen of another module (the host's
    // settings, the phone's emergency assistance): no view state of the phone is then on screen.
    const QStringList views = innermostActiveViews();
    Quorvel::HmiViewState *active = Quorvel::HmiViewState::activeViewState();
    const bool one = views.size() == 1 && active && views.first() == active->objectName();
    if (!one && !(views.isEmpty() && otherModulesScreen()))
        return QStringLiteral("%1 view states on screen (%2), the framework's active view: %3; "
                              "active leaves: %4")
                .arg(views.size())
                .arg(views.join(QStringLiteral(", ")),
                     active ? active->objectName() : QStringLiteral("none"), activeLeaves());

    // The journal's popup-shown and popup-hidden say what is on top; covered popups stay open.
    Brisken::ViewController *viewController = Brisken::ViewController::instance();
    const QStringList onTop = viewController->shownPopups();
    const QStringList open = viewController->openPopups();
    const QSet<QString> onTopSet(onTop.begin(), onTop.end());
    const QSet<QString> openSet(open.begin(), open.end());
    if (onTopSet != m_shownPopups || onTopSet.size() != onTop.size())
        return QStringLiteral("popups on top %1, the journal shows %2")
                .arg(onTop.isEmpty() ? QStringLiteral("none") : onTop.join(QStringLiteral(", ")),
                     sorted(m_shownPopups));
    if (!openSet.contains(onTopSet) || openSet.size() != open.size())
        return QStringLiteral("popups on top %1, open %2")
                .arg(onTop.join(QStringLiteral(", ")), open.join(QStringLiteral(", ")));

    auto *phone = Mavrosk::PhoneSource::instance();
    if (!phone->incomingCall()) {
        for (const QString &popup : open) {
            if (isCallPopup(popup))
                return QStringLiteral("%1 is open while the phone reports no incoming call")
                        .arg(popup);
        }
    }

    // The module's one timer counts the extended mode down a minute a tick: it stops by the end
    // of the countdown the phone gives, whatever the phone said in between.
    auto *clock = VirtualEventDispatcher::instance();
    if (m_host->integration() && clock) {
        for (QTimer *timer : m_host->integration()->findChildren<QTimer *>()) {
            const qint64 since = timer->isActive() ? clock->startedAt(timer->timerId()) : -1;
            if (since < 0 || timer->interval() <= 0)
                continue;
            // A countdown the phone shortened ends at the next tick.
            const qint64 ticks = (clock->now() - since) / timer->interval();
            const qint64 countdown = qMax(0, phone->extendedModeTimerValue());
            if (ticks > countdown + 1 && clock->now() - m_countdownChanged > timer->interval())
                return QStringLiteral("a module timer of %1 ms has ticked %2 times and runs on; "
                                      "the extended mode lasts %3 minutes")
                        .arg(timer->interval())
                        .arg(ticks)
                        .arg(phone->extendedModeTimerValue());
        }
    }

    if (!m_windowErrors.isEmpty()) {
        const QString error = m_windowErrors.first();
        m_windowErrors.clear();
        return error;
    }

    if (controller) {
        const bool empty = controller->property("isEmptyNumber").toBool();
        if (empty != phone->callNumberEntered().isEmpty())
            return QStringLiteral("isEmptyNumber is %1 for the entered number \"%2\"")
                    .arg(empty ? QStringLiteral("true") : QStringLiteral("false"),
                         phone->callNumberEntered());
    }
    return QString();
}

} // namespace Simulator
