#include "snmp/transport.h"

#include <chrono>
#include <string_view>

#include "base/value.h"
#include "snmp/ber_writer.h"
#include "snmp/codec.h"

namespace onramp {

std::int32_t snmp_request_counter = 0;
std::int64_t snmp_request_counter_ext = 200;

namespace {

constexpr std::chrono::seconds kSendWait{2};
constexpr std::chrono::seconds kReceiveWait{2};
constexpr std::size_t kAddressTextSize = 32;  // its closing zero included
constexpr IPv4Address kAllOnes{0xFFFFFFFF};

}  // namespace

std::uint64_t snmp_next_request_id() {
  const std::int32_t id = snmp_request_counter;
  snmp_request_counter = static_cast<std::int32_t>(static_cast<std::uint32_t>(id) + 1);
  return static_cast<std::uint64_t>(id);
}

std::optional<std::string> snmp_normalize_ipv4(const char* text) {
  if (!text || *text == '\0') return std::nullopt;
  std::string normalized;
  std::string_view rest(text);
  for (;;) {
    const std::size_t dot = rest.find('.');
    normalized += std::to_string(leadingInteger(rest.substr(0, dot)));
    if (normalized.size() >= kAddressTextSize) return std::nullopt;
    if (dot == std::string_view::npos) return normalized;
    normalized += '.';
    rest.remove_prefix(dot + 1);
  }
}

DatagramEndpoint snmp_agent_at(const std::string& address) {
  return {parseIPv4(address).value_or(kAllOnes), kSnmpPort};
}

void snmp_send(DatagramSocket& socket, const DatagramEndpoint& destination,
               std::span<const std::uint8_t> request) {
  if (socket.waitWritable(kSendWait)) socket.sendTo(destination, request);
}

std::optional<DatagramSocket::Received> snmp_receive(DatagramSocket& socket,
                                                     const DatagramEndpoint* sender,
                                                     snmp_packet& reply) {
  using std::chrono::steady_clock;
  const auto deadline = steady_clock::now() + kReceiveWait;
  for (std::chrono::nanoseconds left = kReceiveWait; left.count() > 0;
       left = deadline - steady_clock::now()) {
    if (!socket.waitReadable(left)) return std::nullopt;
    const auto received = socket.receive(std::span(reply).first(kReplySize));
    if (!received || !sender || received->sender == *sender) return received;
  }
  return std::nullopt;
}

snmp_status snmp_exchange(snmp_message& message, const char* address, std::uint32_t mode) {
  snmp_packet request{};
  std::uint16_t length = 0;
  if (snmp_encode_message(message, request, length)) return SNMP_ERR_CODEC;

  snmp_packet reply{};
  std::size_t received = 0;
  if (mode != kModeNoNetwork) {
    auto socket = DatagramSocket::open();
    if (!socket) return SNMP_ERR_TRANSPORT;
    const DatagramEndpoint agent = snmp_agent_at(address ? address : "");
    snmp_send(*socket, agent, std::span(request).first(length));
    if (const auto datagram = snmp_receive(*socket, &agent, reply)) received = datagram->length;
  }

  const std::uint16_t community_length = message.community_length;
  const char* const community = message.community;
  const snmp_status status = snmp_decode_message(message, std::span(reply).first(received));
  message.community_length = community_length;
  message.community = community;
  return status;
}

snmp_status snmp_request_to_address(snmp_message* message, const char* address) {
  const auto normalized = snmp_normalize_ipv4(address);
  if (!message || !normalized) return SNMP_ERR_TRANSPORT;
  message->request_id = snmp_next_request_id();
  const std::uint64_t sent = ber_low_bytes(message->request_id, ber_int_size(message->request_id));
  const snmp_status status = snmp_exchange(*message, normalized->c_str(), kModeNetwork);
  return message->request_id == sent ? status : SNMP_ERR_TRANSPORT;
}

}  // namespace onramp
