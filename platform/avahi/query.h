#pragma once

#include <systemd/sd-bus.h>

#include <functional>
#include <memory>
#include <string>

#include "platform/avahi/daemon.h"

namespace onramp::avahi {

inline constexpr int kAnyInterface = -1;
inline constexpr int kAnyProtocol = -1;

/// A question to the daemon that stays open as long as this object lives: a browser object of
/// Avahi's D-Bus interface, version 0.8. (The daemon delays by 10 ms what the methods of earlier
/// versions start; the *Prepare methods of 0.8 avoid that.)
class Query {
 public:
  enum class Event {
    kFound,           ///< the message is at the arguments of ItemNew
    kGone,            ///< the message is at the arguments of ItemRemove
    kCacheExhausted,  ///< the daemon has reported all that it knew already
    kLost,            ///< the daemon went away or failed: what was found so far is void
  };
  /// Called from within the daemon's loop. It must not destroy the query.
  using Handler = std::function<void(Event event, sd_bus_message* message)>;
  /// Appends the arguments of the *Prepare method. Returns a negative number on failure.
  using Arguments = std::function<int(sd_bus_message* call)>;

  /// `kind` names the objects, such as "RecordBrowser", and is not copied. The daemon must outlive
  /// the query.
  Query(Daemon& daemon, const char* kind, Arguments arguments, Handler handler);
  Query(const Query&) = delete;
  Query& operator=(const Query&) = delete;
  ~Query();

  /// Whether the daemon calls the question invalid. Such a question is not repeated.
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
  std::shared_ptr<char> asked_;  ///< set while an answer or an object is expected or held
  std::string path_;             ///< the daemon's name for the object; empty before it has one
  bool isRefused_ = false;
};

}  // namespace onramp::avahi
