#pragma once

#include <QString>
#include <QVariantList>
#include <QtGlobal>

namespace Simulator {

// The car's keys as the key source sends them (keyEvent(key, kind)): the one table that the
// scenario reader checks "key" steps against, that the window's panel shows and that the README
// lists.
struct CarKey
{
    int code;
    const char *meaning; // as the README names it
    const char *label; // the window's button (UTF-8), translated in the context "CarKeys"
};

inline constexpr CarKey CarKeys[] = {
        {12, "phone", QT_TRANSLATE_NOOP("CarKeys", "Phone")},
        {49, "send", QT_TRANSLATE_NOOP("CarKeys", "Send")},
        {50, "end", QT_TRANSLATE_NOOP("CarKeys", "End")},
        {77, "accept, or seek left", QT_TRANSLATE_NOOP("CarKeys", "Accept/\u25C0")},
        {78, "reject, or seek right", QT_TRANSLATE_NOOP("CarKeys", "Reject/\u25B6")},
        {79, "send (second key)", QT_TRANSLATE_NOOP("CarKeys", "Send 2")},
        {80, "end (second key)", QT_TRANSLATE_NOOP("CarKeys", "End 2")},
        {90, "steering-wheel seek down", QT_TRANSLATE_NOOP("CarKeys", "Wheel \u25BC")},
        {91, "steering-wheel seek up", QT_TRANSLATE_NOOP("CarKeys", "Wheel \u25B2")},
};

// Kinds of a key event, from 1.
inline constexpr const char *KeyKinds[]
        = {"press", "short press", "long press", "release after a long press"};

// Why `code` is not a key of the table or `kind` not a kind of key event; empty when both are.
QString carKeyError(int code, int kind);

// The keys for the window's panel: maps with "code" and "label".
QVariantList carKeysForQml();

} // namespace Simulator
