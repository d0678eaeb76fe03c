#include "headunitscreen.h"

#include "virtualeventdispatcher.h"

#include <brisken/datastore.h>
#include <brisken/statusbarcontroller.h>
#include <brisken/viewcontroller.h>
#include <journal/journal.h>
#include <quorvel/statemachine.h>

#include <QTimer>

namespace Simulator {

namespace {

bool changesScreen(const QString &kind)
{
    return kind == QLatin1String("view") || kind == QLatin1String("popup-shown")
            || kind == QLatin1String("popup-hidden") || kind == QLatin1String("popup-closed")
            || kind == QLatin1String("transient") || kind == QLatin1String("transient-hide");
}

QString nameOf(const QString &viewId)
{
    return viewId.section(QLatin1Char('.'), -1);
}

} // namespace

HeadUnitScreen::HeadUnitScreen(VirtualEventDispatcher *clock, bool ticking, QObject *parent)
    : QObject(parent)
    , m_clock(clock)
{
    connect(Platform::Journal::instance(), &Platform::Journal::appended, this,
            [this](const Platform::JournalEntry &entry) {
                if (changesScreen(entry.kind))
                    refresh();
            });
    if (ticking) {
        auto *tick = new QTimer(this);
        connect(tick, &QTimer::timeout, this, &HeadUnitScreen::refresh);
        tick->start(1000);
    }
}

HeadUnitScreen::~HeadUnitScreen() = default;

qint64 HeadUnitScreen::time() const
{
    return m_clock ? m_clock->now() : 0;
}

void HeadUnitScreen::refresh()
{
    QString view;
    QVariantList popups;
    if (auto *machine = Quorvel::StateMachine::existingInstance()) {
        view = Brisken::ViewController::instance()->activeView();
        // Each shown popup tops the stack of its region; the ones below it stay open, covered.
        for (const QString &shown : machine->shownPopups()) {
            QStringList stack = machine->popupStack(shown);
            stack.removeAll(shown);
            for (const QString &id : qAsConst(stack))
                popups.append(QVariantMap{{QStringLiteral("id"), id},
                                          {QStringLiteral("name"), nameOf(id)},
                                          {QStringLiteral("top"), false}});
            popups.append(QVariantMap{{QStringLiteral("id"), shown},
                                      {QStringLiteral("name"), nameOf(shown)},
                                      {QStringLiteral("top"), true}});
        }
    }
    auto *statusBar = Brisken::DataStore::get<Brisken::StatusBarController>(
            QStringLiteral("StatusBarController"));
    const QStringList transients = statusBar ? statusBar->transientWidgets() : QStringList();
    if (view != m_view || popups != m_popups || transients != m_transients) {
        m_view = view;
        m_popups = popups;
        m_transients = transients;
        emit changed();
    }
    if (time() != m_time) {
        m_time = time();
        emit timeChanged();
    }
}

} // namespace Simulator
