#include "platform/cfnetwork/net_service.h"

#include <map>
#include <memory>
#include <utility>

#include "platform/corefoundation/convert.h"

namespace onramp {

namespace {

using corefoundation::Reference;
using corefoundation::toCFString;
using corefoundation::toString;

class CFService;

// Returns the table of existing handles. Its keys are the framework's objects that the handles own.
std::map<CFNetServiceRef, std::weak_ptr<CFService>>& liveServices() {
  static std::map<CFNetServiceRef, std::weak_ptr<CFService>> services;
  return services;
}

class CFService final : public NetService, public std::enable_shared_from_this<CFService> {
 public:
  explicit CFService(Reference<CFNetServiceRef> service) : service_(std::move(service)) {}
  CFService(const CFService&) = delete;
  CFService& operator=(const CFService&) = delete;
  ~CFService() override {
    unschedule();
    setClient(nullptr, nullptr);
    cancel();
    liveServices().erase(service_.get());
  }

  [[nodiscard]] std::optional<std::string> name() const override {
    return toString(CFNetServiceGetName(service_.get()));
  }
  [[nodiscard]] std::optional<std::string> type() const override {
    return toString(CFNetServiceGetType(service_.get()));
  }
  [[nodiscard]] std::optional<std::string> domain() const override {
    return toString(CFNetServiceGetDomain(service_.get()));
  }

  [[nodiscard]] std::vector<Data> addressing() const override {
    std::vector<Data> addresses;
    const CFArrayRef array = isResolved_ ? CFNetServiceGetAddressing(service_.get()) : nullptr;
    const CFIndex count = array ? CFArrayGetCount(array) : 0;
    for (CFIndex index = 0; index < count; ++index) {
      addresses.push_back(
          corefoundation::toData(static_cast<CFDataRef>(CFArrayGetValueAtIndex(array, index))));
    }
    return addresses;
  }

  [[nodiscard]] std::optional<Data> txtData() const override {
    const CFDataRef data = isResolved_ ? CFNetServiceGetTXTData(service_.get()) : nullptr;
    return data ? std::optional(corefoundation::toData(data)) : std::nullopt;
  }

  void setClient(Client client, void* info) override {
    client_ = client;
    info_ = info;
    if (!client) {
      CFNetServiceSetClient(service_.get(), nullptr, nullptr);
      return;
    }
    CFNetServiceClientContext context = {0, this, nullptr, nullptr, nullptr};
    CFNetServiceSetClient(service_.get(), resolved, &context);
  }

  void schedule() override {
    CFNetServiceScheduleWithRunLoop(service_.get(), CFRunLoopGetCurrent(), kCFRunLoopCommonModes);
  }
  void unschedule() override {
    CFNetServiceUnscheduleFromRunLoop(service_.get(), CFRunLoopGetCurrent(), kCFRunLoopCommonModes);
  }

  bool resolveWithTimeout(std::chrono::duration<double> timeLimit) override {
    isResolved_ = false;
    const bool done = CFNetServiceResolveWithTimeout(service_.get(), timeLimit.count(), nullptr);
    if (!client_) isResolved_ = done;
    return done;
  }

  void cancel() override { CFNetServiceCancel(service_.get()); }

 private:
  // `self` keeps the object alive during the call, because the client may release all other handles
  // to it.
  static void resolved(CFNetServiceRef, CFStreamError* error, void* info) {
    const auto self = static_cast<CFService*>(info)->shared_from_this();
    self->isResolved_ = !error || error->error == 0;
    if (self->client_) self->client_(self, {error ? error->error : 0}, self->info_);
  }

  Reference<CFNetServiceRef> service_;
  Client client_ = nullptr;
  void* info_ = nullptr;
  /// Whether the last resolve has succeeded. After a failed resolve, the framework may still return
  /// the results of an earlier one.
  bool isResolved_ = false;
};

}  // namespace

NetServiceRef cfnetwork::handleOf(CFNetServiceRef service) {
  if (!service) return nullptr;
  std::weak_ptr<CFService>& known = liveServices()[service];
  std::shared_ptr<CFService> handle = known.lock();
  if (!handle) {
    handle = std::make_shared<CFService>(Reference<CFNetServiceRef>::retaining(service));
    known = handle;
  }
  return handle;
}

NetServiceRef NetService::create(const std::string& domain, const std::string& type,
                                 const std::string& name, std::int32_t port) {
  const Reference<CFStringRef> domainString = toCFString(domain);
  const Reference<CFStringRef> typeString = toCFString(type);
  const Reference<CFStringRef> nameString = toCFString(name);
  if (!domainString || !typeString || !nameString) return nullptr;
  const Reference<CFNetServiceRef> service(CFNetServiceCreate(
      kCFAllocatorDefault, domainString.get(), typeString.get(), nameString.get(), port));
  return cfnetwork::handleOf(service.get());
}

}  // namespace onramp
