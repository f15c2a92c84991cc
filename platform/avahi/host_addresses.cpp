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

std::optional<AvahiAddress> addressIn(const RecordBrowser::Event& event) {
  AvahiAddress address{};
  if (event.type == AVAHI_DNS_TYPE_A && event.data.size() == sizeof address.data.ipv4) {
    address.proto = AVAHI_PROTO_INET;
  } else if (event.type == AVAHI_DNS_TYPE_AAAA && event.data.size() == sizeof address.data.ipv6) {
    address.proto = AVAHI_PROTO_INET6;
  } else {
    return std::nullopt;
  }
  std::memcpy(address.data.data, event.data.data(), event.data.size());
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
  self->browse(self->ipv4_, AVAHI_DNS_TYPE_A);
  return self;
}

void HostAddresses::wantIPv6() {
  if (!ipv6_) browse(ipv6_, AVAHI_DNS_TYPE_AAAA);
}

void HostAddresses::browse(std::optional<RecordBrowser>& browser, std::uint16_t type) {
  ++unanswered_;
  browser.emplace(connection_.bus(), interface_, host_, type,
                  [this](const RecordBrowser::Event& event) { happened(event); });
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

void HostAddresses::happened(const RecordBrowser::Event& event) {
  const auto address = addressIn(event);
  if (event.kind == AVAHI_BROWSER_CACHE_EXHAUSTED || event.kind == AVAHI_BROWSER_FAILURE) {
    exhausted();
  } else if (event.kind == AVAHI_BROWSER_NEW && address) {
    records_.push_back({event.protocol, *address});
    check();
  } else if (event.kind == AVAHI_BROWSER_REMOVE && address) {
    std::erase_if(records_, [&](const Record& r) {
      return r.heardBy == event.protocol && sameAddress(r.address, *address);
    });
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
