#include <cstddef>
#include <cstdint>
#include <cstdlib>

#include "platform/libplist/parse.h"

// What was read comes back the same from what is written.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* bytes, std::size_t size) {
  using namespace onramp;
  const auto value =
      libplist::parsePropertyList(std::string(reinterpret_cast<const char*>(bytes), size));
  const auto* const dictionary = value ? value->as<Dictionary>() : nullptr;
  if (!dictionary) return 0;
  const std::string xml = libplist::formatPropertyList(*dictionary);
  const auto again = libplist::parsePropertyList(xml);
  if (!again || libplist::formatPropertyList(*again->as<Dictionary>()) != xml) std::abort();
  return 0;
}
