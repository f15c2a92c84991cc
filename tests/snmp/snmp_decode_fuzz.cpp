#include "tests/snmp/fuzz.h"
#include "tests/snmp/message.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static onramp::Message m(8, 16, 64);
  requireQuick([&] {
    const auto status = m.decode({data, size});
    require(status == onramp::SNMP_OK || status == onramp::SNMP_ERR_CODEC, "a status of the codec");
  });
  require(m.guardsIntact(), "nothing is written beyond the storage");
  require(m.message.varbind_count <= m.varbinds.size(), "the array holds the bindings");
  for (std::size_t i = 0; i < m.varbinds.size(); ++i) {
    require(m.names[i].count <= m.room && m.oids[i].count <= m.room, "the storage holds the arcs");
    require(m.octets[i].length <= 64, "the storage holds the strings");
  }
  return 0;
}
