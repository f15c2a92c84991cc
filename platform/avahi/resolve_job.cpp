#include "platform/avahi/resolve_job.h"

#include <avahi-client/client.h>
#include <avahi-common/error.h>
#include <avahi-common/strlst.h>

#include <cstring>
#include <utility>

#include "platform/avahi/connection.h"
#include "platform/avahi/host_addresses.h"

namespace onramp::avahi {

namespace {

Data wireForm(AvahiStringList* txt) {
  Data data(avahi_string_list_serialize(txt, nullptr, 0));
  data.resize(avahi_string_list_serialize(txt, data.data(), data.size()));
  return data;
}

template <typename Number>
void put(Data& data, std::size_t offset, const Number& number) {
  std::memcpy(data.data() + offset, &number, sizeof number);
}

// The socket address in the BSD layout that the seam speaks of.
Data socketAddress(const AvahiAddress& address, std::uint16_t port, AvahiIfIndex interface) {
  const bool ipv4 = address.proto == AVAHI_PROTO_INET;
  Data data(ipv4 ? 16 : 28);
  put(data, 0, static_cast<std::uint8_t>(data.size()));
  put(data, 1, std::uint8_t{ipv4 ? std::uint8_t{2} : std::uint8_t{30}});
  put(data, 2, static_cast<std::uint8_t>(port >> 8U));
  put(data, 3, static_cast<std::uint8_t>(port & 0xffU));
  if (ipv4) {
    put(data, 4, address.data.ipv4);
    return data;
  }
  const auto& bytes = address.data.ipv6.address;
  put(data, 8, bytes);
  const bool linkLocal = bytes[0] == 0xfe && (bytes[1] & 0xc0U) == 0x80;
  if (linkLocal) put(data, 24, static_cast<std::uint32_t>(interface));
  return data;
}

}  // namespace

ResolveJob::ResolveJob(Sighting service, std::optional<std::chrono::milliseconds> timeLimit,
                       Report report)
    : service_(std::move(service)), timeLimit_(timeLimit), report_(std::move(report)) {}

void ResolveJob::begin(Connection& connection) {
  connection_ = &connection;
  if (!timeLimit_) return;
  timeUp_.emplace(connection.loop(), [this] { end(std::nullopt); });
  timeUp_->start(*timeLimit_);
}

bool ResolveJob::start(Connection& connection) {
  std::vector<AvahiProtocol> protocols{service_.protocol};
  if (service_.protocol == AVAHI_PROTO_UNSPEC) protocols = {AVAHI_PROTO_INET, AVAHI_PROTO_INET6};
  for (const AvahiProtocol protocol : protocols) {
    ServiceResolverHandle resolver(avahi_service_resolver_new(
        connection.client(), service_.interface, protocol, service_.name.c_str(),
        service_.type.c_str(), service_.domain.c_str(), AVAHI_PROTO_UNSPEC, AVAHI_LOOKUP_NO_ADDRESS,
        called, this));
    if (resolver) resolvers_.push_back(std::move(resolver));
  }
  return running();
}

void ResolveJob::stop() {
  host_.reset();
  resolvers_.clear();
}

void ResolveJob::called(AvahiServiceResolver*, AvahiIfIndex interface, AvahiProtocol,
                        AvahiResolverEvent event, const char*, const char*, const char*,
                        const char* host, const AvahiAddress*, std::uint16_t port,
                        AvahiStringList* txt, AvahiLookupResultFlags, void* self) {
  auto& job = *static_cast<ResolveJob*>(self);
  if (event == AVAHI_RESOLVER_FOUND) {
    job.found(interface, host, port, txt);
  } else {
    job.failed();
  }
}

void ResolveJob::found(AvahiIfIndex interface, const char* host, std::uint16_t port,
                       AvahiStringList* txt) {
  if (!report_) return;
  port_ = port;
  txt_ = wireForm(txt);
  if (host_) return;
  host_ = connection_->addressesOf(interface, host);
  if (service_.protocol != AVAHI_PROTO_INET) host_->wantIPv6();
  host_->whenKnown([weak = weak_from_this()] {
    const auto job = std::static_pointer_cast<ResolveJob>(weak.lock());
    if (!job || !job->host_) return;
    Resolution resolution{{}, std::move(job->txt_)};
    for (const AvahiAddress& address : job->host_->addresses()) {
      resolution.addressing.push_back(socketAddress(address, job->port_, job->host_->interface()));
    }
    job->end(std::move(resolution));
  });
}

void ResolveJob::failed() {
  // A resolver whose time is up goes on to wait for the records.
  if (avahi_client_errno(connection_->client()) == AVAHI_ERR_TIMEOUT) return;
  connection_->restart(shared_from_this());
}

void ResolveJob::end(std::optional<Resolution> resolution) {
  if (!report_) return;
  std::exchange(report_, nullptr)(std::move(resolution));
  connection_->finish(shared_from_this());
}

}  // namespace onramp::avahi
