#include "tests/recording/agents.h"

#include <algorithm>
#include <cstdlib>
#include <utility>

#include "tests/snmp/message.h"

namespace onramp {

using recording::Agents;

struct DatagramSocket::Native {
  DatagramEndpoint peer;
  std::optional<Agents::Bytes> reply;  ///< the reply that the program has not received yet
  bool refused = false;                ///< the peer's host refused the request
};

namespace recording {

namespace {

// Returns a reply with `value` to `request`, which asks for one SNMP object.
Agents::Bytes answerTo(const Agents::Bytes& request, int value) {
  Message message(1);
  if (message.decode(request)) std::abort();
  message.message.pdu_type = kPduResponse;
  message.varbinds[0].type = kTagInteger;
  message.varbinds[0].int_value = value;
  return message.encode();
}

}  // namespace

Agents& Agents::instance() {
  static Agents agents;
  return agents;
}

int Agents::nextAnswer(const std::string& address) {
  const auto found = answers.find(address);
  if (found == answers.end() || found->second.empty()) return kSilent;
  std::vector<int>& values = found->second;
  const int value = values.front();
  if (values.size() > 1) values.erase(values.begin());
  return value;
}

}  // namespace recording

DatagramSocket::DatagramSocket(std::unique_ptr<Native> native) : native_(std::move(native)) {}
DatagramSocket::DatagramSocket(DatagramSocket&& other) noexcept = default;
DatagramSocket& DatagramSocket::operator=(DatagramSocket&& other) noexcept = default;
DatagramSocket::~DatagramSocket() = default;

std::optional<DatagramSocket> DatagramSocket::open() {
  if (!Agents::instance().socketsOpen) return std::nullopt;
  return DatagramSocket(std::make_unique<Native>());
}

bool DatagramSocket::connect(const DatagramEndpoint& peer) {
  native_->peer = peer;
  return true;
}

bool DatagramSocket::waitWritable(std::chrono::nanoseconds timeout) const {
  Agents::instance().waits.push_back(timeout);
  return true;
}

bool DatagramSocket::waitReadable(std::chrono::nanoseconds timeout) const {
  Agents::instance().waits.push_back(timeout);
  return native_->refused || native_->reply;
}

bool DatagramSocket::send(std::span<const std::uint8_t> bytes) {
  Agents& agents = Agents::instance();
  const Agents::Bytes request(bytes.begin(), bytes.end());
  const std::string address = dottedIPv4(native_->peer.address);
  agents.asked.push_back(address);
  agents.port = native_->peer.port;
  if (agents.reply) {
    native_->reply = agents.reply(request);
    return true;
  }
  const int answer = agents.nextAnswer(address);
  native_->refused = answer == Agents::kRefused;
  if (answer >= 0) native_->reply = recording::answerTo(request, answer);
  return true;
}

std::optional<DatagramSocket::Received> DatagramSocket::receive(std::span<std::uint8_t> buffer) {
  native_->refused = false;
  Agents::instance().room = buffer.size();
  const auto reply = std::exchange(native_->reply, std::nullopt);
  if (!reply) return std::nullopt;
  const std::size_t length = std::min(buffer.size(), reply->size());
  std::copy_n(reply->begin(), length, buffer.begin());
  return Received{length, native_->peer};
}

}  // namespace onramp
