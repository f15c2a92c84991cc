#include <CoreServices/CoreServices.h>

#include <algorithm>
#include <chrono>
#include <memory>
#include <utility>
#include <vector>

#include "platform/cfnetwork/net_service.h"
#include "platform/corefoundation/convert.h"
#include "platform/run_loop.h"

namespace onramp {

namespace {

// The pause before a retry. Without it, a search that fails immediately would keep the processor
// busy.
constexpr std::chrono::seconds kRetryPause{1};

using corefoundation::Reference;
using corefoundation::toCFString;

class CFBrowser final : public NetServiceBrowser, public std::enable_shared_from_this<CFBrowser> {
 public:
  CFBrowser(Client client, void* info) : client_(client), info_(info) {
    CFNetServiceClientContext context = {0, this, nullptr, nullptr, nullptr};
    browser_ = Reference<CFNetServiceBrowserRef>(
        CFNetServiceBrowserCreate(kCFAllocatorDefault, browsed, &context));
  }
  CFBrowser(const CFBrowser&) = delete;
  CFBrowser& operator=(const CFBrowser&) = delete;
  ~CFBrowser() override {
    if (browser_) CFNetServiceBrowserInvalidate(browser_.get());
  }

  [[nodiscard]] bool isCreated() const { return static_cast<bool>(browser_); }

  void schedule() override {
    CFNetServiceBrowserScheduleWithRunLoop(browser_.get(), CFRunLoopGetCurrent(),
                                           kCFRunLoopCommonModes);
  }
  void unschedule() override {
    CFNetServiceBrowserUnscheduleFromRunLoop(browser_.get(), CFRunLoopGetCurrent(),
                                             kCFRunLoopCommonModes);
  }

  bool searchForServices(const std::string& domain, const std::string& type) override {
    forgetSearch();
    domain_ = toCFString(domain);
    type_ = toCFString(type);
    return domain_ && type_ && start();
  }

  void invalidate() override {
    forgetSearch();
    CFNetServiceBrowserInvalidate(browser_.get());
  }

  void stopSearch() override {
    forgetSearch();
    CFNetServiceBrowserStopSearch(browser_.get(), nullptr);
  }

 private:
  bool start() {
    return CFNetServiceBrowserSearchForServices(browser_.get(), domain_.get(), type_.get(),
                                                nullptr);
  }

  void forgetSearch() {
    domain_ = Reference<CFStringRef>();
    found_.clear();
    isFailed_ = false;
    ++search_;
  }

  // `self` keeps the object alive during the call, because the client may release all other handles
  // to it.
  static void browsed(CFNetServiceBrowserRef, CFOptionFlags flags, CFTypeRef found,
                      CFStreamError* error, void* info) {
    const auto self = static_cast<CFBrowser*>(info)->shared_from_this();
    if (error && error->error != 0) {
      self->failed({error->error});
      return;
    }
    // `found` is a service, because this browser never searches for domains. The cast removes
    // const, because CFTypeRef is a pointer to const and CFNetServiceRef is not.
    const NetServiceRef service =
        cfnetwork::handleOf(static_cast<CFNetServiceRef>(const_cast<void*>(found)));
    if (!service) return;
    if (const NetServiceRef changed = self->count(service, (flags & kNetServiceFlagRemove) == 0)) {
      self->client_(self, flags, changed, {}, self->info_);
    }
  }

  // Adds a sighting of the service if `isSeen` is true, and removes one otherwise. The framework
  // may report a service once for each network interface, with a different object each time.
  // If this call adds the service's first sighting or removes its last one, returns the object with
  // which the service was first reported. Returns null otherwise.
  NetServiceRef count(const NetServiceRef& service, bool isSeen) {
    const auto known = std::find_if(found_.begin(), found_.end(), [&](const Found& found) {
      return found.service->name() == service->name() && found.service->type() == service->type() &&
             found.service->domain() == service->domain();
    });
    if (known == found_.end()) {
      if (isSeen) found_.push_back({service, 1});
      return isSeen ? service : nullptr;
    }
    known->sightings += isSeen ? 1 : -1;
    if (known->sightings > 0) return nullptr;
    NetServiceRef gone = std::move(known->service);
    found_.erase(known);
    return gone;
  }

  // Reports all services as gone, reports the error, and restarts the search after a pause. A
  // search fails, for instance, when the responder exits. The new search finds the services again.
  // Stopping the failed search may cause another error, which this function ignores.
  void failed(NetServiceError error) {
    if (isFailed_ || !domain_) return;
    isFailed_ = true;
    CFNetServiceBrowserStopSearch(browser_.get(), nullptr);
    retryLater();
    const unsigned long search = search_;
    const auto self = shared_from_this();
    for (const Found& found : std::exchange(found_, {})) {
      if (search == search_) client_(self, kNetServiceFlagRemove, found.service, {}, info_);
    }
    if (search == search_) client_(self, 0, nullptr, error, info_);
  }

  void retryLater() {
    scheduleTimer(kRetryPause, [weak = weak_from_this(), search = search_] {
      const auto self = weak.lock();
      if (!self || search != self->search_) return;
      self->isFailed_ = false;
      if (!self->start()) self->retryLater();
    });
  }

  struct Found {
    NetServiceRef service;
    int sightings;
  };

  Client client_;
  void* info_;
  Reference<CFNetServiceBrowserRef> browser_;
  Reference<CFStringRef> domain_;  ///< null while there is no search
  Reference<CFStringRef> type_;
  std::vector<Found> found_;
  unsigned long search_ = 0;  ///< this search's number; earlier searches are not retried
  bool isFailed_ = false;     ///< a retry is pending
};

}  // namespace

NetServiceBrowserRef NetServiceBrowser::create(Client client, void* info) {
  auto browser = std::make_shared<CFBrowser>(client, info);
  return browser->isCreated() ? browser : nullptr;
}

}  // namespace onramp
