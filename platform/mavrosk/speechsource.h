#pragma once

#include <mavrosk/datasource.h>

namespace Mavrosk {

// The voice system. The whole bridge is listed in <mavrosk/bridge.h>.
class SpeechSource : public DataSource
{
    Q_OBJECT
    Q_PROPERTY(int sessionState READ sessionState WRITE setSessionState NOTIFY sessionStateChanged)
    Q_PROPERTY(bool ttsSessionActive READ ttsSessionActive WRITE setTtsSessionActive NOTIFY
                       ttsSessionActiveChanged)
public:
    static SpeechSource *instance();

    int sessionState() const { return m_sessionState; }
    bool ttsSessionActive() const { return m_ttsSessionActive; }

    // Setters notify only on a real change. Those marked "module" are the module's own calls:
    // they are also journaled (not when written through setBridgeValue()).
    void setSessionState(int value);
    void setTtsSessionActive(bool value);

    // Commands: journaled as bridge {call, args}; their outcome arrives later as changes.
public slots:
    // Voice session
    void cancelVRSession();

signals:
    void sessionStateChanged(int value);
    void ttsSessionActiveChanged(bool value);

    void displayPairingPopup();

private:
    SpeechSource();
    int m_sessionState = 0;
    bool m_ttsSessionActive = false;
};

} // namespace Mavrosk
