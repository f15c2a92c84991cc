#include "platform/avahi/responder.h"

#include <chrono>
#include <optional>
#include <utility>

#include "platform/avahi/connection.h"
#include "platform/avahi/loop.h"

namespace onramp::avahi {

namespace {

// A daemon that answers at all does so in milliseconds; one that hangs keeps its callers for half a
// minute, and no one wants to watch a window that long that they have closed.
constexpr std::chrono::seconds kPatienceAtTheEnd{1};

}  // namespace

struct Responder::Work {
  Loop loop;
  std::optional<Connection> connection{std::in_place, loop};
};

std::shared_ptr<Responder> Responder::shared() {
  static std::weak_ptr<Responder> current;
  if (auto responder = current.lock()) return responder;
  auto responder = std::make_shared<Responder>();
  current = responder;
  return responder;
}

Responder::Responder() : work_(std::make_shared<Work>()) {
  std::packaged_task<void()> task([work = work_] {
    work->loop.run();
    work->connection.reset();
  });
  ended_ = task.get_future();
  thread_ = std::thread(std::move(task));
}

Responder::~Responder() {
  work_->loop.post([work = work_.get()] { work->loop.quit(); });
  if (ended_.wait_for(kPatienceAtTheEnd) == std::future_status::ready) {
    thread_.join();
  } else {
    thread_.detach();
  }
}

void Responder::add(std::shared_ptr<Job> job) {
  work_->loop.post([work = work_.get(), job = std::move(job)] { work->connection->add(job); });
}

void Responder::remove(std::shared_ptr<Job> job) {
  work_->loop.post([work = work_.get(), job = std::move(job)] { work->connection->remove(job); });
}

}  // namespace onramp::avahi
