#pragma once

#include <QList>
#include <QMap>
#include <QObject>
#include <QPointer>
#include <QString>

namespace Quorvel {
class HmiState;
}

namespace Taldris {

class HmiHostedSubmodule;

// Brings hosted submodules and the modules that host them together: a module offers a submodule
// under an id, another asks for the submodule of that id under one of its states. A request made
// before the submodule is offered is kept and served when it is. Submodules and host states are
// held weakly: a destroyed one is forgotten.
class HmiSubmoduleProvider : public QObject
{
    Q_OBJECT
public:
    static HmiSubmoduleProvider *instance();

    void registerHostedSubmodule(int id, HmiHostedSubmodule *submodule);
    HmiHostedSubmodule *hostedSubmodule(int id) const;

    // Builds the submodule `id` under `parent` for the module `moduleId`, and returns the state
    // it built; null while no submodule of that id is offered (the request is then kept).
    Quorvel::HmiState *requestSubmodule(int id, Quorvel::HmiState *parent, const QString &moduleId,
                                        int mode);

signals:
    void submoduleCreated(int id, Quorvel::HmiState *state, const QString &moduleId);

private:
    struct Request
    {
        int id;
        QPointer<QObject> parent;
        QString moduleId;
        int mode;
    };

    explicit HmiSubmoduleProvider(QObject *parent = nullptr);
    Quorvel::HmiState *create(HmiHostedSubmodule *submodule, const Request &request);

    QMap<int, QPointer<HmiHostedSubmodule>> m_submodules;
    QList<Request> m_pending;
};

} // namespace Taldris
