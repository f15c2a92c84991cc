#include <gtest/gtest.h>

#include <cstdlib>
#include <new>
#include <utility>

#include "bonjour/device_uri.h"
#include "bonjour/txt_record.h"
#include "platform/freedesktop/strings_table.h"
#include "platform/libplist/parse.h"
#include "platform/property_list.h"
#include "snmp/query.h"
#include "tests/platform/plist.h"
#include "tests/recording/agents.h"
#include "tests/recording/temporary_folder.h"
#include "tests/snmp/message.h"

namespace {

std::size_t allocationsUntilFailure = 0;  // 0 means that no allocation fails
std::ptrdiff_t liveAllocations = 0;

}  // namespace

// Without noinline, GCC inlines only some of these functions, and then warns that new and delete do
// not match.
[[gnu::noinline]] void* operator new(std::size_t size) {
  if (allocationsUntilFailure != 0 && --allocationsUntilFailure == 0) throw std::bad_alloc();
  void* const memory = std::malloc(size == 0 ? 1 : size);  // NOLINT(cppcoreguidelines-*)
  if (!memory) throw std::bad_alloc();
  ++liveAllocations;
  return memory;
}

[[gnu::noinline]] void* operator new(std::size_t size, const std::nothrow_t& /*tag*/) noexcept {
  try {
    return operator new(size);
  } catch (const std::bad_alloc&) {
    return nullptr;
  }
}

[[gnu::noinline]] void operator delete(void* memory) noexcept {
  if (memory) --liveAllocations;
  std::free(memory);  // NOLINT(cppcoreguidelines-*)
}

void operator delete(void* memory, std::size_t /*size*/) noexcept {
  operator delete(memory);
}

namespace onramp {
namespace {

// Runs `work` repeatedly. The first allocation fails in the first run, the second allocation in the
// second run, and so on, until a run makes no allocation that fails. Each run must either throw
// std::bad_alloc, or return the same result as a run without a failure. No run may lose memory.
// After each run that throws, `afterFailure` is called.
template <typename Work, typename AfterFailure>
void failEveryAllocation(const Work& work, const AfterFailure& afterFailure) {
  const auto expected = work();
  for (std::size_t number = 1;; ++number) {
    SCOPED_TRACE("allocation " + std::to_string(number));
    const std::ptrdiff_t before = liveAllocations;
    bool reached = true;
    try {
      allocationsUntilFailure = number;
      const auto result = work();
      reached = std::exchange(allocationsUntilFailure, 0) == 0;
      EXPECT_EQ(result, expected);
    } catch (const std::bad_alloc&) {
      afterFailure();
    }
    EXPECT_EQ(liveAllocations, before) << "memory was lost";
    if (!reached) {
      EXPECT_GT(number, 1U) << "nothing was allocated";
      return;
    }
  }
}

template <typename Work>
void failEveryAllocation(const Work& work) {
  failEveryAllocation(work, [] {});
}

TEST(AllocationFailure, AParserReturnsItsWholeResultOrThrows) {
  // This text is too long for std::string to store without an allocation.
  const std::string text(40, 'x');
  const auto values = "<array><string>" + text + "</string><data>AAAA</data><real>1.5</real>" +
                      "<dict><key>" + text + "</key><integer>7</integer></dict></array>";
  failEveryAllocation([&] { return libplist::parsePropertyList(plistWith(values)); });
  failEveryAllocation(
      [&] { return parseStrings("\"" + text + "\" = \"\\U00e4" + text + "\"; b;"); });
  failEveryAllocation(
      [&] { return serviceInstanceOf("dnssd://" + text + "%20._ipp._tcp.local."); });
  failEveryAllocation([&] { return hostOfURL("http://" + text + "/" + text); });
  const std::string record =
      "\x2B"
      "k=a" +
      text +
      "\x02"
      "x=";
  failEveryAllocation([&] {
    const auto parsed = TxtRecord::parse(std::as_bytes(std::span(record)));
    return parsed ? parsed->value("K") : std::nullopt;
  });
  failEveryAllocation([] {
    recording::Agents::instance().reply = [](const auto&) { return realReply(); };
    snmp_request_counter = 7;
    bool noReply = false;
    struct Reset {
      Reset() = default;
      Reset(const Reset&) = delete;
      Reset& operator=(const Reset&) = delete;
      ~Reset() { recording::Agents::instance().reset(); }
    } reset;
    return snmp_query_table(&active_interface_table, "192.0.2.1", noReply, nullptr, nullptr);
  });
}

TEST(AllocationFailure, AFailedWriteLeavesTheOldFileOrTheNewOne) {
  const TemporaryFolder folder;
  const std::string path = folder / "list";
  const Dictionary old{{"k", "before"}};
  const Dictionary next{{"k", Array{"after", std::string(40, 'x'), 5}}};
  failEveryAllocation(
      [&] {
        EXPECT_TRUE(writeDictionaryAtomically(next, path));
        return loadDictionary(path);
      },
      [&] {
        const auto found = loadDictionary(path);
        EXPECT_TRUE(found == old || found == next);
        EXPECT_EQ(folder.names().size(), 1U) << "a temporary file was left";
        EXPECT_TRUE(writeDictionaryAtomically(old, path));
      });
}

}  // namespace
}  // namespace onramp
