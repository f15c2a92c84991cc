#pragma once

#include <map>
#include <memory>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include "platform/avahi/bus.h"
#include "platform/avahi/handles.h"
#include "platform/avahi/job.h"
#include "platform/avahi/loop.h"

namespace onramp::avahi {

class HostAddresses;

/// The client of the daemon and the jobs that it works on. The daemon may be absent, come and go at
/// any time, and so may the message bus: jobs start when there is a daemon, and start again when
/// there is a new one. On the loop's thread only.
class Connection {
 public:
  explicit Connection(Loop& loop);
  Connection(const Connection&) = delete;
  Connection& operator=(const Connection&) = delete;
  ~Connection();

  void add(const std::shared_ptr<Job>& job);
  void remove(const std::shared_ptr<Job>& job);

  // What a job asks for from within a callback of Avahi is done once that is over.

  /// The job is done; what it has of the daemon is freed when there is nothing more urgent.
  void finish(const std::shared_ptr<Job>& job);
  /// What the job has of the daemon is of no use any more: stop it and start it again after a
  /// pause.
  void restart(const std::shared_ptr<Job>& job);

  /// The addresses of a host, looked up once for all who ask at the same time.
  [[nodiscard]] std::shared_ptr<HostAddresses> addressesOf(AvahiIfIndex interface,
                                                           const std::string& host);

  [[nodiscard]] AvahiClient* client() const { return client_.get(); }
  /// There while jobs run.
  [[nodiscard]] Bus& bus() const { return *bus_; }
  [[nodiscard]] Loop& loop() const { return loop_; }

 private:
  void connect();
  void disconnect();
  void stateChanged(AvahiClientState state);
  void startJobs();
  void retryLater();
  void freeFinished();

  Loop& loop_;
  Timer retry_;
  Timer quiet_;
  ClientHandle client_;
  std::unique_ptr<Bus> bus_;
  bool connected_ = false;
  // Jobs hold objects of the client and on the bus, so they come after these.
  std::map<std::pair<AvahiIfIndex, std::string>, std::weak_ptr<HostAddresses>> hosts_;
  std::set<std::shared_ptr<Job>> jobs_;
  std::vector<std::shared_ptr<Job>> finished_;
};

}  // namespace onramp::avahi
