// Compares the time of the wizard's SNMP query with that of a bare UDP exchange, which sends the
// same agent a request for the same object. Queries and bare exchanges alternate. With --json as
// the last argument, prints the times in the form that bench/compare reads.

#include <array>
#include <cstdio>
#include <cstdlib>
#include <string>

#include "bench/snmp/median.h"
#include "bench/snmp/posix/bare_exchange.h"
#include "snmp/codec.h"
#include "snmp/protocol.h"
#include "snmp/query.h"

namespace {

constexpr int kQueries = 2000;
constexpr int kWarmUp = 100;

[[noreturn]] void giveUp(const char* what) {
  std::fprintf(stderr, "snmp_query_bench: %s; run it through tests/snmp/agents.py\n", what);
  std::exit(1);
}

}  // namespace

int main(int argc, char** argv) {
  const bool asJson = wantsJson(argc, argv);
  const std::string address = argc > (asJson ? 2 : 1) ? argv[1] : "127.0.1.1";
  const auto agent = onramp::parseIPv4(address);
  onramp::snmp_table_request request(onramp::active_interface_table);
  onramp::snmp_packet packet{};
  std::uint16_t length = 0;
  if (!agent || onramp::snmp_encode_message(request.message(), packet, length)) {
    giveUp("the argument is not an IPv4 address");
  }

  Samples query;
  Samples bare;
  for (int i = -kWarmUp; i < kQueries; ++i) {
    if (i == 0) query = bare = {};
    query.measure(1, [&] {
      bool noReply = false;
      if (!onramp::snmp_query_table(&onramp::active_interface_table, address.c_str(), noReply,
                                    nullptr, nullptr)) {
        giveUp("the agent does not answer the query");
      }
    });
    bare.measure(1, [&] {
      onramp::snmp_packet reply;
      if (bareExchange(agent->bits, onramp::kSnmpPort, std::span(packet).first(length), reply) ==
          0) {
        giveUp("the agent does not answer the bare request");
      }
    });
  }
  if (asJson) {
    printJson("SNMP query on loopback", "one device", "the bare exchange", query, bare);
    return 0;
  }
  const auto microseconds = [](double nanoseconds) { return nanoseconds / 1000; };
  std::printf("Medians of %d queries on loopback [5 %%, 95 %%]\n", kQueries);
  std::printf("query  %.1f us [%.1f, %.1f]   bare exchange  %.1f us [%.1f, %.1f]   ratio  %.3f\n",
              microseconds(query.median()), microseconds(query.quantile(0.05)),
              microseconds(query.quantile(0.95)), microseconds(bare.median()),
              microseconds(bare.quantile(0.05)), microseconds(bare.quantile(0.95)),
              query.median() / bare.median());
  return 0;
}
