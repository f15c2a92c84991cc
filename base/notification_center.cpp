#include "base/notification_center.h"

#include <algorithm>
#include <utility>

namespace onramp {

NotificationCenter& NotificationCenter::defaultCenter() {
  static NotificationCenter center;
  return center;
}

void NotificationCenter::addObserver(const void* observer, std::string_view name, Handler handler) {
  observations_.push_back({nextId_++, observer, std::string(name), std::move(handler)});
}

void NotificationCenter::removeObserver(const void* observer) {
  std::erase_if(observations_, [&](const Observation& o) { return o.observer == observer; });
}

void NotificationCenter::post(const Notification& notification) {
  std::vector<unsigned long> ids;
  for (const Observation& observation : observations_) {
    if (observation.name == notification.name) ids.push_back(observation.id);
  }
  for (const unsigned long id : ids) {
    const auto found = std::find_if(observations_.begin(), observations_.end(),
                                    [&](const Observation& o) { return o.id == id; });
    if (found == observations_.end()) continue;
    const Handler handler = found->handler;  // a copy; a handler may remove its own observer
    handler(notification);
  }
}

}  // namespace onramp
