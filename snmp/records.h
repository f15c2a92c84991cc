#pragma once

#include <cstdint>
#include <span>

namespace onramp {

/// Tag bytes of the values that a binding can hold (X.690 section 8, RFC 1155 section 6).
constexpr std::uint8_t kTagBoolean = 0x01;
constexpr std::uint8_t kTagInteger = 0x02;
constexpr std::uint8_t kTagOctetString = 0x04;
constexpr std::uint8_t kTagNull = 0x05;
constexpr std::uint8_t kTagObjectIdentifier = 0x06;
constexpr std::uint8_t kTagSequence = 0x30;
constexpr std::uint8_t kTagIpAddress = 0x40;
constexpr std::uint8_t kTagCounter = 0x41;
constexpr std::uint8_t kTagGauge = 0x42;
constexpr std::uint8_t kTagTimeTicks = 0x43;
constexpr std::uint8_t kTagOpaque = 0x44;

/// Kinds of PDU, the low five bits of its tag (RFC 1157 section 4.1).
constexpr std::uint64_t kPduGet = 0;
constexpr std::uint64_t kPduGetNext = 1;
constexpr std::uint64_t kPduResponse = 2;
constexpr std::uint64_t kPduSet = 3;

/// An object identifier over the caller's storage, in arcs of 16 bits. Larger arcs cannot be held.
struct snmp_oid {
  std::uint16_t count = 0;     ///< arcs in use; on entry to a decoder the room that it may fill
  std::uint16_t capacity = 0;  ///< size of the storage, in arcs
  std::uint16_t* arcs = nullptr;
};

/// A byte string over the caller's storage. `bytes` to `bytes + capacity` may be written.
struct snmp_octets {
  std::uint16_t length = 0;
  std::uint16_t capacity = 0;
  std::uint8_t* bytes = nullptr;
};

/// One variable binding. Only the value field that belongs to `type` means anything.
struct snmp_varbind {
  std::uint64_t type = kTagNull;
  snmp_oid* name = nullptr;             ///< a reply's name is decoded into this same record
  std::int64_t int_value = 0;           ///< of types 1, 2, 65, 66 and 67; 32 bits of it count
  snmp_octets* octets_value = nullptr;  ///< of types 4, 64 and 68
  snmp_oid* oid_value = nullptr;        ///< of type 6
  std::uint16_t encoded_length = 0;     ///< set by the encoder: bytes of name and value together
  std::uint32_t index = 0;              ///< set by the decoder: position in the reply, from 0
};

/// One SNMPv1 message (RFC 1157 section 4). It owns nothing: every pointer is the caller's.
struct snmp_message {
  std::uint64_t version = 0;
  std::uint16_t community_length = 0;
  const char* community = nullptr;  ///< after decoding it points into the reply
  std::uint64_t pdu_type = kPduGet;
  std::uint64_t request_id = 0;
  std::uint64_t error_status = 0;
  std::uint64_t error_index = 0;
  std::uint64_t varbind_count = 0;
  std::span<snmp_varbind> varbinds;  ///< the array, whose size bounds what a decoder fills
};

/// Makes `message` an SNMPv1 request of the program's community with `varbind_count` NULL bindings
/// (as many of them as the array has). `request_id` and `pdu_type` stay as they are.
void snmp_message_init(snmp_message& message, std::uint64_t varbind_count);

/// -1 when `first` is less: its arc is, at the first difference, or it ends first. 1 when its arc
/// is greater. 0 otherwise, so also for a `first` that goes on where `second` ends.
[[nodiscard]] int snmp_oid_compare(const snmp_oid& first, const snmp_oid& second);

}  // namespace onramp
