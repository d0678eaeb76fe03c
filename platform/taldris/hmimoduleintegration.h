#pragma once

#include <quorvel/statelevel.h>

#include <QList>
#include <QObject>
#include <QPair>
#include <QString>
#include <QUrl>

class QAbstractTransition;
class QQmlContext;

namespace Quorvel {
class HmiState;
class PopupState;
} // namespace Quorvel

namespace Taldris {

// The object through which the host talks to a loaded module: its identity, its QML types and
// objects, its part of the HMI state machine and the popups and transitions it installs at the
// root of the machine.
class HmiModuleIntegration : public QObject
{
    Q_OBJECT
public:
    using RootHierarchyTransitions = QList<QPair<Quorvel::StateLevel, QAbstractTransition *>>;
    using RootHierarchyPopupStates = QList<QPair<Quorvel::StateLevel, Quorvel::PopupState *>>;

    HmiModuleIntegration(int moduleType, QObject *parent = nullptr);
    ~HmiModuleIntegration() override;

    int moduleType() const { return m_moduleType; }
    // The id of a module type in the head unit's module table; empty for an unknown type.
    static QString moduleIdForType(int moduleType);

    // The id of this integration's module type (e.g. "PHONE" for type 1).
    virtual QString moduleId() const;
    virtual QString moduleName() const = 0;
    virtual int modulePriority() const;
    virtual int moduleDomain() const;
    virtual QString viewDescriptorFile() const;
    virtual QString rootStateIdentifier() const;
    virtual QUrl iconUrl() const;
    virtual RootHierarchyTransitions moduleRootHierarchyTransitions() const;
    virtual RootHierarchyPopupStates moduleRootHierarchyPopupStates() const;
    virtual void registerTypes();
    // Builds the module's screens under `parent` (a state of the host's) and returns their root.
    virtual Quorvel::HmiState *createScreenStateSubTree(Quorvel::HmiState *parent) = 0;
    virtual void exportObjects(QQmlContext *context);

private:
    int m_moduleType;
};

} // namespace Taldris
