#include <CoreServices/CoreServices.h>

#include <memory>

#include "platform/cfnetwork/net_service.h"
#include "platform/corefoundation/convert.h"

namespace onramp {

namespace {

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
    const Reference<CFStringRef> domainString = toCFString(domain);
    const Reference<CFStringRef> typeString = toCFString(type);
    return domainString && typeString &&
           CFNetServiceBrowserSearchForServices(browser_.get(), domainString.get(),
                                                typeString.get(), nullptr);
  }

  void invalidate() override { CFNetServiceBrowserInvalidate(browser_.get()); }

  void stopSearch() override { CFNetServiceBrowserStopSearch(browser_.get(), nullptr); }

 private:
  // The client may let go of the last handle. What was found is a service: domains are not asked
  // for.
  static void browsed(CFNetServiceBrowserRef, CFOptionFlags flags, CFTypeRef found,
                      CFStreamError* error, void* info) {
    const auto self = static_cast<CFBrowser*>(info)->shared_from_this();
    const NetServiceError problem = {error ? error->error : 0};
    // CFNetServiceRef is not const, where what is found comes as a constant object.
    auto* const service = static_cast<CFNetServiceRef>(const_cast<void*>(found));
    self->client_(self, flags, problem.code == 0 ? cfnetwork::handleOf(service) : nullptr, problem,
                  self->info_);
  }

  Client client_;
  void* info_;
  Reference<CFNetServiceBrowserRef> browser_;
};

}  // namespace

NetServiceBrowserRef NetServiceBrowser::create(Client client, void* info) {
  auto browser = std::make_shared<CFBrowser>(client, info);
  return browser->isCreated() ? browser : nullptr;
}

}  // namespace onramp
