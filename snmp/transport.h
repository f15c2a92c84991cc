#pragma once

#include <array>
#include <chrono>
#include <cstdint>
#include <optional>
#include <string>

#include "platform/datagram_socket.h"
#include "snmp/records.h"
#include "snmp/status.h"

namespace onramp {

/// The maximum size of a reply datagram, and of all strings in a reply together, in bytes.
constexpr std::uint16_t kReplySize = 1500;

/// A buffer for one encoded message.
using snmp_packet = std::array<std::uint8_t, 1536>;

/// The maximum time to wait until a request can be sent, and the maximum time to wait for its
/// reply.
constexpr std::chrono::seconds kSendWait{2};
constexpr std::chrono::seconds kReceiveWait{2};

/// Modes of snmp_exchange(). Any other value has the effect of kModeNetwork.
constexpr std::uint32_t kModeNetwork = 4;
constexpr std::uint32_t kModeNoNetwork = 6;

/// The identifiers of the next requests. snmp_next_request_id() uses the first counter; snmp_get()
/// and snmp_set() use the second. Neither counter is locked, so only one thread at a time may make
/// requests.
extern std::int32_t snmp_request_counter;
extern std::int64_t snmp_request_counter_ext;

/// Returns snmp_request_counter, for use as a message's `request_id`, and increases it by 1.
[[nodiscard]] std::uint64_t snmp_next_request_id();

/// Returns `text` with each of its dot-separated parts replaced by the decimal number at the start
/// of that part, or by 0 if it does not start with a number. This removes leading zeros, which
/// would mark a part as octal. Returns nothing for a null pointer or an empty string, and when the
/// result would be longer than 31 characters.
[[nodiscard]] std::optional<std::string> snmp_normalize_ipv4(const char* text);

/// Returns the endpoint of the SNMP agent at `address`, an IPv4 address in dotted form. For any
/// other string, the endpoint's address is 255.255.255.255.
[[nodiscard]] DatagramEndpoint snmp_agent_at(const std::string& address);

/// Sends `message` to the SNMP port of `address`, an IPv4 address in dotted form, and decodes the
/// reply into `message`. Sends nothing if `address` is null or not an IPv4 address. Blocks for at
/// most kSendWait plus kReceiveWait. The wait ends early when the host reports that the port is
/// closed. `message.community` keeps its value, because the reply's community does not outlive the
/// call. The reply's identifier is stored in `message.request_id` but not checked.
///
/// Returns SNMP_OK for a valid reply, SNMP_ERR_TRANSPORT when no socket can be opened, and
/// SNMP_ERR_CODEC when the message cannot be encoded or the wait ends without a valid reply. With
/// kModeNoNetwork, sends nothing and returns SNMP_ERR_CODEC.
[[nodiscard]] snmp_status snmp_exchange(snmp_message& message, const char* address,
                                        std::uint32_t mode);

/// Normalizes `address` with snmp_normalize_ipv4(), sets the request identifier with
/// snmp_next_request_id() and makes one exchange. Returns SNMP_ERR_TRANSPORT for a null message,
/// for an address that cannot be normalized, and for a reply whose identifier is not the request's.
/// Otherwise returns the status of snmp_exchange().
[[nodiscard]] snmp_status snmp_request_to_address(snmp_message* message, const char* address);

}  // namespace onramp
