#pragma once

#include <cstdint>
#include <map>
#include <set>
#include <utility>
#include <vector>

namespace onramp::avahi {

/// The daemon's numbers for the interface and the protocol on which a service or domain is seen.
using Place = std::pair<std::int32_t, std::int32_t>;

/// Keeps track of sightings: the interfaces and protocols on which each thing (a service or a
/// domain) is seen. A thing is present from its first sighting until its last sighting is removed.
template <typename Thing>
class Sightings {
 public:
  /// Adds a sighting, if it is new. Returns whether it is the thing's first sighting.
  bool add(const Thing& thing, Place place) {
    auto& places = places_[thing];
    const bool isNew = places.insert(place).second;
    return isNew && places.size() == 1;
  }

  /// Removes a sighting. Returns whether it was the thing's last sighting.
  bool remove(const Thing& thing, Place place) {
    const auto found = places_.find(thing);
    if (found == places_.end()) return false;
    found->second.erase(place);
    if (!found->second.empty()) return false;
    places_.erase(found);
    return true;
  }

  /// Forgets all sightings and returns the things that were seen.
  std::vector<Thing> clear() {
    std::vector<Thing> things;
    for (const auto& [thing, places] : std::exchange(places_, {}))
      things.push_back(thing);
    return things;
  }

 private:
  std::map<Thing, std::set<Place>> places_;
};

}  // namespace onramp::avahi
