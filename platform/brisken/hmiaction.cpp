#include "hmiaction.h"

#include "briskenlog.h"

#include <QCoreApplication>

namespace Brisken {

HmiAction::HmiAction(const QString &name, const QString &iconPath, int actionType, QObject *parent)
    : QObject(parent)
    , m_name(name)
    , m_iconPath(iconPath)
    , m_actionType(actionType)
{ }

HmiAction::~HmiAction() = default;

QString HmiAction::text() const
{
    if (m_translationContext.isEmpty())
        return m_name;
    return QCoreApplication::translate(m_translationContext.toUtf8().constData(),
                                       m_name.toUtf8().constData());
}

void HmiAction::setTranslationContext(const QString &context)
{
    if (m_translationContext == context)
        return;
    m_translationContext = context;
    emit textChanged();
}

bool HmiAction::enabledBinding(const QObject *sender, const char *signal)
{
    const bool bound = sender && signal && connect(sender, signal, this, SLOT(setEnabled(bool)));
    if (!bound)
        qCCritical(briskenLog, "HmiAction: cannot bind the enabled state of \"%s\" to %s",
                   qUtf8Printable(m_name), signal ? signal : "(null)");
    return bound;
}

void HmiAction::setEnabled(bool enabled)
{
    if (m_enabled == enabled)
        return;
    m_enabled = enabled;
    emit enabledChanged(enabled);
}

void HmiAction::trigger()
{
    if (m_enabled)
        emit triggered();
}

} // namespace Brisken
