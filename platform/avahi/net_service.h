#pragma once

#include <memory>

#include "platform/avahi/browse_job.h"
#include "platform/net_service.h"

namespace onramp::avahi {

/// The service of a sighting.
[[nodiscard]] NetServiceRef makeService(Sighting sighting);

}  // namespace onramp::avahi
