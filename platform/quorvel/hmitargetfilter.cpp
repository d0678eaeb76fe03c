#include "hmitargetfilter.h"

namespace Quorvel {

HmiTargetFilter::~HmiTargetFilter() = default;

} // namespace Quorvel
