// What decodes stays within its storage, and what is encoded again decodes to the same message.

#include <array>

#include "tests/snmp/fuzz.h"
#include "tests/snmp/message.h"

namespace {

using onramp::Message;
using Bytes = std::vector<std::uint8_t>;

// Decodes into bindings whose strings have the same place, or places `stride` bytes apart.
onramp::snmp_status decode(Message& m, std::span<const std::uint8_t> bytes, std::uint16_t stride) {
  m.reset();
  for (std::uint16_t i = 0; i < m.octets.size(); ++i) {
    const auto start = static_cast<std::uint16_t>(i * stride);
    const auto room = static_cast<std::uint16_t>(m.stringRoom - start);
    m.octets[i] = {room, room, m.strings.data() + start};
  }
  auto status = onramp::SNMP_OK;
  requireQuick([&] { status = onramp::snmp_decode_message(m.message, bytes); });
  require(m.guardsIntact(), "nothing is written beyond the storage");
  require(m.message.varbind_count <= m.varbinds.size(), "the array holds the bindings");
  for (std::size_t i = 0; i < m.varbinds.size(); ++i) {
    require(m.names[i].count <= m.room && m.oids[i].count <= m.room, "the storage holds the arcs");
    require(m.octets[i].length <= m.stringRoom, "the storage holds the strings");
  }
  return status;
}

// Whether the encoder has a form for the binding that the decoder takes back.
bool comesBack(const onramp::snmp_varbind& binding) {
  using namespace onramp;  // NOLINT(google-build-using-namespace)
  const bool isUnsigned = binding.type >= kTagCounter && binding.type <= kTagTimeTicks;
  return binding.type <= kTagObjectIdentifier
             ? binding.type != 0 && binding.type != 3
             : binding.type == kTagIpAddress || binding.type == kTagOpaque ||
                   (isUnsigned && (binding.int_value >> 31 & 1) == 0);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static Message small(8, 16, 64);
  static Message m(8, 16, 1500);
  static_cast<void>(decode(small, {data, size}, 0));
  static_cast<void>(decode(small, {data, size}, 8));
  if (decode(m, {data, size}, 0) != onramp::SNMP_OK) return 0;

  // Of the header's numbers, negative ones are read back as others.
  for (std::uint64_t* const number :
       {&m.message.version, &m.message.request_id, &m.message.error_status, &m.message.error_index})
    *number &= INT32_MAX;
  const auto bindings = m.message.varbinds.first(m.message.varbind_count);
  const Bytes once = m.encode();
  require(once.empty() == !std::all_of(bindings.begin(), bindings.end(),
                                       [](const auto& binding) {
                                         return binding.name->count >= 2 &&
                                                (binding.type != onramp::kTagObjectIdentifier ||
                                                 binding.oid_value->count >= 2);
                                       }),
          "encoded if it can be");
  if (once.empty() || !std::all_of(bindings.begin(), bindings.end(), comesBack)) return 0;
  const auto count = bindings.size();
  require(decode(m, once, 0) == onramp::SNMP_OK && m.message.varbind_count == count,
          "decoded again");
  require(m.encode() == once, "encoded to the same bytes");
  return 0;
}
