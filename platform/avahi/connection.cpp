#include "platform/avahi/connection.h"

#include <chrono>

#include "platform/avahi/host_addresses.h"

namespace onramp::avahi {

namespace {

// What fails at once is not tried again at once, so that nothing ever keeps the processor busy.
constexpr std::chrono::milliseconds kRetryPause{1000};

// Freeing takes as many calls as asking does, and in a burst of services the next one waits.
constexpr std::chrono::milliseconds kQuiet{50};
// Well below the objects that a daemon allows each client.
constexpr std::size_t kMostFinished = 200;

}  // namespace

Connection::Connection(Loop& loop)
    : loop_(loop),
      retry_(loop, [this] { client_ ? startJobs() : connect(); }),
      quiet_(loop, [this] { freeFinished(); }) {}

Connection::~Connection() {
  freeFinished();
  for (const auto& job : jobs_)
    job->stop();
}

void Connection::add(const std::shared_ptr<Job>& job) {
  jobs_.insert(job);
  job->begin(*this);
  if (!client_) {
    connect();
  } else if (connected_ && !job->start(*this)) {
    retryLater();
  }
}

void Connection::remove(const std::shared_ptr<Job>& job) {
  if (jobs_.erase(job) == 0) return;
  job->stop();
}

void Connection::finish(const std::shared_ptr<Job>& job) {
  loop_.post([this, job] {
    if (jobs_.erase(job) == 0) return;
    finished_.push_back(job);
    if (finished_.size() >= kMostFinished) freeFinished();
    quiet_.start(kQuiet);
  });
}

void Connection::restart(const std::shared_ptr<Job>& job) {
  loop_.post([this, job] {
    if (!jobs_.contains(job)) return;
    job->stop();
    job->lost();
    retryLater();
  });
}

void Connection::freeFinished() {
  for (const auto& job : std::exchange(finished_, {}))
    job->stop();
}

void Connection::retryLater() {
  retry_.ensure(kRetryPause);
}

std::shared_ptr<HostAddresses> Connection::addressesOf(AvahiIfIndex interface,
                                                       const std::string& host) {
  std::erase_if(hosts_, [](const auto& entry) { return entry.second.expired(); });
  auto& known = hosts_[{interface, host}];
  if (auto addresses = known.lock()) return addresses;
  auto addresses = HostAddresses::lookUp(*this, interface, host);
  known = addresses;
  return addresses;
}

void Connection::connect() {
  const auto callback = [](AvahiClient*, AvahiClientState state, void* self) {
    static_cast<Connection*>(self)->stateChanged(state);
  };
  // Without a daemon the client waits for one to appear on the bus; without a bus there is none.
  bus_ = Bus::open(loop_, [this] { loop_.post([this] { disconnect(); }); });
  if (bus_) {
    client_.reset(avahi_client_new(&loop_.api(), AVAHI_CLIENT_NO_FAIL, callback, this, nullptr));
  }
  if (!client_) retryLater();
}

void Connection::disconnect() {
  connected_ = false;
  freeFinished();
  for (const auto& job : jobs_)
    job->stop();
  client_.reset();
  bus_.reset();
  for (const auto& job : jobs_)
    job->lost();
  retryLater();
}

// Avahi calls this while a client is being made, too, so all that needs one is put off.
void Connection::stateChanged(AvahiClientState state) {
  switch (state) {
    case AVAHI_CLIENT_S_REGISTERING:
    case AVAHI_CLIENT_S_RUNNING:
    case AVAHI_CLIENT_S_COLLISION:
      loop_.post([this] {
        connected_ = client_ != nullptr;
        if (connected_) startJobs();
      });
      break;
    case AVAHI_CLIENT_FAILURE:
      loop_.post([this] { disconnect(); });
      break;
    case AVAHI_CLIENT_CONNECTING:
      break;
  }
}

void Connection::startJobs() {
  if (!connected_) return;
  bool allRun = true;
  for (const auto& job : jobs_)
    allRun = (job->running() || job->start(*this)) && allRun;
  if (!allRun) retryLater();
}

}  // namespace onramp::avahi
