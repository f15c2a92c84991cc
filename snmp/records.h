#pragma once

#include <cstdint>
#include <span>

namespace onramp {

/// Tag bytes (X.690 section 8, RFC 1155 section 6).
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

/// PDU types: the low five bits of a PDU's tag (RFC 1157 section 4.1).
constexpr std::uint64_t kPduGet = 0;
constexpr std::uint64_t kPduGetNext = 1;
constexpr std::uint64_t kPduResponse = 2;
constexpr std::uint64_t kPduSet = 3;

/// An object identifier, whose arcs are in the caller's storage. Arcs above 65,535 cannot be
/// represented.
struct snmp_oid {
  std::uint16_t count = 0;     ///< the number of arcs; before decoding, the maximum number
  std::uint16_t capacity = 0;  ///< size of the storage, in arcs
  std::uint16_t* arcs = nullptr;
};

/// A byte string in the caller's storage, which starts at `bytes` and is `capacity` bytes long.
struct snmp_octets {
  std::uint16_t length = 0;
  std::uint16_t capacity = 0;
  std::uint8_t* bytes = nullptr;
};

/// One variable binding. `type` is one of the tag bytes above; the comments give it in decimal.
/// Only the value field for this type is used.
struct snmp_varbind {
  std::uint64_t type = kTagNull;
  snmp_oid* name = nullptr;             ///< the name to ask for; a reply's name replaces it
  std::int64_t int_value = 0;           ///< for types 1, 2 and 65 to 67; the low 32 bits are used
  snmp_octets* octets_value = nullptr;  ///< for types 4, 64 and 68
  snmp_oid* oid_value = nullptr;        ///< for type 6
  std::uint16_t encoded_length = 0;     ///< set by the encoder: bytes of name and value together
  std::uint32_t index = 0;  ///< set by the decoder: position in the reply, from 0; see snmp_set()
};

/// One SNMPv1 message (RFC 1157 section 4). It owns none of the memory that it points to.
struct snmp_message {
  std::uint64_t version = 0;
  std::uint16_t community_length = 0;
  const char* community = nullptr;  ///< not zero-terminated; after decoding, points into the reply
  std::uint64_t pdu_type = kPduGet;
  std::uint64_t request_id = 0;
  std::uint64_t error_status = 0;
  std::uint64_t error_index = 0;
  std::uint64_t varbind_count = 0;
  std::span<snmp_varbind> varbinds;  ///< the whole array, including unused bindings
};

/// Makes `message` an SNMPv1 request with the community kCommunity of snmp/protocol.h. Sets
/// `varbind_count`, and sets the type of that many bindings to NULL. If the array has fewer, sets
/// the type of all bindings. Leaves `request_id` and `pdu_type` unchanged.
void snmp_message_init(snmp_message& message, std::uint64_t varbind_count);

/// Compares two object identifiers arc by arc. At the first difference, returns -1 when the arc of
/// `first` is smaller, and 1 when it is larger. If there is no difference, returns -1 when `first`
/// is shorter, and 0 otherwise, even when `second` is shorter. The wizard does not use this
/// function.
[[nodiscard]] int snmp_oid_compare(const snmp_oid& first, const snmp_oid& second);

}  // namespace onramp
