#include <cstddef>
#include <cstdint>
#include <cstdlib>

#include "platform/libplist/parse.h"

// Parses each input, writes it as XML, and parses the XML. A second round must change nothing. The
// first round may change strings and dates, because XML cannot hold all of them.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* bytes, std::size_t size) {
  using namespace onramp;
  const auto value =
      libplist::parsePropertyList(std::string(reinterpret_cast<const char*>(bytes), size));
  const auto* const dictionary = value ? value->as<Dictionary>() : nullptr;
  if (!dictionary) return 0;
  const auto written = libplist::parsePropertyList(libplist::formatPropertyList(*dictionary));
  if (!written) std::abort();
  const std::string xml = libplist::formatPropertyList(*written->as<Dictionary>());
  const auto again = libplist::parsePropertyList(xml);
  if (!again || libplist::formatPropertyList(*again->as<Dictionary>()) != xml) std::abort();
  return 0;
}
