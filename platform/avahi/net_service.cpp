#include "platform/avahi/net_service.h"

#include <avahi-common/domain.h>

#include <algorithm>
#include <chrono>
#include <future>
#include <utility>

#include "platform/avahi/names.h"
#include "platform/avahi/resolve_job.h"
#include "platform/avahi/responder.h"
#include "platform/run_loop.h"

namespace onramp {

namespace avahi {

namespace {

std::optional<std::chrono::milliseconds> timeLimitOf(double seconds) {
  constexpr double kLongest = 365.0 * 24 * 60 * 60;
  if (!(seconds > 0)) return std::nullopt;
  return std::chrono::ceil<std::chrono::milliseconds>(
      std::chrono::duration<double>(std::min(seconds, kLongest)));
}

class Service final : public NetService, public std::enable_shared_from_this<Service> {
 public:
  explicit Service(Sighting sighting) : sighting_(std::move(sighting)) {}
  Service(const Service&) = delete;
  Service& operator=(const Service&) = delete;
  ~Service() override { Service::cancel(); }

  [[nodiscard]] std::optional<std::string> name() const override { return sighting_.name; }
  [[nodiscard]] std::optional<std::string> type() const override { return sighting_.type + '.'; }
  [[nodiscard]] std::optional<std::string> domain() const override {
    return sighting_.domain + '.';
  }
  [[nodiscard]] std::vector<Data> addressing() const override { return addressing_; }
  [[nodiscard]] std::optional<Data> txtData() const override { return txt_; }

  void setClient(Client client, void* info) override {
    client_ = client;
    info_ = info;
  }
  void schedule() override { scheduled_ = true; }
  void unschedule() override { scheduled_ = false; }

  bool resolveWithTimeout(double seconds) override;
  void cancel() override {
    if (job_) responder_->remove(std::exchange(job_, nullptr));
  }

 private:
  void ended(unsigned long resolve, std::optional<Resolution> resolution);
  bool keep(std::optional<Resolution> resolution);

  Sighting sighting_;
  std::vector<Data> addressing_;
  std::optional<Data> txt_;
  Client client_ = nullptr;
  void* info_ = nullptr;
  bool scheduled_ = false;
  std::shared_ptr<Responder> responder_ = Responder::shared();
  std::shared_ptr<ResolveJob> job_;
  unsigned long resolve_ = 0;  ///< tells the end of this resolve from a late one of an earlier one
};

bool Service::resolveWithTimeout(double seconds) {
  const bool possible = !job_ && avahi_is_valid_service_name(sighting_.name.c_str()) &&
                        avahi_is_valid_service_type_strict(sighting_.type.c_str()) &&
                        avahi_is_valid_domain_name(sighting_.domain.c_str());
  if (!possible) return false;
  const auto timeLimit = timeLimitOf(seconds);

  if (!client_) {
    const auto answer = std::make_shared<std::promise<std::optional<Resolution>>>();
    const auto job = std::make_shared<ResolveJob>(sighting_, timeLimit, [answer](auto resolution) {
      answer->set_value(std::move(resolution));
    });
    responder_->add(job);
    auto future = answer->get_future();
    // The job's own limit does not hold while the daemon hangs.
    if (timeLimit && future.wait_for(*timeLimit) != std::future_status::ready) {
      responder_->remove(job);
      return false;
    }
    return keep(future.get());
  }

  job_ = std::make_shared<ResolveJob>(
      sighting_, timeLimit, [weak = weak_from_this(), resolve = ++resolve_](auto resolution) {
        performOnMainThread([weak, resolve, resolution = std::move(resolution)] {
          if (const auto service = weak.lock()) service->ended(resolve, resolution);
        });
      });
  responder_->add(job_);
  return true;
}

bool Service::keep(std::optional<Resolution> resolution) {
  if (!resolution) return false;
  addressing_ = std::move(resolution->addressing);
  txt_ = std::move(resolution->txt);
  return true;
}

void Service::ended(unsigned long resolve, std::optional<Resolution> resolution) {
  if (!job_ || resolve != resolve_) return;
  job_.reset();
  const NetServiceError error{keep(std::move(resolution)) ? 0 : kNetServiceErrorTimeout};
  if (scheduled_ && client_) client_(shared_from_this(), error, info_);
}

}  // namespace

NetServiceRef makeService(Sighting sighting) {
  return std::make_shared<Service>(std::move(sighting));
}

}  // namespace avahi

NetServiceRef NetService::create(const std::string& domain, const std::string& type,
                                 const std::string& name, std::int32_t) {
  using avahi::withoutClosingDot;
  return avahi::makeService({AVAHI_IF_UNSPEC, AVAHI_PROTO_UNSPEC, name, withoutClosingDot(type),
                             withoutClosingDot(domain)});
}

}  // namespace onramp
