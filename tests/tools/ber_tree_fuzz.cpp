#include <cstdint>
#include <cstdlib>

#include "tools/devices/ber_tree.h"

// Formats each input as a tree, as onramp-devices formats a device's reply. For an empty input, the
// text must be empty. Otherwise, it must end with a line feed.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::string tree = onramp::devices::berTree({data, size});
  if (tree.empty() != (size == 0) || (size != 0 && tree.back() != '\n')) std::abort();
  return 0;
}
