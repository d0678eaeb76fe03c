#pragma once

#include <mavrosk/datasource.h>

namespace Mavrosk {

// Hard keys and steering-wheel keys. Keys: 12 phone, 77/78 accept-or-seek-left and
// reject-or-seek-right, 49/79 send, 50/80 end, 90/91 steering-wheel seek down/up.
// Kinds: 1 press, 2 short press, 3 long press, 4 release after a long press.
class KeySource : public DataSource
{
    Q_OBJECT
public:
    static KeySource *instance();

    // Bridge side: a key was operated.
    Q_INVOKABLE void sendKeyEvent(int key, int kind);

signals:
    void keyEvent(int key, int kind);

private:
    KeySource();
};

} // namespace Mavrosk
