#pragma once

#include <CoreServices/CoreServices.h>

#include "platform/net_service.h"

namespace onramp::cfnetwork {

/// Returns the handle for `service`. Every call for one service returns the same handle, for as
/// long as that handle exists. Returns null when `service` is null.
[[nodiscard]] NetServiceRef handleOf(CFNetServiceRef service);

}  // namespace onramp::cfnetwork
