#pragma once

#include <CoreServices/CoreServices.h>

#include "platform/net_service.h"

namespace onramp::cfnetwork {

/// Returns the handle for `service`, and creates the handle if there is none. A handle retains its
/// service. Returns null when `service` is null. Main thread only.
[[nodiscard]] NetServiceRef handleOf(CFNetServiceRef service);

}  // namespace onramp::cfnetwork
