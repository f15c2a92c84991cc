#include "snmp/ber_reader.h"

#include <algorithm>

namespace onramp {

snmp_status ber_get_oid(ber_reader& in, snmp_oid* target, std::uint16_t length) {
  if (!target) return SNMP_ERR_CODEC;
  ber_reader ahead = in;
  const auto content = ahead.take(length);
  if (!content) return SNMP_ERR_CODEC;

  const std::span<std::uint16_t> arcs(target->arcs, target->count);
  std::size_t count = 0;
  if (!content->empty()) {
    if (arcs.size() < 2) return SNMP_ERR_CODEC;
    arcs[0] = content->front() / 40;
    arcs[1] = content->front() % 40;
    count = 2;

    std::uint32_t arc = 0;
    bool inside = false;
    for (const std::uint8_t byte : content->subspan(1)) {
      arc = arc << 7 | (byte & 0x7FU);
      if (arc > UINT16_MAX) return SNMP_ERR_CODEC;
      inside = (byte & 0x80U) != 0;
      if (inside) continue;
      if (count == arcs.size()) return SNMP_ERR_CODEC;
      arcs[count++] = static_cast<std::uint16_t>(arc);
      arc = 0;
    }
    if (inside) return SNMP_ERR_CODEC;
  }
  target->count = static_cast<std::uint16_t>(count);
  in = ahead;
  return SNMP_OK;
}

snmp_status ber_get_octets(ber_reader& in, snmp_octets* target, std::uint16_t length) {
  if (length == 0) {
    if (target) target->length = 0;
    return SNMP_OK;
  }
  if (!target || length > target->capacity) return SNMP_ERR_CODEC;
  const auto content = in.take(length);
  if (!content) return SNMP_ERR_CODEC;
  std::copy(content->begin(), content->end(), target->bytes);
  target->length = length;
  return SNMP_OK;
}

snmp_status ber_get_octets_ref(ber_reader& in, snmp_octets* target, std::uint16_t length) {
  if (length == 0) {
    if (target) target->length = 0;
    return SNMP_OK;
  }
  if (!target) return SNMP_ERR_CODEC;
  const auto content = in.take(length);
  if (!content) return SNMP_ERR_CODEC;
  target->bytes = const_cast<std::uint8_t*>(content->data());
  target->length = length;
  target->capacity = 0;
  return SNMP_OK;
}

}  // namespace onramp
