#include "platform/avahi/daemon.h"

#include <algorithm>
#include <chrono>
#include <cstdint>
#include <limits>
#include <string_view>
#include <utility>

#include "platform/avahi/query.h"

namespace onramp::avahi {

namespace {

constexpr const char* kAvahi = "org.freedesktop.Avahi";
constexpr const char* kBus = "org.freedesktop.DBus";
constexpr const char* kOwnerChanges =
    "type='signal',sender='org.freedesktop.DBus',interface='org.freedesktop.DBus',"
    "member='NameOwnerChanged',arg0='org.freedesktop.Avahi'";

// The pause before a retry. Without it, an operation that fails immediately would keep the
// processor busy.
constexpr std::chrono::milliseconds kRetryPause{1000};

// Calls need no time limit. A hung daemon answers once it resumes, and the bus answers on behalf of
// a dead one.
constexpr std::uint64_t kForever = std::numeric_limits<std::uint64_t>::max();

}  // namespace

std::shared_ptr<Daemon> Daemon::shared() {
  static std::weak_ptr<Daemon> current;
  if (auto daemon = current.lock()) return daemon;
  std::shared_ptr<Daemon> daemon = create();
  if (!daemon) return nullptr;
  daemon->thread_ = LoopThread::start(daemon->loop());
  if (!daemon->thread_) return nullptr;
  current = daemon;
  return daemon;
}

std::unique_ptr<Daemon> Daemon::create() {
  sd_event* created = nullptr;
  if (sd_event_new(&created) < 0) return nullptr;
  std::unique_ptr<Daemon> daemon(new Daemon(EventLoop(created)));
  if (!daemon->retry_.isUsable()) return nullptr;
  daemon->connect();
  return daemon;
}

Daemon::Daemon(EventLoop loop)
    : loop_(std::move(loop)), retry_(loop_.get(), [this] {
        if (!isConnected_) {
          connect();
        } else if (isPresent_) {
          arrived();
        }
      }) {}

bool Daemon::runUntil(const std::function<bool()>& done) {
  while (!done()) {
    if (sd_event_run(loop_.get(), kForever) < 0) return false;
  }
  return true;
}

void Daemon::runSoon() {
  if (thread_) thread_->runSoon();
}

void Daemon::retryLater() {
  retry_.ensure(kRetryPause);
}

void Daemon::add(Query* query) {
  queries_.push_back(query);
  if (isPresent_) query->ask();
  runSoon();  // makes the loop notice new timers, such as a Resolve's time limit
}

void Daemon::remove(Query* query) {
  std::erase(queries_, query);
}

void Daemon::connect() {
  sd_bus* opened = nullptr;
  bus_.reset();
  if (sd_bus_open_system(&opened) >= 0) bus_.reset(opened);
  isConnected_ = bus_ && watchDaemon();
  if (!isConnected_) retryLater();
}

bool Daemon::watchDaemon() {
  const Message question = newBusCall("GetNameOwner");
  return question && sd_bus_message_append(question.get(), "s", kAvahi) >= 0 &&
         sd_bus_attach_event(bus_.get(), loop_.get(), SD_EVENT_PRIORITY_NORMAL) >= 0 &&
         sd_bus_add_filter(bus_.get(), nullptr, onMessage, this) >= 0 &&
         sd_bus_add_match_async(bus_.get(), nullptr, kOwnerChanges, onOwnerChanged, nullptr,
                                this) >= 0 &&
         call(question.get(), [this](sd_bus_message* reply) {
           sd_bus_message_is_method_error(reply, nullptr) > 0 ? startDaemon() : arrived();
         });
}

// Asks the bus to start the daemon. This works on systems that start the daemon on demand. The bus
// reports when the daemon has started.
void Daemon::startDaemon() {
  const Message request = newBusCall("StartServiceByName");
  if (request && sd_bus_message_append(request.get(), "su", kAvahi, 0U) >= 0) {
    sd_bus_send(bus_.get(), request.get(), nullptr);
  }
}

int Daemon::onMessage(sd_bus_message* message, void* self, sd_bus_error*) {
  auto& daemon = *static_cast<Daemon*>(self);
  if (sd_bus_message_is_signal(message, "org.freedesktop.DBus.Local", "Disconnected") > 0) {
    daemon.isConnected_ = false;
    daemon.lost();
    daemon.retryLater();
    return 0;
  }
  const char* const path = sd_bus_message_get_path(message);
  const auto listener = path ? daemon.listeners_.find(path) : daemon.listeners_.end();
  if (listener == daemon.listeners_.end()) return 0;
  if (sd_bus_message_is_signal(message, nullptr, nullptr) > 0) listener->second->signalled(message);
  return 0;
}

int Daemon::onOwnerChanged(sd_bus_message* message, void* self, sd_bus_error*) {
  auto& daemon = *static_cast<Daemon*>(self);
  const char* name = nullptr;
  const char* before = nullptr;
  const char* now = nullptr;
  if (sd_bus_message_read(message, "sss", &name, &before, &now) < 0) return 0;
  if (*before != '\0') daemon.lost();
  if (*now != '\0') daemon.arrived();
  return 0;
}

void Daemon::arrived() {
  isPresent_ = true;
  for (Query* const query : std::vector(queries_)) {
    if (std::find(queries_.begin(), queries_.end(), query) != queries_.end()) query->ask();
  }
}

// A query's handler may destroy other queries, which removes them from `queries_`. This function
// therefore iterates over a copy and skips the removed queries.
void Daemon::lost() {
  isPresent_ = false;
  ++losses_;
  listeners_.clear();
  for (Query* const query : std::vector(queries_)) {
    if (std::find(queries_.begin(), queries_.end(), query) != queries_.end()) query->lost();
  }
}

Message Daemon::newBusCall(const char* method) const {
  sd_bus_message* message = nullptr;
  sd_bus_message_new_method_call(bus_.get(), &message, kBus, "/org/freedesktop/DBus", kBus, method);
  return Message(message);
}

Message Daemon::newCall(const char* method) const {
  sd_bus_message* message = nullptr;
  sd_bus_message_new_method_call(bus_.get(), &message, kAvahi, "/", "org.freedesktop.Avahi.Server2",
                                 method);
  return Message(message);
}

// The connection to the bus takes ownership of `reply`, and destroys it after the answer has
// arrived or when the connection itself is destroyed. Returns false when the message cannot be
// sent.
bool Daemon::call(sd_bus_message* message, Reply reply) {
  const auto answered = [](sd_bus_message* answer, void* receiver, sd_bus_error*) {
    (*static_cast<Reply*>(receiver))(answer);
    return 0;
  };
  auto receiver = std::make_unique<Reply>(std::move(reply));
  sd_bus_slot* created = nullptr;
  if (sd_bus_call_async(bus_.get(), &created, message, answered, receiver.get(), kForever) < 0) {
    return false;
  }
  const Slot slot(created);
  sd_bus_slot_set_destroy_callback(slot.get(), [](void* held) {
    const std::unique_ptr<Reply> freed(static_cast<Reply*>(held));
  });
  static_cast<void>(receiver.release());
  sd_bus_slot_set_floating(slot.get(), 1);
  runSoon();
  return true;
}

void Daemon::tell(const std::string& path, const char* interface, const char* method) {
  sd_bus_call_method_async(bus_.get(), nullptr, kAvahi, path.c_str(), interface, method, nullptr,
                           nullptr, nullptr);
  runSoon();
}

}  // namespace onramp::avahi
