#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>

#include "snmp/records.h"
#include "snmp/status.h"

namespace onramp {

/// A cursor over the room for a message that cannot leave it.
class ber_writer {
 public:
  explicit ber_writer(std::span<std::uint8_t> room) : rest_(room) {}

  [[nodiscard]] std::size_t remaining() const { return rest_.size(); }

  /// The next `count` bytes, which are the caller's to fill; nothing, and no move, when fewer are
  /// left.
  [[nodiscard]] std::optional<std::span<std::uint8_t>> take(std::size_t count) {
    if (count > rest_.size()) return std::nullopt;
    const auto taken = rest_.first(count);
    rest_ = rest_.subspan(count);
    return taken;
  }

 private:
  std::span<std::uint8_t> rest_;
};

// Sizes in bytes. What a writing primitive writes has exactly the size given here.

/// Of the length field for `length` bytes of content, 65,535 at most.
[[nodiscard]] constexpr std::size_t ber_length_size(std::size_t length) {
  return length < 0x80 ? 1 : length <= 0xFF ? 2 : 3;
}

/// Of a whole element: tag, length field and content.
[[nodiscard]] constexpr std::size_t ber_element_size(std::size_t content) {
  return 1 + ber_length_size(content) + content;
}

/// Of the content of an element of at most 255 bytes of content, from the element's size.
[[nodiscard]] constexpr std::size_t ber_content_size(std::size_t element) {
  return element < ber_element_size(0x80) ? element - 2 : element - 3;
}

/// Of the content of an INTEGER, 1 to 4: the fewest bytes that hold the low 32 bits of `value` as a
/// signed number.
[[nodiscard]] constexpr std::size_t ber_int_size(std::uint64_t value) {
  const auto bits = static_cast<std::uint32_t>(value);
  const std::uint32_t magnitude = (bits & 0x80000000U) != 0 ? ~bits : bits;
  return magnitude < 0x80U ? 1 : magnitude < 0x8000U ? 2 : magnitude < 0x800000U ? 3 : 4;
}

/// The lowest `size` bytes of `value`, 1 to 4.
[[nodiscard]] constexpr std::uint64_t ber_low_bytes(std::uint64_t value, std::size_t size) {
  return value & UINT32_MAX >> (32 - 8 * size);
}

/// Of the content of a Counter, Gauge or TimeTicks: the low 32 bits of `value` as an unsigned
/// number. As in an INTEGER below 2^31; from there on 5 bytes, of which the first is zero, because
/// their content is an INTEGER's and so must not look negative (RFC 1155 section 6, X.690
/// section 8.3).
[[nodiscard]] constexpr std::size_t ber_uint_size(std::uint64_t value) {
  return (value & 0x80000000U) != 0 ? 5 : ber_int_size(value);
}

/// Of the content of an object identifier. 0 when it cannot be encoded: fewer than two arcs, first
/// two arcs that do not fit one byte, or more than 255 bytes.
[[nodiscard]] std::size_t ber_oid_size(const snmp_oid& oid);

/// Fills `field`, of ber_length_size(length) bytes.
inline void ber_fill_length(std::span<std::uint8_t> field, std::uint16_t length) {
  field.back() = static_cast<std::uint8_t>(length);
  if (length < 0x80) return;
  field.front() = static_cast<std::uint8_t>(0x80U | (field.size() - 1));
  if (length > 0xFF) field[1] = static_cast<std::uint8_t>(length >> 8);
}

// The writing primitives. Each moves the cursor past what it wrote and answers SNMP_OK, or answers
// SNMP_ERR_CODEC and writes nothing when the room or the value does not do.

/// A length field of one, two or three bytes (short form, 0x81, 0x82).
[[nodiscard]] inline snmp_status ber_put_length(ber_writer& out, std::uint16_t length) {
  const auto field = out.take(ber_length_size(length));
  if (!field) return SNMP_ERR_CODEC;
  ber_fill_length(*field, length);
  return SNMP_OK;
}

/// The tag and the length of an element whose content the caller writes next.
[[nodiscard]] inline snmp_status ber_put_header(ber_writer& out, std::uint8_t tag,
                                                std::uint16_t length) {
  const auto header = out.take(1 + ber_length_size(length));
  if (!header) return SNMP_ERR_CODEC;
  header->front() = tag;
  ber_fill_length(header->subspan(1), length);
  return SNMP_OK;
}

/// A whole element but for its content: `length` bytes, which are the caller's to fill. Nothing,
/// and nothing is written, when the element does not fit.
[[nodiscard]] inline std::optional<std::span<std::uint8_t>> ber_put_element(ber_writer& out,
                                                                            std::uint8_t tag,
                                                                            std::uint16_t length) {
  const auto element = out.take(ber_element_size(length));
  if (!element) return std::nullopt;
  element->front() = tag;
  ber_fill_length(element->subspan(1, ber_length_size(length)), length);
  return element->last(length);
}

[[nodiscard]] inline snmp_status ber_put_octets(ber_writer& out,
                                                std::span<const std::uint8_t> bytes,
                                                std::uint8_t tag) {
  if (bytes.size() > UINT16_MAX) return SNMP_ERR_CODEC;
  const auto content = ber_put_element(out, tag, static_cast<std::uint16_t>(bytes.size()));
  if (!content) return SNMP_ERR_CODEC;
  std::copy(bytes.begin(), bytes.end(), content->begin());
  return SNMP_OK;
}

[[nodiscard]] inline snmp_status ber_put_octets(ber_writer& out, const snmp_octets& octets,
                                                std::uint8_t tag) {
  return ber_put_octets(out, std::span<const std::uint8_t>(octets.bytes, octets.length), tag);
}

/// The low 32 bits of `value` in `size` bytes, big-endian; a fifth byte is zero.
[[nodiscard]] inline snmp_status ber_put_bits(ber_writer& out, std::uint32_t value,
                                              std::size_t size, std::uint8_t tag) {
  const auto element = out.take(2 + size);
  if (!element) return SNMP_ERR_CODEC;
  (*element)[0] = tag;
  (*element)[1] = static_cast<std::uint8_t>(size);
  std::size_t left = size;
  for (std::uint8_t& byte : element->last(size))
    byte = static_cast<std::uint8_t>(std::uint64_t{value} >> (8 * --left));
  return SNMP_OK;
}

/// An integer in `size` bytes, its ber_int_size. A negative value is cut down in place to the bytes
/// written, which is the number that ber_get_uint reads when they come back.
template <typename Integer>
[[nodiscard]] inline snmp_status ber_put_sized_int(ber_writer& out, Integer& value,
                                                   std::size_t size, std::uint8_t tag) {
  const auto bits = static_cast<std::uint32_t>(value);
  if (bits > INT32_MAX) value = static_cast<Integer>(ber_low_bytes(bits, size));
  return ber_put_bits(out, bits, size, tag);
}

template <typename Integer>
[[nodiscard]] snmp_status ber_put_int(ber_writer& out, Integer& value, std::uint8_t tag) {
  return ber_put_sized_int(out, value, ber_int_size(static_cast<std::uint64_t>(value)), tag);
}

/// An unsigned integer in ber_uint_size bytes.
[[nodiscard]] inline snmp_status ber_put_uint(ber_writer& out, std::uint64_t value,
                                              std::uint8_t tag) {
  return ber_put_bits(out, static_cast<std::uint32_t>(value), ber_uint_size(value), tag);
}

/// An object identifier whose ber_oid_size is `size`.
[[nodiscard]] snmp_status ber_put_sized_oid(ber_writer& out, const snmp_oid& oid, std::size_t size);

[[nodiscard]] inline snmp_status ber_put_oid(ber_writer& out, const snmp_oid& oid) {
  return ber_put_sized_oid(out, oid, ber_oid_size(oid));
}

[[nodiscard]] inline snmp_status ber_put_null(ber_writer& out) {
  return ber_put_element(out, kTagNull, 0) ? SNMP_OK : SNMP_ERR_CODEC;
}

}  // namespace onramp
