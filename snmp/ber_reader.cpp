#include "snmp/ber_reader.h"

#include <cstring>
#include <optional>
#include <span>

namespace onramp {

namespace {

// Reads one arc of an object identifier. Each byte holds seven bits of the arc, the most
// significant bits first. The top bit is set in every byte except the last. Returns nothing when
// the arc does not fit in 16 bits or its last byte is missing.
std::optional<std::uint16_t> next_arc(ByteReader& content) {
  std::uint32_t arc = 0;
  while (const auto byte = content.byte()) {
    arc = arc << 7 | (*byte & 0x7FU);
    if (arc > UINT16_MAX) return std::nullopt;
    if (*byte < 0x80) return static_cast<std::uint16_t>(arc);
  }
  return std::nullopt;
}

}  // namespace

snmp_status ber_get_oid(ByteReader& in, snmp_oid* target, std::uint16_t length) {
  const auto bytes = in.take(length);
  if (!target || !bytes) return SNMP_ERR_CODEC;
  ByteReader content(*bytes);
  const std::span<std::uint16_t> arcs(target->arcs, target->count);
  std::uint16_t count = 0;
  if (const auto first = content.byte()) {
    if (arcs.size() < 2) return SNMP_ERR_CODEC;
    arcs[0] = *first / 40;
    arcs[1] = *first % 40;
    count = 2;
  }
  while (!content.atEnd()) {
    const auto arc = next_arc(content);
    if (!arc || count == arcs.size()) return SNMP_ERR_CODEC;
    arcs[count++] = *arc;
  }
  target->count = count;
  return SNMP_OK;
}

snmp_status ber_get_octets(ByteReader& in, snmp_octets* target, std::uint16_t length) {
  if (length == 0) {
    if (target) target->length = 0;
    return SNMP_OK;
  }
  if (!target || length > target->capacity) return SNMP_ERR_CODEC;
  const auto content = in.take(length);
  if (!content) return SNMP_ERR_CODEC;
  std::memcpy(target->bytes, content->data(), length);
  target->length = length;
  return SNMP_OK;
}

snmp_status ber_get_octets_ref(ByteReader& in, snmp_octets* target, std::uint16_t length) {
  if (length == 0) {
    if (target) target->length = 0;
    return SNMP_OK;
  }
  const auto content = in.take(length);
  if (!target || !content) return SNMP_ERR_CODEC;
  const auto* const bytes = reinterpret_cast<const std::uint8_t*>(content->data());
  *target = {.length = length, .capacity = 0, .bytes = const_cast<std::uint8_t*>(bytes)};
  return SNMP_OK;
}

}  // namespace onramp
