#pragma once

#include <CoreServices/CoreServices.h>

#include "platform/net_service.h"

namespace onramp::cfnetwork {

/// The service that `service` stands for. Not created anew while a handle to it lives.
[[nodiscard]] NetServiceRef handleOf(CFNetServiceRef service);

}  // namespace onramp::cfnetwork
