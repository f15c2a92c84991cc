#include "tools/devices/exchange.h"

#include <algorithm>
#include <array>
#include <chrono>
#include <span>
#include <utility>

#include "platform/datagram_socket.h"
#include "snmp/codec.h"
#include "snmp/query.h"
#include "snmp/transport.h"

namespace onramp::devices {

namespace {

using Clock = std::chrono::steady_clock;
using Outcome = Exchange::Outcome;

constexpr std::chrono::milliseconds kGlance{20};

double secondsSince(Clock::time_point start) {
  return std::chrono::duration<double>(Clock::now() - start).count();
}

// A copy of active_interface_table, so that decoding a reply changes only the copy.
class OwnTable {
 public:
  OwnTable() {
    const mib_table& original = active_interface_table;
    entries_.assign(original.entries, original.entries + original.count);
    for (mib_entry& entry : entries_) {
      arcs_.emplace_back(entry.oid.arcs, entry.oid.arcs + entry.oid.capacity);
      entry.oid.arcs = arcs_.back().data();
    }
    table_ = {entries_.data(), original.count, original.handlers};
  }
  OwnTable(const OwnTable&) = delete;
  OwnTable& operator=(const OwnTable&) = delete;
  ~OwnTable() = default;

  [[nodiscard]] mib_table& get() { return table_; }

  /// Returns the object identifiers that the table now holds.
  [[nodiscard]] std::vector<std::vector<std::uint16_t>> names() const {
    std::vector<std::vector<std::uint16_t>> names;
    for (const mib_entry& entry : entries_)
      names.emplace_back(entry.oid.arcs, entry.oid.arcs + entry.oid.count);
    return names;
  }

 private:
  std::vector<mib_entry> entries_;
  std::vector<std::vector<std::uint16_t>> arcs_;
  mib_table table_;
};

std::uint64_t nextRequestId() {
  static std::atomic<std::uint32_t> next{1};
  return next++ & 0x7FFFFFFFU;
}

// A request that has been sent. The socket stays open after the wait for the reply, so that a late
// reply is noticed. `exchange` is an index into Questioning::exchanges_.
struct Sent {
  DatagramSocket socket;
  Clock::time_point at;
  std::size_t exchange = 0;
};

class Questioning {
 public:
  explicit Questioning(const std::atomic<bool>& stopped) : stopped_(stopped) {}

  std::optional<Dictionary> once(const char* address, bool& noReply);
  std::vector<Exchange> exchanges() { return std::move(exchanges_); }
  void collectLateReplies();

 private:
  bool send(snmp_table_request& request, Exchange& exchange);
  void await(Sent& sent, Exchange& exchange);
  std::optional<Dictionary> read(snmp_table_request& request, std::uint64_t id, Exchange& exchange);

