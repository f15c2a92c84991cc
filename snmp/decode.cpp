#include <algorithm>
#include <cstddef>

#include "snmp/ber_reader.h"
#include "snmp/codec.h"

namespace onramp {

namespace {

constexpr std::uint64_t kTagNumber = 0x1F;

// Reads an element's header. Its content is then certain to lie within the input.
snmp_status get_header(ber_reader& in, std::uint8_t& tag, std::uint16_t& length) {
  if (ber_get_tag(in, tag) || ber_get_length(in, length)) return SNMP_ERR_CODEC;
  return length > in.remaining() ? SNMP_ERR_CODEC : SNMP_OK;
}

snmp_status expect_header(ber_reader& in, std::uint8_t expected, std::uint16_t& length) {
  std::uint8_t tag = 0;
  if (get_header(in, tag, length)) return SNMP_ERR_CODEC;
  return tag == expected ? SNMP_OK : SNMP_ERR_CODEC;
}

// Everything from here on has to lie within the sequence.
snmp_status enter_sequence(ber_reader& in) {
  std::uint16_t length = 0;
  if (expect_header(in, kTagSequence, length)) return SNMP_ERR_CODEC;
  return in.narrow(length) ? SNMP_OK : SNMP_ERR_CODEC;
}

snmp_status enter_pdu(ber_reader& in, std::uint64_t& pdu_type) {
  std::uint8_t tag = 0;
  std::uint16_t length = 0;
  if (get_header(in, tag, length)) return SNMP_ERR_CODEC;
  pdu_type = tag & kTagNumber;
  return in.narrow(length) ? SNMP_OK : SNMP_ERR_CODEC;
}

snmp_status get_field(ber_reader& in, std::uint64_t& value) {
  std::uint16_t length = 0;
  if (expect_header(in, kTagInteger, length)) return SNMP_ERR_CODEC;
  return ber_get_uint(in, value, length);
}

snmp_status get_community(ber_reader& in, snmp_message& message) {
  std::uint16_t length = 0;
  if (expect_header(in, kTagOctetString, length)) return SNMP_ERR_CODEC;
  const auto content = in.take(length);
  if (!content) return SNMP_ERR_CODEC;
  message.community_length = length;
  message.community = reinterpret_cast<const char*>(content->data());
  return SNMP_OK;
}

// `earlier` counts the bytes of the reply's strings so far, which share one buffer.
snmp_status get_string(ber_reader& in, snmp_octets* target, std::uint16_t length,
                       std::size_t& earlier) {
  if (target) {
    const auto taken = std::min<std::size_t>(earlier, target->capacity);
    target->bytes += taken;
    target->capacity = static_cast<std::uint16_t>(target->capacity - taken);
  }
  earlier += length;
  return ber_get_octets(in, target, length);
}

snmp_status get_value(ber_reader& in, snmp_varbind& binding, std::size_t& earlier) {
  std::uint8_t tag = 0;
  std::uint16_t length = 0;
  if (ber_get_tag(in, tag)) return SNMP_ERR_CODEC;
  binding.type = tag;
  if (ber_get_length(in, length) || length > in.remaining()) return SNMP_ERR_CODEC;

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
  ber_reader in(bytes);
  if (enter_sequence(in) || get_field(in, message.version) || get_community(in, message) ||
      enter_pdu(in, message.pdu_type) || get_field(in, message.request_id) ||
      get_field(in, message.error_status) || get_field(in, message.error_index) ||
      enter_sequence(in)) {
    return SNMP_ERR_CODEC;
  }

  std::size_t strings = 0;
  for (std::uint32_t i = 0; in.remaining() != 0; ++i) {
    if (i == message.varbinds.size()) return SNMP_ERR_CODEC;
    snmp_varbind& binding = message.varbinds[i];
    std::uint16_t length = 0;  // of the binding, whose own elements say where they end
    if (expect_header(in, kTagSequence, length)) return SNMP_ERR_CODEC;
    if (expect_header(in, kTagObjectIdentifier, length)) return SNMP_ERR_CODEC;
    if (ber_get_oid(in, binding.name, length)) return SNMP_ERR_CODEC;
    binding.index = i;
    if (get_value(in, binding, strings)) return SNMP_ERR_CODEC;
    ++message.varbind_count;
  }
  return SNMP_OK;
}

}  // namespace onramp
