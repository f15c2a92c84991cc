#include <cstddef>
#include <cstdint>
#include <cstdlib>

#include "base/text.h"
#include "platform/freedesktop/strings_table.h"

// Every value that parseStrings() returns must be well-formed UTF-8.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* bytes, std::size_t size) {
  using namespace onramp;
  const auto text = decodedText({reinterpret_cast<const char*>(bytes), size});
  const auto table = text ? parseStrings(*text) : std::nullopt;
  if (!table) return 0;
  for (const auto& [key, value] : *table) {
    std::string_view rest = *value.as<std::string>();
    while (!rest.empty()) {
      if (!takeUTF8(rest)) std::abort();
    }
  }
  return 0;
}
