#pragma once

#include <QPointer>
#include <QVariant>

namespace Taldris {

// Supplies the arguments of an intent action at the moment the action is requested.
class IntentDataProvider : public QObject
{
    Q_OBJECT
public:
    using QObject::QObject;
    virtual QVariantList intentArguments() const = 0;
};

// Requests an intent action each time it runs, with the arguments that its data provider gives
// at that moment (none without a provider). Usable as a functor in connect.
class IntentActionRequest
{
public:
    IntentActionRequest(int action, IntentDataProvider *dataProvider = nullptr);

    bool run() const;
    void operator()() const { run(); }

    int action() const { return m_action; }

private:
    int m_action;
    bool m_hasProvider;
    QPointer<IntentDataProvider> m_dataProvider;
};

} // namespace Taldris
