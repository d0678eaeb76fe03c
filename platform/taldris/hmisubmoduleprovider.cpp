#include "hmisubmoduleprovider.h"

#include "hmihostedsubmodule.h"
#include "taldrislog.h"

namespace Taldris {

HmiSubmoduleProvider::HmiSubmoduleProvider(QObject *parent)
    : QObject(parent)
{ }

HmiSubmoduleProvider *HmiSubmoduleProvider::instance()
{
    static HmiSubmoduleProvider provider;
    return &provider;
}

void HmiSubmoduleProvider::registerHostedSubmodule(int id, HmiHostedSubmodule *submodule)
{
    if (!submodule)
        return;
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
    Request request{id, nullptr, moduleId, mode};
    Q_UNUSED(parent)
    if (HmiHostedSubmodule *submodule = hostedSubmodule(id))
        return create(submodule, request);
    m_pending.append(request);
    return nullptr;
}

Quorvel::HmiState *HmiSubmoduleProvider::create(HmiHostedSubmodule *submodule,
                                                const Request &request)
{
    Q_UNUSED(submodule)
    Q_UNUSED(request)
    return nullptr;
}

} // namespace Taldris
