#pragma once

#include <QAbstractState>
#include <QPointer>
#include <QString>

namespace Brisken {

// The view a request names: either a view identifier, or a view or popup state whose name is its
// identifier, read when the request runs. A state that is gone names nothing (an empty string).
class ViewName
{
public:
    ViewName(const QString &viewId)
        : m_viewId(viewId)
    { }
    ViewName(QAbstractState *state)
        : m_fromState(true)
        , m_state(state)
    { }

    QString toString() const
    {
        if (!m_fromState)
            return m_viewId;
        return m_state ? m_state->objectName() : QString();
    }

private:
    QString m_viewId;
    bool m_fromState = false;
    QPointer<QAbstractState> m_state;
};

} // namespace Brisken
