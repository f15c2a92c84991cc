#include "tests/recording/agents.h"

#include <algorithm>
#include <utility>

#include "platform/datagram_socket.h"

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

// A request for one object as its answer (RFC 1157): another PDU, and an INTEGER of one byte, one
// byte longer than the NULL in its place, at the end. All lengths are of one byte.
std::vector<std::uint8_t> answerTo(std::span<const std::uint8_t> request, int value) {
  std::vector<std::uint8_t> bytes(request.begin(), request.end() - 2);
  const std::size_t version = 2;
  const std::size_t community = version + 2 + bytes.at(version + 1);
  const std::size_t pdu = community + 2 + bytes.at(community + 1);
  std::size_t list = pdu + 2;
  for (int field = 0; field < 3; ++field)
    list += 2U + bytes.at(list + 1);
  for (const std::size_t enclosing : {std::size_t{0}, pdu, list, list + 2})
    ++bytes.at(enclosing + 1);
  bytes.at(pdu) = 0xA2;
  for (const int byte : {0x02, 0x01, value})
    bytes.push_back(static_cast<std::uint8_t>(byte));
  return bytes;
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
