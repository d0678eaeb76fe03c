#include "viewmanager.h"

namespace Brisken {

ViewManager::ViewManager(QObject *parent)
    : QObject(parent)
{ }

ViewManager::~ViewManager() = default;

QString ViewManager::viewIdentifier(const QString &module, const QString &view)
{
    return module + QLatin1Char('.') + view;
}

int ViewManager::displayContext() const
{
    return m_displayContext;
}

void ViewManager::setDisplayContext(int displayContext)
{
    if (m_displayContext == displayContext)
        return;
    m_displayContext = displayContext;
    emit displayContextChanged(displayContext);
}

} // namespace Brisken
