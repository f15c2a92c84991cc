#pragma once

#include <any>
#include <functional>
#include <map>
#include <string>
#include <string_view>
#include <vector>

namespace onramp {

/// What a notification carries besides its name. Each name has its own keys and types, said where
/// it is posted.
using UserInfo = std::map<std::string, std::any, std::less<>>;

struct Notification {
  std::string name;
  const void* object = nullptr;  ///< who posted it, for comparison only; may be null
  UserInfo userInfo;
};

/// Hands every posted notification to those who observe its name, at once, in the order in which
/// they registered. Main thread only.
class NotificationCenter {
 public:
  using Handler = std::function<void(const Notification&)>;

  /// The process's one default centre.
  [[nodiscard]] static NotificationCenter& defaultCenter();

  /// Calls `handler` for every posting of `name`, whoever posts it, until `observer` is removed.
  /// `observer` is an identity only; it is never dereferenced.
  void addObserver(const void* observer, std::string_view name, Handler handler);

  /// Ends all observations of `observer`. An observer removed while a notification is handed round
  /// does not get it any more.
  void removeObserver(const void* observer);

  /// Handlers may add and remove observers and post further notifications; an observer added while
  /// a notification is handed round does not get that one.
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
