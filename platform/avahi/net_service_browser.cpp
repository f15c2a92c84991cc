#include <avahi-common/domain.h>

#include <map>
#include <memory>
#include <utility>

#include "platform/avahi/browse_job.h"
#include "platform/avahi/names.h"
#include "platform/avahi/net_service.h"
#include "platform/avahi/responder.h"
#include "platform/net_service.h"
#include "platform/run_loop.h"

namespace onramp {

namespace avahi {

namespace {

class Browser final : public NetServiceBrowser, public std::enable_shared_from_this<Browser> {
 public:
  Browser(Client client, void* info) : client_(client), info_(info) {}
  Browser(const Browser&) = delete;
  Browser& operator=(const Browser&) = delete;
  ~Browser() override { Browser::stopSearch(); }

  void schedule() override { scheduled_ = true; }
  void unschedule() override { scheduled_ = false; }
  bool searchForServices(const std::string& domain, const std::string& type) override;
  void invalidate() override {
    client_ = nullptr;
    stopSearch();
  }
  void stopSearch() override {
    if (!job_) return;
    responder_->remove(std::exchange(job_, nullptr));
    services_.clear();
    ++search_;
  }

 private:
  void happened(unsigned long search, BrowseEvent event, const Sighting& sighting);
  void tell(unsigned long flags, const NetServiceRef& service);

  Client client_;
  void* info_;
  bool scheduled_ = false;
  std::shared_ptr<Responder> responder_ = Responder::shared();
  std::shared_ptr<BrowseJob> job_;
  unsigned long search_ = 0;  ///< tells events of this search from late ones of an earlier one
  // What was told of, so that a removal comes with the same object.
  std::map<Sighting, NetServiceRef> services_;
};

bool Browser::searchForServices(const std::string& domain, const std::string& type) {
  const std::string bareType = withoutClosingDot(type);
  const std::string bareDomain = withoutClosingDot(domain);
  const bool possible = client_ && !job_ && avahi_is_valid_service_type_generic(bareType.c_str()) &&
                        avahi_is_valid_domain_name(bareDomain.c_str());
  if (!possible) return false;
  job_ = std::make_shared<BrowseJob>(
      bareType, bareDomain,
      [weak = weak_from_this(), search = search_](BrowseEvent event, const Sighting& sighting) {
        performOnMainThread([weak, search, event, sighting] {
          if (const auto browser = weak.lock()) browser->happened(search, event, sighting);
        });
      });
  responder_->add(job_);
  return true;
}

void Browser::happened(unsigned long search, BrowseEvent event, const Sighting& sighting) {
  if (search != search_) return;
  switch (event) {
    case BrowseEvent::kFound:
      if (const auto [entry, isNew] = services_.try_emplace(sighting); isNew) {
        const NetServiceRef service = entry->second = makeService(sighting);
        tell(0, service);
      }
      break;
    case BrowseEvent::kGone:
      if (const auto node = services_.extract(sighting)) tell(kNetServiceFlagRemove, node.mapped());
      break;
    case BrowseEvent::kAllGone:
      // Whoever is told may end this search.
      while (search == search_ && !services_.empty()) {
        const auto node = services_.extract(services_.begin());
        tell(kNetServiceFlagRemove, node.mapped());
      }
      break;
  }
}

void Browser::tell(unsigned long flags, const NetServiceRef& service) {
  if (client_ && scheduled_) client_(shared_from_this(), flags, service, {}, info_);
}

}  // namespace

}  // namespace avahi

NetServiceBrowserRef NetServiceBrowser::create(Client client, void* info) {
  return std::make_shared<avahi::Browser>(client, info);
}

}  // namespace onramp
