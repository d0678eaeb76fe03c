#include "statusbarcontroller.h"

#include <journal/journal.h>

namespace Brisken {

StatusBarController::StatusBarController(QObject *parent)
    : QObject(parent)
{ }

StatusBarController::~StatusBarController() = default;

void StatusBarController::requestTransientWidget(const QString &name, int value)
{
    Platform::Journal::instance()->append(
            QStringLiteral("transient"),
            {{QStringLiteral("name"), name}, {QStringLiteral("value"), value}});
    m_transients.removeAll(name);
    m_transients.append(name);
}

void StatusBarController::hideTransientWidget(const QString &name)
{
    Platform::Journal::instance()->append(QStringLiteral("transient-hide"),
                                          {{QStringLiteral("name"), name}});
    m_transients.removeAll(name);
}

void StatusBarController::setStatusBarVisible(bool visible)
{
    if (m_visible == visible)
        return;
    m_visible = visible;
    emit statusBarVisibleChanged(visible);
}

} // namespace Brisken
