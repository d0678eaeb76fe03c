#pragma once

#include <QState>
#include <QString>

namespace Quorvel {

// A state known by its name (its object name), findable with stateForName().
class NamedState : public QState
{
    Q_OBJECT
public:
    explicit NamedState(const QString &name, QState *parent = nullptr);
    NamedState(const QString &name, QState::ChildMode childMode, QState *parent = nullptr);
    ~NamedState() override;

    QString name() const;
    bool isActive() const;

    // The first living state of that name in the machine, or null.
    static NamedState *stateForName(const QString &name);
};

} // namespace Quorvel
