#include "keysource.h"

namespace Mavrosk {

KeySource::KeySource()
    : DataSource(QStringLiteral("key"))
{ }

KeySource *KeySource::instance()
{
    static KeySource *const source = adopt(new KeySource);
    return source;
}

void KeySource::sendKeyEvent(int key, int kind)
{
    emit keyEvent(key, kind);
}

} // namespace Mavrosk
