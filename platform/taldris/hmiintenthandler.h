#pragma once

#include <QList>
#include <QObject>
#include <QString>
#include <QVariant>

namespace Taldris {

// Base of a module's intent handler: the actions it offers, by the platform's action numbers, and
// the operation that performs them. Registered with HmiIntentManager.
class HmiIntentHandler : public QObject
{
    Q_OBJECT
public:
    explicit HmiIntentHandler(QObject *parent = nullptr);
    ~HmiIntentHandler() override;

    // The actions this handler offers, in the order they were added.
    QList<int> actions() const { return m_actions; }
    bool handlesAction(int action) const { return m_actions.contains(action); }

    // Performs `action`; returns whether the action was carried out.
    virtual bool performAction(int action, const QVariantList &arguments, bool flag,
                               const QVariant &extra) const = 0;
    // Whether `action` can be performed right now (the base: every action it offers).
    virtual bool isActionEnabled(int action) const;
    virtual QString lastError() const;

signals:
    // Tells the intent manager that `action` has become available or unavailable.
    void actionStatusChanged(int action, bool enabled);

protected:
    void addAction(int action);

private:
    QList<int> m_actions;
};

} // namespace Taldris
