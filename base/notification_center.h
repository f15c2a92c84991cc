#pragma once

#include <any>
#include <functional>
#include <map>
#include <string>
#include <string_view>
#include <vector>

namespace onramp {

/// The data of a notification. The keys and the types of their values depend on the notification's
/// name and are documented where the name is declared.
using UserInfo = std::map<std::string, std::any, std::less<>>;

struct Notification {
  std::string name;
  const void* object = nullptr;  ///< the poster, for comparison only; may be null
  UserInfo userInfo;
};

/// Delivers every posted notification to the observers of its name, synchronously and in the order
/// in which the observers were added. All functions must be called on the main thread.
class NotificationCenter {
 public:
  using Handler = std::function<void(const Notification&)>;

  /// The centre that the whole process shares.
  [[nodiscard]] static NotificationCenter& defaultCenter();

  /// Calls `handler` for every notification called `name`, whoever posts it, until `observer` is
  /// removed. `observer` only identifies the observation and is never dereferenced.
  void addObserver(const void* observer, std::string_view name, Handler handler);

  /// Removes all observations of `observer`. An observer that is removed before a delivery reaches
  /// it is not called.
  void removeObserver(const void* observer);

  /// Calls the handlers that observe the notification's name. Handlers may add and remove observers
  /// and post further notifications. An observer added during a delivery does not get that
  /// notification.
  void post(const Notification& notification);

 private:
  struct Observation {
    unsigned long id;
    const void* observer;
    std::string name;
    Handler handler;
  };

  std::vector<Observation> observations_;
  unsigned long nextId_ = 0;
};

}  // namespace onramp
