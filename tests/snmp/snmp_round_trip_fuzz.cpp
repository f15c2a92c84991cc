// What decodes and is encoded again decodes to the same message.

#include <array>

#include "tests/snmp/fuzz.h"
#include "tests/snmp/message.h"

namespace {

using onramp::Message;

constexpr std::size_t kBindings = 8;
using Numbers = std::array<std::uint32_t, kBindings>;

bool isUnsigned(std::uint64_t type) {
  return type >= onramp::kTagCounter && type <= onramp::kTagTimeTicks;
}

bool isNumber(std::uint64_t type) {
  return type == onramp::kTagBoolean || type == onramp::kTagInteger || isUnsigned(type);
}

bool isString(std::uint64_t type) {
  return type == onramp::kTagOctetString || type == onramp::kTagIpAddress ||
         type == onramp::kTagOpaque;
}

// Whether the encoder has a form for the binding that the decoder takes back.
bool comesBack(const onramp::snmp_varbind& binding) {
  if (isUnsigned(binding.type)) return (binding.int_value & 0x80000000) == 0;
  return isNumber(binding.type) || isString(binding.type) || binding.type == onramp::kTagNull ||
         binding.type == onramp::kTagObjectIdentifier;
}

bool canBeEncoded(const onramp::snmp_varbind& binding) {
  return binding.name->count >= 2 &&
         (binding.type != onramp::kTagObjectIdentifier || binding.oid_value->count >= 2);
}

bool same(const onramp::snmp_oid& a, const onramp::snmp_oid& b) {
  return std::equal(a.arcs, a.arcs + a.count, b.arcs, b.arcs + b.count);
}

void requireSameBinding(const onramp::snmp_varbind& a, std::uint32_t number,
                        const onramp::snmp_varbind& b) {
  require(a.type == b.type && a.index == b.index, "same type and place");
  require(same(*a.name, *b.name), "same name");
  if (isNumber(a.type)) require(number == static_cast<std::uint32_t>(b.int_value), "same number");
  if (a.type == onramp::kTagObjectIdentifier)
    require(same(*a.oid_value, *b.oid_value), "same value");
  if (!isString(a.type)) return;
  const auto& x = *a.octets_value;
  const auto& y = *b.octets_value;
  require(std::equal(x.bytes, x.bytes + x.length, y.bytes, y.bytes + y.length), "same string");
}

// The header's numbers are compared with what encoding left of them.
void requireSame(const Message& a, const Numbers& numbers, const Message& b) {
  const auto& x = a.message;
  const auto& y = b.message;
  require(x.version == y.version && x.pdu_type == y.pdu_type, "same version and kind");
  require(x.request_id == y.request_id && x.error_status == y.error_status &&
              x.error_index == y.error_index,
          "same numbers");
  require(std::string_view(x.community, x.community_length) ==
              std::string_view(y.community, y.community_length),
          "same community");
  require(x.varbind_count == y.varbind_count, "same number of bindings");
  for (std::size_t i = 0; i < x.varbind_count; ++i)
    requireSameBinding(a.varbinds[i], numbers[i], b.varbinds[i]);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static Message first(kBindings, 16, 1500);
  static Message second(kBindings, 16, 1500);
  static std::array<std::uint8_t, 65535> buffer;

  if (first.decode({data, size}) != onramp::SNMP_OK) return 0;
  const auto bindings = first.message.varbinds.first(first.message.varbind_count);
  Numbers numbers{};
  for (const onramp::snmp_varbind& binding : bindings)
    numbers[binding.index] = static_cast<std::uint32_t>(binding.int_value);

  std::uint16_t length = 0;
  onramp::snmp_status status = onramp::SNMP_OK;
  requireQuick([&] { status = onramp::snmp_encode_message(first.message, buffer, length); });
  const bool encodable = std::all_of(bindings.begin(), bindings.end(), canBeEncoded);
  require((status == onramp::SNMP_OK) == encodable, "encoded if it can be");
  if (!encodable || !std::all_of(bindings.begin(), bindings.end(), comesBack)) return 0;

  require(second.decode(std::span(buffer).first(length)) == onramp::SNMP_OK, "decoded again");
  requireSame(first, numbers, second);
  return 0;
}
