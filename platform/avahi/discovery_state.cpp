#include "platform/discovery_state.h"

#include <net/if.h>

#include <array>
#include <utility>

#include "platform/avahi/handles.h"
#include "platform/avahi/sighting_watch.h"
#include "platform/run_loop.h"

namespace onramp {

namespace {

constexpr int kIPv6Protocol = 1;  // the daemon's number for IPv6

std::function<void(const ServiceSighting&)>& sightingWatch() {
  static std::function<void(const ServiceSighting&)> watch;
  return watch;
}

std::string interfaceName(int index) {
  std::array<char, IF_NAMESIZE> name{};
  if (!if_indextoname(static_cast<unsigned>(index), name.data())) return std::to_string(index);
  return name.data();
}

}  // namespace

namespace avahi {

void tellSighting(const Instance& instance, Place place, bool isGone) {
  if (!sightingWatch()) return;
  const ServiceSighting sighting{.name = instance.name,
                                 .type = instance.type + '.',
                                 .domain = instance.domain + '.',
                                 .interface = interfaceName(place.first),
                                 .isIPv6 = place.second == kIPv6Protocol,
                                 .isGone = isGone};
  performOnMainThread([sighting] {
    if (sightingWatch()) sightingWatch()(sighting);
  });
}

}  // namespace avahi

void watchSightings(std::function<void(const ServiceSighting&)> watch) {
  sightingWatch() = std::move(watch);
}

std::optional<std::string> discoveryProblem() {
  sd_bus* opened = nullptr;
  if (sd_bus_open_system(&opened) < 0) return "the system's message bus cannot be reached";
  const avahi::Bus bus(opened);
  sd_bus_creds* found = nullptr;
  const int status = sd_bus_get_name_creds(bus.get(), "org.freedesktop.Avahi", 0, &found);
  const avahi::Credentials owner(found);
  if (status < 0) return "avahi-daemon is not running";
  return std::nullopt;
}

}  // namespace onramp
