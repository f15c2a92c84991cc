// Uses each input as an agent's reply to a query, a get and a set. The buffers for the results have
// no spare room, so the sanitizers report any write past their end. If the input can be decoded,
// also encodes the decoded message and decodes it again. Skips messages with a name or value that
// cannot be encoded and decoded.

#include <algorithm>
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

// Aborts when `holds` is false, so that the fuzzer saves the input.
void require(bool holds, const char* what) {
  if (holds) return;
  std::fprintf(stderr, "not so: %s\n", what);
  std::abort();
}

void query() {
  const auto arcs =
      std::make_unique<std::array<std::uint16_t, kActiveIFObject.size()>>(kActiveIFObject);
  mib_entry entry{kTagInteger, {kActiveIFObject.size(), kActiveIFObject.size(), arcs->data()}};
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
    require(octets[i].length <= texts[i].size(), "a string fits in its slot");
}

// Returns whether the decoder can read `binding` after the encoder has written it. The decoder
// cannot read a value of an unknown type, because the encoder leaves it out. Nor can it read
// unsigned numbers of 2^31 or more, because they take 5 bytes.
bool isReadable(const snmp_varbind& binding) {
  const std::uint64_t type = binding.type;
  if (type >= kTagCounter && type <= kTagTimeTicks)
    return static_cast<std::int32_t>(binding.int_value) >= 0;
  return (type >= kTagBoolean && type <= kTagObjectIdentifier && type != 3) ||
         type == kTagIpAddress || type == kTagOpaque;
}

void encodeAndDecode(std::span<const std::uint8_t> bytes) {
  constexpr std::size_t kBindings = 6;
  Message first(kBindings);
  if (first.decode(bytes)) return;
  const std::size_t count = first.message.varbind_count;
  const auto bindings = first.message.varbinds.first(count);
  if (!std::all_of(bindings.begin(), bindings.end(), isReadable)) return;
  const auto written = first.encode();
  if (written.empty()) return;  // an object identifier that cannot be encoded

  Message second(kBindings);
  require(!second.decode(written) && second.message.varbind_count == count,
          "an encoded message can be decoded");
  for (std::size_t i = 0; i < count; ++i) {
    const snmp_varbind& one = bindings[i];
    const snmp_varbind& other = second.message.varbinds[i];
    require(one.type == other.type && one.name->count == other.name->count,
            "the type and the name's length stay the same");
    require(one.octets_value->length == other.octets_value->length,
            "the string's length stays the same");
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  recording::Agents& agents = recording::Agents::instance();
  agents.reset();
  agents.reply = [=](const auto&) { return recording::Agents::Bytes(data, data + size); };
  query();
  exchangeStrings(false);
  exchangeStrings(true);
  encodeAndDecode({data, size});
  return 0;
}
