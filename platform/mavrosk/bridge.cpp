#include "bridge.h"

namespace Mavrosk {

void resetAll()
{
    // Sources not built yet still hold their initial values; build them all so that the
    // reset is complete and the order of first use does not matter.
    PhoneSource::instance();
    EAPhoneSource::instance();
    BluetoothSource::instance();
    ProjectionSource::instance();
    SpeechSource::instance();
    KeySource::instance();
    NavSource::instance();
    GlobalSource::instance();
    ArdelSource::instance();
    const QList<DataSource *> sources = DataSource::sources();
    for (DataSource *source : sources)
        source->reset();
}

} // namespace Mavrosk
