#include "platform/avahi/responder.h"

#include <chrono>
#include <optional>
#include <utility>
#include <vector>

#include "platform/avahi/connection.h"
#include "platform/avahi/loop.h"

namespace onramp::avahi {

namespace {

// A daemon that answers at all does so in milliseconds; one that hangs keeps its callers for half a
// minute, and no one wants to watch a window that long that they have closed.
constexpr std::chrono::seconds kPatienceAtTheEnd{1};

struct Ending {
  std::future<void> ended;
  std::thread thread;

  [[nodiscard]] bool isOver(std::chrono::seconds patience) const {
    return ended.wait_for(patience) == std::future_status::ready;
  }

  void await() {
    if (isOver(kPatienceAtTheEnd)) {
      thread.join();
    } else {
      thread.detach();
    }
  }
};

bool isProgramEnding = false;

// Threads that were told to end. They are waited for when the program ends, not before.
class Endings {
 public:
  Endings() = default;
  Endings(const Endings&) = delete;
  Endings& operator=(const Endings&) = delete;
  ~Endings() {
    isProgramEnding = true;
    for (Ending& ending : endings_)
      ending.await();
  }

  void add(Ending last) {
    std::erase_if(endings_, [](Ending& ending) {
      const bool over = ending.isOver(std::chrono::seconds(0));
      if (over) ending.thread.join();
      return over;
    });
    endings_.push_back(std::move(last));
  }

 private:
  std::vector<Ending> endings_;
};

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
  Ending ending{std::move(ended_), std::move(thread_)};
  if (isProgramEnding) {
    ending.await();
    return;
  }
  static Endings endings;
  endings.add(std::move(ending));
}

void Responder::add(std::shared_ptr<Job> job) {
  work_->loop.post([work = work_.get(), job = std::move(job)] { work->connection->add(job); });
}

void Responder::remove(std::shared_ptr<Job> job) {
  work_->loop.post([work = work_.get(), job = std::move(job)] { work->connection->remove(job); });
}

}  // namespace onramp::avahi
