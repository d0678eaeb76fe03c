#pragma once

namespace Quorvel {

// The levels of the HMI's root hierarchy at which a module installs its global popups and
// always-armed transitions.
enum StateLevel { StateLevel1 = 1, StateLevel2 = 2, StateLevel3 = 3 };

} // namespace Quorvel
