#include <gtest/gtest.h>

#include <new>
#include <optional>

#include "bonjour/device_uri.h"
#include "bonjour/txt_record.h"
#include "platform/freedesktop/strings_table.h"
#include "platform/libplist/parse.h"
#include "snmp/query.h"
#include "tests/faults/failures.h"
#include "tests/platform/plist.h"
#include "tests/recording/agents.h"
#include "tests/snmp/message.h"

namespace onramp {
namespace {

// Lets failEveryCall() make the allocations of `work` fail. Expects each run of `work` to throw
// std::bad_alloc or to return the same result as without a failure. In builds with the address
// sanitizer, a leak also fails the test.
template <typename Work>
void failEveryAllocation(const Work& work) {
  const auto expected = work();
  auto result = std::optional(expected);
  const auto seen = faults::failEveryCall(
      {ENOMEM},
      [&] {
        result.reset();
        try {
          result = work();
        } catch (const std::bad_alloc&) {
        }
      },
      [&](const std::string& failed, const faults::Failure&) {
        EXPECT_TRUE(result ? *result == expected : !failed.empty());
      });
  EXPECT_FALSE(seen.empty()) << "nothing was allocated";
}

TEST(AllocationFailure, AParserReturnsItsWholeResultOrThrows) {
  // The text is so long that std::string must allocate memory for it.
  const std::string text(40, 'x');
  const auto values = "<array><string>" + text + "</string><data>AAAA</data><real>1.5</real>" +
                      "<dict><key>" + text + "</key><integer>7</integer></dict></array>";
  failEveryAllocation([&] { return libplist::parsePropertyList(plistWith(values)); });
  failEveryAllocation(
      [&] { return parseStrings("\"" + text + "\" = \"\\U00e4" + text + "\"; b;"); });
  failEveryAllocation(
      [&] { return serviceInstanceOf("dnssd://" + text + "%20._ipp._tcp.local."); });
  failEveryAllocation([&] { return hostOfURL("http://" + text + "/" + text); });
  const std::string record = "\x2Bk=" + text + "a\x02x=";
  failEveryAllocation([&] {
    const auto parsed = TxtRecord::parse(std::as_bytes(std::span(record)));
    return parsed ? parsed->value("K") : std::nullopt;
  });
  recording::Agents::instance().reply = [](const auto&) { return realReply(); };
  failEveryAllocation([] {
    snmp_request_counter = 7;
    bool noReply = false;
    return snmp_query_table(&active_interface_table, "192.0.2.1", noReply, nullptr, nullptr);
  });
  recording::Agents::instance().reset();
}

}  // namespace
}  // namespace onramp
