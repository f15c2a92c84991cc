#pragma once

#include <systemd/sd-bus.h>

#include <functional>
#include <memory>
#include <string>

#include "platform/avahi/daemon.h"

namespace onramp::avahi {

inline constexpr int kAnyInterface = -1;
inline constexpr int kAnyProtocol = -1;

/// A request that stays active in the daemon as long as the Query exists. For each request, the
/// daemon holds an object: a browser or a resolver. Queries create these objects with the *Prepare
/// methods of version 0.8 of Avahi's D-Bus interface. (The daemon waits 10 ms before it starts an
/// object that was created with an older method.)
class Query {
 public:
  enum class Event {
    kFound,           ///< a new result; `message` is the signal ItemNew or Found
    kGone,            ///< a removed result; `message` is the signal ItemRemove
    kCacheExhausted,  ///< the daemon has reported everything in its cache
    kLost,            ///< the daemon went away or the query failed; all results are invalid
  };
  /// Called from inside sd-event's loop. The handler must not destroy the query. `message` is null
  /// for kLost when the daemon went away.
  using Handler = std::function<void(Event event, sd_bus_message* message)>;
  /// Appends the arguments of the *Prepare method to `call`. Returns a negative number on failure.
  using Arguments = std::function<int(sd_bus_message* call)>;

  /// `kind` is the kind of the object in the daemon, such as "RecordBrowser". `daemon` and the
  /// string `kind`, which is not copied, must outlive the query.
  Query(Daemon& daemon, const char* kind, Arguments arguments, Handler handler);
  Query(const Query&) = delete;
  Query& operator=(const Query&) = delete;
  ~Query();

  /// Returns true if the request failed for good: it could not be put into a message, or the daemon
  /// called it invalid. The query then gets no result and is not sent again.
  [[nodiscard]] bool isRefused() const { return isRefused_; }

 private:
  friend class Daemon;

  [[nodiscard]] std::string interface() const;
  void ask();
  void answered(sd_bus_message* reply);
  void signalled(sd_bus_message* signal);
  void lost();
  void drop();

  Daemon& daemon_;
  const char* kind_;
  Arguments arguments_;
  Handler handler_;
  std::shared_ptr<char> asked_;  ///< set while an answer is expected or the daemon holds the object
  std::string path_;  ///< the object's path in the daemon; empty while there is no object
  bool isRefused_ = false;
};

}  // namespace onramp::avahi
