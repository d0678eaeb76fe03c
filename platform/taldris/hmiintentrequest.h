#pragma once

#include <QVariant>

namespace Taldris {

// An intent request made once and run each time: connect it as a functor to a signal, or run it
// at once. Running it asks the intent manager for the action with the stored content.
class HmiIntentRequest
{
public:
    HmiIntentRequest(int action, const QVariantList &arguments = QVariantList(), bool flag = false,
                     bool fromVoice = false, const QVariant &extra = QVariant());

    bool run() const;
    void operator()() const { run(); }

    int action() const { return m_action; }
    QVariantList arguments() const { return m_arguments; }

private:
    int m_action;
    QVariantList m_arguments;
    bool m_flag;
    bool m_fromVoice;
    QVariant m_extra;
};

} // namespace Taldris
