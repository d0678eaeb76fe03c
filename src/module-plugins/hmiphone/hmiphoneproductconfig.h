#pragma once

// Product constants of the head unit's phone module: the values this product ships with.
// The views may change the tunables at run time through the controller's properties; these are
// the values the controller starts from.

namespace HmiPhone {
namespace ProductConfig {

// Customer-support line of the head unit, dialled as is: eleven digits, no separators and no
// leading plus sign, so that the phone dials it in any network.
inline constexpr char KovaSupportPhoneNumber[] = "18005550147";

// Time a view key must be held to count as a long press, in milliseconds.
inline constexpr int DefaultLongPressInterval = 3000;

// Number of characters at which a dialled number counts as full.
inline constexpr int DefaultMaximumSizeOfNumber = 22;

// Number of paired devices the head unit remembers.
inline constexpr int DefaultMaxKnownBluetoothDevices = 12;

// Phone battery level at or below which the battery counts as low.
inline constexpr int DefaultBatteryLowLevel = 1;

} // namespace ProductConfig
} // namespace HmiPhone
