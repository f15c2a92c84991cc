#include "snmp/transport.h"

#include <span>
#include <string_view>

#include "base/value.h"
#include "snmp/codec.h"
#include "snmp/protocol.h"

namespace onramp {

std::int32_t snmp_request_counter = 0;
std::int64_t snmp_request_counter_ext = 200;

namespace {

constexpr std::size_t kAddressTextSize = 32;  // including the terminating zero
constexpr IPv4Address kAllOnes{0xFFFFFFFF};

// Returns the size of the agent's reply, or 0 when there is none.
std::size_t ask(DatagramSocket& socket, const DatagramEndpoint& agent,
                std::span<const std::uint8_t> request, snmp_packet& reply) {
  if (!socket.connect(agent)) return 0;
  if (socket.waitWritable(kSendWait)) socket.send(request);
  if (!socket.waitReadable(kReceiveWait)) return 0;
  const auto received = socket.receive(std::span(reply).first(kReplySize));
  return received ? received->length : 0;
}

// Does what snmp_exchange() does, and sets `sent` to the identifier that a reply must carry. `sent`
// may differ from the caller's `request_id`, because encoding replaces a negative identifier.
snmp_status exchange(snmp_message& message, const char* address, std::uint32_t mode,
                     std::uint64_t& sent) {
  snmp_packet request{};
  std::uint16_t length = 0;
  const snmp_status encoded = snmp_encode_message(message, request, length);
  sent = message.request_id;
  if (encoded) return SNMP_ERR_CODEC;

  snmp_packet reply{};
  std::size_t received = 0;
  if (mode != kModeNoNetwork) {
    auto socket = DatagramSocket::open();
    if (!socket) return SNMP_ERR_TRANSPORT;
    received = ask(*socket, snmp_agent_at(address ? address : ""), std::span(request).first(length),
                   reply);
  }

  const std::uint16_t community_length = message.community_length;
  const char* const community = message.community;
  const snmp_status status = snmp_decode_message(message, std::span(reply).first(received));
  message.community_length = community_length;
  message.community = community;
  return status;
}

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

snmp_status snmp_exchange(snmp_message& message, const char* address, std::uint32_t mode) {
  std::uint64_t sent = 0;
  return exchange(message, address, mode, sent);
}

snmp_status snmp_request_to_address(snmp_message* message, const char* address) {
  const auto normalized = snmp_normalize_ipv4(address);
  if (!message || !normalized) return SNMP_ERR_TRANSPORT;
  message->request_id = snmp_next_request_id();
  std::uint64_t sent = 0;
  const snmp_status status = exchange(*message, normalized->c_str(), kModeNetwork, sent);
  return message->request_id == sent ? status : SNMP_ERR_TRANSPORT;
}

}  // namespace onramp
