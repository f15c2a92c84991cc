#pragma once

#include <any>
#include <functional>
#include <map>
#include <string>
#include <string_view>
#include <vector>

namespace onramp {

/// The data that a notification carries. The keys and the types of their values depend on the
/// notification's name and are documented where the name is declared.
using UserInfo = std::map<std::string, std::any, std::less<>>;

struct Notification {
  std::string name;
  const void* object = nullptr;  ///< the poster, for comparison only; may be null
  UserInfo userInfo;
};

/// Passes every posted notification to the handlers that observe its name. Calls the handlers
/// synchronously, in the order in which they were added. All functions must be called on the main
/// thread.
class NotificationCenter {
 public:
  using Handler = std::function<void(const Notification&)>;

  /// Returns the centre that the whole process shares.
  [[nodiscard]] static NotificationCenter& defaultCenter();

  /// Adds `handler` for all notifications called `name`, regardless of who posts them. `observer`
  /// identifies the handler for removeObserver() and is never dereferenced. An observer may have
  /// several handlers.
  void addObserver(const void* observer, std::string_view name, Handler handler);

  /// Removes all handlers of `observer`. During a delivery, a handler that is removed before its
  /// turn is not called.
  void removeObserver(const void* observer);

  /// Calls all handlers that were added for the notification's name. A handler may add and remove
  /// observers and post further notifications. A handler that is added during a delivery does not
  /// receive that notification.
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
