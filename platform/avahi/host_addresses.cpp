#include "platform/avahi/host_addresses.h"

#include <avahi-common/defs.h>

#include <algorithm>
#include <chrono>
#include <cstdint>
#include <cstring>
#include <optional>
#include <utility>

#include "platform/avahi/connection.h"

namespace onramp::avahi {

namespace {

// Long enough for a question to be asked again once after its first answer was lost.
constexpr std::chrono::milliseconds kPatienceForIPv4{2000};

bool sameAddress(const AvahiAddress& a, const AvahiAddress& b) {
  return avahi_address_cmp(&a, &b) == 0;
}

std::optional<AvahiAddress> addressIn(std::uint16_t type, const void* data, std::size_t size) {
  AvahiAddress address{};
  if (type == AVAHI_DNS_TYPE_A && size == sizeof address.data.ipv4) {
    address.proto = AVAHI_PROTO_INET;
  } else if (type == AVAHI_DNS_TYPE_AAAA && size == sizeof address.data.ipv6) {
    address.proto = AVAHI_PROTO_INET6;
  } else {
    return std::nullopt;
  }
  std::memcpy(address.data.data, data, size);
  return address;
}

}  // namespace

HostAddresses::HostAddresses(Connection& connection, AvahiIfIndex interface, std::string host)
    : connection_(connection),
      interface_(interface),
      host_(std::move(host)),
      patience_(connection.loop(), [this] {
        patient_ = false;
        check();
      }) {}

std::shared_ptr<HostAddresses> HostAddresses::lookUp(Connection& connection, AvahiIfIndex interface,
                                                     const std::string& host) {
  std::shared_ptr<HostAddresses> self(new HostAddresses(connection, interface, host));
  self->ipv4_ = self->browse(AVAHI_DNS_TYPE_A);
  return self->ipv4_ ? self : nullptr;
}

void HostAddresses::wantIPv6() {
  if (!ipv6_) ipv6_ = browse(AVAHI_DNS_TYPE_AAAA);
}

RecordBrowserHandle HostAddresses::browse(std::uint16_t type) {
  RecordBrowserHandle browser(avahi_record_browser_new(connection_.client(), interface_,
                                                       AVAHI_PROTO_UNSPEC, host_.c_str(),
                                                       AVAHI_DNS_CLASS_IN, type, {}, called, this));
  if (browser) ++unanswered_;
  return browser;
}

void HostAddresses::whenKnown(std::function<void()> action) {
  waiting_.push_back(std::move(action));
  check();
}

std::vector<AvahiAddress> HostAddresses::addresses() const {
  std::vector<AvahiAddress> addresses;
  for (const Record& record : records_) {
    const bool listed = std::any_of(addresses.begin(), addresses.end(), [&](const AvahiAddress& a) {
      return sameAddress(a, record.address);
    });
    if (!listed) addresses.push_back(record.address);
  }
  return addresses;
}

void HostAddresses::called(AvahiRecordBrowser*, AvahiIfIndex, AvahiProtocol protocol,
                           AvahiBrowserEvent event, const char*, std::uint16_t, std::uint16_t type,
                           const void* data, std::size_t size, AvahiLookupResultFlags, void* self) {
  auto& host = *static_cast<HostAddresses*>(self);
  switch (event) {
    case AVAHI_BROWSER_NEW:
      if (const auto address = addressIn(type, data, size)) {
        host.records_.push_back({protocol, *address});
        host.check();
      }
      break;
    case AVAHI_BROWSER_REMOVE:
      if (const auto address = addressIn(type, data, size)) {
        std::erase_if(host.records_, [&](const Record& r) {
          return r.heardBy == protocol && sameAddress(r.address, *address);
        });
      }
      break;
    case AVAHI_BROWSER_CACHE_EXHAUSTED:
    case AVAHI_BROWSER_FAILURE:
      host.exhausted();
      break;
    case AVAHI_BROWSER_ALL_FOR_NOW:
      break;
  }
}

void HostAddresses::exhausted() {
  if (unanswered_ == 0 || --unanswered_ != 0) return;
  patience_.start(kPatienceForIPv4);
  if (records_.empty()) wantIPv6();
  check();
}

bool HostAddresses::known() const {
  if (unanswered_ != 0 || records_.empty()) return false;
  return !patient_ || std::any_of(records_.begin(), records_.end(), [](const Record& record) {
    return record.address.proto == AVAHI_PROTO_INET;
  });
}

void HostAddresses::check() {
  if (waiting_.empty() || !known()) return;
  connection_.loop().post([weak = weak_from_this()] {
    const auto self = weak.lock();
    if (!self) return;
    for (const auto& action : std::exchange(self->waiting_, {}))
      action();
  });
}

}  // namespace onramp::avahi
