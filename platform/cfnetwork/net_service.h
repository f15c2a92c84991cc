#pragma once

#include <CoreServices/CoreServices.h>

#include "platform/net_service.h"

namespace onramp::cfnetwork {

/// The handle of `service`: the same one for as long as it lives. Null for null.
[[nodiscard]] NetServiceRef handleOf(CFNetServiceRef service);

}  // namespace onramp::cfnetwork
