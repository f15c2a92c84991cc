// A stand-in for the network services of CFNetwork; CoreFoundation/CoreFoundation.h says what the
// stand-ins are for.
#pragma once

#include <CoreFoundation/CoreFoundation.h>

struct CFStreamError {
  CFIndex domain;
  SInt32 error;
};

struct CFNetServiceClientContext {
  CFIndex version;
  void* info;
  std::nullptr_t retain, release, copyDescription;
};

namespace standin {

/// The members that services and browsers have in common. `isScheduled` is true while the object is
/// scheduled on the main loop in the common modes.
template <typename Client>
struct Scheduled : Object {
  Scheduled() : Object(kOther) {}

  Client client = nullptr;
  void* info = nullptr;
  bool isScheduled = false;
  bool isRunning = false;  // whether a search or a resolve is running
};

struct Service : Scheduled<void (*)(Service*, CFStreamError*, void*)> {
  Service() { last = this; }

  static inline Service* last = nullptr;
  CFArrayRef addresses = nullptr;
  CFDataRef txt = nullptr;
};

struct Browser : Scheduled<void (*)(Browser*, CFOptionFlags, CFTypeRef, CFStreamError*, void*)> {
  Browser() { last = this; }

  static inline Browser* last = nullptr;
  std::string searched;
};

template <typename Part, bool kIsScheduled>
void setScheduled(Part* part, CFRunLoopRef loop, const char* modes) {
  if (loop == kMainLoop && modes == kCFRunLoopCommonModes) part->isScheduled = kIsScheduled;
}

}  // namespace standin

using CFNetServiceRef = standin::Service*;
using CFNetServiceBrowserRef = standin::Browser*;

inline const auto CFNetServiceCreate = [](std::nullptr_t, CFStringRef domain, CFStringRef type,
                                          CFStringRef name, SInt32) {
  auto* const service = new standin::Service;
  for (const CFStringRef text : {domain, type, name})
    CFArrayAppendValue(service, text);
  return service;
};
inline const auto CFNetServiceGetDomain = [](CFNetServiceRef s) { return s->members[0]; };
inline const auto CFNetServiceGetType = [](CFNetServiceRef s) { return s->members[1]; };
inline const auto CFNetServiceGetName = [](CFNetServiceRef s) { return s->members[2]; };
inline const auto CFNetServiceGetAddressing = [](CFNetServiceRef s) { return s->addresses; };
inline const auto CFNetServiceGetTXTData = [](CFNetServiceRef s) { return s->txt; };
inline const auto CFNetServiceSetClient = [](CFNetServiceRef service,
                                             decltype(standin::Service::client) client,
                                             CFNetServiceClientContext* context) {
  service->client = client;
  service->info = context ? context->info : nullptr;
};
inline const auto CFNetServiceScheduleWithRunLoop = standin::setScheduled<standin::Service, true>;
inline const auto CFNetServiceUnscheduleFromRunLoop =
    standin::setScheduled<standin::Service, false>;
inline const auto CFNetServiceResolveWithTimeout = [](CFNetServiceRef service, double,
                                                      CFStreamError*) {
  return service->isRunning = service->client != nullptr;
};
inline const auto CFNetServiceCancel = [](CFNetServiceRef service) { service->isRunning = false; };

inline const auto CFNetServiceBrowserCreate = [](std::nullptr_t,
                                                 decltype(standin::Browser::client) client,
                                                 CFNetServiceClientContext* context) {
  auto* const browser = new standin::Browser;
  browser->client = client;
  browser->info = context->info;
  return browser;
};
inline const auto CFNetServiceBrowserScheduleWithRunLoop =
    standin::setScheduled<standin::Browser, true>;
inline const auto CFNetServiceBrowserUnscheduleFromRunLoop =
    standin::setScheduled<standin::Browser, false>;
inline const auto CFNetServiceBrowserSearchForServices =
    [](CFNetServiceBrowserRef browser, CFStringRef domain, CFStringRef type, CFStreamError*) {
      browser->searched = type->bytes + " in " + domain->bytes;
      return browser->isRunning = true;
    };
inline const auto CFNetServiceBrowserStopSearch =
    [](CFNetServiceBrowserRef browser, CFStreamError*) { browser->isRunning = false; };
inline const auto CFNetServiceBrowserInvalidate = [](CFNetServiceBrowserRef browser) {
  browser->client = nullptr;
  browser->isRunning = false;
};
