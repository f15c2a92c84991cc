#pragma once

#include <future>
#include <memory>
#include <thread>

#include "platform/avahi/job.h"

namespace onramp::avahi {

/// The main thread's way to the daemon. Nothing here waits for it.
class Responder {
 public:
  /// The process's one responder, there for as long as anyone holds it.
  [[nodiscard]] static std::shared_ptr<Responder> shared();

  Responder();
  Responder(const Responder&) = delete;
  Responder& operator=(const Responder&) = delete;
  ~Responder();

  void add(std::shared_ptr<Job> job);
  void remove(std::shared_ptr<Job> job);

 private:
  struct Work;

  // The thread owns it too, and outlives this object when the daemon hangs.
  std::shared_ptr<Work> work_;
  std::future<void> ended_;
  std::thread thread_;
};

}  // namespace onramp::avahi
