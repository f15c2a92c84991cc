// Uses every input as an agent's reply to a query, a get and a set. Nothing may be written past the
// storage that the caller provides. The storage has no spare room, so the sanitizers report such a
// write.

#include <array>
#include <cstdio>
#include <cstdlib>
#include <memory>

#include "snmp/get_set.h"
#include "snmp/protocol.h"
#include "snmp/query.h"
#include "tests/recording/agents.h"
#include "tests/snmp/message.h"

namespace {

using namespace onramp;  // NOLINT(google-build-using-namespace)

constexpr const char* kAddress = "192.0.2.1";

// Aborts when `holds` is false. The fuzzer then keeps the input.
void require(bool holds, const char* what) {
  if (holds) return;
  std::fprintf(stderr, "not so: %s\n", what);
  std::abort();
}

void query() {
  const auto arcs = std::make_unique<std::array<std::uint16_t, 14>>(kActiveIFObject);
  mib_entry entry{kTagInteger, {14, 14, arcs->data()}};
  mib_table table{&entry, 1, active_interface_table.handlers};
  snmp_request_counter = 7;
  bool noReply = false;
  const auto result = snmp_query_table(&table, kAddress, noReply, nullptr, nullptr);
  require(!result || (result->find(kActiveIFKey) && !noReply), "a result contains ActiveIF");
}

void exchangeStrings(bool set) {
  constexpr std::size_t kSlots = 4;
  Message m(kSlots, 14, 4);
  std::vector<std::uint8_t> texts[kSlots];
  snmp_octets octets[kSlots];
  snmp_result_slot slots[kSlots];
  for (std::uint32_t i = 0; i < kSlots; ++i) {
    texts[i].assign(7 * i, 'x');
    texts[i].shrink_to_fit();
    const auto size = static_cast<std::uint16_t>(texts[i].size());
    octets[i] = {size, size, texts[i].data()};
    slots[i] = {.type = i == 2 ? kTagIpAddress : kTagOctetString, .octets = &octets[i]};
    m.varbinds[i].index = i;
  }
  (set ? snmp_set : snmp_get)(m.message, slots, kAddress, kModeNetwork);
  for (std::size_t i = 0; i < kSlots; ++i)
    require(octets[i].length <= texts[i].size(), "a string fits its slot");
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  recording::Agents& agents = recording::Agents::instance();
  agents.reset();
  agents.reply = [=](const auto&) { return recording::Agents::Bytes(data, data + size); };
  query();
  exchangeStrings(false);
  exchangeStrings(true);
  return 0;
}
