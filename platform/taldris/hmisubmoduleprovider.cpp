#include "hmisubmoduleprovider.h"

#include "hmihostedsubmodule.h"
#include "taldrislog.h"

#include <quorvel/hmistate.h>

namespace Taldris {

HmiSubmoduleProvider::HmiSubmoduleProvider(QObject *parent)
    : QObject(parent)
{
    qRegisterMetaType<Quorvel::HmiState *>();
}

HmiSubmoduleProvider *HmiSubmoduleProvider::instance()
{
    static HmiSubmoduleProvider provider;
    return &provider;
}

void HmiSubmoduleProvider::registerHostedSubmodule(int id, HmiHostedSubmodule *submodule)
{
    if (!submodule)
        return;
    if (HmiHostedSubmodule *previous = hostedSubmodule(id); previous && previous != submodule)
        qCWarning(taldrisLog,
                  "HmiSubmoduleProvider: submodule %d is offered again; the newer one "
                  "replaces the older",
                  id);
    m_submodules.insert(id, submodule);
    const QList<Request> pending = m_pending;
    m_pending.clear();
    for (const Request &request : pending) {
        if (request.id == id)
            create(submodule, request);
        else
            m_pending.append(request);
    }
}

HmiHostedSubmodule *HmiSubmoduleProvider::hostedSubmodule(int id) const
{
    return m_submodules.value(id);
}

Quorvel::HmiState *HmiSubmoduleProvider::requestSubmodule(int id, Quorvel::HmiState *parent,
                                                          const QString &moduleId, int mode)
{
    Request request{id, parent, moduleId, mode};
    if (HmiHostedSubmodule *submodule = hostedSubmodule(id))
        return create(submodule, request);
    m_pending.append(request);
    return nullptr;
}

Quorvel::HmiState *HmiSubmoduleProvider::create(HmiHostedSubmodule *submodule,
                                                const Request &request)
{
    // The host state is gone: there is nothing to build the submodule under.
    auto *parent = qobject_cast<Quorvel::HmiState *>(request.parent.data());
    if (!parent) {
        qCWarning(taldrisLog, "HmiSubmoduleProvider: the state that asked for submodule %d is gone",
                  request.id);
        return nullptr;
    }
    Quorvel::HmiState *state = submodule->createStateHierarchy(parent);
    emit submoduleCreated(request.id, state, request.moduleId);
    return state;
}

} // namespace Taldris
