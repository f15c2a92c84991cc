#include <cstdint>
#include <cstdlib>

#include "tools/devices/ber_tree.h"

// Formats each input as a tree, as onramp-devices formats a device's reply. The result must be
// empty for an empty input, and must end with a line feed for any other input.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::string tree = onramp::devices::berTree({data, size});
  if (tree.empty() != (size == 0) || (size != 0 && tree.back() != '\n')) std::abort();
  return 0;
}
