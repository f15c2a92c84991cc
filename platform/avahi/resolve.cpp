#include "platform/avahi/resolve.h"

#include <algorithm>
#include <utility>

namespace onramp::avahi {

namespace {

// How long a resolve waits for IPv4 addresses before it accepts IPv6 addresses instead. In this
// time the daemon can repeat the question once if the first answer was lost.
constexpr std::chrono::milliseconds kGraceForIPv4{2000};

}  // namespace

Resolve::Resolve(Daemon& daemon, const Instance& service,
                 std::optional<std::chrono::milliseconds> timeLimit, Report report)
    : daemon_(daemon),
      name_(fullName(service)),
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
  ipv4_.reset();
  ipv6_.reset();
  txtData_.reset();
  ask(server_, name_, RecordType::kServer);
  ask(txt_, name_, RecordType::kTXT);
}

void Resolve::ask(std::optional<Records>& records, const std::string& name, RecordType type) {
  records.emplace(daemon_, name, type, [this] { check_.start(std::chrono::milliseconds(0)); });
}

void Resolve::check() {
  if (!report_) return;
  if (losses_ != daemon_.losses()) begin();
  if (txt_ && !txt_->all().empty()) {
    txtData_ = txt_->all().front().data;
    txt_.reset();
  }
  const auto server =
      server_ && !server_->all().empty() ? serverIn(server_->all().front().data) : std::nullopt;
  if (server) {
    host_ = server->host;
    port_ = server->port;
    server_.reset();
    isGraceOver_ = false;
    ask(ipv4_, host_, RecordType::kIPv4);
  }
  const Records* const addresses = knownAddresses();
  if (!addresses || !txtData_) return;

  Resolution resolution{{}, *txtData_};
  for (const Records::Record& record : addresses->all()) {
    const auto address = socketAddress(record, port_);
    auto& list = resolution.addressing;
    // The daemon reports the same address once for each interface and protocol.
    if (address && std::find(list.begin(), list.end(), *address) == list.end()) {
      list.push_back(*address);
    }
  }
  end(std::move(resolution));
}

// Returns the IPv4 addresses, or the IPv6 addresses when no IPv4 address has arrived in time.
// Returns null while no usable address is known.
const Records* Resolve::knownAddresses() {
  if (!ipv4_ || !ipv4_->isCacheExhausted()) return nullptr;
  if (!ipv4_->all().empty()) return &*ipv4_;
  if (!ipv6_) {
    ask(ipv6_, host_, RecordType::kIPv6);
    graceForIPv4_.start(kGraceForIPv4);
  }
  return isGraceOver_ && !ipv6_->all().empty() ? &*ipv6_ : nullptr;
}

void Resolve::end(std::optional<Resolution> resolution) {
  if (report_) std::exchange(report_, nullptr)(std::move(resolution));
}

}  // namespace onramp::avahi
