#pragma once

#include <array>
#include <cstdint>
#include <optional>
#include <span>
#include <string>

#include "platform/datagram_socket.h"
#include "snmp/records.h"
#include "snmp/status.h"

namespace onramp {

/// The UDP port that agents answer on (RFC 1157 section 4).
constexpr std::uint16_t kSnmpPort = 161;

/// The most bytes of a datagram that are taken for a reply, and of the strings of one reply.
constexpr std::uint16_t kReplySize = 1500;

/// Room for one encoded message, a little more than is ever read.
using snmp_packet = std::array<std::uint8_t, 1536>;

/// How snmp_exchange treats the network. Every other number sends as well.
constexpr std::uint32_t kModeNetwork = 4;
constexpr std::uint32_t kModeNoNetwork = 6;

/// The next request identifiers: of snmp_request_to_address, and of snmp_get and snmp_set. Neither
/// is locked, so requests come from one thread at a time.
extern std::int32_t snmp_request_counter;
extern std::int64_t snmp_request_counter_ext;

/// Takes the next identifier of snmp_request_counter, as a message's `request_id`.
[[nodiscard]] std::uint64_t snmp_next_request_id();

/// `text` with each of its dot-separated parts as the decimal number that it starts with, 0 when it
/// starts with none: leading zeros, which would make a part octal, vanish. Nothing for a null or
/// empty text, or when the numbers take more than the 31 characters of an address's storage.
[[nodiscard]] std::optional<std::string> snmp_normalize_ipv4(const char* text);

/// Port 161 of `address`, dotted IPv4 text. Other text stands for the address 255.255.255.255.
[[nodiscard]] DatagramEndpoint snmp_agent_at(const std::string& address);

/// Sends `request` as soon as `socket` takes it; sends nothing when it does not within 2 seconds.
void snmp_send(DatagramSocket& socket, const DatagramEndpoint& destination,
               std::span<const std::uint8_t> request);

/// Receives one reply of at most kReplySize bytes into `reply`, within 2 seconds. Datagrams of
/// other senders than `sender` are not taken, unless it is null. Nothing on a time-out or an error.
[[nodiscard]] std::optional<DatagramSocket::Received> snmp_receive(DatagramSocket& socket,
                                                                   const DatagramEndpoint* sender,
                                                                   snmp_packet& reply);

/// Sends `message` to port 161 of `address`, dotted IPv4 text, and decodes the reply into it. Other
/// text stands for the address 255.255.255.255, which nothing is sent to. Takes at most 2 seconds
/// to send and 2 to receive. `community` stays the one sent, because the reply's does not outlive
/// the call. SNMP_ERR_CODEC when the message cannot be encoded or no proper reply came in time,
/// SNMP_ERR_TRANSPORT when there is no socket. With kModeNoNetwork nothing is sent or received.
[[nodiscard]] snmp_status snmp_exchange(snmp_message& message, const char* address,
                                        std::uint32_t mode);

/// One exchange under the next identifier of snmp_request_counter with an address that is
/// normalized first. SNMP_ERR_TRANSPORT also for a null message, an address that cannot be
/// normalized and a reply to another request; otherwise as snmp_exchange.
[[nodiscard]] snmp_status snmp_request_to_address(snmp_message* message, const char* address);

}  // namespace onramp
