#include <cstdint>
#include <cstdlib>

#include "tools/devices/ber_tree.h"

// Describes every input as onramp-devices does with a device's reply. Each line ends with a line
// feed, and only an empty input has no lines.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::string tree = onramp::devices::berTree({data, size});
  if (tree.empty() != (size == 0) || (size != 0 && tree.back() != '\n')) std::abort();
  return 0;
}
