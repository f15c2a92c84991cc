#include "snmp/ber_writer.h"

namespace onramp {

namespace {

constexpr std::size_t kMaxOidContent = 0xFF;

constexpr bool inOneByte(std::uint32_t arc) {
  return arc < 1U << 7;
}
constexpr bool inTwoBytes(std::uint32_t arc) {
  return arc < 1U << 14;
}

bool has_room(const ber_writer& out, std::size_t content) {
  return content <= UINT16_MAX && ber_element_size(content) <= out.remaining();
}

}  // namespace

std::size_t ber_int_size(std::uint64_t& value) {
  const auto bits = static_cast<std::uint32_t>(value);
  if (bits < 0x80U) return 1;
  if (bits < 0x8000U) return 2;
  if (bits < 0x80000000U) return (bits & 0xFF800000U) != 0 ? 4 : 3;

  const std::size_t size = bits >= 0xFFFFFF80U   ? 1
                           : bits >= 0xFFFF8000U ? 2
                           : bits >= 0xFF800000U ? 3
                                                 : 4;
  value &= UINT32_MAX >> (32 - 8 * size);
  return size;
}

std::size_t ber_int_size(std::int64_t& value) {
  auto bits = static_cast<std::uint64_t>(value);
  const std::size_t size = ber_int_size(bits);
  value = static_cast<std::int64_t>(bits);
  return size;
}

std::size_t ber_uint_size(std::uint64_t value) {
  value &= UINT32_MAX;
  return value > INT32_MAX ? 5 : ber_int_size(value);
}

std::size_t ber_oid_size(const snmp_oid& oid) {
  const std::span<const std::uint16_t> arcs(oid.arcs, oid.count);
  if (arcs.size() < 2 || arcs[0] * 40 + arcs[1] > UINT8_MAX) return 0;
  std::size_t size = 1;
  for (const std::uint16_t arc : arcs.subspan(2))
    size += inOneByte(arc) ? 1 : inTwoBytes(arc) ? 2 : 3;
  return size <= kMaxOidContent ? size : 0;
}

snmp_status ber_put_length(ber_writer& out, std::uint16_t length) {
  const std::size_t size = ber_length_size(length);
  if (size > out.remaining()) return SNMP_ERR_CODEC;
  if (size > 1) out.put(static_cast<std::uint8_t>(0x80U | (size - 1)));
  if (size > 2) out.put(static_cast<std::uint8_t>(length >> 8));
  out.put(static_cast<std::uint8_t>(length));
  return SNMP_OK;
}

snmp_status ber_put_header(ber_writer& out, std::uint8_t tag, std::size_t length) {
  if (!has_room(out, length)) return SNMP_ERR_CODEC;
  out.put(tag);
  return ber_put_length(out, static_cast<std::uint16_t>(length));
}

snmp_status ber_put_octets(ber_writer& out, const snmp_octets& octets, std::uint8_t tag) {
  return ber_put_octets(out, std::span<const std::uint8_t>(octets.bytes, octets.length), tag);
}

snmp_status ber_put_octets(ber_writer& out, std::span<const std::uint8_t> bytes, std::uint8_t tag) {
  if (ber_put_header(out, tag, bytes.size())) return SNMP_ERR_CODEC;
  out.put(bytes);
  return SNMP_OK;
}

snmp_status ber_put_int(ber_writer& out, std::uint64_t& value, std::uint8_t tag) {
  const std::size_t size = ber_int_size(value);
  return ber_put_sized_int(out, value, size, tag);
}

snmp_status ber_put_int(ber_writer& out, std::int64_t& value, std::uint8_t tag) {
  const std::size_t size = ber_int_size(value);
  return ber_put_sized_int(out, static_cast<std::uint64_t>(value), size, tag);
}

snmp_status ber_put_sized_int(ber_writer& out, std::uint64_t value, std::size_t size,
                              std::uint8_t tag) {
  if (ber_put_header(out, tag, size)) return SNMP_ERR_CODEC;
  value &= UINT32_MAX;
  for (std::size_t left = size; left-- > 0;)
    out.put(static_cast<std::uint8_t>(value >> (8 * left)));
  return SNMP_OK;
}

snmp_status ber_put_oid(ber_writer& out, const snmp_oid& oid) {
  const std::size_t size = ber_oid_size(oid);
  if (size == 0 || ber_put_header(out, kTagObjectIdentifier, size)) return SNMP_ERR_CODEC;

  const std::span<const std::uint16_t> arcs(oid.arcs, oid.count);
  ber_writer content = out;
  content.put(static_cast<std::uint8_t>(arcs[0] * 40 + arcs[1]));
  for (const std::uint16_t arc : arcs.subspan(2)) {
    if (!inTwoBytes(arc)) content.put(static_cast<std::uint8_t>(0x80U | arc >> 14));
    if (!inOneByte(arc)) content.put(static_cast<std::uint8_t>(0x80U | (arc >> 7 & 0x7FU)));
    content.put(static_cast<std::uint8_t>(arc & 0x7FU));
  }
  out = content;
  return SNMP_OK;
}

snmp_status ber_put_null(ber_writer& out) {
  return ber_put_header(out, kTagNull, 0);
}

}  // namespace onramp
