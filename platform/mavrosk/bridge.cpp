#include "bridge.h"

namespace Mavrosk {

QList<DataSource *> createAll()
{
    PhoneSource::instance();
    EAPhoneSource::instance();
    BluetoothSource::instance();
    ProjectionSource::instance();
    SpeechSource::instance();
    KeySource::instance();
    NavSource::instance();
    GlobalSource::instance();
    ArdelSource::instance();
    return DataSource::sources();
}

void resetAll()
{
    // Sources not built yet still hold their initial values; build them all so that the
    // reset is complete and the order of first use does not matter.
    const QList<DataSource *> sources = createAll();
    for (DataSource *source : sources)
        source->reset();
}

} // namespace Mavrosk
