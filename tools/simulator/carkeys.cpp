#include "carkeys.h"

#include <QStringList>
#include <QVariantMap>

#include <iterator>

namespace Simulator {

QString carKeyError(int code, int kind)
{
    QStringList keys;
    bool known = false;
    for (const CarKey &key : CarKeys) {
        known = known || key.code == code;
        keys.append(QStringLiteral("%1 %2").arg(key.code).arg(QLatin1String(key.meaning)));
    }
    if (!known)
        return QStringLiteral("key %1 is none of the car's keys (%2)")
                .arg(code)
                .arg(keys.join(QStringLiteral("; ")));
    const int kinds = int(std::size(KeyKinds));
    if (kind < 1 || kind > kinds) {
        QStringList names;
        for (int i = 0; i < kinds; ++i)
            names.append(QStringLiteral("%1 %2").arg(i + 1).arg(QLatin1String(KeyKinds[i])));
        return QStringLiteral("kind %1 is no kind of key event (%2)")
                .arg(kind)
                .arg(names.join(QStringLiteral(", ")));
    }
    return QString();
}

QVariantList carKeysForQml()
{
    QVariantList keys;
    for (const CarKey &key : CarKeys)
        keys.append(QVariantMap{{QStringLiteral("code"), key.code},
                                {QStringLiteral("label"), QString::fromUtf8(key.label)}});
    return keys;
}

} // namespace Simulator
