#pragma once

#include <cstdint>
#include <map>
#include <set>
#include <utility>
#include <vector>

namespace onramp::avahi {

/// An interface and a protocol on which something is seen, by the daemon's numbers.
using Place = std::pair<std::int32_t, std::int32_t>;

/// Folds the sightings of things on several interfaces and protocols into one presence of each.
template <typename Thing>
class Sightings {
 public:
  /// Returns whether this is the thing's first sighting.
  bool add(const Thing& thing, Place place) {
    auto& places = places_[thing];
    const bool isNew = places.insert(place).second;
    return isNew && places.size() == 1;
  }

  /// Returns whether the thing's last sighting is gone with this one.
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