  const std::atomic<bool>& stopped_;
  OwnTable table_;
  std::vector<Exchange> exchanges_;
  std::vector<Sent> sent_;
};

bool Questioning::send(snmp_table_request& request, Exchange& exchange) {
  exchange.outcome = Outcome::kUnsent;
  const auto normalized = snmp_normalize_ipv4(exchange.address.c_str());
  snmp_packet packet{};
  std::uint16_t length = 0;
  if (!normalized || snmp_encode_message(request.message(), packet, length)) return false;
  exchange.request.assign(packet.begin(), packet.begin() + length);
  auto socket = DatagramSocket::open();
  if (!socket) return false;
  if (!socket->connect(snmp_agent_at(*normalized))) return false;
  const auto at = Clock::now();
  if (!socket->waitWritable(kSendWait) || !socket->send(exchange.request)) return false;
  exchange.outcome = Outcome::kNone;
  sent_.push_back({std::move(*socket), at, exchanges_.size()});
  return true;
}

// Waits for the reply as long as the wizard does, or until `stopped_` is set. Stores the reply in
// `exchange`. Sets the outcome only if the host reports that no program uses the port.
void Questioning::await(Sent& sent, Exchange& exchange) {
  const auto deadline = sent.at + kReceiveWait;
  while (!stopped_ && Clock::now() < deadline) {
    const auto left = std::min<Clock::duration>(kGlance, deadline - Clock::now());
    if (sent.socket.waitReadable(left)) {
      snmp_packet reply{};
      const auto received = sent.socket.receive(std::span(reply).first(kReplySize));
      if (!received) {
        exchange.outcome = Outcome::kRefused;
        return;
      }
      exchange.seconds = secondsSince(sent.at);
      exchange.reply.assign(reply.begin(), reply.begin() + static_cast<long>(received->length));
      return;
    }
    collectLateReplies();
  }
}

void Questioning::collectLateReplies() {
  for (Sent& sent : sent_) {
    if (sent.exchange >= exchanges_.size()) continue;  // await() still waits for this reply
    Exchange& exchange = exchanges_[sent.exchange];
    if (exchange.outcome != Outcome::kNone || !sent.socket.waitReadable({})) continue;
    snmp_packet reply{};
    const auto received = sent.socket.receive(std::span(reply).first(kReplySize));
    if (!received) continue;
    exchange.outcome = Outcome::kLate;
    exchange.seconds = secondsSince(sent.at);
    exchange.reply.assign(reply.begin(), reply.begin() + static_cast<long>(received->length));
  }
}

// Decodes the reply as the wizard does, and sets the exchange's outcome. Returns the reply's values
// if the outcome is kValue, otherwise nothing.
std::optional<Dictionary> Questioning::read(snmp_table_request& request, std::uint64_t id,
                                            Exchange& exchange) {
  const auto before = table_.names();
  const bool isReadable = snmp_decode_message(request.message(), exchange.reply) == SNMP_OK;
  exchange.changedQuestion = table_.names() != before;
  if (!isReadable) {
    exchange.outcome = Outcome::kUnreadable;
  } else if (request.message().request_id != id) {
    exchange.outcome = Outcome::kOtherRequest;
  } else if (request.message().error_status != 0) {
    exchange.outcome = Outcome::kError;
    exchange.errorStatus = request.message().error_status;
  } else if (auto result = request.result(exchange.address)) {
    exchange.outcome = Outcome::kValue;
    exchange.value = result->integerValue(kActiveIFKey);
    return result;
  } else {
    exchange.outcome = Outcome::kOtherType;
    exchange.type = static_cast<unsigned>(request.message().varbinds[0].type);
  }
  return std::nullopt;
}

std::optional<Dictionary> Questioning::once(const char* address, bool& noReply) {
  Exchange exchange{.address = address ? address : ""};
  std::optional<Dictionary> result;
  if (!stopped_) {
    snmp_table_request request(table_.get());
    request.message().request_id = nextRequestId();
    if (send(request, exchange)) {
      const std::uint64_t id = request.message().request_id;
      await(sent_.back(), exchange);
      if (exchange.seconds) result = read(request, id, exchange);
    }
    exchanges_.push_back(exchange);
  }
  const bool isProperReply = exchange.outcome == Outcome::kValue ||
                             exchange.outcome == Outcome::kError ||
                             exchange.outcome == Outcome::kOtherType;
  if (address && !isProperReply) noReply = true;
  return result;
}

// All outcomes except kValue, the most informative first.
constexpr std::array kTellingOrder{
    Outcome::kError, Outcome::kOtherType, Outcome::kUnreadable, Outcome::kOtherRequest,
    Outcome::kLate,  Outcome::kRefused,   Outcome::kNone,       Outcome::kUnsent};

}  // namespace

const Exchange* Answer::telling() const {
  // The wizard asks until a value decides the answer, so only the last value can decide.
  const auto last = std::find_if(exchanges.rbegin(), exchanges.rend(),
                                 [](const Exchange& e) { return e.outcome == Outcome::kValue; });
  if (last != exchanges.rend()) return &*last;
  for (const Outcome outcome : kTellingOrder) {
    const auto found = std::find_if(exchanges.begin(), exchanges.end(),
                                    [&](const Exchange& e) { return e.outcome == outcome; });
    if (found != exchanges.end()) return &*found;
  }
  return nullptr;
}

Answer askDevice(const Array& addresses, const std::atomic<bool>& stopped) {
  const auto start = Clock::now();
  Questioning questioning(stopped);
  Answer answer;
  answer.isWireless = snmp_active_interface_is_wireless(
      addresses, [&questioning](const char* address, bool& noReply) {
        return questioning.once(address, noReply);
      });
  answer.seconds = secondsSince(start);
  answer.isComplete = !stopped;
  questioning.collectLateReplies();
  answer.exchanges = questioning.exchanges();
  return answer;
}

std::string errorStatusName(std::uint64_t status) {
  constexpr std::array kNames{"noError", "tooBig", "noSuchName", "badValue", "readOnly", "genErr"};
  return status < kNames.size() ? kNames[status] : "error status " + std::to_string(status);
}

}  // namespace onramp::devices
