#include <cassert>
#include <cstddef>

#include "snmp/ber_writer.h"
#include "snmp/codec.h"

namespace onramp {

namespace {

constexpr std::uint8_t kPduTag = 0xA0;

// Content sizes.
struct layout {
  std::size_t version = 0;
  std::size_t request_id = 0;
  std::size_t error_status = 0;
  std::size_t error_index = 0;
  std::uint16_t varbinds = 0;
  std::uint16_t pdu = 0;
  std::uint16_t message = 0;
};

snmp_status size_value(const snmp_varbind& binding, std::size_t& size) {
  switch (binding.type) {
    case kTagBoolean:
    case kTagInteger:
      size = ber_element_size(ber_int_size(static_cast<std::uint64_t>(binding.int_value)));
      return SNMP_OK;
    case kTagCounter:
    case kTagGauge:
    case kTagTimeTicks:
      size = ber_element_size(ber_uint_size(static_cast<std::uint64_t>(binding.int_value)));
      return SNMP_OK;
    case kTagOctetString:
    case kTagIpAddress:
    case kTagOpaque:
      if (!binding.octets_value) return SNMP_ERR_CODEC;
      size = ber_element_size(binding.octets_value->length);
      return SNMP_OK;
    case kTagObjectIdentifier: {
      const std::size_t content = binding.oid_value ? ber_oid_size(*binding.oid_value) : 0;
      size = ber_element_size(content);
      return content == 0 ? SNMP_ERR_CODEC : SNMP_OK;
    }
    case kTagNull:
      size = ber_element_size(0);
      return SNMP_OK;
    default:
      size = 0;
      return SNMP_OK;
  }
}

snmp_status size_bindings(std::span<snmp_varbind> bindings, std::size_t& list) {
  for (snmp_varbind& binding : bindings) {
    const std::size_t name = binding.name ? ber_oid_size(*binding.name) : 0;
    std::size_t value = 0;
    if (name == 0 || size_value(binding, value)) return SNMP_ERR_CODEC;
    const std::size_t content = ber_element_size(name) + value;
    if (content > UINT16_MAX) return SNMP_ERR_CODEC;
    binding.encoded_length = static_cast<std::uint16_t>(content);
    list += ber_element_size(content);
  }
  return SNMP_OK;
}

snmp_status size_message(const snmp_message& message, std::span<snmp_varbind> bindings,
                         layout& sizes) {
  std::size_t list = 0;
  if (size_bindings(bindings, list)) return SNMP_ERR_CODEC;
  sizes.version = ber_int_size(message.version);
  sizes.request_id = ber_int_size(message.request_id);
  sizes.error_status = ber_int_size(message.error_status);
  sizes.error_index = ber_int_size(message.error_index);
  const std::size_t pdu = ber_element_size(sizes.request_id) +
                          ber_element_size(sizes.error_status) +
                          ber_element_size(sizes.error_index) + ber_element_size(list);
  const std::size_t content = ber_element_size(sizes.version) +
                              ber_element_size(message.community_length) + ber_element_size(pdu);
  // The largest one: when it fits 16 bits, so do those that it encloses.
  if (ber_element_size(content) > UINT16_MAX) return SNMP_ERR_CODEC;
  sizes.varbinds = static_cast<std::uint16_t>(list);
  sizes.pdu = static_cast<std::uint16_t>(pdu);
  sizes.message = static_cast<std::uint16_t>(content);
  return SNMP_OK;
}

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
      return ber_put_octets(out, *binding.octets_value, tag);
    case kTagObjectIdentifier:
      return ber_put_oid(out, *binding.oid_value);
    case kTagNull:
      return ber_put_null(out);
    default:
      return SNMP_OK;
  }
}

// Into exactly the room that the sizes ask for.
snmp_status put_bindings(std::span<std::uint8_t> room, std::span<snmp_varbind> bindings) {
  ber_writer out(room);
  for (snmp_varbind& binding : bindings) {
    if (ber_put_header(out, kTagSequence, binding.encoded_length)) return SNMP_ERR_CODEC;
    [[maybe_unused]] const std::size_t after = out.remaining() - binding.encoded_length;
    // A name takes longer to size than most values, so its size is what the value leaves over.
    std::size_t value = 0;
    if (size_value(binding, value)) return SNMP_ERR_CODEC;
    const std::size_t name = ber_content_size(binding.encoded_length - value);
    if (ber_put_sized_oid(out, *binding.name, name) || put_value(out, binding)) {
      return SNMP_ERR_CODEC;
    }
    assert(out.remaining() == after);
  }
  assert(out.remaining() == 0);
  return SNMP_OK;
}

}  // namespace

snmp_status snmp_encode_message(snmp_message& message, std::span<std::uint8_t> out_buffer,
                                std::uint16_t& out_length) {
  if (message.varbind_count > message.varbinds.size()) return SNMP_ERR_CODEC;
  const auto bindings = message.varbinds.first(message.varbind_count);
  layout sizes;
  if (size_message(message, bindings, sizes)) return SNMP_ERR_CODEC;
  const std::size_t size = ber_element_size(sizes.message);
  if (size > out_buffer.size()) return SNMP_ERR_CODEC;

  ber_writer out(out_buffer.first(size));
  const std::span community(reinterpret_cast<const std::uint8_t*>(message.community),
                            message.community_length);
  const auto pdu_tag = static_cast<std::uint8_t>(kPduTag | message.pdu_type);
  if (ber_put_header(out, kTagSequence, sizes.message) ||
      ber_put_sized_int(out, message.version, sizes.version, kTagInteger) ||
      ber_put_octets(out, community, kTagOctetString) || ber_put_header(out, pdu_tag, sizes.pdu) ||
      ber_put_sized_int(out, message.request_id, sizes.request_id, kTagInteger) ||
      ber_put_sized_int(out, message.error_status, sizes.error_status, kTagInteger) ||
      ber_put_sized_int(out, message.error_index, sizes.error_index, kTagInteger) ||
      ber_put_header(out, kTagSequence, sizes.varbinds)) {
    return SNMP_ERR_CODEC;
  }
  const auto list = out.take(sizes.varbinds);
  if (!list || put_bindings(*list, bindings)) return SNMP_ERR_CODEC;
  assert(out.remaining() == 0);
  out_length = static_cast<std::uint16_t>(size);
  return SNMP_OK;
}

}  // namespace onramp
