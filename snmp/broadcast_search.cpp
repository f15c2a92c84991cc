#include "snmp/broadcast_search.h"

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <utility>

#include "netconfig/local_address_list.h"
#include "platform/datagram_socket.h"
#include "platform/ipv4.h"
#include "snmp/codec.h"
#include "snmp/transport.h"

namespace onramp {

namespace {

constexpr std::size_t kLongestAddressText = 255;
constexpr const char* kLoopbackAddress = "127.0.0.1";
constexpr int kReceiveAttempts = 256;
constexpr std::chrono::seconds kListening{5};

// Room for kReceiveAttempts replies, each of which fits in an Ethernet frame.
constexpr std::size_t kReceiveBufferSize = std::size_t{kReceiveAttempts} * 2048;

std::chrono::seconds wholeSeconds() {
  return std::chrono::floor<std::chrono::seconds>(
      std::chrono::steady_clock::now().time_since_epoch());
}

bool isAddressText(const std::string* text) {
  return text && text->size() <= kLongestAddressText;
}

std::optional<DatagramSocket> openBroadcastSocket() {
  auto socket = DatagramSocket::open();
  if (!socket || !socket->permitBroadcast()) return std::nullopt;
  socket->setReceiveBufferSize(kReceiveBufferSize);
  return socket;
}

// Waits for one datagram and receives it. Returns the result of a valid reply without an error
// status, otherwise nothing.
std::optional<Dictionary> receiveResult(DatagramSocket& socket, snmp_table_request& request) {
  snmp_packet reply{};
  if (!socket.waitReadable(kReceiveWait)) return std::nullopt;
  const auto received = socket.receive(std::span(reply).first(kReplySize));
  if (!received) return std::nullopt;
  request.clear_values();
  if (snmp_decode_message(request.message(), std::span(reply).first(received->length)) ||
      request.message().error_status != 0) {
    return std::nullopt;
  }
  return request.result(dottedIPv4(received->sender.address));
}

void searchSubnet(mib_table& table, const std::string& broadcast, Array& results) {
  snmp_table_request request(table);
  const auto normalized = snmp_normalize_ipv4(broadcast.c_str());
  if (!normalized) return;

  request.message().request_id = snmp_next_request_id();
  snmp_packet encoded{};
  std::uint16_t length = 0;
  if (snmp_encode_message(request.message(), encoded, length)) return;
  auto socket = openBroadcastSocket();
  if (!socket) return;
  if (socket->waitWritable(kSendWait)) {
    socket->sendTo(snmp_agent_at(*normalized), std::span(encoded).first(length));
  }

  const std::chrono::seconds sent = wholeSeconds();
  for (int attempt = 0; attempt < kReceiveAttempts && wholeSeconds() - sent <= kListening;
       ++attempt) {
    if (auto result = receiveResult(*socket, request)) results.emplace_back(std::move(*result));
  }
}

}  // namespace

Array snmp_broadcast_search(mib_table& table) {
  Array results;
  local_address_list list;
  if (KSSysConfigCopyCurrentLocalAddressList(&list) != 0) return results;

  for (std::size_t i = 0; i < local_address_list_count(list); ++i) {
    const std::string* address = local_address_at(list, i);
    const std::string* broadcast = local_broadcast_address_at(list, i);
    if (!isAddressText(address) || !isAddressText(broadcast) || *address == kLoopbackAddress) {
      continue;
    }
    searchSubnet(table, *broadcast, results);
  }
  return results;
}

}  // namespace onramp
