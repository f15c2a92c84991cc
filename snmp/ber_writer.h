#pragma once

#include <cstddef>
#include <cstdint>
#include <span>

#include "snmp/records.h"
#include "snmp/status.h"

namespace onramp {

/// Writes bytes into a buffer, from the buffer's end towards its start. Because an element's
/// content is written before its header, the content's length is known when the header is written.
/// The buffer must outlive the writer.
class ber_writer {
 public:
  explicit ber_writer(std::span<std::uint8_t> room) : room_(room), left_(room.size()) {}

  /// The number of bytes written so far.
  [[nodiscard]] std::size_t size() const { return room_.size() - left_; }

  /// Puts `byte` in front of the bytes written so far. Returns SNMP_ERR_CODEC, and writes nothing,
  /// when the buffer is full.
  [[nodiscard]] snmp_status put(std::uint8_t byte) {
    if (left_ == 0) return SNMP_ERR_CODEC;
    room_[--left_] = byte;
    return SNMP_OK;
  }

  /// Puts `bytes` in front of the bytes written so far. Returns SNMP_ERR_CODEC, and writes nothing,
  /// when the buffer has too little room.
  [[nodiscard]] snmp_status put(std::span<const std::uint8_t> bytes);

 private:
  std::span<std::uint8_t> room_;
  std::size_t left_;
};

// Each of these functions puts one part of a BER encoding (X.690 section 8) in front of the bytes
// written so far and returns SNMP_OK. If the buffer has too little room, or if the function refuses
// a value that cannot be encoded, it returns SNMP_ERR_CODEC and may leave some bytes of the part in
// the buffer.

/// Puts a length field of one, two or three bytes: the short form, or the long form that starts
/// with 0x81 or 0x82. Refuses a length above 65,535.
[[nodiscard]] inline snmp_status ber_put_length(ber_writer& out, std::size_t length) {
  if (length > UINT16_MAX || out.put(static_cast<std::uint8_t>(length))) return SNMP_ERR_CODEC;
  if (length < 0x80) return SNMP_OK;
  if (length <= UINT8_MAX) return out.put(0x81);
  const auto high = static_cast<std::uint8_t>(length >> 8);
  return out.put(high) || out.put(0x82) ? SNMP_ERR_CODEC : SNMP_OK;
}

/// Puts the tag and the length field of an element. The element's content is everything written
/// since out.size() was `end`.
[[nodiscard]] inline snmp_status ber_put_header(ber_writer& out, std::uint8_t tag,
                                                std::size_t end) {
  return ber_put_length(out, out.size() - end) || out.put(tag) ? SNMP_ERR_CODEC : SNMP_OK;
}

[[nodiscard]] snmp_status ber_put_octets(ber_writer& out, std::span<const std::uint8_t> bytes,
                                         std::uint8_t tag);

[[nodiscard]] inline snmp_status ber_put_octets(ber_writer& out, const snmp_octets& octets,
                                                std::uint8_t tag) {
  return ber_put_octets(out, std::span<const std::uint8_t>(octets.bytes, octets.length), tag);
}

/// Puts the low 32 bits of `value` as a signed number in as few bytes as possible, 1 to 4. If the
/// number is negative, also sets `value` to the number that ber_get_uint() would read from these
/// bytes. For example, -1 becomes 255.
[[nodiscard]] snmp_status ber_put_int(ber_writer& out, std::uint64_t& value, std::uint8_t tag);
[[nodiscard]] snmp_status ber_put_int(ber_writer& out, std::int64_t& value, std::uint8_t tag);

/// Puts the low 32 bits of `value` as the unsigned number of a Counter, Gauge or TimeTicks, in as
/// few bytes as possible, 1 to 5. These types are encoded like an INTEGER, which is signed (RFC
/// 1155 section 6, X.690 section 8.3). So a zero byte precedes a number whose first byte has its
/// top bit set.
[[nodiscard]] snmp_status ber_put_uint(ber_writer& out, std::uint64_t value, std::uint8_t tag);

/// Puts an object identifier. Refuses an identifier that has fewer than two arcs or more than 255
/// bytes of content, or in which 40 times the first arc plus the second exceeds 255.
[[nodiscard]] snmp_status ber_put_oid(ber_writer& out, const snmp_oid& oid);

[[nodiscard]] snmp_status ber_put_null(ber_writer& out);

}  // namespace onramp
