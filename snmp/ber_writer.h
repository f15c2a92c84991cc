#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <span>

#include "snmp/records.h"
#include "snmp/status.h"

namespace onramp {

/// A cursor over the room for a message that cannot leave it.
class ber_writer {
 public:
  explicit ber_writer(std::span<std::uint8_t> room) : room_(room) {}

  [[nodiscard]] std::size_t written() const { return written_; }
  [[nodiscard]] std::size_t remaining() const { return room_.size() - written_; }

  /// Writes one byte; writes nothing when the room is full.
  void put(std::uint8_t byte) {
    if (remaining() != 0) room_[written_++] = byte;
  }

  /// Writes all of `bytes`; writes nothing when the room is too small.
  void put(std::span<const std::uint8_t> bytes) {
    if (bytes.size() > remaining()) return;
    std::copy(bytes.begin(), bytes.end(), room_.subspan(written_).begin());
    written_ += bytes.size();
  }

 private:
  std::span<std::uint8_t> room_;
  std::size_t written_ = 0;
};

// Sizes in bytes. What a writing primitive writes has exactly the size given here.

/// Of the length field for `length` bytes of content.
[[nodiscard]] constexpr std::size_t ber_length_size(std::size_t length) {
  return length < 0x80 ? 1 : length <= 0xFF ? 2 : 3;
}

/// Of a whole element: tag, length field and content.
[[nodiscard]] constexpr std::size_t ber_element_size(std::size_t content) {
  return 1 + ber_length_size(content) + content;
}

/// Of the content of an INTEGER, 1 to 4: the fewest that hold the low 32 bits of `value` as a
/// signed number. A negative value is masked in place to those bytes, so that a message keeps the
/// number that its reader will see.
[[nodiscard]] std::size_t ber_int_size(std::uint64_t& value);
[[nodiscard]] std::size_t ber_int_size(std::int64_t& value);

/// Of the content of a Counter, Gauge or TimeTicks: the low 32 bits of `value` as an unsigned
/// number. As in an INTEGER below 2^31; from there on 5 bytes, of which the first is zero, because
/// their content is an INTEGER's and so must not look negative (RFC 1155 section 6, X.690
/// section 8.3).
[[nodiscard]] std::size_t ber_uint_size(std::uint64_t value);

/// Of the content of an object identifier. 0 when it cannot be encoded: fewer than two arcs, first
/// two arcs that do not fit one byte, or more than 255 bytes.
[[nodiscard]] std::size_t ber_oid_size(const snmp_oid& oid);

// The writing primitives. Each moves the cursor past what it wrote and answers SNMP_OK, or answers
// SNMP_ERR_CODEC and writes nothing when the room or the value does not do.

/// A length field of one, two or three bytes (short form, 0x81, 0x82).
[[nodiscard]] snmp_status ber_put_length(ber_writer& out, std::uint16_t length);

/// A tag and the length of the content that the caller writes next.
[[nodiscard]] snmp_status ber_put_header(ber_writer& out, std::uint8_t tag, std::size_t length);

[[nodiscard]] snmp_status ber_put_octets(ber_writer& out, const snmp_octets& octets,
                                         std::uint8_t tag);
[[nodiscard]] snmp_status ber_put_octets(ber_writer& out, std::span<const std::uint8_t> bytes,
                                         std::uint8_t tag);

/// An integer in the fewest bytes, masked in place as by ber_int_size.
[[nodiscard]] snmp_status ber_put_int(ber_writer& out, std::uint64_t& value, std::uint8_t tag);
[[nodiscard]] snmp_status ber_put_int(ber_writer& out, std::int64_t& value, std::uint8_t tag);

/// An integer in `size` bytes, 1 to 5, as sized before.
[[nodiscard]] snmp_status ber_put_sized_int(ber_writer& out, std::uint64_t value, std::size_t size,
                                            std::uint8_t tag);

[[nodiscard]] snmp_status ber_put_oid(ber_writer& out, const snmp_oid& oid);
[[nodiscard]] snmp_status ber_put_null(ber_writer& out);

}  // namespace onramp
