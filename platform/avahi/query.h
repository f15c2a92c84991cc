#pragma once

#include <systemd/sd-bus.h>

#include <functional>
#include <memory>
#include <string>

#include "platform/avahi/daemon.h"

namespace onramp::avahi {

inline constexpr int kAnyInterface = -1;
inline constexpr int kAnyProtocol = -1;

/// A standing question to the daemon, for as long as this object lives: a browser object of
/// Avahi's D-Bus interface, version 0.8. (That version's *Prepare methods are used because the
/// daemon delays what the older ones start by 10 ms.)
class Query {
 public:
  enum class Event {
    kFound,           ///< the message is at the arguments of ItemNew
    kGone,            ///< the message is at the arguments of ItemRemove
    kCacheExhausted,  ///< all that the daemon knew already has been told
    kLost,            ///< the daemon went or failed: nothing told so far holds any more
  };
  /// Called from within the daemon's loop. It must not destroy the query.
  using Handler = std::function<void(Event event, sd_bus_message* message)>;
  /// Appends the arguments of the *Prepare method; returns a negative number when it cannot.
  using Arguments = std::function<int(sd_bus_message* call)>;

  /// `kind` names the objects, such as "RecordBrowser", and is not copied. The daemon must outlive
  /// the query.
  Query(Daemon& daemon, const char* kind, Arguments arguments, Handler handler);
  Query(const Query&) = delete;
  Query& operator=(const Query&) = delete;
  ~Query();

  /// Whether the daemon finds the question itself invalid, so that it is not put again.
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
  std::shared_ptr<char> asked_;  ///< set while an answer or an object of the daemon is ours
  std::string path_;             ///< the daemon's name for the object; empty before it has one
  bool isRefused_ = false;
};

}  // namespace onramp::avahi
