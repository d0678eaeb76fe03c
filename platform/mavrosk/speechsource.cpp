#include "speechsource.h"

namespace Mavrosk {

SpeechSource::SpeechSource()
    : DataSource(QStringLiteral("speech"))
{ }

SpeechSource *SpeechSource::instance()
{
    static SpeechSource *const source = adopt(new SpeechSource);
    return source;
}

void SpeechSource::setSessionState(int value)
{
    update(m_sessionState, value, &SpeechSource::sessionStateChanged);
}

void SpeechSource::setTtsSessionActive(bool value)
{
    update(m_ttsSessionActive, value, &SpeechSource::ttsSessionActiveChanged);
}

void SpeechSource::cancelVRSession()
{
    journalCall(QStringLiteral("cancelVRSession"));
}

} // namespace Mavrosk
