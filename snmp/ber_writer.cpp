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

}  // namespace

std::size_t ber_oid_size(const snmp_oid& oid) {
  const std::span<const std::uint16_t> arcs(oid.arcs, oid.count);
  if (arcs.size() < 2 || arcs[0] * 40 + arcs[1] > UINT8_MAX) return 0;
  std::size_t size = arcs.size() - 1;
  for (const std::uint16_t arc : arcs.subspan(2)) {
    if (!inOneByte(arc)) size += inTwoBytes(arc) ? 1 : 2;
  }
  return size <= kMaxOidContent ? size : 0;
}

snmp_status ber_put_sized_oid(ber_writer& out, const snmp_oid& oid, std::size_t size) {
  if (size == 0) return SNMP_ERR_CODEC;
  const auto content = ber_put_element(out, kTagObjectIdentifier, static_cast<std::uint16_t>(size));
  if (!content) return SNMP_ERR_CODEC;

  const std::span<const std::uint16_t> arcs(oid.arcs, oid.count);
  auto at = content->begin();
  *at++ = static_cast<std::uint8_t>(arcs[0] * 40 + arcs[1]);
  for (const std::uint16_t arc : arcs.subspan(2)) {
    if (!inOneByte(arc)) {
      if (!inTwoBytes(arc)) *at++ = static_cast<std::uint8_t>(0x80U | arc >> 14);
      *at++ = static_cast<std::uint8_t>(0x80U | (arc >> 7 & 0x7FU));
    }
    *at++ = static_cast<std::uint8_t>(arc & 0x7FU);
  }
  return SNMP_OK;
}

}  // namespace onramp
