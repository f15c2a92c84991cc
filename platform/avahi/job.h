#pragma once

#include <memory>

namespace onramp::avahi {

class Connection;

/// Something wanted of the daemon for as long as it takes, however often the daemon goes and comes.
/// All calls are made on the loop's thread.
class Job : public std::enable_shared_from_this<Job> {
 public:
  Job() = default;
  Job(const Job&) = delete;
  Job& operator=(const Job&) = delete;
  virtual ~Job() = default;

  /// Called once, before all else, whether or not the daemon is there.
  virtual void begin(Connection& connection) = 0;

  /// Sets the daemon to work. False when it would not: the job is started again after a pause.
  virtual bool start(Connection& connection) = 0;
  [[nodiscard]] virtual bool running() const = 0;

  /// Frees what start() has made.
  virtual void stop() = 0;

  /// Called after stop() when the daemon went or failed: what it told does not hold any more.
  virtual void lost() = 0;

  /// Called once, after all else.
  virtual void finish() {}
};

}  // namespace onramp::avahi
