#include "snmp/records.h"

#include <algorithm>

#include "snmp/protocol.h"

namespace onramp {

void snmp_message_init(snmp_message& message, std::uint64_t varbind_count) {
  message.version = 0;
  message.community_length = static_cast<std::uint16_t>(kCommunity.size());
  message.community = kCommunity.data();
  message.error_status = 0;
  message.error_index = 0;
  message.varbind_count = varbind_count;
  const auto bindings = std::min<std::uint64_t>(varbind_count, message.varbinds.size());
  for (snmp_varbind& binding : message.varbinds.first(bindings))
    binding.type = kTagNull;
}

int snmp_oid_compare(const snmp_oid& first, const snmp_oid& second) {
  const std::uint16_t shorter = std::min(first.count, second.count);
  for (std::uint16_t i = 0; i < shorter; ++i) {
    if (first.arcs[i] != second.arcs[i]) return first.arcs[i] < second.arcs[i] ? -1 : 1;
  }
  return first.count < second.count ? -1 : 0;
}

}  // namespace onramp
