#pragma once

#include <cstddef>
#include <cstdint>

#include "base/byte_reader.h"
#include "snmp/records.h"
#include "snmp/status.h"

namespace onramp {

// Each of these functions reads one part of a BER encoding (X.690 section 8, as restricted by RFC
// 1157). On success, the function moves `in` past that part and returns SNMP_OK. If it refuses the
// part, it returns SNMP_ERR_CODEC and leaves `in` anywhere from the part's start to its end. Every
// function refuses a part that is malformed or incomplete.

/// Reads a one-byte tag. Refuses a longer tag without moving `in`.
[[nodiscard]] inline snmp_status ber_get_tag(ByteReader& in, std::uint8_t& tag) {
  constexpr std::uint8_t kHighTagNumber = 0x1F;
  ByteReader ahead = in;
  const auto byte = ahead.byte();
  if (!byte || (*byte & kHighTagNumber) == kHighTagNumber) return SNMP_ERR_CODEC;
  tag = *byte;
  in = ahead;
  return SNMP_OK;
}

/// Reads a length in the short form, or in the long form with a number of one or two bytes. Does
/// not check whether the input has as many bytes left as the length says.
[[nodiscard]] inline snmp_status ber_get_length(ByteReader& in, std::uint16_t& length) {
  const auto first = in.byte();
  if (!first) return SNMP_ERR_CODEC;
  if (*first < 0x80) {
    length = *first;
    return SNMP_OK;
  }
  const std::size_t count = *first & 0x7FU;
  if (count < 1 || count > 2) return SNMP_ERR_CODEC;
  const auto number = in.number(count);
  if (!number) return SNMP_ERR_CODEC;
  length = static_cast<std::uint16_t>(*number);
  return SNMP_OK;
}

/// Reads an integer of `length` bytes as an unsigned number. Refuses a length other than 1 to 4.
[[nodiscard]] inline snmp_status ber_get_uint(ByteReader& in, std::uint64_t& value,
                                              std::uint16_t length) {
  if (length < 1 || length > 4) return SNMP_ERR_CODEC;
  const auto number = in.number(length);
  if (!number) return SNMP_ERR_CODEC;
  value = *number;
  return SNMP_OK;
}

/// Reads an integer of `length` bytes as a signed number. Refuses a length other than 1 to 4. Use
/// only the low 32 bits of `value`: a number of one or two bytes is sign-extended to 64 bits, but a
/// longer one only to 32 bits.
[[nodiscard]] inline snmp_status ber_get_int(ByteReader& in, std::int64_t& value,
                                             std::uint16_t length) {
  std::uint64_t bits = 0;
  if (ber_get_uint(in, bits, length)) return SNMP_ERR_CODEC;
  const bool negative = (bits >> (8U * length - 1U)) != 0;
  if (negative && length == 1) bits |= ~std::uint64_t{0xFF};
  if (negative && length == 2) bits |= ~std::uint64_t{0xFFFF};
  if (negative && length == 3) bits |= 0xFF000000U;
  value = static_cast<std::int64_t>(bits);
  return SNMP_OK;
}

/// Reads an object identifier of `length` content bytes into `target`. On entry, `target->count` is
/// the number of arcs that fit. On success, it is the number of arcs read, which is 0 when `length`
/// is 0. The first byte encodes the first two arcs: the byte divided by 40, and the remainder.
/// Refuses a null target, more arcs than fit, an arc above 65,535, and content that ends inside an
/// arc. A refusal leaves `count` unchanged, but some arcs may have been stored.
[[nodiscard]] snmp_status ber_get_oid(ByteReader& in, snmp_oid* target, std::uint16_t length);

/// Reads a string of `length` bytes, copies it to `target->bytes` and sets `target->length`.
/// Refuses a string longer than `target->capacity`. If `target` is null, refuses every non-empty
/// string.
[[nodiscard]] snmp_status ber_get_octets(ByteReader& in, snmp_octets* target, std::uint16_t length);

// The wizard does not use ber_get_octets_ref(), which is here for completeness.

/// Reads a string of `length` bytes and makes `target->bytes` point to it in the input, which must
/// outlive `target`. Sets `target->capacity` to 0, because the input must not be written to. For an
/// empty string, changes only `target->length`. If `target` is null, refuses every non-empty
/// string.
[[nodiscard]] snmp_status ber_get_octets_ref(ByteReader& in, snmp_octets* target,
                                             std::uint16_t length);

}  // namespace onramp
