#include <algorithm>
#include <cstddef>

#include "snmp/ber_writer.h"
#include "snmp/codec.h"

namespace onramp {

namespace {

constexpr std::uint8_t kPduTag = 0xA0;

snmp_status put_value(ber_writer& out, snmp_varbind& binding) {
  const auto tag = static_cast<std::uint8_t>(binding.type);
  switch (binding.type) {
    case kTagBoolean:
    case kTagInteger:
      return ber_put_int(out, binding.int_value, tag);
    case kTagCounter:
    case kTagGauge:
    case kTagTimeTicks:
      return ber_put_uint(out, static_cast<std::uint64_t>(binding.int_value), tag);
    case kTagOctetString:
    case kTagIpAddress:
    case kTagOpaque:
      return binding.octets_value ? ber_put_octets(out, *binding.octets_value, tag)
                                  : SNMP_ERR_CODEC;
    case kTagObjectIdentifier:
      return binding.oid_value ? ber_put_oid(out, *binding.oid_value) : SNMP_ERR_CODEC;
    case kTagNull:
      return ber_put_null(out);
    default:
      return SNMP_OK;
  }
}

snmp_status put_binding(ber_writer& out, snmp_varbind& binding) {
  const std::size_t end = out.size();
  if (!binding.name || put_value(out, binding) || ber_put_oid(out, *binding.name)) {
    return SNMP_ERR_CODEC;
  }
  binding.encoded_length = static_cast<std::uint16_t>(out.size() - end);
  return ber_put_header(out, kTagSequence, end);
}

snmp_status put_pdu(ber_writer& out, snmp_message& message) {
  for (std::uint64_t i = message.varbind_count; i > 0; --i) {
    if (put_binding(out, message.varbinds[i - 1])) return SNMP_ERR_CODEC;
  }
  return ber_put_header(out, kTagSequence, 0) ||
                 ber_put_int(out, message.error_index, kTagInteger) ||
                 ber_put_int(out, message.error_status, kTagInteger) ||
                 ber_put_int(out, message.request_id, kTagInteger) ||
                 ber_put_header(out, static_cast<std::uint8_t>(kPduTag | message.pdu_type), 0)
             ? SNMP_ERR_CODEC
             : SNMP_OK;
}

}  // namespace

// The message is encoded from its end to its start, as ber_writer requires.
snmp_status snmp_encode_message(snmp_message& message, std::span<std::uint8_t> out_buffer,
                                std::uint16_t& out_length) {
  if (message.varbind_count > message.varbinds.size()) return SNMP_ERR_CODEC;
  const std::span community(reinterpret_cast<const std::uint8_t*>(message.community),
                            message.community_length);
  ber_writer out(out_buffer);
  if (put_pdu(out, message) || ber_put_octets(out, community, kTagOctetString) ||
      ber_put_int(out, message.version, kTagInteger) || ber_put_header(out, kTagSequence, 0) ||
      out.size() > UINT16_MAX) {
    return SNMP_ERR_CODEC;
  }
  const auto written = out_buffer.last(out.size());
  std::copy(written.begin(), written.end(), out_buffer.begin());
  out_length = static_cast<std::uint16_t>(out.size());
  return SNMP_OK;
}

}  // namespace onramp
