#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>

#include "snmp/records.h"
#include "snmp/status.h"

namespace onramp {

/// A cursor over received bytes that cannot leave them.
class ber_reader {
 public:
  explicit ber_reader(std::span<const std::uint8_t> bytes) : rest_(bytes) {}

  [[nodiscard]] std::size_t remaining() const { return rest_.size(); }

  /// The next byte, which the cursor moves past; nothing at the end.
  [[nodiscard]] std::optional<std::uint8_t> next() {
    if (rest_.empty()) return std::nullopt;
    const std::uint8_t byte = rest_.front();
    rest_ = rest_.subspan(1);
    return byte;
  }

  /// The next `count` bytes, which the cursor moves past; nothing, and no move, when fewer are
  /// left.
  [[nodiscard]] std::optional<std::span<const std::uint8_t>> take(std::size_t count) {
    if (count > rest_.size()) return std::nullopt;
    const auto taken = rest_.first(count);
    rest_ = rest_.subspan(count);
    return taken;
  }

  /// Lets the input end after `count` more bytes. False, and no change, when fewer are left.
  [[nodiscard]] bool narrow(std::size_t count) {
    if (count > rest_.size()) return false;
    rest_ = rest_.first(count);
    return true;
  }

 private:
  std::span<const std::uint8_t> rest_;
};

// The reading primitives (X.690 section 8, as RFC 1157 restricts it). Each moves the cursor past
// what it read and answers SNMP_OK, or answers SNMP_ERR_CODEC and leaves the cursor where it was.

/// One tag byte. Tags of more than one byte are refused.
[[nodiscard]] inline snmp_status ber_get_tag(ber_reader& in, std::uint8_t& tag) {
  constexpr std::uint8_t kHighTagNumber = 0x1F;
  ber_reader ahead = in;
  const auto byte = ahead.next();
  if (!byte || (*byte & kHighTagNumber) == kHighTagNumber) return SNMP_ERR_CODEC;
  tag = *byte;
  in = ahead;
  return SNMP_OK;
}

/// A length in the short form, or in the long form of one or two bytes. Whether as much input is
/// left is for the caller to check.
[[nodiscard]] inline snmp_status ber_get_length(ber_reader& in, std::uint16_t& length) {
  ber_reader ahead = in;
  const auto first = ahead.next();
  if (!first) return SNMP_ERR_CODEC;
  if (*first < 0x80) {
    length = *first;
  } else {
    const std::size_t count = *first & 0x7FU;
    if (count < 1 || count > 2) return SNMP_ERR_CODEC;
    const auto bytes = ahead.take(count);
    if (!bytes) return SNMP_ERR_CODEC;
    length = static_cast<std::uint16_t>(count == 1 ? (*bytes)[0] : (*bytes)[0] << 8 | (*bytes)[1]);
  }
  in = ahead;
  return SNMP_OK;
}

/// The 1 to 4 bytes of an integer, taken as unsigned.
[[nodiscard]] inline snmp_status ber_get_uint(ber_reader& in, std::uint64_t& value,
                                              std::uint16_t length) {
  if (length < 1 || length > 4) return SNMP_ERR_CODEC;
  const auto bytes = in.take(length);
  if (!bytes) return SNMP_ERR_CODEC;
  value = 0;
  for (const std::uint8_t byte : *bytes)
    value = value << 8 | byte;
  return SNMP_OK;
}

/// The 1 to 4 bytes of an integer. One or two bytes are sign-extended to 64 bits, three only to 32,
/// four not at all: the low 32 bits hold the signed value.
[[nodiscard]] inline snmp_status ber_get_int(ber_reader& in, std::int64_t& value,
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

/// An object identifier of `length` content bytes, into `target`, whose `count` is the room on
/// entry and the arcs read on return. Refused without a target, when it needs more room, when an
/// arc leaves 16 bits, and when the content ends inside an arc; the arcs read until then are
/// stored.
[[nodiscard]] snmp_status ber_get_oid(ber_reader& in, snmp_oid* target, std::uint16_t length);

/// A string of `length` bytes, copied. Refused when it is not empty and there is no target, or when
/// it exceeds the target's `capacity`.
[[nodiscard]] snmp_status ber_get_octets(ber_reader& in, snmp_octets* target, std::uint16_t length);

/// The same without a copy: `bytes` points into the input, which must not be written, so `capacity`
/// becomes 0.
[[nodiscard]] snmp_status ber_get_octets_ref(ber_reader& in, snmp_octets* target,
                                             std::uint16_t length);

}  // namespace onramp
