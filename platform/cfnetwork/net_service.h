#pragma once

#include <CoreServices/CoreServices.h>

#include "platform/net_service.h"

namespace onramp::cfnetwork {

/// Returns the handle for `service`. If there is none yet, creates one, which retains `service`.
/// Returns null when `service` is null. Main thread only.
[[nodiscard]] NetServiceRef handleOf(CFNetServiceRef service);

}  // namespace onramp::cfnetwork
