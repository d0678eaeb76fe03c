#pragma once

#include <QList>
#include <QObject>
#include <QPointer>
#include <QVariant>

namespace Taldris {

class HmiIntentHandler;

// The head unit's broker of intents: modules and the voice system request actions by number, and
// the manager hands each request to the handler that offers the action. Handlers are held weakly:
// a destroyed handler is forgotten and never called.
class HmiIntentManager : public QObject
{
    Q_OBJECT
public:
    static HmiIntentManager *instance();

    void registerIntentHandler(HmiIntentHandler *handler);
    void unregisterIntentHandler(HmiIntentHandler *handler);

    // Records the request and hands it to the handler that offers `action`; returns the
    // handler's answer, or false when no live handler offers it. `flag` and `extra` reach the
    // handler unchanged; `fromVoice` marks a request made by the voice system.
    bool requestAction(int action, const QVariantList &arguments = QVariantList(),
                       bool flag = false, bool fromVoice = false,
                       const QVariant &extra = QVariant());
    bool isActionEnabled(int action) const;

signals:
    void actionStatusChanged(int action, bool enabled);

private:
    explicit HmiIntentManager(QObject *parent = nullptr);
    HmiIntentHandler *handlerFor(int action) const;

    QList<QPointer<HmiIntentHandler>> m_handlers;
};

} // namespace Taldris
