#include <map>
#include <memory>
#include <utility>

#include "platform/avahi/daemon.h"
#include "platform/avahi/net_service.h"
#include "platform/avahi/query.h"
#include "platform/avahi/records.h"
#include "platform/avahi/sighting_watch.h"
#include "platform/avahi/sightings.h"
#include "platform/net_service.h"
#include "platform/run_loop.h"

namespace onramp {

namespace avahi {

namespace {

constexpr const char* kLocalDomain = "local";
constexpr int kDomainsToBrowse = 0;  // the daemon's code for finding domains to browse

class Browser final : public NetServiceBrowser, public std::enable_shared_from_this<Browser> {
 public:
  Browser(Client client, void* info) : client_(client), info_(info) {}
  Browser(const Browser&) = delete;
  Browser& operator=(const Browser&) = delete;
  ~Browser() override { Browser::stopSearch(); }

  void schedule() override { isScheduled_ = true; }
  void unschedule() override { isScheduled_ = false; }
  bool searchForServices(const std::string& domain, const std::string& type) override;
  void invalidate() override {
    client_ = nullptr;
    stopSearch();
  }
  void stopSearch() override;

 private:
  /// The search in one domain.
  struct Browse {
    Sightings<Instance> sightings;
    std::unique_ptr<Query> query;
  };

  void browse(const std::string& domain);
  void domainEvent(Query::Event event, sd_bus_message* message);
  void serviceEvent(Browse& browse, Query::Event event, sd_bus_message* message);
  void leave(const std::string& domain);
  void found(const Instance& instance);
  void gone(const Instance& instance);
  void tell(unsigned long flags, const NetServiceRef& service);

  Client client_;
  void* info_;
  bool isScheduled_ = false;
  unsigned long search_ = 0;  ///< this search's number; events of earlier searches are ignored
  std::string type_;
  /// The services that have been found. When a service is gone, the client gets the same object as
  /// when it was found.
  std::map<Instance, NetServiceRef> services_;
  std::shared_ptr<Daemon> daemon_;         ///< held while a search runs
  std::map<std::string, Browse> browses_;  ///< the searches, by domain
  Sightings<std::string> domains_;
  std::unique_ptr<Query> domainQuery_;
};

// If `domain` is empty, a DomainBrowser query finds the domains that the computer or its network
// recommends for browsing. The query never reports the local domain, so this function adds it.
bool Browser::searchForServices(const std::string& domain, const std::string& type) {
  if (!client_ || daemon_) return false;
  daemon_ = Daemon::shared();
  if (!daemon_) return false;
  type_ = withoutClosingDot(type);
  browse(domain.empty() ? kLocalDomain : withoutClosingDot(domain));
  if (!domain.empty()) return true;
  domainQuery_ = std::make_unique<Query>(
      *daemon_, "DomainBrowser",
      [](sd_bus_message* call) {
        return sd_bus_message_append(call, "iisiu", kAnyInterface, kAnyProtocol, "",
                                     kDomainsToBrowse, 0U);
      },
      [this](Query::Event event, sd_bus_message* message) { domainEvent(event, message); });
  return true;
}

void Browser::stopSearch() {
  ++search_;
  domainQuery_.reset();
  domains_.clear();
  browses_.clear();
  services_.clear();
  daemon_.reset();
}

void Browser::browse(const std::string& domain) {
  const auto [entry, isNew] = browses_.try_emplace(domain);
  if (!isNew) return;
  Browse& browse = entry->second;
  browse.query = std::make_unique<Query>(
      *daemon_, "ServiceBrowser",
      [type = type_, domain](sd_bus_message* call) {
        return sd_bus_message_append(call, "iissu", kAnyInterface, kAnyProtocol, type.c_str(),
                                     domain.c_str(), 0U);
      },
      [this, &browse](Query::Event event, sd_bus_message* message) {
        serviceEvent(browse, event, message);
      });
}

void Browser::leave(const std::string& domain) {
  const auto browse = browses_.find(domain);
  if (browse == browses_.end() || domain == kLocalDomain) return;
  for (const Instance& instance : browse->second.sightings.clear())
    gone(instance);
  browses_.erase(browse);
}

void Browser::domainEvent(Query::Event event, sd_bus_message* message) {
  if (event == Query::Event::kCacheExhausted) return;
  if (event == Query::Event::kLost) {
    for (const std::string& domain : domains_.clear())
      leave(domain);
    return;
  }
  Place place;
  const char* domain = nullptr;
  if (sd_bus_message_read(message, "iis", &place.first, &place.second, &domain) <= 0) return;
  if (event == Query::Event::kFound && domains_.add(domain, place)) browse(domain);
  if (event == Query::Event::kGone && domains_.remove(domain, place)) leave(domain);
}

void Browser::serviceEvent(Browse& browse, Query::Event event, sd_bus_message* message) {
  if (event == Query::Event::kCacheExhausted) return;
  if (event == Query::Event::kLost) {
    for (const Instance& instance : browse.sightings.clear())
      gone(instance);
    return;
  }
  Place place;
  const char* name = nullptr;
  const char* type = nullptr;
  const char* domain = nullptr;
  if (sd_bus_message_read(message, "iisss", &place.first, &place.second, &name, &type, &domain) <=
      0) {
    return;
  }
  const Instance instance{name, type, domain};
  tellSighting(instance, place, event == Query::Event::kGone);
  if (event == Query::Event::kFound && browse.sightings.add(instance, place)) found(instance);
  if (event == Query::Event::kGone && browse.sightings.remove(instance, place)) gone(instance);
}

void Browser::found(const Instance& instance) {
  const NetServiceRef service = makeService(instance);
  services_[instance] = service;
  tell(0, service);
}

void Browser::gone(const Instance& instance) {
  if (const auto node = services_.extract(instance)) tell(kNetServiceFlagRemove, node.mapped());
}

// The client is called from the main loop, not from inside sd-event's loop. So the client may
// destroy any object. A slow client does not delay the messages that are already waiting, because
// sd-event's loop reads them before the client is called.
void Browser::tell(unsigned long flags, const NetServiceRef& service) {
  performOnMainThread([weak = weak_from_this(), search = search_, flags, service] {
    const auto browser = weak.lock();
    if (!browser || search != browser->search_ || !browser->client_ || !browser->isScheduled_) {
      return;
    }
    browser->client_(browser, flags, service, {}, browser->info_);
  });
}

}  // namespace

}  // namespace avahi

NetServiceBrowserRef NetServiceBrowser::create(Client client, void* info) {
  return std::make_shared<avahi::Browser>(client, info);
}

}  // namespace onramp
