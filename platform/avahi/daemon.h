#pragma once

#include <systemd/sd-bus.h>

#include <functional>
#include <map>
#include <memory>
#include <string>
#include <vector>

#include "platform/avahi/handles.h"
#include "platform/avahi/loop_thread.h"
#include "platform/avahi/timer.h"

namespace onramp::avahi {

class Query;

/// A connection to the Avahi daemon over the system's message bus. The bus and the daemon may come
/// and go at any time. The connection keeps a list of all queries and sends them again to each new
/// daemon. Only runUntil() waits for the daemon. Main thread only. README.md in this folder
/// explains how the parts of this backend work together.
class Daemon {
 public:
  /// Returns the connection that all callers share. If there is none, creates it. The connection
  /// runs on the main loop. Returns null when a descriptor or the thread cannot be created.
  [[nodiscard]] static std::shared_ptr<Daemon> shared();

  /// Creates a connection that runs only inside runUntil(). Returns null when a descriptor
  /// cannot be created.
  [[nodiscard]] static std::unique_ptr<Daemon> create();

  Daemon(const Daemon&) = delete;
  Daemon& operator=(const Daemon&) = delete;
  ~Daemon() = default;

  /// Runs the connection's event loop until `done` returns true, and then returns true. Returns
  /// false when the loop fails.
  bool runUntil(const std::function<bool()>& done);

  /// Returns how many times the daemon or the bus has gone away so far.
  [[nodiscard]] unsigned losses() const { return losses_; }

  [[nodiscard]] sd_event* loop() const { return loop_.get(); }

 private:
  friend class Query;
  using Reply = std::function<void(sd_bus_message*)>;

  explicit Daemon(EventLoop loop);

  // Queries call these functions.
  void add(Query* query);
  void remove(Query* query);
  void listen(const std::string& path, Query* query) { listeners_[path] = query; }
  void stopListening(const std::string& path) { listeners_.erase(path); }
  [[nodiscard]] Message newCall(const char* method) const;
  bool call(sd_bus_message* message, Reply reply);
  void tell(const std::string& path, const char* interface, const char* method);
  void retryLater();

  void connect();
  bool watchDaemon();
  void startDaemon();
  [[nodiscard]] Message newBusCall(const char* method) const;
  void arrived();
  void lost();
  void runSoon();
  static int onMessage(sd_bus_message* message, void* self, sd_bus_error* error);
  static int onOwnerChanged(sd_bus_message* message, void* self, sd_bus_error* error);

  // The first member is destroyed last: the thread, the bus and the timer use the loop.
  EventLoop loop_;
  Timer retry_;
  std::vector<Query*> queries_;
  std::map<std::string, Query*> listeners_;  ///< by the path of the query's object in the daemon
  unsigned losses_ = 0;
  bool isPresent_ = false;    ///< the daemon is on the bus
  bool isConnected_ = false;  ///< `bus_` is set and works
  Bus bus_;
  std::shared_ptr<LoopThread> thread_;
};

}  // namespace onramp::avahi
