#include "tests/recording/agents.h"

#include <algorithm>
#include <cstdlib>
#include <utility>

#include "platform/datagram_socket.h"
#include "tests/snmp/message.h"

namespace onramp {

namespace recording {

namespace {

struct Reply {
  DatagramEndpoint sender;
  std::vector<std::uint8_t> bytes;
};

// Of the one request that is under way; empty when it stays unanswered.
std::optional<Reply>& pendingReply() {
  static std::optional<Reply> reply;
  return reply;
}

// A request for one object as the answer to it.
std::vector<std::uint8_t> answerTo(std::span<const std::uint8_t> request, int value) {
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

void Agents::reset() {
  *this = Agents();
  pendingReply().reset();
}

int Agents::nextAnswer(const std::string& address) {
  asked.push_back(address);
  const auto found = answers.find(address);
  if (found == answers.end() || found->second.empty()) return kSilent;
  std::vector<int>& values = found->second;
  const int value = values.front();
  if (values.size() > 1) values.erase(values.begin());
  return value;
}

}  // namespace recording

using recording::pendingReply;

std::optional<DatagramSocket> DatagramSocket::open() {
  pendingReply().reset();
  return DatagramSocket(0);
}

DatagramSocket::DatagramSocket(DatagramSocket&& other) noexcept = default;
DatagramSocket& DatagramSocket::operator=(DatagramSocket&& other) noexcept = default;
// What was not received goes with the socket.
DatagramSocket::~DatagramSocket() {
  pendingReply().reset();
}

bool DatagramSocket::permitBroadcast() {
  return true;
}

bool DatagramSocket::waitWritable(std::chrono::nanoseconds) const {
  return true;
}

bool DatagramSocket::waitReadable(std::chrono::nanoseconds) const {
  return pendingReply().has_value();
}

bool DatagramSocket::sendTo(const DatagramEndpoint& destination,
                            std::span<const std::uint8_t> bytes) {
  recording::Agents& agents = recording::Agents::instance();
  const int value = agents.nextAnswer(dottedIPv4(destination.address));
  if (value != recording::Agents::kSilent) {
    pendingReply() = {destination, recording::answerTo(bytes, value)};
  }
  return true;
}

std::optional<DatagramSocket::Received> DatagramSocket::receive(std::span<std::uint8_t> buffer) {
  if (!pendingReply()) return std::nullopt;
  const auto reply = std::exchange(pendingReply(), std::nullopt);
  const std::size_t length = std::min(buffer.size(), reply->bytes.size());
  std::copy_n(reply->bytes.begin(), length, buffer.begin());
  return Received{length, reply->sender};
}

}  // namespace onramp
