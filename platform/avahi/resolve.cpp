#include "platform/avahi/resolve.h"

#include <algorithm>
#include <cerrno>
#include <cstdint>
#include <utility>

namespace onramp::avahi {

namespace {

// How long a resolve waits for IPv4 addresses before it accepts IPv6 addresses instead. During this
// time, the daemon can repeat the question once if the first answer was lost.
constexpr std::chrono::milliseconds kGraceForIPv4{2000};

// Tells a service resolver not to look up an address. The resolver would find only one address, but
// Records finds all of them.
constexpr unsigned kNoAddress = 8;

// Reads a service resolver's Found signal. Builds the data of the TXT record (RFC 1035 section
// 3.3.14) from the record's strings, which the signal lists in reverse order. If there are no
// strings, the data is one empty string. Returns nothing when the signal is malformed or names no
// host.
std::optional<Server> serverIn(sd_bus_message* message) {
  Server server;
  const char* host = nullptr;
  if (sd_bus_message_skip(message, "iisss") < 0 || sd_bus_message_read(message, "s", &host) <= 0 ||
      sd_bus_message_skip(message, "is") < 0 ||
      sd_bus_message_read(message, "q", &server.port) <= 0 ||
      sd_bus_message_enter_container(message, 'a', "ay") < 0) {
    return std::nullopt;
  }
  server.host = host;
  const void* text = nullptr;
  std::size_t size = 0;
  while (sd_bus_message_read_array(message, 'y', &text, &size) > 0) {
    if (size > UINT8_MAX) return std::nullopt;
    const auto* const bytes = static_cast<const std::byte*>(text);
    server.txt.insert(server.txt.begin(), bytes, bytes + size);
    server.txt.insert(server.txt.begin(), static_cast<std::byte>(size));
  }
  if (server.txt.empty()) server.txt.push_back(std::byte{0});
  return server.host.empty() ? std::nullopt : std::optional(std::move(server));
}

}  // namespace

Resolve::Resolve(Daemon& daemon, const Instance& service,
                 std::optional<std::chrono::milliseconds> timeLimit, Report report)
    : daemon_(daemon),
      instance_(service),
      report_(std::move(report)),
      check_(
          daemon.loop(), [this] { check(); }, SD_EVENT_PRIORITY_IDLE),
      timeUp_(daemon.loop(), [this] { end(std::nullopt); }),
      graceForIPv4_(daemon.loop(), [this] {
        isGraceOver_ = true;
        check();
      }) {
  if (timeLimit) timeUp_.start(*timeLimit);
  begin();
}

void Resolve::begin() {
  losses_ = daemon_.losses();
  graceForIPv4_.stop();
  isGraceOver_ = false;
  ipv4_.reset();
  ipv6_.reset();
  server_.reset();
  service_.emplace(
      daemon_, "ServiceResolver",
      [this](sd_bus_message* call) {
        // For an empty name, the daemon would look up the type itself instead of a service. For an
        // empty domain, it would use its own default domain.
        if (instance_.name.empty() || instance_.domain.empty()) return -EINVAL;
        return sd_bus_message_append(call, "iisssiu", kAnyInterface, kAnyProtocol,
                                     instance_.name.c_str(), instance_.type.c_str(),
                                     instance_.domain.c_str(), kAnyProtocol, kNoAddress);
      },
      [this](Query::Event event, sd_bus_message* message) { happened(event, message); });
}

// A failure needs no action here, because the query is then sent again automatically.
void Resolve::happened(Query::Event event, sd_bus_message* message) {
  if (event == Query::Event::kFound) server_ = serverIn(message);
  checkSoon();
}

void Resolve::checkSoon() {
  check_.start(std::chrono::milliseconds(0));
}

void Resolve::ask(std::optional<Records>& addresses, RecordType type) {
  addresses.emplace(daemon_, server_->host, type, [this] { checkSoon(); });
}

void Resolve::check() {
  if (!report_) return;
  if (losses_ != daemon_.losses()) begin();
  if (service_ && server_) {
    service_.reset();
    ask(ipv4_, RecordType::kIPv4);
  }
  const Records* const addresses = knownAddresses();
  if (!addresses) return;

  Resolution resolution{{}, server_->txt};
  for (const Records::Record& record : addresses->all()) {
    const auto address = socketAddress(record, server_->port);
    auto& list = resolution.addressing;
    // The daemon reports the same address once for each interface and protocol.
    if (address && std::find(list.begin(), list.end(), *address) == list.end()) {
      list.push_back(*address);
    }
  }
  end(std::move(resolution));
}

// Returns the IPv4 addresses, or the IPv6 addresses when no IPv4 address has arrived within
// kGraceForIPv4. Returns null while the resolve must still wait for addresses.
const Records* Resolve::knownAddresses() {
  if (!ipv4_ || !ipv4_->isCacheExhausted()) return nullptr;
  if (!ipv4_->all().empty()) return &*ipv4_;
  if (!ipv6_) {
    ask(ipv6_, RecordType::kIPv6);
    graceForIPv4_.start(kGraceForIPv4);
  }
  return isGraceOver_ && !ipv6_->all().empty() ? &*ipv6_ : nullptr;
}

void Resolve::end(std::optional<Resolution> resolution) {
  if (report_) std::exchange(report_, nullptr)(std::move(resolution));
}

}  // namespace onramp::avahi
