#include "platform/avahi/net_service.h"

#include <algorithm>
#include <chrono>
#include <utility>

#include "platform/avahi/daemon.h"
#include "platform/avahi/resolve.h"
#include "platform/run_loop.h"

namespace onramp {

namespace avahi {

namespace {

std::optional<std::chrono::milliseconds> timeLimitOf(std::chrono::duration<double> limit) {
  constexpr std::chrono::duration<double> kLongest = std::chrono::years(1);
  if (!(limit.count() > 0)) return std::nullopt;
  return std::chrono::ceil<std::chrono::milliseconds>(std::min(limit, kLongest));
}

class Service final : public NetService, public std::enable_shared_from_this<Service> {
 public:
  explicit Service(Instance instance) : instance_(std::move(instance)) {}
  Service(const Service&) = delete;
  Service& operator=(const Service&) = delete;
  ~Service() override { Service::cancel(); }

  [[nodiscard]] std::optional<std::string> name() const override { return instance_.name; }
  [[nodiscard]] std::optional<std::string> type() const override { return instance_.type + '.'; }
  [[nodiscard]] std::optional<std::string> domain() const override {
    return instance_.domain + '.';
  }
  [[nodiscard]] std::vector<Data> addressing() const override { return addressing_; }
  [[nodiscard]] std::optional<Data> txtData() const override { return txt_; }

  void setClient(Client client, void* info) override {
    client_ = client;
    info_ = info;
  }
  void schedule() override { isScheduled_ = true; }
  void unschedule() override { isScheduled_ = false; }

  bool resolveWithTimeout(std::chrono::duration<double> timeLimit) override;
  void cancel() override {
    resolve_.reset();
    daemon_.reset();
  }

 private:
  using TimeLimit = std::optional<std::chrono::milliseconds>;

  bool startResolve(TimeLimit timeLimit);
  bool resolveNow(TimeLimit timeLimit);
  void ended(unsigned long resolve, std::optional<Resolution> resolution);
  bool keep(std::optional<Resolution> resolution);

  Instance instance_;
  std::vector<Data> addressing_;
  std::optional<Data> txt_;
  Client client_ = nullptr;
  void* info_ = nullptr;
  bool isScheduled_ = false;
  std::shared_ptr<Daemon> daemon_;  ///< held while a resolve with a client runs
  std::unique_ptr<Resolve> resolve_;
  // The number of the newest resolve. A late report from an earlier resolve is ignored.
  unsigned long resolves_ = 0;
};

bool Service::resolveWithTimeout(std::chrono::duration<double> timeLimit) {
  if (resolve_) return false;
  addressing_.clear();
  txt_.reset();
  return client_ ? startResolve(timeLimitOf(timeLimit)) : resolveNow(timeLimitOf(timeLimit));
}

// The client is called from the main loop, not from inside sd-event's loop. So the client may
// destroy any object. A slow client does not delay the messages that are already waiting, because
// sd-event's loop reads them before the client is called.
bool Service::startResolve(TimeLimit timeLimit) {
  daemon_ = Daemon::shared();
  if (!daemon_) return false;
  const auto report = [weak = weak_from_this(), number = ++resolves_](auto resolution) {
    performOnMainThread([weak, number, resolution = std::move(resolution)] {
      if (const auto service = weak.lock()) service->ended(number, resolution);
    });
  };
  resolve_ = std::make_unique<Resolve>(*daemon_, instance_, timeLimit, report);
  return true;
}

// Uses a separate connection, so that no other client is called while this call blocks.
bool Service::resolveNow(TimeLimit timeLimit) {
  const auto daemon = Daemon::create();
  if (!daemon) return false;
  bool hasEnded = false;
  std::optional<Resolution> found;
  const Resolve resolve(*daemon, instance_, timeLimit, [&](auto resolution) {
    found = std::move(resolution);
    hasEnded = true;
  });
  daemon->runUntil([&] { return hasEnded || resolve.isRefused(); });
  return keep(std::move(found));
}

bool Service::keep(std::optional<Resolution> resolution) {
  if (!resolution) return false;
  addressing_ = std::move(resolution->addressing);
  txt_ = std::move(resolution->txt);
  return true;
}

void Service::ended(unsigned long resolve, std::optional<Resolution> resolution) {
  if (!resolve_ || resolve != resolves_) return;
  cancel();
  const NetServiceError error{keep(std::move(resolution)) ? 0 : kNetServiceErrorTimeout};
  if (isScheduled_ && client_) client_(shared_from_this(), error, info_);
}

}  // namespace

NetServiceRef makeService(Instance instance) {
  return std::make_shared<Service>(std::move(instance));
}

}  // namespace avahi

NetServiceRef NetService::create(const std::string& domain, const std::string& type,
                                 const std::string& name, std::int32_t) {
  using avahi::withoutClosingDot;
  return avahi::makeService({name, withoutClosingDot(type), withoutClosingDot(domain)});
}

}  // namespace onramp
