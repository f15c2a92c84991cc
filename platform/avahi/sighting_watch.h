#pragma once

#include "platform/avahi/records.h"
#include "platform/avahi/sightings.h"

namespace onramp::avahi {

/// Passes a sighting to the function that watchSightings() has set, if there is one.
void tellSighting(const Instance& instance, Place place, bool isGone);

}  // namespace onramp::avahi
