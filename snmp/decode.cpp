#include <algorithm>
#include <cstddef>

#include "snmp/ber_reader.h"
#include "snmp/codec.h"

namespace onramp {

namespace {

constexpr std::uint64_t kTagNumber = 0x1F;

snmp_status get_header(ByteReader& in, std::uint8_t expected, std::uint16_t& length) {
  std::uint8_t tag = 0;
  if (ber_get_tag(in, tag) || tag != expected) return SNMP_ERR_CODEC;
  return ber_get_length(in, length);
}

snmp_status get_pdu_header(ByteReader& in, std::uint64_t& pdu_type) {
  std::uint8_t tag = 0;
  std::uint16_t length = 0;
  if (ber_get_tag(in, tag)) return SNMP_ERR_CODEC;
  pdu_type = tag & kTagNumber;
  return ber_get_length(in, length);
}

snmp_status get_field(ByteReader& in, std::uint64_t& value) {
  std::uint16_t length = 0;
  if (get_header(in, kTagInteger, length)) return SNMP_ERR_CODEC;
  return ber_get_uint(in, value, length);
}

snmp_status get_community(ByteReader& in, snmp_message& message) {
  std::uint16_t length = 0;
  if (get_header(in, kTagOctetString, length)) return SNMP_ERR_CODEC;
  const auto community = in.text(length);
  if (!community) return SNMP_ERR_CODEC;
  message.community_length = length;
  message.community = community->data();
  return SNMP_OK;
}

// Appends the string to the buffer that all strings of the reply share. `earlier` is the total size
// of the strings before this one. Adds `length` to `earlier`.
snmp_status get_string(ByteReader& in, snmp_octets* target, std::uint16_t length,
                       std::size_t& earlier) {
  if (target) {
    const auto taken = std::min<std::size_t>(earlier, target->capacity);
    target->bytes += taken;
    target->capacity = static_cast<std::uint16_t>(target->capacity - taken);
  }
  earlier += length;
  return ber_get_octets(in, target, length);
}

snmp_status get_value(ByteReader& in, snmp_varbind& binding, std::size_t& earlier) {
  std::uint8_t tag = 0;
  std::uint16_t length = 0;
  if (ber_get_tag(in, tag)) return SNMP_ERR_CODEC;
  binding.type = tag;
  if (ber_get_length(in, length)) return SNMP_ERR_CODEC;

  switch (tag) {
    case kTagBoolean:
    case kTagInteger:
    case kTagCounter:
    case kTagGauge:
    case kTagTimeTicks:
      if (ber_get_int(in, binding.int_value, length)) return SNMP_ERR_CODEC;
      break;
    case kTagObjectIdentifier:
      if (ber_get_oid(in, binding.oid_value, length)) return SNMP_ERR_CODEC;
      break;
    case kTagOctetString:
    case kTagIpAddress:
    case kTagOpaque:
      return get_string(in, binding.octets_value, length, earlier);
    default:
      return SNMP_OK;
  }
  if (binding.octets_value) *binding.octets_value = {};
  return SNMP_OK;
}

}  // namespace

snmp_status snmp_decode_message(snmp_message& message, std::span<const std::uint8_t> bytes) {
  message.varbind_count = 0;
  ByteReader in(bytes);
  std::uint16_t length = 0;
  if (get_header(in, kTagSequence, length) || get_field(in, message.version) ||
      get_community(in, message) || get_pdu_header(in, message.pdu_type) ||
      get_field(in, message.request_id) || get_field(in, message.error_status) ||
      get_field(in, message.error_index) || get_header(in, kTagSequence, length) ||
      length > in.remaining()) {
    return SNMP_ERR_CODEC;
  }

  const std::size_t end = in.remaining() - length;
  std::size_t strings = 0;
  for (std::uint32_t i = 0; in.remaining() > end; ++i) {
    if (i == message.varbinds.size()) return SNMP_ERR_CODEC;
    snmp_varbind& binding = message.varbinds[i];
    if (get_header(in, kTagSequence, length) || get_header(in, kTagObjectIdentifier, length) ||
        ber_get_oid(in, binding.name, length)) {
      return SNMP_ERR_CODEC;
    }
    binding.index = i;
    if (get_value(in, binding, strings)) return SNMP_ERR_CODEC;
    ++message.varbind_count;
  }
  return SNMP_OK;
}

}  // namespace onramp
