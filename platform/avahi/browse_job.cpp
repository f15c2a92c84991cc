#include "platform/avahi/browse_job.h"

#include <utility>

#include "platform/avahi/connection.h"

namespace onramp::avahi {

BrowseJob::BrowseJob(std::string type, std::string domain, Report report)
    : type_(std::move(type)), domain_(std::move(domain)), report_(std::move(report)) {}

void BrowseJob::begin(Connection& connection) {
  connection_ = &connection;
}

bool BrowseJob::start(Connection& connection) {
  browser_.reset(avahi_service_browser_new(
      connection.client(), AVAHI_IF_UNSPEC, AVAHI_PROTO_UNSPEC, type_.c_str(),
      domain_.empty() ? nullptr : domain_.c_str(), {}, called, this));
  return running();
}

void BrowseJob::lost() {
  report_(BrowseEvent::kAllGone, {});
}

void BrowseJob::called(AvahiServiceBrowser*, AvahiIfIndex interface, AvahiProtocol protocol,
                       AvahiBrowserEvent event, const char* name, const char* type,
                       const char* domain, AvahiLookupResultFlags, void* self) {
  auto& job = *static_cast<BrowseJob*>(self);
  switch (event) {
    case AVAHI_BROWSER_NEW:
      job.report_(BrowseEvent::kFound, {interface, protocol, name, type, domain});
      break;
    case AVAHI_BROWSER_REMOVE:
      job.report_(BrowseEvent::kGone, {interface, protocol, name, type, domain});
      break;
    case AVAHI_BROWSER_FAILURE:
      job.connection_->restart(job.shared_from_this());
      break;
    case AVAHI_BROWSER_CACHE_EXHAUSTED:
    case AVAHI_BROWSER_ALL_FOR_NOW:
      break;
  }
}

}  // namespace onramp::avahi
