#pragma once

#include <quorvel/statelevel.h>

#include <QList>
#include <QObject>
#include <QPair>
#include <QString>

class QAbstractTransition;

namespace Quorvel {
class HmiState;
class PopupState;
} // namespace Quorvel

namespace Brisken {
class HmiAction;
}

namespace Taldris {

// A part of one module that another module hosts among its own screens (for example a module's
// pages in the settings screens). Offered to HmiSubmoduleProvider under a submodule id.
class HmiHostedSubmodule : public QObject
{
    Q_OBJECT
public:
    using RootHierarchyTransitions = QList<QPair<Quorvel::StateLevel, QAbstractTransition *>>;
    using RootHierarchyPopupStates = QList<QPair<Quorvel::StateLevel, Quorvel::PopupState *>>;

    explicit HmiHostedSubmodule(QObject *parent = nullptr);
    ~HmiHostedSubmodule() override;

    virtual RootHierarchyTransitions createRootHierarchyTransitions();
    virtual RootHierarchyPopupStates createRootHierarchyPopupStates();
    // The hosting module's menu entry for this submodule; a new action on every call.
    virtual Brisken::HmiAction *subModuleEntryAction() = 0;
    virtual QString moduleIdentifier() const = 0;
    virtual QString submoduleName() const = 0;
    virtual QString viewDescriptorFile() const = 0;
    // Builds the submodule's states under `parent`, a state of the hosting module.
    virtual Quorvel::HmiState *createStateHierarchy(Quorvel::HmiState *parent) = 0;
};

} // namespace Taldris
