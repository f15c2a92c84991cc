#include "snmp/ber_writer.h"

#include <algorithm>

namespace onramp {

namespace {

constexpr std::size_t kLongestOid = 0xFF;

snmp_status put_arc(ber_writer& out, std::uint16_t arc) {
  std::uint8_t more = 0;
  do {
    if (out.put(static_cast<std::uint8_t>(more | (arc & 0x7FU)))) return SNMP_ERR_CODEC;
    more = 0x80;
    arc = static_cast<std::uint16_t>(arc >> 7);
  } while (arc != 0);
  return SNMP_OK;
}

}  // namespace

snmp_status ber_writer::put(std::span<const std::uint8_t> bytes) {
  if (bytes.size() > left_) return SNMP_ERR_CODEC;
  left_ -= bytes.size();
  std::copy(bytes.begin(), bytes.end(), room_.begin() + static_cast<std::ptrdiff_t>(left_));
  return SNMP_OK;
}

snmp_status ber_put_octets(ber_writer& out, std::span<const std::uint8_t> bytes, std::uint8_t tag) {
  const std::size_t end = out.size();
  return out.put(bytes) || ber_put_header(out, tag, end) ? SNMP_ERR_CODEC : SNMP_OK;
}

// This function and ber_put_oid() write through a copy of the writer, so that the compiler can keep
// the copy in registers. It could not keep `out` there, because a written byte might alias `out`.
snmp_status ber_put_int(ber_writer& out, std::uint64_t& value, std::uint8_t tag) {
  ber_writer own = out;
  const std::size_t end = own.size();
  const auto number = static_cast<std::int32_t>(value);
  std::int32_t rest = number;
  for (; rest != static_cast<std::int8_t>(rest); rest >>= 8) {
    if (own.put(static_cast<std::uint8_t>(rest))) return SNMP_ERR_CODEC;
  }
  if (own.put(static_cast<std::uint8_t>(rest))) return SNMP_ERR_CODEC;
  const std::size_t bits = 8 * (own.size() - end);
  if (ber_put_header(own, tag, end)) return SNMP_ERR_CODEC;
  if (number < 0) value = static_cast<std::uint32_t>(number) & ((std::uint64_t{1} << bits) - 1);
  out = own;
  return SNMP_OK;
}

snmp_status ber_put_int(ber_writer& out, std::int64_t& value, std::uint8_t tag) {
  auto bits = static_cast<std::uint64_t>(value);
  const snmp_status status = ber_put_int(out, bits, tag);
  value = static_cast<std::int64_t>(bits);
  return status;
}

snmp_status ber_put_uint(ber_writer& out, std::uint64_t value, std::uint8_t tag) {
  const std::size_t end = out.size();
  auto number = static_cast<std::uint32_t>(value);
  for (; number >= 0x80; number >>= 8) {
    if (out.put(static_cast<std::uint8_t>(number))) return SNMP_ERR_CODEC;
  }
  return out.put(static_cast<std::uint8_t>(number)) || ber_put_header(out, tag, end)
             ? SNMP_ERR_CODEC
             : SNMP_OK;
}

snmp_status ber_put_oid(ber_writer& out, const snmp_oid& oid) {
  const std::span<const std::uint16_t> arcs(oid.arcs, oid.count);
  if (arcs.size() < 2) return SNMP_ERR_CODEC;
  ber_writer own = out;
  const std::size_t end = own.size();
  for (std::size_t i = arcs.size() - 1; i >= 2; --i) {
    if (put_arc(own, arcs[i])) return SNMP_ERR_CODEC;
  }
  const int first = arcs[0] * 40 + arcs[1];
  if (first > UINT8_MAX || own.put(static_cast<std::uint8_t>(first)) ||
      own.size() - end > kLongestOid || ber_put_header(own, kTagObjectIdentifier, end)) {
    return SNMP_ERR_CODEC;
  }
  out = own;
  return SNMP_OK;
}

snmp_status ber_put_null(ber_writer& out) {
  return ber_put_header(out, kTagNull, out.size());
}

}  // namespace onramp
